#include "grid/colorswatchpickerview.h"
#include "shell/colorpickerviewfactory.h"
#include "spectrum/spectrum.h"
#include "theme/theme.h"

#include <QAccessible>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QTest>

using namespace favrin;
using service::Tab;

namespace {

/** The root view in a window of 360 × 480 points. */
class PickerWindow
{
public:
    PickerWindow()
    {
        state.size.set(QSizeF(360.0, 480.0));
        state.close.set([this] { ++closed; });
        view = factory.create(state);
        if (!view)
            return;
        view->setParentItem(window.contentItem());
        view->setSize({360.0, 480.0});
        view->setFocus(true);
        window.resize(360, 480);
        window.show();
        window.requestActivate();
    }

    bool isReady() { return view && QTest::qWaitForWindowActive(&window); }

    grid::ColorSwatchPickerView *grid() const { return view->findChild<grid::ColorSwatchPickerView *>(); }
    /** Null while another tab is shown. */
    spectrum::Spectrum *spectrum() const { return itemBelow<spectrum::Spectrum>(view.get()); }

    /** Whatever is made later is a child in the scene only. */
    template<class Item>
    static Item *itemBelow(QQuickItem *root)
    {
        const QList<QQuickItem *> children = root->childItems();
        for (QQuickItem *child : children) {
            auto *item = qobject_cast<Item *>(child);
            if (item || (item = itemBelow<Item>(child)))
                return item;
        }
        return nullptr;
    }

    /** The first item below the root that assistive technologies call @p name. */
    QAccessibleInterface *accessible(const QString &name) const { return accessibleBelow(view.get(), name); }

    static QAccessibleInterface *accessibleBelow(const QQuickItem *root, const QString &name)
    {
        const QList<QQuickItem *> children = root->childItems();
        for (QQuickItem *child : children) {
            QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(child);
            if (interface && interface->text(QAccessible::Name) == name)
                return interface;
            if ((interface = accessibleBelow(child, name)))
                return interface;
        }
        return nullptr;
    }

    QQuickItem *item(const QString &name) const
    {
        QAccessibleInterface *interface = accessible(name);
        return interface ? qobject_cast<QQuickItem *>(interface->object()) : nullptr;
    }

    static QRectF inWindow(const QQuickItem *item) { return item->mapRectToScene(item->boundingRect()); }

    service::ColorPickerState state = service::ColorPickerState({});
    int closed = 0;
    QQmlEngine engine;
    shell::ColorPickerViewFactory factory = shell::ColorPickerViewFactory(engine);
    QQuickWindow window;
    std::unique_ptr<QQuickItem> view;
};

} // namespace

class ColorPickerViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { theme::Theme::instance().setLayoutDirection(Qt::LeftToRight); }
    void contentIsLaidOut_data();
    void contentIsLaidOut();
    void everyWayOfClosingCloses_data();
    void everyWayOfClosingCloses();
    void hiddenCloseButtonKeepsItsRoom_data();
    void hiddenCloseButtonKeepsItsRoom();
    void longTitleStaysBetweenTheButtons();
    void titleIsPlainText();
    void mirroredExceptTheGrid();
    void tabStopsAreCloseButtonTabPickerAndContent();
    void everyWayOfSelectingATabSelectsIt_data();
    void everyWayOfSelectingATabSelectsIt();
    void tabOfTheStateIsShown();
    void arrowsFollowTheDirection_data();
    void arrowsFollowTheDirection();
    void selectingAnotherTabEndsADrag();
};

void ColorPickerViewTest::contentIsLaidOut_data()
{
    QTest::addColumn<bool>("landscape");
    QTest::addColumn<QRectF>("gridArea");
    QTest::addColumn<double>("bottomPadding");
    QTest::newRow("portrait") << false << QRectF(16.0, 107.0, 328.0, 328.0 / 1.2) << 16.0;
    QTest::newRow("landscape") << true << QRectF(20.0, 103.0, 320.0, 320.0 / 1.2) << 20.0;
}

void ColorPickerViewTest::contentIsLaidOut()
{
    QFETCH(bool, landscape);
    QFETCH(QRectF, gridArea);
    QFETCH(double, bottomPadding);
    PickerWindow picker;
    picker.state.useLandscapeLayout.set(landscape);
    // Known at once: the host makes room for the picker before its first frame.
    QVERIFY(picker.view);
    QCOMPARE(PickerWindow::inWindow(picker.grid()), gridArea);
    QCOMPARE(picker.view->implicitWidth(), 360.0);
    QCOMPARE(picker.view->implicitHeight(), gridArea.bottom() + bottomPadding);
    QVERIFY(picker.isReady());
    QCOMPARE(PickerWindow::inWindow(picker.grid()), gridArea);
}

void ColorPickerViewTest::everyWayOfClosingCloses_data()
{
    QTest::addColumn<QString>("way");
    for (const char *way : {"click", "click beside the face", "touch", "space", "return", "escape",
                            "escape in the grid", "assistive technology"})
        QTest::newRow(way) << QString::fromLatin1(way);
}

void ColorPickerViewTest::everyWayOfClosingCloses()
{
    QFETCH(QString, way);
    PickerWindow picker;
    QVERIFY(picker.isReady());
    QQuickItem *button = picker.item(QStringLiteral("Close"));
    QVERIFY(button);
    const QPoint center = PickerWindow::inWindow(button).center().toPoint();
    if (way == u"click") {
        QTest::mouseClick(&picker.window, Qt::LeftButton, {}, center);
    } else if (way == u"click beside the face") {
        QTest::mouseClick(&picker.window, Qt::LeftButton, {}, center + QPoint(-20, 20));
    } else if (way == u"touch") {
        std::unique_ptr<QPointingDevice> touch(QTest::createTouchDevice());
        QTest::touchEvent(&picker.window, touch.get()).press(0, center);
        QTest::touchEvent(&picker.window, touch.get()).release(0, center);
    } else if (way == u"assistive technology") {
        picker.accessible(QStringLiteral("Close"))
            ->actionInterface()
            ->doAction(QAccessibleActionInterface::pressAction());
    } else {
        (way == u"escape in the grid" ? picker.grid() : button)->forceActiveFocus();
        QTest::keyClick(&picker.window, way == u"space"    ? Qt::Key_Space
                                        : way == u"return" ? Qt::Key_Return
                                                           : Qt::Key_Escape);
    }
    QCOMPARE(picker.closed, 1);
}

void ColorPickerViewTest::hiddenCloseButtonKeepsItsRoom_data()
{
    QTest::addColumn<bool>("popover");
    QTest::addColumn<bool>("embedded");
    QTest::newRow("popover") << true << false;
    QTest::newRow("embedded") << false << true;
}

void ColorPickerViewTest::hiddenCloseButtonKeepsItsRoom()
{
    QFETCH(bool, popover);
    QFETCH(bool, embedded);
    PickerWindow picker;
    QVERIFY(picker.isReady());
    QQuickItem *button = picker.item(QStringLiteral("Close"));
    const QRectF title = PickerWindow::inWindow(picker.item(QStringLiteral("Colors")));
    picker.state.isPopover.set(popover);
    picker.state.isEmbedded.set(embedded);
    QCOMPARE(button->opacity(), 0.0);
    QTest::mouseClick(&picker.window, Qt::LeftButton, {}, PickerWindow::inWindow(button).center().toPoint());
    QCOMPARE(picker.closed, 0);
    QVERIFY(!button->hasActiveFocus());
    QCOMPARE(PickerWindow::inWindow(picker.item(QStringLiteral("Colors"))), title);
}

void ColorPickerViewTest::longTitleStaysBetweenTheButtons()
{
    const QString title = QStringLiteral("A title that is a good deal longer than the navigation bar is wide");
    PickerWindow picker;
    picker.state.title.set(title.toStdString());
    theme::Theme::instance().setTextSizeCategory(theme::TextSizeCategory::AccessibilityExtraExtraExtraLarge);
    QVERIFY(picker.isReady());
    const QQuickItem *text = picker.item(title);
    QVERIFY(text->property("truncated").toBool());
    QCOMPARE(text->property("lineCount").toInt(), 1);
    QVERIFY(PickerWindow::inWindow(text).right() + 10.0 <=
            PickerWindow::inWindow(picker.item(QStringLiteral("Close"))).left());
    QVERIFY(text->height() <= 55.0);
    theme::Theme::instance().setTextSizeCategory(theme::TextSizeCategory::Large);
}

void ColorPickerViewTest::titleIsPlainText()
{
    const QString title = QStringLiteral("<b>Ink</b> & <img src='http://127.0.0.1/x'>");
    PickerWindow picker;
    picker.state.title.set(title.toStdString());
    QVERIFY(picker.isReady());
    QQuickItem *text = picker.item(title);
    QVERIFY(text);
    const double plain = text->implicitWidth();
    picker.state.title.set("Ink");
    QVERIFY(text->implicitWidth() < plain);
}

void ColorPickerViewTest::mirroredExceptTheGrid()
{
    theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
    PickerWindow picker;
    QVERIFY(picker.isReady());
    QCOMPARE(PickerWindow::inWindow(picker.item(QStringLiteral("Close"))).left(), 16.0);
    const QPoint topLeft = PickerWindow::inWindow(picker.grid()).topLeft().toPoint() + QPoint(4, 40);
    QTest::mouseClick(&picker.window, Qt::LeftButton, {}, topLeft);
    QCOMPARE(picker.grid()->markedCell(), std::optional(grid::CellPosition{1, 0}));
}

void ColorPickerViewTest::tabStopsAreCloseButtonTabPickerAndContent()
{
    PickerWindow picker;
    QVERIFY(picker.isReady());
    QQuickItem *button = picker.item(QStringLiteral("Close"));
    QTest::keyClick(&picker.window, Qt::Key_Tab);
    QVERIFY(button->hasActiveFocus());
    QTest::keyClick(&picker.window, Qt::Key_Tab);
    QVERIFY(picker.item(QStringLiteral("Color Picker Type"))->hasActiveFocus());
    QTest::keyClick(&picker.window, Qt::Key_Tab);
    QVERIFY(picker.grid()->hasActiveFocus());
    QTest::keyClick(&picker.window, Qt::Key_Tab);
    QVERIFY(button->hasActiveFocus());
    picker.state.selectedTab.set(Tab::spectrum);
    QTest::keyClick(&picker.window, Qt::Key_Tab);
    QTest::keyClick(&picker.window, Qt::Key_Tab);
    QVERIFY(picker.spectrum()->hasActiveFocus());
    QVERIFY(picker.spectrum()->focusVisible());
}

void ColorPickerViewTest::everyWayOfSelectingATabSelectsIt_data()
{
    QTest::addColumn<QString>("way");
    for (const char *way : {"click", "touch", "arrow", "assistive technology"})
        QTest::newRow(way) << QString::fromLatin1(way);
}

void ColorPickerViewTest::everyWayOfSelectingATabSelectsIt()
{
    QFETCH(QString, way);
    PickerWindow picker;
    QVERIFY(picker.isReady());
    QVERIFY(!picker.spectrum());
    const QRectF area = PickerWindow::inWindow(picker.grid());
    const QPoint center = PickerWindow::inWindow(picker.item(QStringLiteral("Spectrum"))).center().toPoint();
    if (way == u"click") {
        QTest::mouseClick(&picker.window, Qt::LeftButton, {}, center);
    } else if (way == u"touch") {
        std::unique_ptr<QPointingDevice> touch(QTest::createTouchDevice());
        QTest::touchEvent(&picker.window, touch.get()).press(0, center);
        QTest::touchEvent(&picker.window, touch.get()).release(0, center);
    } else if (way == u"arrow") {
        picker.item(QStringLiteral("Color Picker Type"))->forceActiveFocus();
        QTest::keyClick(&picker.window, Qt::Key_Right);
    } else {
        picker.accessible(QStringLiteral("Spectrum"))
            ->actionInterface()
            ->doAction(QAccessibleActionInterface::pressAction());
    }
    QCOMPARE(picker.state.selectedTab(), Tab::spectrum);
    QVERIFY(picker.spectrum());
    QVERIFY(!picker.spectrum()->hasActiveFocus());
    QCOMPARE(PickerWindow::inWindow(picker.spectrum()), area);
    QVERIFY(!picker.grid()->isVisible());
    QVERIFY(picker.accessible(QStringLiteral("Color Spectrum")));
}

void ColorPickerViewTest::tabOfTheStateIsShown()
{
    PickerWindow picker;
    QVERIFY(picker.isReady());
    const auto isChecked = [&](const QString &name) { return picker.accessible(name)->state().checked; };
    QVERIFY(!isChecked(QStringLiteral("Spectrum")));
    picker.state.selectedTab.set(Tab::spectrum);
    QVERIFY(isChecked(QStringLiteral("Spectrum")));
    QCOMPARE(picker.accessible(QStringLiteral("Spectrum"))->role(), QAccessible::PageTab);
    picker.state.selectedTab.set(Tab::grid);
    QVERIFY(!isChecked(QStringLiteral("Spectrum")));
    QVERIFY(picker.grid()->isVisible());
}

void ColorPickerViewTest::arrowsFollowTheDirection_data()
{
    QTest::addColumn<bool>("mirrored");
    QTest::newRow("left to right") << false;
    QTest::newRow("right to left") << true;
}

void ColorPickerViewTest::arrowsFollowTheDirection()
{
    QFETCH(bool, mirrored);
    theme::Theme::instance().setLayoutDirection(mirrored ? Qt::RightToLeft : Qt::LeftToRight);
    PickerWindow picker;
    QVERIFY(picker.isReady());
    const QRectF second = PickerWindow::inWindow(picker.item(QStringLiteral("Spectrum")));
    QCOMPARE(second.left() < 180.0, mirrored);
    picker.item(QStringLiteral("Color Picker Type"))->forceActiveFocus();
    const Qt::Key forward = mirrored ? Qt::Key_Left : Qt::Key_Right;
    const Qt::Key back = mirrored ? Qt::Key_Right : Qt::Key_Left;
    QTest::keyClick(&picker.window, back);
    QCOMPARE(picker.state.selectedTab(), Tab::grid);
    QTest::keyClick(&picker.window, forward);
    QCOMPARE(picker.state.selectedTab(), Tab::spectrum);
    QTest::keyClick(&picker.window, back);
    QCOMPARE(picker.state.selectedTab(), Tab::grid);
}

void ColorPickerViewTest::selectingAnotherTabEndsADrag()
{
    PickerWindow picker;
    QVERIFY(picker.isReady());
    picker.state.selectedTab.set(Tab::spectrum);
    QTest::mousePress(&picker.window, Qt::LeftButton, {}, PickerWindow::inWindow(picker.spectrum()).center().toPoint());
    QVERIFY(picker.state.isVolatile());
    picker.state.selectedTab.set(Tab::grid);
    QVERIFY(!picker.state.isVolatile());
    QTest::mouseRelease(&picker.window, Qt::LeftButton, {}, QPoint(180, 200));
    QVERIFY(!picker.state.isVolatile());
}

QTEST_MAIN(ColorPickerViewTest)
#include "tst_colorpickerview.moc"
