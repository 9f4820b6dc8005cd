#pragma once

#include "model/somecolor.h"
#include "platform/observation/published.h"
#include "service/tab.h"

#include <QObject>
#include <QSizeF>
#include <QString>
#include <QtQmlIntegration/qqmlintegration.h>

#include <functional>
#include <optional>
#include <vector>

namespace favrin::service {

enum class ColorScheme { Light, Dark };

/**
 * Everything the picker shows and everything the user has chosen: the one shared mutable object of a presentation.
 *
 * Main thread only. The published fields announce, deliver, then store (see platform::Published); the QML properties
 * below notify after the value is stored. Sizes are in points.
 */
class ColorPickerState : public QObject, public platform::ObservableObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("There is one state per presentation, made by its controller")

    Q_PROPERTY(bool hasSelectedColor READ hasSelectedColor NOTIFY selectedColorChanged)
    Q_PROPERTY(QString selectedTab READ selectedTabName WRITE setSelectedTabName NOTIFY selectedTabChanged)
    Q_PROPERTY(QString title READ titleText NOTIFY titleChanged)
    Q_PROPERTY(bool allowsNoColor READ readAllowsNoColor NOTIFY allowsNoColorChanged)
    Q_PROPERTY(bool showsAlpha READ readShowsAlpha NOTIFY showsAlphaChanged)
    Q_PROPERTY(bool showsEyedropper READ readShowsEyedropper NOTIFY showsEyedropperChanged)
    Q_PROPERTY(
        bool eyedropperShowing READ readEyedropperShowing WRITE setEyedropperShowing NOTIFY eyedropperShowingChanged)
    Q_PROPERTY(bool eyedropperIsFloating READ readEyedropperIsFloating WRITE setEyedropperIsFloating NOTIFY
                   eyedropperIsFloatingChanged)
    Q_PROPERTY(bool useLandscapeLayout READ readUseLandscapeLayout NOTIFY useLandscapeLayoutChanged)
    Q_PROPERTY(bool isEmbedded READ readIsEmbedded NOTIFY isEmbeddedChanged)
    Q_PROPERTY(bool isPopover READ readIsPopover NOTIFY isPopoverChanged)
    Q_PROPERTY(QSizeF size READ readSize NOTIFY sizeChanged)
    Q_PROPERTY(bool animatesChanges READ animatesChanges NOTIFY animatesChangesChanged)

public:
    explicit ColorPickerState(std::vector<model::SomeColor> favoriteColors, QObject *parent = nullptr);
    ~ColorPickerState() override;

    using OptionalColor = std::optional<model::SomeColor>;
    using ColorList = std::vector<model::SomeColor>;

    // The published fields, in declaration order.
    platform::Published<OptionalColor> selectedColor;
    platform::Published<model::SomeColor> fallbackColor;
    platform::Published<bool> allowsNoColor;
    platform::Published<bool> isVolatile;
    platform::Published<Tab> selectedTab;
    platform::Published<ColorList> favoriteColors;
    platform::Published<std::string> title;
    platform::Published<bool> showsAlpha;
    platform::Published<bool> showsEyedropper;
    platform::Published<std::optional<ColorList>> suggestedColors;
    platform::Published<bool> eyedropperShowing;
    platform::Published<bool> eyedropperIsFloating;
    platform::Published<bool> useLandscapeLayout;
    platform::Published<bool> isEmbedded;
    platform::Published<bool> isPopover;
    platform::Published<QSizeF> size;
    /** Ends the presentation; none until the controller sets it. */
    platform::Published<std::function<void()>> close;
    platform::Published<bool> enableDarkGrid;
    platform::Published<std::optional<ColorScheme>> overrideColorScheme;

    /** The outgoing stream of picks, made on first use: the selected color as a platform color, or none. */
    platform::Publisher<std::optional<platform::Color>> &finalColor();

    /** Reads selectedColor when there is one, else fallbackColor. */
    model::SomeColor colorBinding() const;
    /** Writes selectedColor, so that a color is selected afterwards. */
    void setColorBinding(const model::SomeColor &color);
    bool hasSelectedColor() const { return selectedColor().has_value(); }

    QString selectedTabName() const;
    void setSelectedTabName(const QString &rawValue);
    QString titleText() const;
    bool readAllowsNoColor() const { return allowsNoColor(); }
    bool readShowsAlpha() const { return showsAlpha(); }
    bool readShowsEyedropper() const { return showsEyedropper(); }
    bool readEyedropperShowing() const { return eyedropperShowing(); }
    void setEyedropperShowing(bool showing) { eyedropperShowing.set(showing); }
    bool readEyedropperIsFloating() const { return eyedropperIsFloating(); }
    void setEyedropperIsFloating(bool floating) { eyedropperIsFloating.set(floating); }
    bool readUseLandscapeLayout() const { return useLandscapeLayout(); }
    bool readIsEmbedded() const { return isEmbedded(); }
    bool readIsPopover() const { return isPopover(); }
    QSizeF readSize() const { return size(); }

    /** Makes @p change with the default animation: while it runs, animatesChanges is true and views may animate. */
    void withAnimation(const std::function<void()> &change);
    bool animatesChanges() const { return m_animatesChanges; }

    /** Runs the close action when there is one. */
    Q_INVOKABLE void performClose();

Q_SIGNALS:
    // Each is emitted after the value is stored.
    void selectedColorChanged();
    void fallbackColorChanged();
    void allowsNoColorChanged();
    void isVolatileChanged();
    void selectedTabChanged();
    void favoriteColorsChanged();
    void titleChanged();
    void showsAlphaChanged();
    void showsEyedropperChanged();
    void suggestedColorsChanged();
    void eyedropperShowingChanged();
    void eyedropperIsFloatingChanged();
    void useLandscapeLayoutChanged();
    void isEmbeddedChanged();
    void isPopoverChanged();
    void sizeChanged();
    void closeChanged();
    void enableDarkGridChanged();
    void overrideColorSchemeChanged();

    void animatesChangesChanged();

private:
    void setAnimatesChanges(bool animates);

    bool m_animatesChanges = false;
    std::optional<platform::Publisher<std::optional<platform::Color>>> m_finalColor;
    platform::Subscription m_objectWillChangeSink;
};

} // namespace favrin::service
