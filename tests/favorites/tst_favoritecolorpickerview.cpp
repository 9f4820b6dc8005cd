#include "favoriteswindow.h"

#include "favorites/favoritecolorwellcell.h"

#include <QSignalSpy>

using namespace favrin;
using favorites::ColorItem;
using Kind = ColorItem::Kind;

namespace {

void swipe(QQuickWindow &window, QPointingDevice *touch, QPoint from, int distance)
{
    QTest::touchEvent(&window, touch).press(0, from);
    for (int step = 1; step <= 10; ++step) {
        QTest::touchEvent(&window, touch).move(0, from + QPoint(distance * step / 10, 0));
        QTest::qWait(8); // A drag has a speed.
    }
    QTest::touchEvent(&window, touch).release(0, from + QPoint(distance, 0));
}

} // namespace

/** The strip in a window: what taps, drags and keys do to the state, and what the state does to the strip. */
class FavoriteColorPickerViewTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        theme::Theme::instance().setLayoutDirection(Qt::LeftToRight);
        theme::Theme::instance().setReduceMotion(false);
    }

    void pagesAreKnownBeforeAnythingIsShown()
    {
        FavoritesWindow one(12);
        QCOMPARE(one.model->numberOfPages(), 1);
        QVERIFY(!one.pageControl->isVisible());
        one.state.selectedColor.set(gray(1));
        QCOMPARE(one.model->numberOfPages(), 2);
        QVERIFY(one.show());
        QVERIFY(one.pageControl->isVisible());
        // Shown, the count follows in a later turn.
        one.state.selectedColor.set(std::nullopt);
        QCOMPARE(one.model->numberOfPages(), 2);
        QTRY_COMPARE(one.model->numberOfPages(), 1);
        QVERIFY(!one.pageControl->isVisible());
    }

    void tapPicksTheColorOfTheItem()
    {
        FavoritesWindow strip(3);
        strip.state.suggestedColors.set(std::vector{gray(10, 0.5), gray(20)});
        QVERIFY(strip.show());
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, strip.middle(0));
        QCOMPARE(strip.state.selectedColor(), std::optional(gray(10, 0.5)));
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, strip.middle(5)); // A filler.
        QCOMPARE(strip.state.selectedColor(), std::optional(gray(10, 0.5)));
        QTest::touchEvent(&strip.window, m_touch.get()).press(0, strip.middle(1));
        QTest::touchEvent(&strip.window, m_touch.get()).release(0, strip.middle(1));
        QCOMPARE(strip.state.selectedColor(), std::optional(gray(20)));
        QTRY_VERIFY(strip.cells().cellAt(1)->isSelected());
        QVERIFY(!strip.cells().cellAt(0)->isSelected());
        // Between the two there is nothing to pick.
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, (strip.middle(0) + strip.middle(1)) / 2);
        QCOMPARE(strip.state.selectedColor(), std::optional(gray(20)));
        // Tapped again, it stays selected.
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, strip.middle(1));
        QTRY_VERIFY(strip.cells().cellAt(1)->isSelected());
    }

    void tapOnTheAddButtonAppends()
    {
        FavoritesWindow strip(2);
        const SomeColor color = strip.state.favoriteColors()[0];
        strip.state.selectedColor.set(color);
        QVERIFY(strip.show());
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, strip.middle(2));
        QCOMPARE(strip.state.favoriteColors().size(), std::size_t(3));
        QCOMPARE(strip.state.favoriteColors()[2], color);
        QTRY_COMPARE(strip.count(), 4);
        QCOMPARE(strip.items()[2], ColorItem::favoriteColor(color, 1));
        QCOMPARE(strip.items()[3].kind, Kind::addButton);
        QCOMPARE(strip.cells().selectedPlaces(), (std::vector{0, 2}));
    }

    void tapOnTheRemoveButtonClears()
    {
        FavoritesWindow strip(2);
        strip.state.allowsNoColor.set(true);
        strip.state.selectedColor.set(SomeColor(1.0, 0.5, 0.0, 0.5, SomeColor::ColorSpace::displayP3));
        QVERIFY(strip.show());
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, strip.middle(0));
        QVERIFY(!strip.state.hasSelectedColor());
        QCOMPARE(strip.state.fallbackColor(), SomeColor(0.0, 0.0, 0.0, 1.0, SomeColor::ColorSpace::displayP3));
        QTRY_COMPARE(strip.count(), 3);
        QCOMPARE(strip.cells().selectedPlaces(), std::vector{0});
    }

    void everyWayOfDeletingDeletes_data()
    {
        QTest::addColumn<QString>("way");
        for (const char *way : {"long press by finger", "long press by mouse", "context key", "shift and F10",
                                "menu by keyboard", "delete key"})
            QTest::newRow(way) << QString::fromLatin1(way);
    }

    void everyWayOfDeletingDeletes()
    {
        QFETCH(QString, way);
        FavoritesWindow strip(4);
        QVERIFY(strip.show());
        auto expected = strip.state.favoriteColors();
        expected.erase(expected.begin() + 1);
        const QPoint middle = strip.middle(1);
        QSignalSpy callouts(strip.strip, &favorites::FavoriteColorPickerView::deleteCalloutRequested);
        if (way.contains(u"key") || way == u"shift and F10") {
            strip.strip->forceActiveFocus(Qt::TabFocusReason);
            QTest::keyClick(&strip.window, Qt::Key_Right);
        }
        if (way == u"delete key") {
            QTest::keyClick(&strip.window, Qt::Key_Delete);
        } else {
            if (way == u"long press by finger")
                QTest::touchEvent(&strip.window, m_touch.get()).press(0, middle);
            else if (way == u"long press by mouse")
                QTest::mousePress(&strip.window, Qt::LeftButton, {}, middle);
            else if (way == u"shift and F10")
                QTest::keyClick(&strip.window, Qt::Key_F10, Qt::ShiftModifier);
            else
                QTest::keyClick(&strip.window, Qt::Key_Menu);
            QTRY_COMPARE(callouts.size(), 1);
            QCOMPARE(callouts[0][0].toRectF(), strip.cells().frame(1));
            if (way == u"long press by finger")
                QTest::touchEvent(&strip.window, m_touch.get()).release(0, middle);
            else if (way == u"long press by mouse")
                QTest::mouseRelease(&strip.window, Qt::LeftButton, {}, middle);
            // Nothing was picked, and nothing is deleted before the command is chosen.
            QVERIFY(!strip.state.hasSelectedColor());
            QCOMPARE(strip.state.favoriteColors().size(), std::size_t(4));
            if (way == u"menu by keyboard")
                QTest::keyClick(&strip.window, Qt::Key_Return);
            else
                QTest::mouseClick(&strip.window, Qt::LeftButton, {}, middle - QPoint(0, 15 + 6 + 8 + 20));
        }
        QTRY_COMPARE(strip.state.favoriteColors(), expected);
        QTRY_VERIFY(strip.isSettled());
        QCOMPARE(strip.count(), 3);
        QCOMPARE(strip.cells().cells().size(), std::size_t(3));
        QVERIFY(strip.strip->hasActiveFocus());
    }

    void whatIsNoFavoriteIsNotDeleted()
    {
        FavoritesWindow strip(2);
        strip.state.allowsNoColor.set(true);
        strip.state.selectedColor.set(gray(5));
        strip.state.suggestedColors.set(std::vector{gray(10)});
        QVERIFY(strip.show());
        strip.strip->forceActiveFocus(Qt::TabFocusReason);
        QSignalSpy callouts(strip.strip, &favorites::FavoriteColorPickerView::deleteCalloutRequested);
        // Remove button, suggested color, filler; then the favorites, which the strip has on its second page, and add.
        for (int place : {0, 1, 4})
            strip.strip->showDeleteCallout(strip.cells().frame(place).center());
        QTest::keyClick(&strip.window, Qt::Key_Delete);
        QTest::keyClick(&strip.window, Qt::Key_End);
        QTest::keyClick(&strip.window, Qt::Key_Delete);
        QTest::keyClick(&strip.window, Qt::Key_Menu);
        QCOMPARE(callouts.size(), 0);
        QCOMPARE(strip.state.favoriteColors().size(), std::size_t(2));
    }

    void deletingOneOfEqualsLeavesTheOther()
    {
        FavoritesWindow strip(0);
        strip.state.favoriteColors.set({gray(1), gray(1), gray(2)});
        QVERIFY(strip.show());
        const auto *second = strip.cells().cellAt(1);
        strip.strip->coordinator().deleteItem(ColorItem::favoriteColor(gray(1), 0));
        QTRY_COMPARE(strip.count(), 2);
        QCOMPARE(strip.items()[0], ColorItem::favoriteColor(gray(1), 1));
        QCOMPARE(strip.cells().cellAt(0), second);
        // The number of a deleted one is not given again, to no other either.
        strip.state.favoriteColors.set({gray(1), gray(1), gray(1)});
        QTRY_COMPARE(strip.count(), 3);
        QCOMPARE(strip.items()[1], ColorItem::favoriteColor(gray(1), 2));
    }

    void onlyAddAndDeleteAreAnimated()
    {
        FavoritesWindow strip(3);
        strip.state.selectedColor.set(gray(1));
        QVERIFY(strip.show());
        QSignalSpy transitions(&strip.cells(), &favorites::FavoritesCollectionView::transitionStarted);
        strip.state.favoriteColors.set(differentColors(5));
        strip.state.allowsNoColor.set(true);
        QTRY_COMPARE(strip.count(), 7);
        QCOMPARE(transitions.size(), 0);
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, strip.middle(6));
        QTRY_COMPARE(transitions.size(), 1);
        QTRY_VERIFY(strip.isSettled());
        for (const auto *cell : strip.cells().cells())
            QCOMPARE(cell->opacity(), 1.0);
        strip.state.favoriteColors.set(differentColors(2));
        QTRY_COMPARE(strip.count(), 4);
        QCOMPARE(transitions.size(), 1);
    }

    void onlyVisibleCellsExist()
    {
        FavoritesWindow strip(10'000);
        strip.state.selectedColor.set(gray(1));
        QVERIFY(strip.show());
        QCOMPARE(strip.cells().cells().size(), std::size_t(12));
        strip.model->pageControlPendingPage.set(500);
        QTRY_COMPARE(strip.page(), 500);
        QCOMPARE(strip.cells().cells().size(), std::size_t(12));
        QCOMPARE(strip.cells().childItems().size(), 12 + 1); // And what holds the focus ring.
        strip.strip->coordinator().deleteItem(strip.items()[6000]);
        QTRY_COMPARE(strip.count(), 10'000);
        QTRY_VERIFY(strip.isSettled());
        QCOMPARE(strip.cells().childItems().size(), 12 + 1);
    }

    void swipeTurnsOnePage_data()
    {
        QTest::addColumn<bool>("mirrored");
        QTest::addColumn<int>("distance");
        QTest::addColumn<int>("page");
        QTest::newRow("on") << false << -120 << 2;
        QTest::newRow("back") << false << 120 << 0;
        QTest::newRow("far") << false << -280 << 2;
        QTest::newRow("mirrored on") << true << 120 << 2;
        QTest::newRow("mirrored back") << true << -120 << 0;
    }

    void swipeTurnsOnePage()
    {
        QFETCH(bool, mirrored);
        QFETCH(int, distance);
        QFETCH(int, page);
        if (mirrored)
            theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        FavoritesWindow strip(40);
        QVERIFY(strip.show());
        strip.model->pageControlPendingPage.set(1);
        QTRY_COMPARE(strip.page(), 1);
        swipe(strip.window, m_touch.get(), QPoint(distance < 0 ? 280 : 20, 139), distance);
        QTRY_COMPARE(strip.page(), page);
        QTRY_COMPARE(strip.cells().mapRectToScene(strip.cells().frame(12 * page + (mirrored ? 5 : 0))).left(), 15.0);
        QVERIFY(!strip.state.hasSelectedColor());
    }

    void indicatorTurnsPages()
    {
        FavoritesWindow strip(40);
        QVERIFY(strip.show());
        // Four dots, 16 apart, around the middle of the row.
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, QPoint(150 + 8, 193));
        QCOMPARE(strip.pageControl->currentPage(), 2);
        QTRY_COMPARE(strip.page(), 2);
        QTRY_VERIFY(!strip.model->pageControlPendingPage());
        QCOMPARE(strip.pageControl->currentPage(), 2);
        QCOMPARE(strip.middle(24), QPoint(15 + 15, 115));
        QTest::mousePress(&strip.window, Qt::LeftButton, {}, QPoint(150, 193));
        for (int x = 150; x > 100; x -= 5)
            QTest::mouseMove(&strip.window, QPoint(x, 193));
        QTest::mouseRelease(&strip.window, Qt::LeftButton, {}, QPoint(105, 193));
        QTRY_COMPARE(strip.page(), 0);
        QCOMPARE(strip.pageControl->value(), 1);
    }

    void pendingPageIsSnappedTo()
    {
        FavoritesWindow strip(40);
        QVERIFY(strip.show());
        strip.model->pageControlPendingPage.set(3);
        QTRY_VERIFY(!strip.model->pageControlPendingPage());
        QTRY_COMPARE(strip.page(), 3);
        QCOMPARE(strip.middle(36), QPoint(15 + 15, 115));
        strip.model->pageControlPendingPage.set(99);
        QTRY_VERIFY(!strip.model->pageControlPendingPage());
        QCOMPARE(strip.middle(36), QPoint(15 + 15, 115));
    }

    void keysMoveAndPick()
    {
        FavoritesWindow strip(9);
        QVERIFY(strip.show());
        strip.strip->forceActiveFocus(Qt::TabFocusReason);
        QVERIFY(strip.strip->focusVisible());
        QCOMPARE(strip.strip->focusFrame(), strip.cells().frame(0));
        QTest::keyClick(&strip.window, Qt::Key_Right);
        QTest::keyClick(&strip.window, Qt::Key_Down);
        QVERIFY(!strip.state.hasSelectedColor());
        QTest::keyClick(&strip.window, Qt::Key_Space);
        QCOMPARE(strip.state.selectedColor(), std::optional(strip.state.favoriteColors()[7]));
        QTest::keyClick(&strip.window, Qt::Key_Home);
        QTest::keyClick(&strip.window, Qt::Key_Return);
        QCOMPARE(strip.state.selectedColor(), std::optional(strip.state.favoriteColors()[0]));
        QTRY_COMPARE(strip.count(), 10);
        QTest::keyClick(&strip.window, Qt::Key_End);
        QTest::keyClick(&strip.window, Qt::Key_Enter);
        QCOMPARE(strip.state.favoriteColors().size(), std::size_t(10));
        // The add button has the keyboard still.
        QTRY_COMPARE(strip.strip->focusFrame(), strip.cells().frame(10));
    }

    void keysTurnPages()
    {
        FavoritesWindow strip(40);
        QVERIFY(strip.show());
        strip.strip->forceActiveFocus(Qt::TabFocusReason);
        QTest::keyClick(&strip.window, Qt::Key_Right);
        QTest::keyClick(&strip.window, Qt::Key_PageDown);
        QTest::keyClick(&strip.window, Qt::Key_PageDown);
        QCOMPARE(strip.strip->focusedPlace(), std::optional(25));
        QTRY_COMPARE(strip.page(), 2);
        QTRY_COMPARE(strip.middle(24), QPoint(15 + 15, 115));
        QTest::keyClick(&strip.window, Qt::Key_Left);
        QTest::keyClick(&strip.window, Qt::Key_Left);
        QCOMPARE(strip.strip->focusedPlace(), std::optional(23));
        QTRY_COMPARE(strip.page(), 1);
        // Swiped on without the keyboard, the keys go on from where the user looks.
        strip.model->pageControlPendingPage.set(3);
        QTRY_COMPARE(strip.page(), 3);
        QTest::keyClick(&strip.window, Qt::Key_Right);
        QCOMPARE(strip.strip->focusedPlace(), std::optional(37));
    }

    void keysAreMirrored()
    {
        theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        FavoritesWindow strip(40);
        QVERIFY(strip.show());
        QVERIFY(strip.middle(0).x() > strip.middle(1).x());
        QCOMPARE(strip.middle(0), QPoint(300 - 30, 115));
        strip.strip->forceActiveFocus(Qt::TabFocusReason);
        QTest::keyClick(&strip.window, Qt::Key_Left);
        QTest::keyClick(&strip.window, Qt::Key_Space);
        QCOMPARE(strip.state.selectedColor(), std::optional(strip.state.favoriteColors()[1]));
        QTest::mouseClick(&strip.window, Qt::LeftButton, {}, QPoint(300 - 30 - 2 * 48, 115));
        QCOMPARE(strip.state.selectedColor(), std::optional(strip.state.favoriteColors()[2]));
    }

    void pageStaysInViewWhenTheLayoutChanges()
    {
        FavoritesWindow strip(100);
        QVERIFY(strip.show());
        const auto items = strip.items();
        strip.model->pageControlPendingPage.set(4);
        QTRY_COMPARE(strip.page(), 4);
        QSignalSpy changes(&strip.strip->coordinator().dataSource(), &QAbstractItemModel::rowsInserted);
        strip.state.useLandscapeLayout.set(true);
        QTRY_COMPARE(strip.cells().frame(0).width(), 28.0);
        QCOMPARE(strip.cells().frame(1).left(), 44.0);
        QCOMPARE(changes.size(), 0);
        QCOMPARE(strip.page(), 4);
        strip.root->setWidth(150);
        QTRY_COMPARE(strip.strip->swatchesPerPage(), 6);
        QTRY_COMPARE(strip.page(), 8);
        QCOMPARE(strip.items(), items);
    }

    void lastPageGoesWithItsLastItem()
    {
        FavoritesWindow strip(25);
        QVERIFY(strip.show());
        strip.model->pageControlPendingPage.set(2);
        QTRY_COMPARE(strip.page(), 2);
        strip.strip->coordinator().deleteItem(strip.items().back());
        QTRY_COMPARE(strip.model->numberOfPages(), 2);
        QTRY_COMPARE(strip.page(), 1);
        QCOMPARE(strip.middle(12), QPoint(15 + 15, 115));
    }

    void mirroredStripKeepsItsPageWhenAPageIsAdded()
    {
        theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        FavoritesWindow strip(24);
        QVERIFY(strip.show());
        QCOMPARE(strip.middle(0), QPoint(300 - 30, 115));
        strip.model->pageControlPendingPage.set(1);
        QTRY_COMPARE(strip.page(), 1);
        QSignalSpy pages(strip.model, &favorites::FavoriteColorPickerModel::currentPageChanged);
        strip.state.selectedColor.set(gray(3));
        QTRY_COMPARE(strip.model->numberOfPages(), 3);
        QCOMPARE(strip.middle(12), QPoint(300 - 30, 115));
        QCOMPARE(pages.size(), 0);
    }

private:
    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
};

QTEST_MAIN(FavoriteColorPickerViewTest)
#include "tst_favoritecolorpickerview.moc"
