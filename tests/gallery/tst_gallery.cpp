#include "apps/gallery/galleryoptions.h"
#include "apps/gallery/messagelog.h"
#include "apps/gallery/pickrecorder.h"
#include "apps/gallery/postershape.h"

#include <QPainter>
#include <QTest>

using namespace favrin::gallery;

class GalleryTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void picksAreWrittenWithoutLoss_data();
    void picksAreWrittenWithoutLoss();
    void logKeepsTheNewestMessages();
    void pointsOfThePosterBelongToParts_data();
    void pointsOfThePosterBelongToParts();
    void commandLineIsUnderstood_data();
    void commandLineIsUnderstood();
};

void GalleryTest::picksAreWrittenWithoutLoss_data()
{
    QTest::addColumn<FVColor>("color");
    QTest::addColumn<QString>("colorspace");
    QTest::addColumn<bool>("isVolatile");
    QTest::addColumn<QByteArray>("line");

    QTest::newRow("every bit of a double") << FVColor(0.1, 1.0 / 3.0, 1.0, 0.5) << FVColor::sRGBName() << true
                                           << QByteArray(R"({"r":0.1,"g":0.3333333333333333,"b":1.0,"a":0.5,)"
                                                         R"("colorSpace":"kTQColorSpaceSRGB","volatile":true})");
    QTest::newRow("no color") << FVColor() << QString() << false
                              << QByteArray(R"({"r":null,"g":null,"b":null,"a":null,)"
                                            R"("colorSpace":null,"volatile":false})");
    QTest::newRow("space not told") << FVColor(0, 0, 0) << QString() << false
                                    << QByteArray(R"({"r":0.0,"g":0.0,"b":0.0,"a":1.0,)"
                                                  R"("colorSpace":null,"volatile":false})");
}

void GalleryTest::picksAreWrittenWithoutLoss()
{
    QFETCH(FVColor, color);
    QFETCH(QString, colorspace);
    QFETCH(bool, isVolatile);
    QTEST(pickLine(color, colorspace, isVolatile), "line");
}

void GalleryTest::logKeepsTheNewestMessages()
{
    MessageLog log;
    const int messages = int(MessageLog::capacity) + 3;
    for (int number = 1; number <= messages; ++number)
        log.addPick(FVColor(0, 0, 0), FVColor::sRGBName(), number < messages);

    QCOMPARE(log.rowCount(), int(MessageLog::capacity));
    const QModelIndex newest = log.index(0);
    QCOMPARE(newest.data(MessageLog::NumberRole).toInt(), messages);
    QCOMPARE(newest.data(MessageLog::KindRole).value<MessageLog::Kind>(), MessageLog::Kind::FinalPick);
    QCOMPARE(log.index(log.rowCount() - 1).data(MessageLog::NumberRole).toInt(), 4);
}

void GalleryTest::pointsOfThePosterBelongToParts_data()
{
    QTest::addColumn<Poster::Part>("part");
    QTest::addColumn<QPointF>("point");
    QTest::addColumn<bool>("inside");

    QTest::newRow("the sun's middle") << Poster::Part::Sun << QPointF(392, 300) << true;
    QTest::newRow("a slit of the sun") << Poster::Part::Sun << QPointF(392, 368) << false;
    QTest::newRow("the sun behind the hills") << Poster::Part::Sun << QPointF(392, 492) << false;
    QTest::newRow("its reflection") << Poster::Part::Sun << QPointF(392, 582) << true;
    QTest::newRow("a hill") << Poster::Part::Hills << QPointF(60, 500) << true;
    QTest::newRow("the sky above it") << Poster::Part::Hills << QPointF(60, 300) << false;
    QTest::newRow("the water") << Poster::Part::Water << QPointF(300, 800) << true;
    QTest::newRow("the paper's edge") << Poster::Part::Paper << QPointF(1, 839) << true;
    QTest::newRow("beside the paper") << Poster::Part::Paper << QPointF(601, 400) << false;
}

void GalleryTest::pointsOfThePosterBelongToParts()
{
    QFETCH(Poster::Part, part);
    QFETCH(QPointF, point);
    PosterShape shape;
    shape.setPart(part);
    QVERIFY(!shape.contains(point)); // Without a size there is nothing to touch.
    shape.setSize(QSizeF(300, 420));
    QTEST(shape.contains(point / 2), "inside");
}

void GalleryTest::commandLineIsUnderstood_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<bool>("understood");
    QTest::addColumn<QString>("folder");

    const QString program = QStringLiteral("gallery");
    QTest::newRow("for a person") << QStringList{program} << true << QString();
    QTest::newRow("tour") << QStringList{program, QStringLiteral("--tour")} << true << QStringLiteral("build/tour");
    QTest::newRow("tour elsewhere") << QStringList{program, QStringLiteral("--tour=/x y")} << true
                                    << QStringLiteral("/x y");
    QTest::newRow("a folder left over") << QStringList{program, QStringLiteral("--tour"), QStringLiteral("/x")} << false
                                        << QString();
    QTest::newRow("unknown option") << QStringList{program, QStringLiteral("--tuor")} << false << QString();
}

void GalleryTest::commandLineIsUnderstood()
{
    QFETCH(QStringList, arguments);
    const ParsedOptions parsed = parseOptions(arguments);
    QTEST(parsed.options.has_value(), "understood");
    QCOMPARE(parsed.isMistake, !parsed.options);
    QCOMPARE(parsed.text.isEmpty(), parsed.options.has_value());
    if (parsed.options)
        QTEST(parsed.options->tourFolder.value_or(QString()), "folder");
}

QTEST_MAIN(GalleryTest)
#include "tst_gallery.moc"
