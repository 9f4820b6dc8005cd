#include "platform/strings/localizedstring.h"
#include "platform/strings/translationtable.h"

#include "../../shared/table.h"

#include <QTest>

#include <atomic>
#include <thread>

using namespace favrin::platform;
using namespace Qt::StringLiterals;

class TranslationTableTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { setStringTable({}); }

    void translates_data()
    {
        addRows<QString, bool>({
            {"the language", u"de"_s, true},
            {"a region of it", u"de-Latn-AT"_s, true},
            {"another language", u"fr"_s, false},
            {"empty", {}, false},
            {"a path", u"../translations/Localizable_de"_s, false},
            {"only hyphens", u"--"_s, false},
        });
    }
    void translates()
    {
        const auto [locale, isFound] = row<QString, bool>();
        // An earlier table must not shine through.
        setStringTable([](std::string_view) { return std::string("earlier"); });
        QCOMPARE(installTranslations(locale), isFound ? u"de"_s : QString());
        QCOMPARE(localizedString("dark", "comment"), std::string(isFound ? "dunkel" : "dark"));
        QCOMPARE(localizedString("Colors", ""), std::string(isFound ? "Farbt\xc3\xb6ne" : "Colors"));
        QCOMPARE(localizedString("no such key", ""), std::string("no such key"));
    }

    void tableMayChangeWhileOthersAsk()
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
};

QTEST_APPLESS_MAIN(TranslationTableTest)
#include "tst_translationtable.moc"
