#include "pickerwindow.h"

#include <algorithm>

using namespace favrin;
using service::Tab;

class ColorPickerViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { theme::Theme::instance().setLayoutDirection(Qt::LeftToRight); }

    void viewsAreLoadedBesideTheMainThread()
    {
        QQmlEngine engine;
        shell::ColorPickerViewFactory factory(engine, shell::ColorPickerViewFactory::Loading::Beside);
        int loaded = 0;
        factory.whenLoaded([&loaded] { ++loaded; });
        QCOMPARE(loaded, 0);
        QTRY_COMPARE(loaded, 1);
        service::ColorPickerState state({});
        QVERIFY(factory.create(state));
        factory.whenLoaded([&loaded] { ++loaded; });
        QCOMPARE(loaded, 2);
    }

    void everyWayOfClosingCloses_data()
    {
        QTest::addColumn<QString>("way");
        for (const char *way : {"click", "click beside the face", "touch", "space", "return", "escape",
                                "escape in the grid", "assistive technology"})
            QTest::newRow(way) << QString::fromLatin1(way);
    }

    void everyWayOfClosingCloses()
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

    void longTitleStaysBetweenTheButtons()
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

    void titleIsPlainText()
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

    void mirroredExceptTheGrid()
    {
        theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        PickerWindow picker;
        QVERIFY(picker.isReady());
        QCOMPARE(PickerWindow::inWindow(picker.item(QStringLiteral("Close"))).left(), 16.0);
        const QPoint topLeft = PickerWindow::inWindow(picker.grid()).topLeft().toPoint() + QPoint(4, 40);
        QTest::mouseClick(&picker.window, Qt::LeftButton, {}, topLeft);
        QCOMPARE(picker.grid()->markedCell(), std::optional(grid::CellPosition{1, 0}));
    }

    void tabStopsFollowTheOrderOfReading_data()
    {
        QTest::addColumn<Tab>("tab");
        QTest::addColumn<QStringList>("content");
        const auto hex = QStringLiteral("sRGB Hex Color #");
        QTest::newRow("grid") << Tab::grid << QStringList{QStringLiteral("Grid")};
        QTest::newRow("spectrum") << Tab::spectrum << QStringList{QStringLiteral("Color Spectrum")};
        QTest::newRow("sliders") << Tab::sliders
                                 << QStringList{QStringLiteral("Red"),
                                                QStringLiteral("Red"),
                                                QStringLiteral("Green"),
                                                QStringLiteral("Green"),
                                                QStringLiteral("Blue"),
                                                QStringLiteral("Blue"),
                                                hex,
                                                hex};
    }

    void tabStopsFollowTheOrderOfReading()
    {
        QFETCH(Tab, tab);
        QFETCH(QStringList, content);
        PickerWindow picker;
        picker.state.selectedTab.set(tab);
        picker.state.selectedColor.set(model::SomeColor(1.0, 0.0, 0.0, 1.0, model::SomeColor::ColorSpace::sRGB));
        QVERIFY(picker.isReady());
        const QStringList expected = QStringList{QStringLiteral("Eyedropper_Accessibility"), QStringLiteral("Close"),
                                                 QStringLiteral("Color Picker Type")} +
                                     content +
                                     QStringList{QStringLiteral("Opacity"), QStringLiteral("Opacity"),
                                                 QStringLiteral("Selected Color"), QStringLiteral("Favorites")};
        const auto names = [&](Qt::Key key, Qt::KeyboardModifiers modifiers) {
            QStringList stops;
            for (qsizetype stop = 0; stop < expected.size(); ++stop) {
                QTest::keyClick(&picker.window, key, modifiers);
                QAccessibleInterface *stopped = QAccessible::queryAccessibleInterface(picker.window.activeFocusItem());
                stops.append(stopped ? stopped->text(QAccessible::Name) : QStringLiteral("nothing"));
            }
            return stops;
        };
        QCOMPARE(names(Qt::Key_Tab, {}), expected);
        QStringList backward = names(Qt::Key_Backtab, Qt::ShiftModifier);
        std::ranges::reverse(backward);
        backward.append(backward.takeFirst());
        QCOMPARE(backward, expected);
    }

    void everyWayOfSelectingATabSelectsIt_data()
    {
        QTest::addColumn<QString>("way");
        for (const char *way : {"click", "touch", "arrow", "assistive technology"})
            QTest::newRow(way) << QString::fromLatin1(way);
    }

    void everyWayOfSelectingATabSelectsIt()
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

    void tabOfTheStateIsShown()
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

    void arrowsFollowTheDirection_data()
    {
        QTest::addColumn<bool>("mirrored");
        QTest::newRow("left to right") << false;
        QTest::newRow("right to left") << true;
    }

    void arrowsFollowTheDirection()
    {
        QFETCH(bool, mirrored);
        theme::Theme::instance().setLayoutDirection(mirrored ? Qt::RightToLeft : Qt::LeftToRight);
        PickerWindow picker;
        QVERIFY(picker.isReady());
        const QRectF first = PickerWindow::inWindow(picker.item(QStringLiteral("Grid")));
        const QRectF second = PickerWindow::inWindow(picker.item(QStringLiteral("Spectrum")));
        QCOMPARE(second.left() < first.left(), mirrored);
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

    void selectingAnotherTabEndsADrag()
    {
        PickerWindow picker;
        QVERIFY(picker.isReady());
        picker.state.selectedTab.set(Tab::spectrum);
        QTest::mousePress(&picker.window, Qt::LeftButton, {},
                          PickerWindow::inWindow(picker.spectrum()).center().toPoint());
        QVERIFY(picker.state.isVolatile());
        picker.state.selectedTab.set(Tab::grid);
        QVERIFY(!picker.state.isVolatile());
        QTest::mouseRelease(&picker.window, Qt::LeftButton, {}, QPoint(180, 200));
        QVERIFY(!picker.state.isVolatile());
    }
};

QTEST_MAIN(ColorPickerViewTest)
#include "tst_colorpickerview.moc"
