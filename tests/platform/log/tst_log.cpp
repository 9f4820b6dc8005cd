#include "platform/log/log.h"

#include <QLoggingCategory>
#include <QtTest>

using favrin::platform::Log;

/** Where entries go, and which are written. */
class LogTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        s_entries.clear();
        m_previous = qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &context, const QString &text) {
            s_entries << QStringLiteral("%1|%2|%3").arg(QString::fromLatin1(context.category)).arg(type).arg(text);
        });
    }
    void cleanup()
    {
        qInstallMessageHandler(m_previous);
        QLoggingCategory::setFilterRules(QString());
    }

    void entriesObeyTheFilterRules_data()
    {
        QTest::addColumn<QString>("rules");
        QTest::addColumn<QStringList>("written");
        const QString debug = QStringLiteral("sub.cat|0|d \"é\"");
        const QString warning = QStringLiteral("sub.cat|1|w");
        const QString error = QStringLiteral("sub.cat|2|e");
        QTest::addRow("by default no debug") << QString() << QStringList{warning, error};
        QTest::addRow("debug on") << QStringLiteral("sub.cat.debug=true") << QStringList{debug, warning, error};
        QTest::addRow("all off") << QStringLiteral("sub.cat*=false") << QStringList();
    }
    void entriesObeyTheFilterRules()
    {
        QFETCH(const QString, rules);
        QFETCH(const QStringList, written);
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
