#include "platform/strings/localizedstring.h"
#include "platform/strings/translationtable.h"

#include <QTest>

#include <atomic>
#include <thread>

using namespace favrin::platform;

class TranslationTableTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { setStringTable({}); }
    void translates_data();
    void translates();
    void tableMayChangeWhileOthersAsk();
};

void TranslationTableTest::translates_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<bool>("isFound");
    QTest::newRow("the language") << QStringLiteral("de") << true;
    QTest::newRow("a region of it") << QStringLiteral("de-Latn-AT") << true;
    QTest::newRow("another language") << QStringLiteral("fr") << false;
    QTest::newRow("empty") << QString() << false;
    QTest::newRow("a path") << QStringLiteral("../translations/Localizable_de") << false;
    QTest::newRow("only hyphens") << QStringLiteral("--") << false;
}

void TranslationTableTest::translates()
{
    QFETCH(QString, locale);
    QFETCH(bool, isFound);
    // An earlier table must not shine through.
    setStringTable([](std::string_view) { return std::string("earlier"); });
    QCOMPARE(installTranslations(locale), isFound ? QStringLiteral("de") : QString());
    QCOMPARE(localizedString("dark", "comment"), std::string(isFound ? "dunkel" : "dark"));
    QCOMPARE(localizedString("Colors", ""), std::string(isFound ? "Farbt\xc3\xb6ne" : "Colors"));
    QCOMPARE(localizedString("no such key", ""), std::string("no such key"));
}

void TranslationTableTest::tableMayChangeWhileOthersAsk()
{
    std::atomic<bool> isDone = false;
    std::atomic<int> oddAnswers = 0;
    std::thread asking([&] {
        while (!isDone) {
            const std::string answer = localizedString("key", "");
            oddAnswers += answer != "key" && answer != "table";
        }
    });
    for (int i = 0; i < 2000; ++i) {
        setStringTable([](std::string_view) { return std::string("table"); });
        setStringTable({});
    }
    isDone = true;
    asking.join();
    QCOMPARE(oddAnswers.load(), 0);
}

QTEST_APPLESS_MAIN(TranslationTableTest)
#include "tst_translationtable.moc"
