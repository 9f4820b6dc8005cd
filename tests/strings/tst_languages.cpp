#include "model/colordescription.h"
#include "model/somecolor.h"
#include "platform/strings/localizedstring.h"
#include "platform/strings/translationtable.h"

#include <QDir>
#include <QSet>
#include <QTest>

#include <vector>

using namespace favrin;
using platform::installTranslations;
using namespace Qt::StringLiterals;

namespace {

QString text(const char *key)
{
    return QString::fromStdString(platform::localizedString(key, ""));
}

QString nameOf(uint value)
{
    const model::SomeColor color((value >> 16) / 255.0, (value >> 8 & 255) / 255.0, (value & 255) / 255.0, 1.0,
                                 model::SomeColor::ColorSpace::sRGB);
    return QString::fromStdString(model::colorDescription(color.platformColor()));
}

/** Colors of which each is called something else in English. */
std::vector<uint> differentColors()
{
    platform::setStringTable({});
    std::vector<uint> colors;
    QSet<QString> names;
    for (uint i = 0; i < 16 * 16 * 16; ++i) {
        const uint color = 0x110000 * (i / 256) + 0x1100 * (i / 16 % 16) + 0x11 * (i % 16);
        const QString name = nameOf(color);
        if (!names.contains(name))
            colors.push_back(color);
        names.insert(name);
    }
    return colors;
}

QStringList languages()
{
    QStringList tags;
    for (const QString &file : QDir(u":/favrin/translations"_s).entryList())
        tags << file.section(u'_', 1).section(u'.', 0, 0);
    return tags;
}

} // namespace

class LanguagesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { platform::setStringTable({}); }

    void findsTheLanguage_data()
    {
        QTest::addColumn<QString>("language");
        const auto row = [](const char *locale, const char *language) {
            QTest::newRow(locale) << QString::fromLatin1(language);
        };
        row("de", "de");
        row("de-AT", "de");
        row("gsw", "de");
        row("pt", "pt-BR");
        row("pt-BR", "pt-BR");
        row("pt-AO", "pt-PT");
        row("pt-PT", "pt-PT");
        row("zh", "zh-Hans");
        row("zh-CN", "zh-Hans");
        row("zh-SG", "zh-Hans");
        row("zh-TW", "zh-Hant");
        row("zh-HK", "zh-Hant");
        row("zh-Hant-MO", "zh-Hant");
        row("no", "nb");
        row("nn", "nb");
        row("nn-NO", "nb");
        row("sr", "sr");
        row("sr-RS", "sr");
        row("sr-ME", "sr-Latn");
        row("sr-Latn-RS", "sr-Latn");
        row("iw", "he");
        row("in-ID", "id");
        row("en-GB", "en");
        row("es-419", "es");
        row("fr-CA", "fr");
        row("ar-EG", "ar");
        row("en-XA", "en-XA");
        row("ar-XB", "ar-XB");
        // Not translated: the texts, not their keys.
        row("sw", "en");
        row("C", "en");
        row("", "en");
        row("../en", "en");
        row("x", "en");
    }
    void findsTheLanguage()
    {
        QFETCH(QString, language);
        QCOMPARE(installTranslations(QString::fromLatin1(QTest::currentDataTag())), language);
        QVERIFY(text("Eyedropper_Accessibility") != u"Eyedropper_Accessibility"_s);
    }

    void everyLanguageNamesEveryColor()
    {
        const std::vector<uint> colors = differentColors();
        QVERIFY(colors.size() > 130);
        QVERIFY(languages().size() >= 30);
        for (const QString &language : languages()) {
            QCOMPARE(installTranslations(language), language);
            QSet<QString> names;
            for (const uint color : colors) {
                const QString name = nameOf(color);
                const QByteArray said = u"%1: %2"_s.arg(language, name).toUtf8();
                QVERIFY2(!name.contains(u'%') && name == name.trimmed(), said);
                // What differs in one language differs in all.
                QVERIFY2(!names.contains(name), said);
                names.insert(name);
            }
        }
    }

    void namesOfColorsAgree_data()
    {
        QTest::addColumn<QString>("language");
        QTest::addColumn<QString>("darkRed");
        QTest::addColumn<QString>("lightPink");
        QTest::addColumn<QString>("mediumBluishGray");
        const auto row = [](const char *language, const char16_t *red, const char16_t *pink, const char16_t *gray) {
            QTest::newRow(language) << QString::fromLatin1(language) << QString::fromUtf16(red)
                                    << QString::fromUtf16(pink) << QString::fromUtf16(gray);
        };
        row("en", u"dark red", u"light pink", u"medium bluish gray");
        row("de", u"dunkles Rot", u"helles Rosa", u"mittleres Blaugrau");
        row("sv", u"mörkröd", u"ljusrosa", u"mellanblågrå");
        row("fr", u"rouge foncé", u"rose clair", u"gris bleuté moyen");
        row("es", u"rojo oscuro", u"rosa claro", u"gris azulado medio");
        row("fi", u"tummanpunainen", u"vaaleanpinkki", u"keskisiniharmaa");
        row("et", u"tumepunane", u"heleroosa", u"keskmine sinakashall");
        row("ru", u"тёмный красный", u"светлый розовый", u"средний синевато-серый");
        row("sk", u"tmavá červená", u"svetlá ružová", u"stredná modrosivá");
        row("lt", u"tamsiai raudona", u"šviesiai rožinė", u"vidutiniškai melsvai pilka");
        row("ar", u"أحمر داكن", u"وردي فاتح", u"رمادي مزرق متوسط");
        row("he", u"אדום כהה", u"ורוד בהיר", u"אפור כחלחל בינוני");
        row("th", u"สีแดงเข้ม", u"สีชมพูอ่อน", u"สีเทาอมน้ำเงินปานกลาง");
        row("zh-Hant", u"深紅色", u"淺粉紅色", u"中藍灰色");
    }
    void namesOfColorsAgree()
    {
        QFETCH(QString, language);
        QCOMPARE(installTranslations(language), language);
        QTEST(nameOf(0x840000), "darkRed");
        QTEST(nameOf(0xFFD1DF), "lightPink");
        QTEST(nameOf(0x66707A), "mediumBluishGray");
    }

    void pseudoLocales()
    {
        const QString english = text("Add selected color to favorites");
        installTranslations(u"en-XA");
        const QString accented = text("Add selected color to favorites");
        QVERIFY2(accented.startsWith(u"[Åðð ") && accented.endsWith(u']'), qPrintable(accented));
        QVERIFY2(accented.size() * 10 >= english.size() * 14, qPrintable(accented));
        QVERIFY(text("%@ Hex Color #").contains(u"%@"));
        installTranslations(u"ar-XB");
        QCOMPARE(text("Delete"), u"\u200f\u202eDelete\u202c\u200f"_s);
    }
};

QTEST_APPLESS_MAIN(LanguagesTest)
#include "tst_languages.moc"
