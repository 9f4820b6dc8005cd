#include "model/colordescription.h"
#include "model/somecolor.h"
#include "platform/strings/localizedstring.h"
#include "platform/strings/translationtable.h"

#include "../shared/table.h"

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
        addRows<QString>({
            {"de", u"de"_s},
            {"de-AT", u"de"_s},
            {"gsw", u"de"_s},
            {"pt", u"pt-BR"_s},
            {"pt-BR", u"pt-BR"_s},
            {"pt-AO", u"pt-PT"_s},
            {"pt-PT", u"pt-PT"_s},
            {"zh", u"zh-Hans"_s},
            {"zh-CN", u"zh-Hans"_s},
            {"zh-SG", u"zh-Hans"_s},
            {"zh-TW", u"zh-Hant"_s},
            {"zh-HK", u"zh-Hant"_s},
            {"zh-Hant-MO", u"zh-Hant"_s},
            {"no", u"nb"_s},
            {"nn", u"nb"_s},
            {"nn-NO", u"nb"_s},
            {"sr", u"sr"_s},
            {"sr-RS", u"sr"_s},
            {"sr-ME", u"sr-Latn"_s},
            {"sr-Latn-RS", u"sr-Latn"_s},
            {"iw", u"he"_s},
            {"in-ID", u"id"_s},
            {"en-GB", u"en"_s},
            {"es-419", u"es"_s},
            {"fr-CA", u"fr"_s},
            {"ar-EG", u"ar"_s},
            {"en-XA", u"en-XA"_s},
            {"ar-XB", u"ar-XB"_s},
            // Not translated: the texts, not their keys.
            {"sw", u"en"_s},
            {"C", u"en"_s},
            {"", u"en"_s},
            {"../en", u"en"_s},
            {"x", u"en"_s},
        });
    }
    void findsTheLanguage()
    {
        const auto [language] = row<QString>();
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
        addRows<QString, QString, QString>({
            {"en", u"dark red"_s, u"light pink"_s, u"medium bluish gray"_s},
            {"de", u"dunkles Rot"_s, u"helles Rosa"_s, u"mittleres Blaugrau"_s},
            {"sv", u"mörkröd"_s, u"ljusrosa"_s, u"mellanblågrå"_s},
            {"fr", u"rouge foncé"_s, u"rose clair"_s, u"gris bleuté moyen"_s},
            {"es", u"rojo oscuro"_s, u"rosa claro"_s, u"gris azulado medio"_s},
            {"fi", u"tummanpunainen"_s, u"vaaleanpinkki"_s, u"keskisiniharmaa"_s},
            {"et", u"tumepunane"_s, u"heleroosa"_s, u"keskmine sinakashall"_s},
            {"ru", u"тёмный красный"_s, u"светлый розовый"_s, u"средний синевато-серый"_s},
            {"sk", u"tmavá červená"_s, u"svetlá ružová"_s, u"stredná modrosivá"_s},
            {"lt", u"tamsiai raudona"_s, u"šviesiai rožinė"_s, u"vidutiniškai melsvai pilka"_s},
            {"ar", u"أحمر داكن"_s, u"وردي فاتح"_s, u"رمادي مزرق متوسط"_s},
            {"he", u"אדום כהה"_s, u"ורוד בהיר"_s, u"אפור כחלחל בינוני"_s},
            {"th", u"สีแดงเข้ม"_s, u"สีชมพูอ่อน"_s, u"สีเทาอมน้ำเงินปานกลาง"_s},
            {"zh-Hant", u"深紅色"_s, u"淺粉紅色"_s, u"中藍灰色"_s},
        });
    }
    void namesOfColorsAgree()
    {
        const auto [darkRed, lightPink, mediumBluishGray] = row<QString, QString, QString>();
        const QString language = QString::fromLatin1(QTest::currentDataTag());
        QCOMPARE(installTranslations(language), language);
        QCOMPARE(nameOf(0x840000), darkRed);
        QCOMPARE(nameOf(0xFFD1DF), lightPink);
        QCOMPARE(nameOf(0x66707A), mediumBluishGray);
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
