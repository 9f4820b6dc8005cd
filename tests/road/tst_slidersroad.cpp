#include "onepointer.h"
#include "roadtest.h"
#include "slidershost.h"

#include <array>

namespace {

using Row = SlidersHost::Row;

constexpr int slidersTab = 2;
const FVColor deepBlue(0, 97 / 255.0, 253 / 255.0);

QString digits(const FVColor &color)
{
    QString text;
    for (const double component : {color.red(), color.green(), color.blue()})
        text += QStringLiteral("%1").arg(std::lround(component * 255), 2, 16, QLatin1Char('0'));
    return text.toUpper();
}

} // namespace

/** The sliders and their fields, from the app's window to the picker's process and back. */
class SlidersRoadTest : public RoadTest
{
    Q_OBJECT

private Q_SLOTS:
    void aDragOfASliderEndsWithOneFinalPick_data();
    void aDragOfASliderEndsWithOneFinalPick();
    void everyKeyTypedIntoAFieldCounts_data();
    void everyKeyTypedIntoAFieldCounts();
    void anIncompleteHexCodeLeavesTheColorAsItIs();
    void aPastedColorBecomesHexDigits();
    void theColorSpaceMenuConverts();
};

void SlidersRoadTest::aDragOfASliderEndsWithOneFinalPick_data()
{
    QTest::addColumn<bool>("byTouch");
    QTest::newRow("finger") << true;
    QTest::newRow("mouse") << false;
}

void SlidersRoadTest::aDragOfASliderEndsWithOneFinalPick()
{
    QFETCH(bool, byTouch);
    SlidersHost host;
    host.picker.setSelectedColor(FVColor(0.25, 0.5, 0.75, 0.4, FVColor::displayP3Name()));
    QVERIFY(host.present());
    host.click(host.tabSegment(slidersTab));

    Pointer pointer(host.window, byTouch ? touchScreen() : nullptr);
    pointer.press(host.onTrack(Row::Red, 0.5));
    QTRY_VERIFY(host.picks.size() >= 2);
    // The value is there before the gesture is known.
    QVERIFY(!host.picks[0].isVolatile);
    QVERIFY(std::abs(host.picks[0].color.red() - 0.5) < 0.005);
    pointer.move(host.onTrack(Row::Red, 0.7));
    QTRY_VERIFY(std::abs(host.picks.back().color.red() - 0.7) < 0.005);
    const QPoint end = host.onTrack(Row::Red, 1.04);
    pointer.move(end);
    QTRY_COMPARE(host.picks.back().color.red(), 1.0);
    QVERIFY(host.picks.back().isVolatile);
    pointer.release(end);
    QTRY_VERIFY(!host.picks.back().isVolatile);

    for (std::size_t i = 1; i + 1 < host.picks.size(); ++i)
        QVERIFY(host.picks[i].isVolatile);
    QCOMPARE(host.picks.back().color, FVColor(1, 0.5, 0.75, 0.4, FVColor::displayP3Name()));
}

void SlidersRoadTest::everyKeyTypedIntoAFieldCounts_data()
{
    QTest::addColumn<int>("row");
    QTest::addColumn<QString>("keys");
    QTest::addColumn<QList<double>>("values");
    QTest::addColumn<QString>("shown");
    using Values = QList<double>;
    QTest::newRow("integer") << int(Row::Red) << "128" << Values{1 / 255.0, 12 / 255.0, 128 / 255.0} << "128";
    QTest::newRow("too large") << int(Row::Green) << "300" << Values{3 / 255.0, 30 / 255.0, 1} << "255";
    QTest::newRow("no digit, too many digits")
        << int(Row::Blue) << "x25-47" << Values{2 / 255.0, 25 / 255.0, 254 / 255.0} << "254";
    QTest::newRow("percent") << int(Row::Opacity) << "30" << Values{0.03, 0.3} << "30%";
    QTest::newRow("too many percent") << int(Row::Opacity) << "150" << Values{0.01, 0.15, 1} << "100%";
}

void SlidersRoadTest::everyKeyTypedIntoAFieldCounts()
{
    QFETCH(int, row);
    QFETCH(QString, keys);
    QFETCH(QList<double>, values);
    QFETCH(QString, shown);
    SlidersHost host;
    host.picker.setSelectedColor(FVColor(0.1, 0.2, 0.3, 0.4));
    QVERIFY(host.present());
    host.click(host.tabSegment(slidersTab));
    const QPoint field = host.field(static_cast<Row>(row));
    host.select(field);
    host.type(keys);
    QTRY_COMPARE(host.picks.size(), static_cast<std::size_t>(values.size()));
    for (std::size_t i = 0; i < host.picks.size(); ++i) {
        const FVColor &color = host.picks[i].color;
        std::array expected = {0.1, 0.2, 0.3, 0.4};
        expected[static_cast<std::size_t>(row)] = values[static_cast<qsizetype>(i)];
        QCOMPARE(color, FVColor(expected[0], expected[1], expected[2], expected[3]));
        QVERIFY(!host.picks[i].isVolatile);
    }
    QCOMPARE(host.text(field), shown);
}

void SlidersRoadTest::anIncompleteHexCodeLeavesTheColorAsItIs()
{
    const FVColor odd(0.1 + 0.2, 1.0 / 3.0, 5e-324, 0.123456789012345678);
    SlidersHost host;
    host.picker.setSelectedColor(odd);
    QVERIFY(host.present());
    host.click(host.tabSegment(slidersTab));
    host.select(host.hexField());
    host.type(QStringLiteral("F"));
    host.press(Qt::Key_NumberSign, Qt::ShiftModifier);
    host.type(QStringLiteral("0g"));
    QCOMPARE(host.text(host.hexField()), QStringLiteral("f0"));
    host.click(host.field(Row::Red));
    QCOMPARE(host.text(host.hexField()), QStringLiteral("4D5500"));
    QVERIFY(host.picks.empty());
    QCOMPARE(host.picker.selectedColor(), odd);

    host.type(QStringLiteral("f00"));
    QTRY_COMPARE(host.picks.size(), std::size_t(1));
    QCOMPARE(host.picks[0].color, FVColor(1, 0, 0));
    QVERIFY(!host.picks[0].isVolatile);
    host.press(Qt::Key_Return);
    QCOMPARE(host.text(host.hexField()), QStringLiteral("FF0000"));
}

void SlidersRoadTest::aPastedColorBecomesHexDigits()
{
    SlidersHost host;
    host.picker.setSelectedColor(FVColor(1, 1, 1));
    QVERIFY(host.present());
    host.click(host.tabSegment(slidersTab));
    QGuiApplication::clipboard()->setText(QStringLiteral("rgb(0 97 253)"));
    host.select(host.hexField());
    host.press(Qt::Key_V, Qt::ControlModifier);
    QTRY_COMPARE(host.picks.size(), std::size_t(1));
    QCOMPARE(host.picks[0].color, deepBlue);
    QCOMPARE(host.text(host.hexField()), QStringLiteral("0061FD"));
}

void SlidersRoadTest::theColorSpaceMenuConverts()
{
    SlidersHost host;
    host.picker.setSelectedColor(deepBlue);
    QVERIFY(host.present());
    host.click(host.tabSegment(slidersTab));

    host.click(host.colorSpaceButton());
    host.click(host.colorSpace(1));
    QTRY_COMPARE(host.picks.size(), std::size_t(1));
    QVERIFY(!host.picks[0].isVolatile);
    QCOMPARE(host.picks[0].space, FVColor::displayP3Name());
    QCOMPARE(digits(host.picks[0].color), QStringLiteral("285FF4"));
    QCOMPARE(host.text(host.hexField()), QStringLiteral("285FF4"));

    host.click(host.colorSpaceButton());
    host.press(Qt::Key_Up);
    host.press(Qt::Key_Return);
    QTRY_COMPARE(host.picks.size(), std::size_t(2));
    QCOMPARE(host.picks[1].space, FVColor::sRGBName());
    QCOMPARE(digits(host.picks[1].color), QStringLiteral("0061FD"));
    QCOMPARE(host.text(host.hexField()), QStringLiteral("0061FD"));
}

QTEST_MAIN(SlidersRoadTest)
#include "tst_slidersroad.moc"
