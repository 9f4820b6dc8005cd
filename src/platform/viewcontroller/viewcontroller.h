#pragma once

#include "platform/viewcontroller/viewcontrollerregistry.h"

#include <QObject>
#include <QPointer>
#include <QQuickItem>
#include <QSizeF>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace favrin::platform {

/** How a controller's content is shown; the numbers are those of the presentation context trait. */
enum class PresentationContext { Unspecified = 0, Presented = 1, Embedded = 2, Popover = 3 };

enum class UserInterfaceStyle { Unspecified = 0, Light = 1, Dark = 2 };

/** What a controller knows about its surroundings. */
struct TraitCollection
{
    PresentationContext presentationContext = PresentationContext::Unspecified;
    UserInterfaceStyle userInterfaceStyle = UserInterfaceStyle::Light;

    bool operator==(const TraitCollection &) const = default;
};

/**
 * A thin controller of one view, a Qt Quick item: parent and child, traits, layout passes, appearance, preferred
 * content size. Main thread only. A child controller is owned by its parent; a view is owned by its controller and must
 * have no owner among the QObjects. Say setAppeared(false) before destroying a controller that is on screen.
 */
class ViewController : public QObject
{
    Q_OBJECT

public:
    /** Children are destroyed first; they have no parent any more then. */
    ~ViewController() override;

    /** The view, loaded on first use (loadView(), then viewDidLoad()). */
    QQuickItem *view();
    QQuickItem *viewIfLoaded() const { return m_view; }

    ViewController *parentController() const { return m_parent; }
    const std::vector<std::unique_ptr<ViewController>> &childControllers() const { return m_children; }
    /** Takes the child and hands it this controller's traits. The caller places its view and calls didMoveToParent().
     */
    ViewController *addChild(std::unique_ptr<ViewController> child);
    /** A child that joins a parent on screen appears. Overrides call this one too. */
    virtual void didMoveToParent(ViewController *parent);

    const TraitCollection &traits() const { return m_traits; }
    /**
     * Sets the traits here and in all children; each controller whose traits changed, and each that never had any set,
     * hears traitsDidChange().
     */
    void setTraits(const TraitCollection &traits);

    /** Points; 0 × 0 at first. */
    QSizeF preferredContentSize() const { return m_preferredContentSize; }
    /** Sizes that are negative or not finite change nothing. */
    void setPreferredContentSize(QSizeF size);

    /**
     * Says that the view, which is loaded for it, is on screen, or no longer; children hear of an appearance after this
     * controller and of a disappearance before it. Saying it twice does nothing.
     */
    void setAppeared(bool appeared);
    bool hasAppeared() const { return m_appeared; }

    /**
     * Asks for a layout pass on the main thread before the next frame of the view's window; any number of requests make
     * one pass. Loading the view and every change of its size or implicit size ask as well. A request made during a
     * pass makes one more pass at once; one made during that pass waits for the next frame.
     */
    void setNeedsLayout();
    /**
     * Runs the layout pass now: this controller, then those of its children that need one. Does nothing before the view
     * is loaded, and is a request like any other during a pass.
     */
    void layoutNow();

Q_SIGNALS:
    void preferredContentSizeChanged();

protected:
    ViewController();

    /** Makes the view. Never call it; call view(). */
    virtual std::unique_ptr<QQuickItem> loadView() = 0;
    virtual void viewDidLoad() {}
    virtual void viewWillAppear() {}
    virtual void viewDidDisappear() {}
    virtual void viewWillLayoutSubviews() {}
    virtual void viewDidLayoutSubviews() {}
    /** @p previous is none when traits are set for the first time. */
    virtual void traitsDidChange(const std::optional<TraitCollection> &previous);

private:
    void deliverTraits(const TraitCollection &traits);
    void watchView();
    void runLayoutPass();

    ViewController *m_parent = nullptr;
    std::vector<std::unique_ptr<ViewController>> m_children;
    QPointer<QQuickItem> m_view;
    QPointer<QQuickItem> m_layoutItem;
    TraitCollection m_traits;
    bool m_traitsDelivered = false;
    QSizeF m_preferredContentSize{0.0, 0.0};
    bool m_appeared = false;
    bool m_layoutPending = false;
    bool m_inLayoutPass = false;
};

} // namespace favrin::platform
