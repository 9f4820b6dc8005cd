#include "support/pseudolocale.h"

#include "../favorites/favoriteswindow.h"
#include "../grid/gridwindow.h"
#include "../sliders/sliderswindow.h"
#include "model/axcolordescription.h"
#include "platform/strings/localizedstring.h"
#include "platform/strings/translationtable.h"

#include <QAccessible>
#include <QLocale>

using favrin::model::ColorNamingReadiness;
using favrin::platform::installTranslations;
using favrin::theme::TextSizeCategory;
using favrin::theme::Theme;

namespace {

bool isMenuShown(const QQuickItem *scene)
{
    const auto items = itemsBelow(scene);
    return std::any_of(items.begin(), items.end(),
                       [](const QQuickItem *item) { return item->inherits("QQuickMenuItem") && item->isVisible(); });
}

} // namespace

class PseudolocaleTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanup();
    void findsTexts_data();
    void findsTexts();
    void slidersAreTranslated_data();
    void slidersAreTranslated();
    void textsAreLookedAt();
    void gridIsTranslated();
    void favoritesAreTranslated();
};

void PseudolocaleTest::initTestCase()
{
    QLocale::setDefault(QLocale(QStringLiteral("en-XA")));
    QAccessible::setActive(true);
    // Names of colors are spoken at once.
    ColorNamingReadiness::process().becomeReady();
}

void PseudolocaleTest::cleanup()
{
    favrin::platform::setStringTable({});
    Theme::instance().setTextSizeCategory(TextSizeCategory::Large);
}

void PseudolocaleTest::findsTexts_data()
{
    QTest::addColumn<QByteArray>("qml");
    QTest::addColumn<int>("untranslated");
    QTest::addColumn<int>("clipped");
    const auto row = [](const char *name, const char *qml, int untranslated, int clipped) {
        QTest::newRow(name) << QByteArray(qml) << untranslated << clipped;
    };
    row("all is well", R"(Text { text: "[Ŕéð one]" })", 0, 0);
    row("upper case", R"(Text { text: "[ŔÉÐ ONE]" })", 0, 0);
    row("a number", R"(Text { text: "100 %" })", 0, 0);
    row("filled in", R"(Text { text: "[[šŔĜƁ] Ĥéх one] #" })", 0, 0);
    row("nobody's", R"(Text { text: "Red" })", 1, 0);
    row("half of it", R"(Text { text: "[Ŕéð] slider" })", 1, 0);
    row("cut by the code", R"(Text { text: "[Ŕéð on" })", 1, 0);
    row("hidden", R"(Item { opacity: 0; Text { text: "Red"; width: 3 } })", 0, 0);
    row("input", R"(TextInput { text: "0061FD" })", 0, 0);
    row("input too narrow", R"(TextInput { text: "0061FD"; width: 5 })", 0, 1);
    row("elided", R"(Text { text: "[Ŕéð one]"; width: 20; elide: Text.ElideRight })", 0, 1);
    row("a line less", R"(Text { text: "[Ŕéð one two]"; width: 40; wrapMode: Text.Wrap; maximumLineCount: 1 })", 0, 1);
    row("wrapped", R"(Text { text: "[Ŕéð one two]"; width: 60; wrapMode: Text.Wrap })", 0, 0);
    row("too wide", R"(Text { text: "[Ŕéð one two]"; width: 20 })", 0, 1);
    row("clipped", R"(Item { width: 20; height: 50; clip: true; Text { text: "[Ŕéð one]" } })", 0, 1);
    row("wide guest", R"(Item { width: 20; height: 50; Text { text: "[Ŕéð one]" } })", 0, 0);
    row("outside", R"(Text { text: "[Ŕéð one]"; x: 180 })", 0, 1);
    row("in a button", R"(AbstractButton { width: 20; height: 40; Text { text: "[Ŕéð]"; anchors.centerIn: parent } })",
        0, 1);
    row("scrolled away",
        R"(Flickable { width: 100; height: 40; contentHeight: 90; clip: true; Text { text: "[Ŕéð]"; y: 60 } })", 0, 0);
    row("not to be scrolled to",
        R"(Flickable { width: 100; height: 40; contentHeight: 60; clip: true; Text { text: "[Ŕéð]"; y: 60 } })", 0, 1);
}

void PseudolocaleTest::findsTexts()
{
    QFETCH(QByteArray, qml);
    QQmlEngine engine;
    QQmlComponent component(&engine);
    component.setData("import QtQuick\nimport QtQuick.Templates\nItem { width: 200; height: 100; " + qml + "}", QUrl());
    const std::unique_ptr<QObject> object(component.create());
    auto *root = qobject_cast<QQuickItem *>(object.get());
    QVERIFY2(root, qPrintable(component.errorString()));
    QQuickWindow window;
    root->setParentItem(window.contentItem());
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    QTEST(static_cast<int>(untranslatedTexts(*root).size()), "untranslated");
    QTEST(static_cast<int>(clippedTexts(*root).size()), "clipped");
}

void PseudolocaleTest::slidersAreTranslated_data()
{
    QTest::addColumn<TextSizeCategory>("size");
    QTest::newRow("usual text") << TextSizeCategory::Large;
    QTest::newRow("large text") << TextSizeCategory::ExtraExtraExtraLarge;
}

void PseudolocaleTest::slidersAreTranslated()
{
    QFETCH(TextSizeCategory, size);
    QCOMPARE(installTranslations(u"en-XA"), QStringLiteral("en-XA"));
    Theme::instance().setTextSizeCategory(size);
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    auto *scene = sliders.window.contentItem();
    for (auto *item : itemsBelow(scene)) {
        if (QByteArray(item->metaObject()->className()).startsWith("ColorSpaceButton"))
            QMetaObject::invokeMethod(item, "clicked");
    }
    QTRY_VERIFY(isMenuShown(scene));
    QCOMPARE(untranslatedTexts(*scene), QStringList());
    QCOMPARE(clippedTexts(*scene), QStringList());
    QCOMPARE(untranslatedSpeech(*sliders.view), QStringList());
}

void PseudolocaleTest::textsAreLookedAt()
{
    // Nothing above passes because nothing was seen.
    SlidersWindow sliders;
    QVERIFY(sliders.isReady());
    QCOMPARE(untranslatedTexts(*sliders.view).size(), 5);
    QVERIFY(untranslatedSpeech(*sliders.view).size() >= 5);
    sliders.view->setWidth(60);
    QVERIFY(!clippedTexts(*sliders.view).isEmpty());
}

void PseudolocaleTest::gridIsTranslated()
{
    installTranslations(u"en-XA");
    GridWindow grid;
    QVERIFY(grid.isReady());
    QCOMPARE(untranslatedTexts(*grid.view), QStringList());
    QCOMPARE(untranslatedSpeech(*grid.view), QStringList());
    // The names of all swatches were read, and in the language that is looked for.
    favrin::platform::setStringTable({});
    QVERIFY(untranslatedSpeech(*grid.view).size() >= 120);
}

void PseudolocaleTest::favoritesAreTranslated()
{
    installTranslations(u"en-XA");
    FavoritesWindow favorites(30);
    QVERIFY(favorites.show());
    favorites.strip->forceActiveFocus();
    favorites.strip->showDeleteCallout(favorites.cells().frame(0).center());
    QTRY_VERIFY(isMenuShown(favorites.window.contentItem()));
    QCOMPARE(untranslatedTexts(*favorites.window.contentItem()), QStringList());
    QCOMPARE(clippedTexts(*favorites.window.contentItem()), QStringList());
    QCOMPARE(untranslatedSpeech(*favorites.root), QStringList());
}

QTEST_MAIN(PseudolocaleTest)
#include "tst_pseudolocale.moc"
