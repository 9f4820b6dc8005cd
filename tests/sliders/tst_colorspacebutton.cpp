#include "sliderswindow.h"

#include <QAccessible>
#include <QSignalSpy>

using namespace favrin;
using model::SomeColor;
using Space = SomeColor::ColorSpace;

namespace {

QQuickItem *button(const SlidersWindow &window)
{
    for (auto *item : window.view->findChildren<QQuickItem *>()) {
        if (item->inherits("QQuickAbstractButton"))
            return item;
    }
    return nullptr;
}

QString name(QQuickItem *item)
{
    auto *interface = QAccessible::queryAccessibleInterface(item);
    return interface ? interface->text(QAccessible::Name) : QString();
}

/** The menu's items from top to bottom, while it is open. */
QList<QQuickItem *> choices(const SlidersWindow &window)
{
    QList<QQuickItem *> items;
    for (auto *item : itemsBelow(window.window.contentItem())) {
        if (item->inherits("QQuickMenuItem") && item->isVisible())
            items << item;
    }
    std::sort(items.begin(), items.end(),
              [](const QQuickItem *left, const QQuickItem *right) { return left->y() < right->y(); });
    return items;
}

void click(SlidersWindow &window, const QQuickItem *item)
{
    QTest::mouseClick(&window.window, Qt::LeftButton, {}, SlidersWindow::at(item, item->width() / 2.0));
}

} // namespace

class ColorSpaceButtonTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void choosesAnotherSpace();
    void currentSpaceWritesNothing();
    void clippedColorStaysClipped();
    void keysChooseToo();
    void disabledWithoutAColor();
    void switchIsAnimated();
};

void ColorSpaceButtonTest::choosesAnotherSpace()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    window.state.selectedColor.set(SomeColor(0.0, 97 / 255.0, 253 / 255.0, 0.3, Space::sRGB));
    QCOMPARE(name(button(window)), QStringLiteral("sRGB Hex Color #"));
    QCOMPARE(name(window.input(3)), QStringLiteral("sRGB Hex Color #"));
    click(window, button(window));
    QTRY_COMPARE(choices(window).size(), 2);
    QCOMPARE(choices(window)[0]->property("text").toString(), QStringLiteral("sRGB"));
    QCOMPARE(choices(window)[1]->property("text").toString(), QStringLiteral("Display P3"));
    QVERIFY(choices(window)[0]->property("isCurrent").toBool());
    click(window, choices(window)[1]);
    QCOMPARE(window.input(3)->property("text").toString(), QStringLiteral("285FF4"));
    QCOMPARE(name(button(window)), QStringLiteral("Display P3 Hex Color #"));
    QCOMPARE(window.state.selectedColor()->a, 0.3);
    QTRY_COMPARE(choices(window).size(), 0);
}

void ColorSpaceButtonTest::currentSpaceWritesNothing()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    QSignalSpy writes(&window.state, &service::ColorPickerState::selectedColorChanged);
    click(window, button(window));
    QTRY_COMPARE(choices(window).size(), 2);
    click(window, choices(window)[0]);
    QTRY_COMPARE(choices(window).size(), 0);
    QCOMPARE(writes.count(), 0);
}

void ColorSpaceButtonTest::clippedColorStaysClipped()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    window.state.selectedColor.set(SomeColor(1.0, 0.0, 0.0, 1.0, Space::displayP3));
    for (const int choice : {0, 1}) {
        click(window, button(window));
        QTRY_COMPARE(choices(window).size(), 2);
        click(window, choices(window)[choice]);
        QTRY_COMPARE(choices(window).size(), 0);
    }
    QVERIFY(
        window.state.selectedColor()->isApproximatelyEqual(SomeColor(0.9175, 0.2003, 0.1386, 1.0, Space::displayP3)));
}

void ColorSpaceButtonTest::keysChooseToo()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    button(window)->forceActiveFocus(Qt::TabFocusReason);
    QTest::keyClick(&window.window, Qt::Key_Space);
    QTRY_COMPARE(choices(window).size(), 2);
    QTest::keyClick(&window.window, Qt::Key_Down);
    QTest::keyClick(&window.window, Qt::Key_Return);
    QTRY_VERIFY(window.state.selectedColor()->colorSpace == Space::displayP3);
    QTRY_VERIFY(button(window)->hasActiveFocus());
    QTest::keyClick(&window.window, Qt::Key_Return);
    QTRY_COMPARE(choices(window).size(), 2);
    QTest::keyClick(&window.window, Qt::Key_Escape);
    QTRY_COMPARE(choices(window).size(), 0);
}

void ColorSpaceButtonTest::disabledWithoutAColor()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    window.state.fallbackColor.set(SomeColor(0.0, 0.0, 0.0, 1.0, Space::displayP3));
    window.state.selectedColor.set(std::nullopt);
    QCOMPARE(name(button(window)), QStringLiteral("Display P3 Hex Color #"));
    click(window, button(window));
    QVERIFY(!button(window)->isEnabled());
    QCOMPARE(choices(window).size(), 0);
    QVERIFY(!window.state.hasSelectedColor());
}

void ColorSpaceButtonTest::switchIsAnimated()
{
    SlidersWindow window;
    QVERIFY(window.isReady());
    window.state.selectedColor.set(SomeColor(1.0, 0.0, 0.0, 1.0, Space::sRGB));
    bool animates = false;
    connect(&window.state, &service::ColorPickerState::selectedColorChanged, this,
            [&] { animates = window.state.animatesChanges(); });
    click(window, button(window));
    QTRY_COMPARE(choices(window).size(), 2);
    click(window, choices(window)[1]);
    QVERIFY(animates);
    QVERIFY(!window.state.animatesChanges());
}

QTEST_MAIN(ColorSpaceButtonTest)
#include "tst_colorspacebutton.moc"
