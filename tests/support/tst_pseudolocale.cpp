#include "support/pseudolocale.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTest>

class PseudolocaleTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void findsTexts_data();
    void findsTexts();
};

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

QTEST_MAIN(PseudolocaleTest)
#include "tst_pseudolocale.moc"
