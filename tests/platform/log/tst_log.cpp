#include "platform/log/log.h"

#include "../../shared/table.h"

#include <QLoggingCategory>
#include <QtTest>

using favrin::platform::Log;
using namespace Qt::StringLiterals;

/** Where entries go, and which are written. */
class LogTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        s_entries.clear();
        m_previous = qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &context, const QString &text) {
            s_entries << u"%1|%2|%3"_s.arg(QString::fromLatin1(context.category)).arg(type).arg(text);
        });
    }
    void cleanup()
    {
        qInstallMessageHandler(m_previous);
        QLoggingCategory::setFilterRules(QString());
    }

    void entriesObeyTheFilterRules_data()
    {
        const QString debug = u"sub.cat|0|d \"é\""_s;
        const QString warning = u"sub.cat|1|w"_s;
        const QString error = u"sub.cat|2|e"_s;
        addRows<QString, QStringList>({
            {"by default no debug", {}, {warning, error}},
            {"debug on", u"sub.cat.debug=true"_s, {debug, warning, error}},
            {"all off", u"sub.cat*=false"_s, {}},
        });
    }
    void entriesObeyTheFilterRules()
    {
        const auto [rules, written] = row<QString, QStringList>();
        QLoggingCategory::setFilterRules(rules);
        const Log log("sub", "cat");
        QCOMPARE(log.isDebugEnabled(), written.size() == 3);
        log.debug("d \"\xC3\xA9\"");
        log.warning("w");
        log.error("e");
        QCOMPARE(s_entries, written);
    }

private:
    static inline QStringList s_entries;
    QtMessageHandler m_previous = nullptr;
};

QTEST_APPLESS_MAIN(LogTest)
#include "tst_log.moc"
