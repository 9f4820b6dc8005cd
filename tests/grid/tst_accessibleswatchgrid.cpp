#include "gridwindow.h"

#include "model/colordescription.h"

#include <QAccessible>
#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

using namespace favrin;

namespace {

QList<std::pair<QAccessible::Event, QString>> &announcements()
{
    static QList<std::pair<QAccessible::Event, QString>> list;
    return list;
}

void record(QAccessibleEvent *event)
{
    if (const auto *interface = event->accessibleInterface(); interface && interface->role() == QAccessible::ListItem)
        announcements().append({event->type(), interface->text(QAccessible::Name)});
}

QString nameOf(const model::SomeColor &color)
{
    return QString::fromStdString(model::colorDescription(color.platformColor()));
}

} // namespace

class AccessibleSwatchGridTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cellsAreNamedByTheirColor();
    void cellsAreFoundWhereTheyAre();
    void changesAreAnnounced();
    void cellsOutliveNothing();
};

void AccessibleSwatchGridTest::initTestCase()
{
    QAccessible::installUpdateHandler(record);
    // As if an assistive technology were running; there is no public way to say so.
    QGuiApplicationPrivate::platformIntegration()->accessibility()->setActive(true);
    QVERIFY(QAccessible::isActive());
}

void AccessibleSwatchGridTest::cellsAreNamedByTheirColor()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
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

void AccessibleSwatchGridTest::cellsAreFoundWhereTheyAre()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    QAccessibleInterface *list = QAccessible::queryAccessibleInterface(grid.view);
    const QPoint middle = grid.window.mapToGlobal(GridWindow::middle(7, 8));
    QAccessibleInterface *cell = list->childAt(middle.x(), middle.y());
    QCOMPARE(list->indexOfChild(cell), 7 * 12 + 8);
    QVERIFY(cell->rect().contains(middle));
    QCOMPARE(cell->rect().size(), QSize(30, 30));
    const QPoint outside = grid.window.mapToGlobal(QPoint(5, 5));
    QCOMPARE(list->childAt(outside.x(), outside.y()), nullptr);
}

void AccessibleSwatchGridTest::changesAreAnnounced()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    QVERIFY(QAccessible::queryAccessibleInterface(grid.view));
    grid.view->forceActiveFocus();
    grid.state.selectedColor.set(swatch(4, 6));
    announcements().clear();
    QTest::keyClick(&grid.window, Qt::Key_Right);
    const QList<std::pair<QAccessible::Event, QString>> expected = {
        {QAccessible::Selection, nameOf(swatch(4, 6))},
        {QAccessible::Selection, nameOf(swatch(4, 7))},
        {QAccessible::Focus, nameOf(swatch(4, 7))},
    };
    QCOMPARE(announcements(), expected);
    QCOMPARE(QAccessible::queryAccessibleInterface(grid.view)->focusChild()->text(QAccessible::Name),
             nameOf(swatch(4, 7)));
}

void AccessibleSwatchGridTest::cellsOutliveNothing()
{
    GridWindow grid;
    QVERIFY(grid.isReady());
    QAccessibleInterface *cell = QAccessible::queryAccessibleInterface(grid.view)->child(5);
    const QAccessible::Id id = QAccessible::uniqueId(cell);
    delete grid.view;
    QCOMPARE(QAccessible::accessibleInterface(id), nullptr);
}

QTEST_MAIN(AccessibleSwatchGridTest)
#include "tst_accessibleswatchgrid.moc"
