#include "apps/gallery/galleryoptions.h"
#include "apps/gallery/messagelog.h"
#include "apps/gallery/pickrecorder.h"

#include <QTest>

using namespace favrin::gallery;

class GalleryTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void picksAreWrittenWithoutLoss_data()
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

    void picksAreWrittenWithoutLoss()
    {
        QFETCH(FVColor, color);
        QFETCH(QString, colorspace);
        QFETCH(bool, isVolatile);
        QTEST(pickLine(color, colorspace, isVolatile), "line");
    }

    void logKeepsTheNewestMessages()
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

    void commandLineIsUnderstood_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<bool>("understood");
        QTest::addColumn<QString>("folder");

        const QString program = QStringLiteral("gallery");
        QTest::newRow("for a person") << QStringList{program} << true << QString();
        QTest::newRow("tour") << QStringList{program, QStringLiteral("--tour")} << true << QStringLiteral("build/tour");
        QTest::newRow("tour elsewhere") << QStringList{program, QStringLiteral("--tour=/x y")} << true
                                        << QStringLiteral("/x y");
        QTest::newRow("a folder left over")
            << QStringList{program, QStringLiteral("--tour"), QStringLiteral("/x")} << false << QString();
        QTest::newRow("unknown option") << QStringList{program, QStringLiteral("--tuor")} << false << QString();
    }

    void commandLineIsUnderstood()
    {
        QFETCH(QStringList, arguments);
        const ParsedOptions parsed = parseOptions(arguments);
        QTEST(parsed.options.has_value(), "understood");
        QCOMPARE(parsed.isMistake, !parsed.options);
        QCOMPARE(parsed.text.isEmpty(), parsed.options.has_value());
        if (parsed.options)
            QTEST(parsed.options->tourFolder.value_or(QString()), "folder");
    }
};

QTEST_MAIN(GalleryTest)
#include "tst_gallery.moc"
