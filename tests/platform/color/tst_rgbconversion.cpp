#include "platform/color/rgbconversion.h"

#include "../../shared/table.h"

#include <QTest>

#include <cmath>
#include <limits>

using namespace favrin::platform;

namespace {

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

long double exactlyDecoded(long double encoded)
{
    return encoded <= 0.04045 ? encoded / 12.92L : std::pow((encoded + 0.055L) / 1.055L, 2.4L);
}

long double exactlyEncoded(long double linear)
{
    return linear <= 0.0031308 ? linear * 12.92L : 1.055L * std::pow(linear, 1.0L / 2.4L) - 0.055L;
}

QString text(const Triple &value)
{
    return QStringLiteral("%1 %2 %3").arg(value[0], 0, 'g', 17).arg(value[1], 0, 'g', 17).arg(value[2], 0, 'g', 17);
}

bool isNear(const Triple &left, const Triple &right, double tolerance)
{
    for (std::size_t i = 0; i < left.size(); ++i) {
        if (!(std::abs(left[i] - right[i]) <= tolerance))
            return false;
    }
    return true;
}

} // namespace

class RGBConversionTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    // The results are of the published primaries and white point, in fifty digits.
    void conversionsAreExact_data()
    {
        addRows<Triple, Triple, Triple>({
            {"zero", {0, 0, 0}, {0, 0, 0}, {0, 0, 0}},
            {"red", {1, 0, 0}, {0.91748755732516575446, 0.20028680774084710713, 0.13856059121111409472}, {1, 0, 0}},
            {"green", {0, 1, 0}, {0.4584015901910302359, 0.98526458332505445069, 0.29829470783345858024}, {0, 1, 0}},
            {"blue", {0, 0, 1}, {0, 0, 0.95958802667580964779}, {0, 0, 1}},
            {"full", {1, 1, 1}, {1, 1, 1}, {1, 1, 1}},
            {"middle",
             {0.5, 0.25, 0.75},
             {0.46737077543602004924, 0.26313097327871073213, 0.72411840244373234112},
             {0.53783181993112673143, 0.23213187867192009755, 0.77705690990152486014}},
            {"bits of 255",
             {0.047058823529411764, 0.3803921568627451, 0.9921568627450981},
             {0.16896948674874223803, 0.37449977197705335931, 0.95612350857637479291},
             {0, 0.38770111516023890179, 1}},
            {"end of the toe",
             {0.04045, 0.04045000000000001, 0.05},
             {0.040449975661806712473, 0.040449999017721530408, 0.049194884217237460088},
             {0.040449963751717992138, 0.040450001244543997861, 0.050874393454626957953}},
            {"within the toe",
             {0.001, 0.02, 0.04},
             {0.0043732225944271174979, 0.019369310221831729655, 0.037885828588597050151},
             {0, 0.020799082139484075489, 0.042282163980965815613}},
            {"smallest number",
             {5e-324, 2.2250738585072014e-308, 1e-16},
             {3.9503523230450664812e-309, 2.1512143143898369209e-308, 9.1051992861491647987e-17},
             {0, 2.3186536890001498139e-308, 1.0982736001409662964e-16}},
            {"just below full",
             {0.9999999999999999, 0.999999, 1},
             {0.99999982246206550212, 0.999999033194220113, 0.99999992760260389057},
             {1, 0.99999895794301618629, 1}},
            {"negative",
             {-0.25, 0.5, 0.75},
             {0.16042726701923859757, 0.4915398072234647369, 0.72935246902611633095},
             {0, 0.51046638378418368591, 0.77198050723187026415}},
            {"negative toe",
             {-0.001, -0.04, 0.01},
             {0, 0, 0.0061922190288695063371},
             {0.0077726668749418382123, 0, 0.014147815378025273372}},
            {"minus zero",
             {-0.0, 0.3, 0.6},
             {0.11775598532494381805, 0.29504163704302778999, 0.57968287033210512883},
             {0, 0.30614626404542174172, 0.62139494703375657767}},
            {"far below", {-1000, 0.5, 0.9}, {0, 0, 0}, {0, 1, 1}},
            {"above full",
             {1.25, 0.5, 0.25},
             {1, 0.54900530699815265717, 0.33232807954785463108},
             {1, 0.42752004895562744637, 0.072984461055912895741}},
            {"far above", {0.1, 100, 0.2}, {1, 1, 1}, {0, 1, 0}},
            {"all above", {1.5, 1.2, 1.1}, {1, 1, 1}, {1, 1, 1}},
        });
    }
    void conversionsAreExact()
    {
        const auto [color, sRGBInDisplayP3, displayP3InSRGB] = row<Triple, Triple, Triple>();
        const Triple wide = convertedSRGBToDisplayP3(color);
        const Triple narrow = convertedDisplayP3ToSRGB(color);
        QVERIFY2(isNear(wide, sRGBInDisplayP3, 2e-14), qPrintable(text(wide)));
        QVERIFY2(isNear(narrow, displayP3InSRGB, 2e-14), qPrintable(text(narrow)));
    }

    void curvesAreExactEverywhere()
    {
        // A step that is no fraction of the tables' own.
        constexpr double step = 1.0 / 30011.0;
        for (double x = 0.0; x <= 1.0; x += step) {
            const auto decodedError = static_cast<double>(std::abs(decodedSRGB(x) - exactlyDecoded(x)));
            const auto encodedError = static_cast<double>(std::abs(encodedSRGB(x) - exactlyEncoded(x)));
            QVERIFY2(decodedError <= 7e-16 && encodedError <= 7e-16,
                     qPrintable(QStringLiteral("%1: %2 %3").arg(x).arg(decodedError).arg(encodedError)));
        }
        for (const double x : {1.0000000000000002, 1.5, 2.0, 64.0}) {
            const long double exact = exactlyDecoded(x);
            QVERIFY(std::abs(decodedSRGB(x) - exact) <= 1e-15L * exact);
            QCOMPARE(decodedExtendedSRGB(-x), -decodedSRGB(x));
        }
    }

    void curvesKeepTheirEnds()
    {
        QCOMPARE(decodedSRGB(0.0), 0.0);
        QCOMPARE(decodedSRGB(1.0), 1.0);
        QCOMPARE(encodedSRGB(0.0), 0.0);
        QCOMPARE(encodedSRGB(1.0), 1.0);
        QVERIFY(encodedSRGB(std::nextafter(1.0, 0.0)) <= 1.0);
        QVERIFY(decodedSRGB(std::nextafter(1.0, 0.0)) <= 1.0);
        QCOMPARE(encodedSRGB(-0.5), 0.0);
        QCOMPARE(encodedSRGB(1.5), 1.0);
        QVERIFY(decodedSRGB(-0.5) == -0.5 / 12.92);
    }

    void whatIsNotFiniteStaysDefined_data()
    {
        addRows<double, double, double>({
            {"not a number", notANumber, notANumber, notANumber},
            {"infinite", infinity, infinity, 1.0},
            {"minus infinite", -infinity, -infinity, 0.0},
            {"too large for its power", 1e300, infinity, 1.0},
        });
    }
    void whatIsNotFiniteStaysDefined()
    {
        const auto [component, decoded, encoded] = row<double, double, double>();
        QCOMPARE(decodedSRGB(component), decoded);
        QCOMPARE(encodedSRGB(component), encoded);
        for (std::size_t place = 0; place < 3; ++place) {
            Triple color = {0.25, 0.5, 0.75};
            color[place] = component;
            for (const Triple &result : {convertedSRGBToDisplayP3(color), convertedDisplayP3ToSRGB(color)}) {
                for (const double each : result)
                    QVERIFY(std::isnan(each) || (each >= 0.0 && each <= 1.0));
                QVERIFY(!std::isnan(component) || std::isnan(result[place]));
            }
        }
    }
};

QTEST_APPLESS_MAIN(RGBConversionTest)
#include "tst_rgbconversion.moc"
