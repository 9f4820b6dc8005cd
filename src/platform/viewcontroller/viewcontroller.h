#pragma once

#include <QObject>
#include <QPointer>
#include <QSizeF>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

class QQuickItem;

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
 * A thin controller of one view, a Qt Quick item: parent and child, traits, layout passes, appearance, preferred content
 * size. Main thread only. A child controller is owned by its parent; a view is owned by its controller.
 */
class ViewController : public QObject
{
    Q_OBJECT

public:
    ~ViewController() override;

    /** The view, loaded on first use (loadView(), then viewDidLoad()). */
    QQuickItem *view();
    QQuickItem *viewIfLoaded() const;

    ViewController *parentController() const { return m_parent; }
    const std::vector<std::unique_ptr<ViewController>> &childControllers() const { return m_children; }
    /** Takes the child and hands it this controller's traits. The caller places its view and calls didMoveToParent(). */
    ViewController *addChild(std::unique_ptr<ViewController> child);
    virtual void didMoveToParent(ViewController *parent);

    const TraitCollection &traits() const { return m_traits; }
    /**
     * Sets the traits here and in all children; each controller whose traits changed, and each that never had any set,
     * hears traitsDidChange().
     */
    void setTraits(const TraitCollection &traits);

    /** Points; 0 × 0 at first. */
    QSizeF preferredContentSize() const { return m_preferredContentSize; }
    void setPreferredContentSize(QSizeF size);

    /** Says that the view is on screen, or no longer; children hear it too. Saying it twice does nothing. */
    void setAppeared(bool appeared);
    bool hasAppeared() const { return m_appeared; }

    /** Asks for a layout pass before the next frame. Any number of requests make one pass. */
    void setNeedsLayout();
    /** Runs the layout pass now: this controller, then its children. */
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

    ViewController *m_parent = nullptr;
    std::vector<std::unique_ptr<ViewController>> m_children;
    std::unique_ptr<QQuickItem> m_view;
    TraitCollection m_traits;
    bool m_traitsDelivered = false;
    QSizeF m_preferredContentSize;
    bool m_appeared = false;
    bool m_layoutPending = false;
};

/** Makes controllers by their registered class name, so that one side can create another that it knows only by messages. */
namespace viewcontrollerregistry {
using Factory = std::function<std::unique_ptr<ViewController>()>;
void registerClass(const std::string &className, Factory factory);
/** None for a name that nobody registered. */
std::unique_ptr<ViewController> create(const std::string &className);
} // namespace viewcontrollerregistry

} // namespace favrin::platform
