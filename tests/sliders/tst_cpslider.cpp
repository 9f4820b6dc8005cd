#include "sliderswindow.h"

#include "../shared/statewrites.h"

#include <QAccessible>
#include <QPointingDevice>

#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

using namespace favrin;
using model::SomeColor;
using sliders::ColorComponent;
using Space = SomeColor::ColorSpace;

namespace {

/** A color is its red component. */
struct Writes : StateWrites
{
    explicit Writes(service::ColorPickerState &state)
        : StateWrites(state, [](const OptionalColor &color) { return QString::number(color ? color->r : -1.0); })
    {
    }
};

} // namespace

class CPSliderTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanup();
    void dragWritesValueThenFlag();
    void cancelledTouchEndsTheDrag();
    void mirroredDragStaysUnderTheFinger();
    void otherComponentsAndSpaceAreKept();
    void dragSelectsTheFallback();
    void keysStepByWhatIsShown();
    void thumbFollowsTheColor();
    void assistiveTechnologiesStep();

private:
    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
};

void CPSliderTest::initTestCase()
{
    // Every move counts here; the toolkit would merge those of one frame.
    qputenv("QML_NO_TOUCH_COMPRESSION", "1");
    // As if an assistive technology were running; there is no public way to say so.
    QGuiApplicationPrivate::platformIntegration()->accessibility()->setActive(true);
}

void CPSliderTest::cleanup()
{
    theme::Theme::instance().setLayoutDirection(Qt::LeftToRight);
}

void CPSliderTest::dragWritesValueThenFlag()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    const auto *red = window.slider(ColorComponent::Red);
    QCOMPARE(red->size(), QSizeF(236.0, 36.0));
    const auto at = [red](double x) { return SlidersWindow::at(red, x); };
    Writes writes(window.state);
    QTest::mousePress(&window.window, Qt::LeftButton, {}, at(118.0));
    QCOMPARE(writes.take(), QStringLiteral("0.5 volatile"));
    QTest::mouseMove(&window.window, at(168.0));
    QCOMPARE(writes.take(), QStringLiteral("0.75 volatile"));
    QTest::mouseMove(&window.window, at(-5000.0));
    QCOMPARE(writes.take(), QStringLiteral("0 volatile"));
    QTest::mouseMove(&window.window, at(330.0));
    QCOMPARE(writes.take(), QStringLiteral("1 volatile"));
    QTest::mouseRelease(&window.window, Qt::LeftButton, {}, at(330.0));
    QCOMPARE(writes.take(), QStringLiteral("final"));
}

void CPSliderTest::cancelledTouchEndsTheDrag()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    const auto *red = window.slider(ColorComponent::Red);
    Writes writes(window.state);
    QTest::touchEvent(&window.window, m_touch.get()).press(0, SlidersWindow::at(red, 118.0));
    writes.take();
    QTouchEvent cancel(QEvent::TouchCancel, m_touch.get());
    QCoreApplication::sendEvent(&window.window, &cancel);
    QCOMPARE(writes.take(), QStringLiteral("final"));
    QVERIFY(!window.state.isVolatile());
}

void CPSliderTest::mirroredDragStaysUnderTheFinger()
{
    theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
    SlidersWindow window;
    QVERIFY(window.isReady());
    const auto *red = window.slider(ColorComponent::Red);
    // The track is at the leading side.
    QCOMPARE(red->mapToScene(QPointF()).x() + red->width(), 336.0);
    QTest::mouseClick(&window.window, Qt::LeftButton, {}, SlidersWindow::at(red, 68.0));
    QCOMPARE(red->value(), 0.75);
    QCOMPARE(red->thumbCenter().x(), 68.0);
}

void CPSliderTest::otherComponentsAndSpaceAreKept()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    const SomeColor color(0.1, 0.2, 0.3, 0.4, Space::displayP3);
    for (const auto component :
         {ColorComponent::Red, ColorComponent::Green, ColorComponent::Blue, ColorComponent::Opacity}) {
        window.state.selectedColor.set(color);
        const auto *slider = window.slider(component);
        QTest::mouseClick(&window.window, Qt::LeftButton, {}, SlidersWindow::at(slider, 118.0));
        QCOMPARE(window.state.selectedColor(), std::optional(color.setting(sliders::component(component), 0.5)));
    }
}

void CPSliderTest::dragSelectsTheFallback()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    window.state.fallbackColor.set(SomeColor(0.1, 0.2, 0.3, 1.0, Space::displayP3));
    window.state.selectedColor.set(std::nullopt);
    QTest::mouseClick(&window.window, Qt::LeftButton, {}, SlidersWindow::at(window.slider(ColorComponent::Red), 118.0));
    QCOMPARE(window.state.selectedColor(), std::optional(SomeColor(0.5, 0.2, 0.3, 1.0, Space::displayP3)));
}

void CPSliderTest::keysStepByWhatIsShown()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    auto *red = window.slider(ColorComponent::Red);
    red->forceActiveFocus(Qt::TabFocusReason);
    QVERIFY(red->focusVisible());
    Writes writes(window.state);
    QTest::keyClick(&window.window, Qt::Key_Left);
    QCOMPARE(writes.take(), QString());
    QTest::keyClick(&window.window, Qt::Key_Right);
    QCOMPARE(writes.take(), QString::number(1 / 255.0));
    QTest::keyClick(&window.window, Qt::Key_End);
    QCOMPARE(writes.take(), QStringLiteral("1"));

    window.slider(ColorComponent::Opacity)->forceActiveFocus(Qt::TabFocusReason);
    QVERIFY(!red->focusVisible());
    QTest::keyClick(&window.window, Qt::Key_Down);
    QCOMPARE(window.state.selectedColor()->a, 0.99);
}

void CPSliderTest::thumbFollowsTheColor()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    const auto *red = window.slider(ColorComponent::Red);
    const QQuickItem *thumb = nullptr;
    for (const auto *child : red->childItems()) {
        if (child->inherits("favrin::lens::ColorLens"))
            thumb = child;
    }
    QVERIFY(thumb);
    window.state.selectedColor.set(SomeColor(0.75, 0.0, 0.0, 1.0, Space::sRGB));
    QCOMPARE(thumb->x() + thumb->width() / 2.0, 168.0);
    QCOMPARE(thumb->size(), QSizeF(36.0, 36.0));
    window.state.selectedColor.set(std::nullopt);
    QVERIFY(!thumb->isVisible());
}

void CPSliderTest::assistiveTechnologiesStep()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    window.state.selectedColor.set(SomeColor(0.95, 0.0, 0.0, 0.05, Space::sRGB));
    auto *red = QAccessible::queryAccessibleInterface(window.slider(ColorComponent::Red));
    auto *opacity = QAccessible::queryAccessibleInterface(window.slider(ColorComponent::Opacity));
    QVERIFY(red && opacity);
    QCOMPARE(red->role(), QAccessible::Slider);
    QCOMPARE(red->text(QAccessible::Name), QStringLiteral("Red"));
    QCOMPARE(red->text(QAccessible::Value), QStringLiteral("242"));
    QCOMPARE(red->valueInterface()->currentValue(), QVariant(242.0));
    QCOMPARE(opacity->text(QAccessible::Value), QStringLiteral("5%"));
    QCOMPARE(red->childCount(), 0);

    Writes writes(window.state);
    red->actionInterface()->doAction(QAccessibleActionInterface::increaseAction());
    QCOMPARE(writes.take(), QStringLiteral("1"));
    opacity->actionInterface()->doAction(QAccessibleActionInterface::decreaseAction());
    QCOMPARE(window.state.selectedColor()->a, 0.0);
    opacity->valueInterface()->setCurrentValue(40);
    QCOMPARE(window.state.selectedColor()->a, 0.4);
    writes.take();
    red->valueInterface()->setCurrentValue(QStringLiteral("x"));
    red->actionInterface()->doAction(QStringLiteral("x"));
    QCOMPARE(writes.take(), QString());
}

QTEST_MAIN(CPSliderTest)
#include "tst_cpslider.moc"
