#include "sliderswindow.h"

#include "../shared/accessibility.h"
#include "../shared/statewrites.h"

#include <QPointingDevice>
#include <QSignalSpy>

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

QQuickItem *button(const SlidersWindow &window)
{
    const auto items = window.view->findChildren<QQuickItem *>();
    const auto found = std::ranges::find_if(items, [](auto *item) { return item->inherits("QQuickAbstractButton"); });
    return found == items.end() ? nullptr : *found;
}

QString name(QQuickItem *item)
{
    return QAccessible::queryAccessibleInterface(item)->text(QAccessible::Name);
}

/** The menu's items from top to bottom, while it is open. */
QList<QQuickItem *> choices(const SlidersWindow &window)
{
    QList<QQuickItem *> items;
    for (auto *item : itemsBelow(window.window.contentItem())) {
        if (item->inherits("QQuickMenuItem") && item->isVisible())
            items << item;
    }
    std::ranges::sort(items, {}, [](const QQuickItem *item) { return item->y(); });
    return items;
}

void openMenu(SlidersWindow &window)
{
    window.click(button(window));
    QTRY_COMPARE(choices(window).size(), 2);
}

void choose(SlidersWindow &window, int index)
{
    openMenu(window);
    window.click(choices(window)[index]);
    QTRY_COMPARE(choices(window).size(), 0);
}

} // namespace

/** The sliders and the button of the color space. */
class RGBAViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        // Every move counts here; the toolkit would merge those of one frame.
        qputenv("QML_NO_TOUCH_COMPRESSION", "1");
        startAssistiveTechnology<QAccessible::Slider>();
    }
    void cleanup() { theme::Theme::instance().setLayoutDirection(Qt::LeftToRight); }

    void dragWritesValueThenFlag()
    {
        SlidersWindow window;
        const auto *red = window.slider(ColorComponent::Red);
        QCOMPARE(red->size(), QSizeF(236.0, 36.0));
        const auto at = [red](double x) { return SlidersWindow::at(red, x); };
        Writes writes(window.state);
        QTest::mousePress(&window.window, Qt::LeftButton, {}, at(118.0));
        QTest::mouseMove(&window.window, at(168.0));
        QTest::mouseMove(&window.window, at(-5000.0));
        QTest::mouseMove(&window.window, at(330.0));
        QTest::mouseRelease(&window.window, Qt::LeftButton, {}, at(330.0));
        QCOMPARE(writes.take(), QStringLiteral("0.5 volatile 0.75 volatile 0 volatile 1 volatile final"));
    }

    void cancelledTouchEndsTheDrag()
    {
        const std::unique_ptr<QPointingDevice> touchScreen(QTest::createTouchDevice());
        SlidersWindow window;
        Writes writes(window.state);
        const QPoint place = SlidersWindow::at(window.slider(ColorComponent::Red), 118.0);
        QTest::touchEvent(&window.window, touchScreen.get()).press(0, place);
        QTouchEvent cancel(QEvent::TouchCancel, touchScreen.get());
        QCoreApplication::sendEvent(&window.window, &cancel);
        QCOMPARE(writes.take(), QStringLiteral("0.5 volatile final"));
    }

    void mirroredDragStaysUnderTheFinger()
    {
        theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        SlidersWindow window;
        const auto *red = window.slider(ColorComponent::Red);
        // The track is at the leading side.
        QCOMPARE(red->mapToScene(QPointF()).x() + red->width(), 336.0);
        window.click(red, 68.0);
        QCOMPARE(red->value(), 0.75);
        QCOMPARE(red->thumbCenter().x(), 68.0);
    }

    void otherComponentsAndSpaceAreKept()
    {
        SlidersWindow window;
        const SomeColor color(0.1, 0.2, 0.3, 0.4, Space::displayP3);
        for (const auto component :
             {ColorComponent::Red, ColorComponent::Green, ColorComponent::Blue, ColorComponent::Opacity}) {
            window.state.selectedColor.set(color);
            window.click(window.slider(component), 118.0);
            QCOMPARE(window.color(), color.setting(sliders::component(component), 0.5));
        }
        // Where none is selected, they are those of the fallback.
        window.state.fallbackColor.set(color);
        window.state.selectedColor.set(std::nullopt);
        window.click(window.slider(ColorComponent::Red), 118.0);
        QCOMPARE(window.color(), color.setting(SomeColor::Component::r, 0.5));
    }

    void keysStepByWhatIsShown()
    {
        SlidersWindow window;
        auto *red = window.slider(ColorComponent::Red);
        red->forceActiveFocus(Qt::TabFocusReason);
        QVERIFY(red->focusVisible());
        Writes writes(window.state);
        QTest::keyClick(&window.window, Qt::Key_Left);
        QCOMPARE(writes.take(), QString());
        QTest::keyClick(&window.window, Qt::Key_Right);
        QTest::keyClick(&window.window, Qt::Key_End);
        QCOMPARE(writes.take(), QString::number(1 / 255.0) + QStringLiteral(" 1"));

        window.slider(ColorComponent::Opacity)->forceActiveFocus(Qt::TabFocusReason);
        QVERIFY(!red->focusVisible());
        QTest::keyClick(&window.window, Qt::Key_Down);
        QCOMPARE(window.color().a, 0.99);
    }

    void thumbFollowsTheColor()
    {
        SlidersWindow window;
        const auto thumbs = window.slider(ColorComponent::Red)->childItems();
        const auto thumb =
            std::ranges::find_if(thumbs, [](auto *child) { return child->inherits("favrin::lens::ColorLens"); });
        QVERIFY(thumb != thumbs.end());
        window.state.selectedColor.set(SomeColor(0.75, 0.0, 0.0, 1.0, Space::sRGB));
        QCOMPARE((*thumb)->x() + (*thumb)->width() / 2.0, 168.0);
        QCOMPARE((*thumb)->size(), QSizeF(36.0, 36.0));
        window.state.selectedColor.set(std::nullopt);
        QVERIFY(!(*thumb)->isVisible());
    }

    void assistiveTechnologiesStep()
    {
        SlidersWindow window;
        window.state.selectedColor.set(SomeColor(0.95, 0.0, 0.0, 0.05, Space::sRGB));
        auto *red = QAccessible::queryAccessibleInterface(window.slider(ColorComponent::Red));
        auto *opacity = QAccessible::queryAccessibleInterface(window.slider(ColorComponent::Opacity));
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
        QCOMPARE(window.color().a, 0.0);
        opacity->valueInterface()->setCurrentValue(40);
        QCOMPARE(window.color().a, 0.4);
        writes.take();
        red->valueInterface()->setCurrentValue(QStringLiteral("x"));
        red->actionInterface()->doAction(QStringLiteral("x"));
        QCOMPARE(writes.take(), QString());
    }

    void anotherSpaceIsChosen()
    {
        SlidersWindow window;
        window.state.selectedColor.set(SomeColor(0.0, 97 / 255.0, 253 / 255.0, 0.3, Space::sRGB));
        bool animates = false;
        connect(&window.state, &service::ColorPickerState::selectedColorChanged, this,
                [&] { animates = window.state.animatesChanges(); });
        QCOMPARE(name(button(window)), QStringLiteral("sRGB Hex Color #"));
        QCOMPARE(name(window.input(3)), QStringLiteral("sRGB Hex Color #"));
        openMenu(window);
        QCOMPARE(choices(window)[0]->property("text").toString(), QStringLiteral("sRGB"));
        QCOMPARE(choices(window)[1]->property("text").toString(), QStringLiteral("Display P3"));
        QVERIFY(choices(window)[0]->property("isCurrent").toBool());
        window.click(choices(window)[1]);
        QCOMPARE(window.input(3)->property("text").toString(), QStringLiteral("285FF4"));
        QCOMPARE(name(button(window)), QStringLiteral("Display P3 Hex Color #"));
        QCOMPARE(window.color().a, 0.3);
        QVERIFY(animates && !window.state.animatesChanges());
    }

    void clippedColorStaysClipped()
    {
        SlidersWindow window;
        window.state.selectedColor.set(SomeColor(1.0, 0.0, 0.0, 1.0, Space::displayP3));
        choose(window, 0);
        // The current one writes nothing.
        QSignalSpy writes(&window.state, &service::ColorPickerState::selectedColorChanged);
        choose(window, 0);
        QCOMPARE(writes.count(), 0);
        choose(window, 1);
        QVERIFY(window.color().isApproximatelyEqual(SomeColor(0.9175, 0.2003, 0.1386, 1.0, Space::displayP3)));
    }

    void keysChooseToo()
    {
        SlidersWindow window;
        button(window)->forceActiveFocus(Qt::TabFocusReason);
        QTest::keyClick(&window.window, Qt::Key_Space);
        QTRY_COMPARE(choices(window).size(), 2);
        QTest::keyClick(&window.window, Qt::Key_Down);
        QTest::keyClick(&window.window, Qt::Key_Return);
        QTRY_VERIFY(window.color().colorSpace == Space::displayP3);
        QTRY_VERIFY(button(window)->hasActiveFocus());
        QTest::keyClick(&window.window, Qt::Key_Return);
        QTRY_COMPARE(choices(window).size(), 2);
        QTest::keyClick(&window.window, Qt::Key_Escape);
        QTRY_COMPARE(choices(window).size(), 0);
    }

    void noSpaceIsChosenWithoutAColor()
    {
        SlidersWindow window;
        window.state.fallbackColor.set(SomeColor(0.0, 0.0, 0.0, 1.0, Space::displayP3));
        window.state.selectedColor.set(std::nullopt);
        QCOMPARE(name(button(window)), QStringLiteral("Display P3 Hex Color #"));
        window.click(button(window));
        QVERIFY(!button(window)->isEnabled());
        QCOMPARE(choices(window).size(), 0);
        QVERIFY(!window.state.hasSelectedColor());
    }
};

QTEST_MAIN(RGBAViewTest)
#include "tst_rgbaview.moc"
