#include "favoriteswindow.h"

#include "../shared/accessibility.h"
#include "favorites/accessiblefavoritecell.h"

using namespace favrin;
using Action = QAccessibleActionInterface;

namespace {

QStringList names(QAccessibleInterface *list)
{
    QStringList names;
    for (int index = 0; index < list->childCount(); ++index)
        names << list->child(index)->text(QAccessible::Name);
    return names;
}

} // namespace

class AccessibleFavoritesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { startAssistiveTechnology<QAccessible::Button>(); }

    void cellsAreNamedAndFillersAreNot()
    {
        FavoritesWindow strip(2);
        const SomeColor suggested(0.0, 0.5, 0.0, 1.0, SomeColor::ColorSpace::sRGB);
        strip.state.allowsNoColor.set(true);
        strip.state.suggestedColors.set(std::vector{suggested});
        strip.state.selectedColor.set(gray(9));
        QVERIFY(strip.show());
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(strip.strip);
        QCOMPARE(list->text(QAccessible::Name), QStringLiteral("Favorites"));
        // One page is on screen.
        QCOMPARE(names(list), (QStringList{QStringLiteral("Remove color"), nameOf(suggested)}));
        strip.model->pageControlPendingPage.set(1);
        QTRY_COMPARE(strip.page(), 1);
        const auto favorites = strip.state.favoriteColors();
        QCOMPARE(names(list), (QStringList{nameOf(favorites[0]), nameOf(favorites[1]),
                                           QStringLiteral("Add selected color to favorites")}));
        for (int index = 0; index < list->childCount(); ++index) {
            QCOMPARE(list->child(index)->role(), QAccessible::Button);
            QCOMPARE(list->child(index)->parent(), list);
            QCOMPARE(list->indexOfChild(list->child(index)), index);
        }
    }

    void selectedCellsSaySo()
    {
        FavoritesWindow strip(0);
        strip.state.favoriteColors.set({gray(1), gray(2), gray(1)});
        strip.state.selectedColor.set(gray(1));
        QVERIFY(strip.show());
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(strip.strip);
        QList<bool> selected;
        for (int index = 0; index < list->childCount(); ++index)
            selected << list->child(index)->state().selected;
        QCOMPARE(selected, (QList<bool>{true, false, true, false}));
        QVERIFY(!list->child(3)->state().selectable);
    }

    void pressPicks()
    {
        FavoritesWindow strip(3);
        QVERIFY(strip.show());
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(strip.strip);
        list->child(2)->actionInterface()->doAction(Action::pressAction());
        QCOMPARE(strip.state.selectedColor(), std::optional(strip.state.favoriteColors()[2]));
    }

    void favoritesCanBeDeletedAndNothingElse()
    {
        FavoritesWindow strip(2);
        strip.state.suggestedColors.set(std::vector{gray(7)});
        QVERIFY(strip.show());
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(strip.strip);
        const QString action = favorites::AccessibleFavoriteCell::deleteAction();
        QCOMPARE(list->child(0)->actionInterface()->actionNames(), QStringList{Action::pressAction()});
        list->child(0)->actionInterface()->doAction(action);
        strip.model->pageControlPendingPage.set(1);
        QTRY_COMPARE(strip.page(), 1);
        QCOMPARE(strip.state.favoriteColors().size(), std::size_t(2));
        const SomeColor second = strip.state.favoriteColors()[1];
        Action *cell = list->child(0)->actionInterface();
        QCOMPARE(cell->actionNames(), (QStringList{Action::pressAction(), action}));
        QCOMPARE(cell->localizedActionName(action), QStringLiteral("Delete"));
        cell->doAction(action);
        QCOMPARE(strip.state.favoriteColors(), std::vector{second});
        QTRY_COMPARE(names(list), QStringList{nameOf(second)});
    }

    void cellsAreFoundWhereTheyAre()
    {
        FavoritesWindow strip(9);
        QVERIFY(strip.show());
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(strip.strip);
        const QPoint middle = strip.window.mapToGlobal(strip.middle(7));
        QCOMPARE(list->indexOfChild(list->childAt(middle.x(), middle.y())), 7);
        QCOMPARE(list->child(7)->rect().size(), QSize(30, 30));
        QCOMPARE(list->childAt(middle.x() + 22, middle.y()), nullptr);
    }

    void focusAndSelectionAreAnnounced()
    {
        FavoritesWindow strip(3);
        QVERIFY(strip.show());
        const auto favorites = strip.state.favoriteColors();
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(strip.strip);
        strip.strip->forceActiveFocus(Qt::TabFocusReason);
        announcements().clear();
        QTest::keyClick(&strip.window, Qt::Key_Right);
        QVERIFY(announcements().contains({QAccessible::Focus, nameOf(favorites[1])}));
        QCOMPARE(list->focusChild(), list->child(1));
        QVERIFY(list->child(1)->state().focused && !list->child(0)->state().focused);
        announcements().clear();
        QTest::keyClick(&strip.window, Qt::Key_Space);
        QTRY_VERIFY(announcements().contains({QAccessible::Selection, nameOf(favorites[1])}));
    }

    void pageControlIsAValue()
    {
        FavoritesWindow strip(40);
        QVERIFY(strip.show());
        QAccessibleInterface *control = QAccessible::queryAccessibleInterface(strip.pageControl);
        QVERIFY(control);
        QAccessibleValueInterface *value = control->valueInterface();
        QVERIFY(value);
        QCOMPARE(value->currentValue().toInt(), 1);
        QCOMPARE(value->maximumValue().toInt(), 4);
        value->setCurrentValue(3);
        QTRY_COMPARE(strip.page(), 2);
        control->actionInterface()->doAction(Action::increaseAction());
        QTRY_COMPARE(strip.page(), 3);
        QCOMPARE(value->currentValue().toInt(), 4);
    }
};

QTEST_MAIN(AccessibleFavoritesTest)
#include "tst_accessiblefavorites.moc"
