#include "platform/input/focusvisibility.h"

#include "../../shared/table.h"

#include <QFocusEvent>
#include <QTest>

using namespace favrin::platform;

class FocusVisibilityTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void reasonsDecide_data()
    {
        // After this reason, when the focus comes and when it goes; as before when neither.
        addRows<Qt::FocusReason, std::optional<bool>, std::optional<bool>>({
            {"tab", Qt::TabFocusReason, true, false},
            {"backtab", Qt::BacktabFocusReason, true, false},
            {"shortcut", Qt::ShortcutFocusReason, true, false},
            {"mouse", Qt::MouseFocusReason, false, false},
            {"other", Qt::OtherFocusReason, false, false},
            {"active window", Qt::ActiveWindowFocusReason, {}, {}},
        });
    }
    void reasonsDecide()
    {
        const auto [reason, afterFocusIn, afterFocusOut] =
            row<Qt::FocusReason, std::optional<bool>, std::optional<bool>>();
        for (const bool before : {false, true}) {
            FocusVisibility entered([] {});
            FocusVisibility left([] {});
            if (before) {
                entered.keyUsed();
                left.keyUsed();
            }
            entered.focusIn(QFocusEvent(QEvent::FocusIn, reason));
            QCOMPARE(entered.isVisible(), afterFocusIn.value_or(before));
            left.focusOut(QFocusEvent(QEvent::FocusOut, reason));
            QCOMPARE(left.isVisible(), afterFocusOut.value_or(before));
        }
    }

    void changesAreToldOnce()
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
};

QTEST_GUILESS_MAIN(FocusVisibilityTest)
#include "tst_focusvisibility.moc"
