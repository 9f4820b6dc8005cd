#include "sliders/opacitybackground.h"
#include "sliders/sliderkeys.h"
#include "sliders/sliderrules.h"

#include <QTest>

#include <limits>

using namespace favrin;
using namespace favrin::sliders;
using model::SomeColor;
using Component = SomeColor::Component;
using Space = SomeColor::ColorSpace;
using Value = std::optional<double>;

Q_DECLARE_METATYPE(Value)

class SliderRulesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void locationsMeanValues_data();
    void locationsMeanValues();
    void thumbStandsWhereItsValueIs();
    void stopsAreTheEndsOfTheComponent();
    void keysMeanValues_data();
    void keysMeanValues();
};

void SliderRulesTest::locationsMeanValues_data()
{
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("width");
    QTest::addColumn<double>("value");
    QTest::newRow("left end") << 18.0 << 236.0 << 0.0;
    QTest::newRow("beyond the left end") << -500.0 << 236.0 << 0.0;
    QTest::newRow("middle") << 118.0 << 236.0 << 0.5;
    QTest::newRow("a quarter") << 68.0 << 236.0 << 0.25;
    QTest::newRow("right end") << 218.0 << 236.0 << 1.0;
    QTest::newRow("beyond the right end") << 1e9 << 236.0 << 1.0;
    QTest::newRow("as wide as high") << 36.0 << 36.0 << 0.0;
    QTest::newRow("narrower than high") << 20.0 << 20.0 << 0.0;
    QTest::newRow("no number") << std::numeric_limits<double>::quiet_NaN() << 236.0 << 0.0;
}

void SliderRulesTest::locationsMeanValues()
{
    QFETCH(double, x);
    QFETCH(double, width);
    const QSizeF size(width, 36.0);
    QTEST(valueAt(x, size, Qt::LeftToRight), "value");
    // On a mirrored track the same holds from the right edge.
    QTEST(valueAt(width - x, size, Qt::RightToLeft), "value");
}

void SliderRulesTest::thumbStandsWhereItsValueIs()
{
    const QSizeF size(236.0, 36.0);
    QCOMPARE(thumbCenter(0.0, size, Qt::LeftToRight), QPointF(18.0, 18.0));
    QCOMPARE(thumbCenter(1.0, size, Qt::LeftToRight), QPointF(218.0, 18.0));
    QCOMPARE(thumbCenter(0.0, size, Qt::RightToLeft), QPointF(218.0, 18.0));
    QCOMPARE(thumbCenter(1.0, size, Qt::RightToLeft), QPointF(18.0, 18.0));
    for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
        for (double x = 18.0; x <= 218.0; x += 12.5)
            QCOMPARE(thumbCenter(valueAt(x, size, direction), size, direction).x(), x);
    }
}

void SliderRulesTest::stopsAreTheEndsOfTheComponent()
{
    using Stops = std::pair<SomeColor, SomeColor>;
    const SomeColor color(0.1, 0.2, 0.3, 0.4, Space::displayP3);
    QVERIFY(gradientStops(color, Component::g) ==
            Stops(SomeColor(0.1, 0.0, 0.3, 1.0, Space::displayP3), SomeColor(0.1, 1.0, 0.3, 1.0, Space::displayP3)));
    QVERIFY(gradientStops(color, Component::a) ==
            Stops(SomeColor(0.1, 0.2, 0.3, 0.0, Space::displayP3), SomeColor(0.1, 0.2, 0.3, 1.0, Space::displayP3)));
    QVERIFY(gradientStops(std::nullopt, Component::b) ==
            Stops(SomeColor(0.0, 0.0, 0.0, 1.0, Space::sRGB), SomeColor(0.0, 0.0, 1.0, 1.0, Space::sRGB)));
}

void SliderRulesTest::keysMeanValues_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<double>("value");
    QTest::addColumn<Value>("leftToRight");
    QTest::addColumn<Value>("rightToLeft");
    const auto row = [](const char *name, int key, double value, Value leftToRight, Value rightToLeft) {
        QTest::newRow(name) << key << value << leftToRight << rightToLeft;
    };
    const auto same = [row](const char *name, int key, double value, Value result) {
        row(name, key, value, result, result);
    };
    row("right", Qt::Key_Right, 100 / 255.0, 101 / 255.0, 99 / 255.0);
    row("left", Qt::Key_Left, 100 / 255.0, 99 / 255.0, 101 / 255.0);
    same("up", Qt::Key_Up, 100 / 255.0, 101 / 255.0);
    same("down", Qt::Key_Down, 100 / 255.0, 99 / 255.0);
    same("from between two steps", Qt::Key_Up, 100.4 / 255.0, 101 / 255.0);
    same("up at the end", Qt::Key_Up, 1.0, 1.0);
    same("down at the end", Qt::Key_Down, 0.0, 0.0);
    same("page up", Qt::Key_PageUp, 0.25, 0.35);
    same("page up near the end", Qt::Key_PageUp, 0.95, 1.0);
    same("page down", Qt::Key_PageDown, 0.5, 0.4);
    same("page down near the end", Qt::Key_PageDown, 0.05, 0.0);
    same("home", Qt::Key_Home, 0.5, 0.0);
    same("end", Qt::Key_End, 0.5, 1.0);
    same("letter", Qt::Key_A, 0.5, std::nullopt);
    same("tab", Qt::Key_Tab, 0.5, std::nullopt);
}

void SliderRulesTest::keysMeanValues()
{
    QFETCH(int, key);
    QFETCH(double, value);
    QTEST(valueForKey(key, {}, value, 255, Qt::LeftToRight), "leftToRight");
    QTEST(valueForKey(key, {}, value, 255, Qt::RightToLeft), "rightToLeft");
    QCOMPARE(valueForKey(key, Qt::ControlModifier, value, 255, Qt::LeftToRight), Value());
}

QTEST_APPLESS_MAIN(SliderRulesTest)
#include "tst_sliderrules.moc"
