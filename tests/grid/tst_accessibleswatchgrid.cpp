#include "gridwindow.h"

#include "../shared/accessibility.h"

using namespace favrin;

class AccessibleSwatchGridTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { startAssistiveTechnology<QAccessible::ListItem>(); }

    void cellsAreNamedByTheirColor()
    {
        GridWindow grid;
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(grid.view);
        QVERIFY(list);
        QCOMPARE(list->text(QAccessible::Name), QStringLiteral("Grid"));
        QCOMPARE(list->childCount(), 120);
        // The very first name of a process arrives later.
        QTRY_COMPARE(list->child(0)->text(QAccessible::Name), nameOf(swatch(0, 0)));
        for (int index = 0; index < 120; ++index) {
            QAccessibleInterface *cell = list->child(index);
            QCOMPARE(cell->text(QAccessible::Name), nameOf(swatch(index / 12, index % 12)));
            QCOMPARE(list->indexOfChild(cell), index);
            QCOMPARE(cell->parent(), list);
        }
        QCOMPARE(list->child(120), nullptr);
        QCOMPARE(list->child(-1), nullptr);
    }

    void cellsAreFoundWhereTheyAre()
    {
        GridWindow grid;
        QAccessibleInterface *list = QAccessible::queryAccessibleInterface(grid.view);
        const QPoint middle = grid.window.mapToGlobal(GridWindow::middle(7, 8));
        QAccessibleInterface *cell = list->childAt(middle.x(), middle.y());
        QCOMPARE(list->indexOfChild(cell), 7 * 12 + 8);
        QVERIFY(cell->rect().contains(middle));
        QCOMPARE(cell->rect().size(), QSize(30, 30));
        const QPoint outside = grid.window.mapToGlobal(QPoint(5, 5));
        QCOMPARE(list->childAt(outside.x(), outside.y()), nullptr);
    }

    void changesAreAnnounced()
    {
        GridWindow grid;
        QVERIFY(QAccessible::queryAccessibleInterface(grid.view));
        grid.view->forceActiveFocus();
        grid.state.selectedColor.set(swatch(4, 6));
        announcements().clear();
        QTest::keyClick(&grid.window, Qt::Key_Right);
        QCOMPARE(announcements(), (Announcements{{QAccessible::Selection, nameOf(swatch(4, 6))},
                                                 {QAccessible::Selection, nameOf(swatch(4, 7))},
                                                 {QAccessible::Focus, nameOf(swatch(4, 7))}}));
        QCOMPARE(QAccessible::queryAccessibleInterface(grid.view)->focusChild()->text(QAccessible::Name),
                 nameOf(swatch(4, 7)));
    }

    void cellsOutliveNothing()
    {
        GridWindow grid;
        QAccessibleInterface *cell = QAccessible::queryAccessibleInterface(grid.view)->child(5);
        const QAccessible::Id id = QAccessible::uniqueId(cell);
        delete grid.view;
        QCOMPARE(QAccessible::accessibleInterface(id), nullptr);
    }
};

QTEST_MAIN(AccessibleSwatchGridTest)
#include "tst_accessibleswatchgrid.moc"
