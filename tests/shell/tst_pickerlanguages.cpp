#include "pickerwindow.h"

#include "model/axcolordescription.h"
#include "platform/strings/localizedstring.h"
#include "platform/strings/translationtable.h"
#include "support/pseudolocale.h"
#include "support/sceneitems.h"

#include <QDir>
#include <QLocale>

#include <algorithm>

using namespace favrin;
using service::Tab;
using theme::TextSizeCategory;
using theme::Theme;

namespace {

/** Everything that can be shown is shown: colors that are suggested and kept, two pages, opacity, a title of a host. */
void prepare(service::ColorPickerState &state)
{
    state.selectedColor.set(model::SomeColor(0.2, 0.4, 0.9, 0.5, model::SomeColor::ColorSpace::displayP3));
    state.title.set("[title]");
    state.allowsNoColor.set(true);
}

std::vector<model::SomeColor> colors(int count)
{
    std::vector<model::SomeColor> colors;
    for (int level = 0; level < count; ++level)
        colors.emplace_back(level / 30.0, 0.5, 0.5, 1.0, model::SomeColor::ColorSpace::sRGB);
    return colors;
}

} // namespace

/** The whole picker in other languages. */
class PickerLanguagesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QAccessible::setActive(true);
        // Names of colors are spoken at once.
        model::ColorNamingReadiness::process().becomeReady();
    }

    void cleanup()
    {
        platform::setStringTable({});
        QLocale::setDefault(QLocale::c());
        Theme::instance().setTextSizeCategory(TextSizeCategory::Large);
        Theme::instance().setLayoutDirection(Qt::LeftToRight);
    }

    void everyTextIsTranslatedAndFits_data()
    {
        QTest::addColumn<QSize>("size");
        QTest::addColumn<TextSizeCategory>("textSize");
        for (const TextSizeCategory textSize : {TextSizeCategory::ExtraSmall, TextSizeCategory::Large,
                                                TextSizeCategory::AccessibilityExtraExtraExtraLarge}) {
            QTest::addRow("portrait, text size %d", static_cast<int>(textSize)) << QSize(360, 700) << textSize;
            QTest::addRow("landscape, text size %d", static_cast<int>(textSize)) << QSize(568, 420) << textSize;
        }
    }

    void everyTextIsTranslatedAndFits()
    {
        QFETCH(QSize, size);
        QFETCH(TextSizeCategory, textSize);
        platform::installTranslations(u"en-XA");
        Theme::instance().setTextSizeCategory(textSize);
        PickerWindow picker(size, colors(30), prepare);
        picker.state.useLandscapeLayout.set(size.width() > 500);
        QVERIFY(picker.isReady());
        for (const Tab tab : service::allTabs) {
            picker.state.selectedTab.set(tab);
            QCOMPARE(untranslatedTexts(*picker.view).join(u'\n'), QString());
            QCOMPARE(clippedTexts(*picker.view).join(u'\n'), QString());
            QCOMPARE(untranslatedSpeech(*picker.view).join(u'\n'), QString());
        }
        // Nothing passed because nothing was seen: all of it, swatches too, is in the language that is looked for.
        picker.state.selectedTab.set(Tab::grid);
        platform::setStringTable({});
        QVERIFY(untranslatedSpeech(*picker.view).size() >= 120);
    }

    void textsOfMenusAreTranslatedAndFit()
    {
        platform::installTranslations(u"en-XA");
        PickerWindow picker(QSize(360, 700), colors(30), prepare);
        picker.state.selectedTab.set(Tab::sliders);
        QVERIFY(picker.isReady());
        const QQuickItem *scene = picker.window.contentItem();
        const auto menuItems = [scene] {
            return std::ranges::count_if(itemsBelow(scene), [](const QQuickItem *item) {
                return item->inherits("QQuickMenuItem") && item->isVisible();
            });
        };
        const auto checkTexts = [scene] {
            QCOMPARE(untranslatedTexts(*scene).join(u'\n'), QString());
            QCOMPARE(clippedTexts(*scene).join(u'\n'), QString());
        };
        for (QQuickItem *item : itemsBelow(scene)) {
            if (QByteArray(item->metaObject()->className()).startsWith("ColorSpaceButton"))
                QMetaObject::invokeMethod(item, "clicked");
        }
        QTRY_COMPARE(menuItems(), 2);
        checkTexts();
        QTest::keyClick(&picker.window, Qt::Key_Escape);
        QTRY_COMPARE(menuItems(), 0);
        auto *strip = picker.itemOf<favorites::FavoriteColorPickerView>();
        strip->showDeleteCallout(strip->collectionView()->frame(1).center());
        QTRY_COMPARE(menuItems(), 1);
        checkTexts();
    }

    void everyLanguageFits_data()
    {
        QTest::addColumn<QString>("language");
        const QStringList tables = QDir(QStringLiteral(":/favrin/translations")).entryList({QStringLiteral("*.qm")});
        QVERIFY(tables.size() >= 30);
        for (const QString &table : tables) {
            const QString language = table.section(u'_', 1).chopped(3);
            QTest::newRow(qPrintable(language)) << language;
        }
    }

    void everyLanguageFits()
    {
        QFETCH(QString, language);
        const QLocale locale(language);
        QLocale::setDefault(locale);
        platform::installTranslations(language);
        Theme::instance().setLayoutDirection(locale.textDirection());
        Theme::instance().setTextSizeCategory(TextSizeCategory::ExtraExtraExtraLarge);
        PickerWindow picker(QSize(360, 700), {}, prepare);
        QVERIFY(picker.isReady());
        for (const Tab tab : service::allTabs) {
            picker.state.selectedTab.set(tab);
            QCOMPARE(clippedTexts(*picker.view).join(u'\n'), QString());
        }
    }

    void anotherLanguageTakesEffectAtOnce()
    {
        platform::installTranslations(u"de");
        PickerWindow picker(QSize(360, 700), {}, prepare);
        picker.state.selectedTab.set(Tab::sliders);
        QVERIFY(picker.isReady());
        QVERIFY(picker.item(QStringLiteral("Rot")));
        const auto field = [&](const QString &name) { return picker.editableItem(name)->property("text").toString(); };
        QCOMPARE(field(QStringLiteral("Blau")), QStringLiteral("230"));

        QLocale::setDefault(QLocale(QStringLiteral("ar-EG")));
        platform::installTranslations(u"ar-EG");
        Theme::instance().noteLocaleChanged();
        for (const char *left : {"Rot", "Blau", "Deckkraft", "Schließen", "Raster", "Favoriten"})
            QVERIFY2(!picker.item(QString::fromUtf8(left)), left);
        for (const char *key : {"Red", "Blue", "Opacity", "Close", "Grid", "Favorites", "Selected Color"})
            QVERIFY2(picker.item(QString::fromStdString(platform::localizedString(key, ""))), key);
        // The formats of numbers are those of the process's first use.
        QCOMPARE(field(QString::fromStdString(platform::localizedString("Blue", ""))), QStringLiteral("230"));
        QVERIFY(picker.state.selectedColor().has_value());
    }
};

QTEST_MAIN(PickerLanguagesTest)
#include "tst_pickerlanguages.moc"
