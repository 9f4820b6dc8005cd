#include "platform/input/focusvisibility.h"

#include <QFocusEvent>
#include <QTest>

using namespace favrin::platform;

class FocusVisibilityTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void reasonsDecide_data();
    void reasonsDecide();
    void changesAreToldOnce();
};

void FocusVisibilityTest::reasonsDecide_data()
{
    QTest::addColumn<Qt::FocusReason>("reason");
    // After this reason, when it was shown and when it was not.
    QTest::addColumn<QString>("afterFocusIn");
    QTest::addColumn<QString>("afterFocusOut");
    const auto row = [](const char *name, Qt::FocusReason reason, const char *afterIn, const char *afterOut) {
        QTest::newRow(name) << reason << QString::fromLatin1(afterIn) << QString::fromLatin1(afterOut);
    };
    row("tab", Qt::TabFocusReason, "shown", "hidden");
    row("backtab", Qt::BacktabFocusReason, "shown", "hidden");
    row("shortcut", Qt::ShortcutFocusReason, "shown", "hidden");
    row("mouse", Qt::MouseFocusReason, "hidden", "hidden");
    row("other", Qt::OtherFocusReason, "hidden", "hidden");
    row("active window", Qt::ActiveWindowFocusReason, "as before", "as before");
}

void FocusVisibilityTest::reasonsDecide()
{
    QFETCH(Qt::FocusReason, reason);
    QFETCH(QString, afterFocusIn);
    QFETCH(QString, afterFocusOut);
    for (const bool before : {false, true}) {
        const auto expected = [before](const QString &after) {
            return after == u"as before" ? before : after == u"shown";
        };
        FocusVisibility entered([] {});
        FocusVisibility left([] {});
        if (before) {
            entered.keyUsed();
            left.keyUsed();
        }
        entered.focusIn(QFocusEvent(QEvent::FocusIn, reason));
        QCOMPARE(entered.isVisible(), expected(afterFocusIn));
        left.focusOut(QFocusEvent(QEvent::FocusOut, reason));
        QCOMPARE(left.isVisible(), expected(afterFocusOut));
    }
}

void FocusVisibilityTest::changesAreToldOnce()
{
    QList<bool> told;
    FocusVisibility visibility([&] { told.append(visibility.isVisible()); });
    visibility.focusIn(QFocusEvent(QEvent::FocusIn, Qt::MouseFocusReason));
    QCOMPARE(told, QList<bool>());
    visibility.keyUsed();
    visibility.keyUsed();
    QCOMPARE(told, QList<bool>({true}));
    visibility.focusOut(QFocusEvent(QEvent::FocusOut, Qt::OtherFocusReason));
    QCOMPARE(told, QList<bool>({true, false}));
}

QTEST_GUILESS_MAIN(FocusVisibilityTest)
#include "tst_focusvisibility.moc"
