#include "spectrumwindow.h"

#include "../shared/statewrites.h"
#include "model/colordescription.h"
#include "spectrum/spectrummapping.h"
#include "spectrum/spectrumview.h"

#include <QAccessible>
#include <QPointingDevice>
#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

using namespace favrin;
using model::SomeColor;

namespace {

constexpr QSizeF fieldSize = {360.0, 300.0};
constexpr auto sRGB = SomeColor::ColorSpace::sRGB;
constexpr auto displayP3 = SomeColor::ColorSpace::displayP3;

/** What a touch at a point of the spectrum must select. */
SomeColor touched(QPointF point, const SomeColor &current)
{
    const SomeColor picked(spectrum::colorForPoint(point, fieldSize), current.colorSpace);
    return {picked.r, picked.g, picked.b, current.a, current.colorSpace};
}

bool isNear(std::optional<QPointF> place, QPointF expected)
{
    return place && QLineF(*place, expected).length() < 0.5;
}

/** Counts the frames of a view on their way to its renderer. */
class FrameCounter : public platform::gpu::VexelViewDelegate
{
public:
    explicit FrameCounter(VexelViewDelegate &renderer) : m_renderer(renderer) {}
    void draw(platform::gpu::VexelView &view) override
    {
        ++frames;
        m_renderer.draw(view);
    }
    void drawableSizeWillChange(platform::gpu::VexelView &view, QSize size) override
    {
        m_renderer.drawableSizeWillChange(view, size);
    }

    int frames = 0;

private:
    VexelViewDelegate &m_renderer;
};

QStringList &spokenDescriptions()
{
    static QStringList list;
    return list;
}

void recordDescription(QAccessibleEvent *event)
{
    if (event->type() == QAccessible::DescriptionChanged)
        spokenDescriptions().append(event->accessibleInterface()->text(QAccessible::Description));
}

} // namespace

class SpectrumTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        // Every move counts here; the toolkit would merge those of one frame.
        qputenv("QML_NO_TOUCH_COMPRESSION", "1");
    }

    void touchIsVolatileThenFinal()
    {
        const SomeColor current(0.2, 0.4, 0.6, 0.5, displayP3);
        SpectrumWindow spectrum(current);
        StateWrites writes(spectrum.state);
        const auto touch = [&] { return QTest::touchEvent(&spectrum.window, m_touch.get()); };
        touch().press(0, SpectrumWindow::at(100, 120));
        QCOMPARE(writes.take(), QStringLiteral("volatile color"));
        QCOMPARE(spectrum.state.selectedColor(), std::optional(touched({100.0, 120.0}, current)));
        touch().move(0, SpectrumWindow::at(101, 130));
        QCOMPARE(writes.take(), QStringLiteral("volatile color"));
        QVERIFY(isNear(spectrum.lensCenter(), {101.0, 130.0}));
        // White at every height: the flag is said again, the color is not.
        touch().move(0, SpectrumWindow::at(-5, 40));
        touch().move(0, SpectrumWindow::at(-9, 50));
        QCOMPARE(writes.take(), QStringLiteral("volatile color volatile"));
        QCOMPARE(spectrum.lensCenter(), std::optional(QPointF(0.0, 50.0)));
        touch().release(0, SpectrumWindow::at(200, 200));
        QCOMPARE(writes.take(), QStringLiteral("final"));
        QCOMPARE(spectrum.state.selectedColor(), std::optional(touched({-9.0, 50.0}, current)));
    }

    void mousePicksTheNearestEdge_data()
    {
        QTest::addColumn<SomeColor::ColorSpace>("space");
        QTest::addColumn<QPoint>("point");
        QTest::addColumn<double>("gray");
        for (const auto space : {sRGB, displayP3}) {
            const char *name = space == sRGB ? "sRGB" : "Display P3";
            QTest::addRow("left edge, %s", name) << space << QPoint(0, 170) << 1.0;
            QTest::addRow("beyond the right edge, %s", name) << space << QPoint(375, 170) << 0.0;
        }
    }

    void mousePicksTheNearestEdge()
    {
        QFETCH(SomeColor::ColorSpace, space);
        QFETCH(QPoint, point);
        QFETCH(double, gray);
        SpectrumWindow spectrum({0.2, 0.4, 0.6, 0.25, space});
        QTest::mousePress(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(180, 150));
        QTest::mouseMove(&spectrum.window, SpectrumWindow::at(point.x(), point.y()));
        const QPointF edge(gray > 0.5 ? 0.0 : 360.0, 170.0);
        QCOMPARE(spectrum.lensCenter(), std::optional(edge));
        QTest::mouseRelease(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(point.x(), point.y()));
        const SomeColor color = spectrum.state.selectedColor().value();
        QVERIFY(color.isApproximatelyEqual({gray, gray, gray, 0.25, space}, true));
        // The lens stays where the reference white and black were read in the same space.
        const double one = 1.0;
        const SomeColor reference(platform::Color(platform::ColorSpace::gray(), std::span(&one, 1), 1.0));
        QCOMPARE(spectrum.lensCenter(), space == reference.colorSpace ? std::optional(edge) : std::nullopt);
    }

    void lensMarksTheColor_data()
    {
        QTest::addColumn<SomeColor>("color");
        QTest::addColumn<int>("half");
        QTest::newRow("tint") << SomeColor(1.0, 0.6, 0.6, 1.0, sRGB) << -1;
        QTest::newRow("shade") << SomeColor(0.6, 0.0, 0.0, 0.3, sRGB) << 1;
        QTest::newRow("gray") << SomeColor(0.5, 0.5, 0.5, 1.0, sRGB) << 0;
        QTest::newRow("none of an extreme") << SomeColor(0.2, 0.4, 0.6, 1.0, sRGB) << 0;
    }

    void lensMarksTheColor()
    {
        QFETCH(SomeColor, color);
        QFETCH(int, half);
        SpectrumWindow spectrum;
        spectrum.state.selectedColor.set(color);
        QCOMPARE(spectrum.item->lens().isVisible(), half != 0);
        if (half == 0)
            return;
        QCOMPARE(spectrum.item->lens().color(), color);
        QVERIFY((spectrum.lensCenter()->x() - 180.0) * half > 0.0);
        // It follows the size: the same share of it.
        const double share = spectrum.lensCenter()->x() / 360.0;
        spectrum.item->setSize({720.0, 600.0});
        QVERIFY(std::abs(spectrum.lensCenter()->x() - share * 720.0) < 1e-6);
    }

    void nothingSelectedShowsNoLens()
    {
        SpectrumWindow spectrum({1.0, 0.6, 0.6, 1.0, sRGB});
        QVERIFY(!spectrum.lensCenter());
        QTest::mouseClick(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(60, 80));
        QVERIFY(isNear(spectrum.lensCenter(), {60.0, 80.0}));
        // What lies under the lens is picked all the same.
        QTest::mouseClick(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(66, 86));
        QVERIFY(isNear(spectrum.lensCenter(), {66.0, 86.0}));
        spectrum.state.selectedColor.set(std::nullopt);
        QVERIFY(!spectrum.lensCenter());
    }

    void hidingEndsTheDrag()
    {
        SpectrumWindow spectrum;
        const auto touch = [&] { return QTest::touchEvent(&spectrum.window, m_touch.get()); };
        touch().press(0, SpectrumWindow::at(50, 50));
        StateWrites writes(spectrum.state);
        spectrum.item->setVisible(false);
        QCOMPARE(writes.take(), QStringLiteral("final"));
        touch().release(0, SpectrumWindow::at(50, 50));
        QCOMPARE(writes.take(), QString());
    }

    void heldKeyIsADrag()
    {
        SpectrumWindow spectrum;
        spectrum.item->forceActiveFocus();
        StateWrites writes(spectrum.state);
        QTest::keyPress(&spectrum.window, Qt::Key_Right);
        QTest::keyPress(&spectrum.window, Qt::Key_Right);
        QTest::keyPress(&spectrum.window, Qt::Key_Down);
        QCOMPARE(writes.take(), QStringLiteral("volatile color volatile color volatile color"));
        QTest::keyRelease(&spectrum.window, Qt::Key_Right);
        QCOMPARE(writes.take(), QString());
        QTest::keyRelease(&spectrum.window, Qt::Key_Down);
        QCOMPARE(writes.take(), QStringLiteral("final"));
        QTest::keyPress(&spectrum.window, Qt::Key_Down);
        writes.take();
        spectrum.item->setFocus(false);
        QCOMPARE(writes.take(), QStringLiteral("final"));
    }

    void keysMoveThePick_data()
    {
        QTest::addColumn<int>("key");
        QTest::addColumn<Qt::KeyboardModifiers>("modifiers");
        QTest::addColumn<QPointF>("expected");
        const auto row = [](const char *name, int key, Qt::KeyboardModifiers modifiers, QPointF expected) {
            QTest::newRow(name) << key << modifiers << expected;
        };
        row("left", Qt::Key_Left, {}, {176.4, 150.0});
        row("right in large steps", Qt::Key_Right, Qt::ShiftModifier, {216.0, 150.0});
        row("up", Qt::Key_Up, {}, {180.0, 147.0});
        row("down in large steps", Qt::Key_Down, Qt::ShiftModifier, {180.0, 180.0});
        row("a hue up", Qt::Key_PageUp, {}, {180.0, 100.0});
        row("a hue down", Qt::Key_PageDown, {}, {180.0, 200.0});
        row("the first hue", Qt::Key_Home, {}, {180.0, 0.0});
        row("the last hue", Qt::Key_End, {}, {180.0, 300.0});
        row("no key of ours", Qt::Key_A, {}, {180.0, 150.0});
        row("a shortcut of others", Qt::Key_Left, Qt::ControlModifier, {180.0, 150.0});
    }

    void keysMoveThePick()
    {
        QFETCH(int, key);
        QFETCH(Qt::KeyboardModifiers, modifiers);
        QFETCH(QPointF, expected);
        QGuiApplication::setLayoutDirection(Qt::RightToLeft);
        SpectrumWindow spectrum;
        QTest::mouseClick(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(180, 150));
        QTest::keyClick(&spectrum.window, static_cast<Qt::Key>(key), modifiers);
        QGuiApplication::setLayoutDirection(Qt::LeftToRight);
        QCOMPARE(spectrum.item->pickPlace(), expected);
        QCOMPARE(spectrum.state.selectedColor(), std::optional(touched(expected, spectrum.state.fallbackColor())));
    }

    void emptySpectrumIgnoresTouches()
    {
        SpectrumWindow spectrum;
        spectrum.item->setSize({0.0, 300.0});
        spectrum.item->forceActiveFocus();
        StateWrites writes(spectrum.state);
        QMouseEvent press(QEvent::MouseButtonPress, QPointF(0.0, 20.0), QPointF(20.0, 40.0), Qt::LeftButton,
                          Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(spectrum.item, &press);
        QTest::keyClick(&spectrum.window, Qt::Key_Right);
        spectrum.item->pickFinally({0.0, 0.0});
        QCOMPARE(writes.take(), QString());
    }

    void colorChangesDrawNothing()
    {
        SpectrumWindow spectrum;
        auto &view = spectrum.item->spectrum().vexelView();
        QTRY_VERIFY(!view.render(1.0).isNull());
        FrameCounter counter(spectrum.item->spectrum().renderer());
        view.setDelegate(&counter);
        // A new delegate draws at once.
        QTRY_COMPARE(counter.frames, 1);
        QTest::mouseClick(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(180, 150));
        spectrum.state.selectedColor.set(SomeColor(1.0, 0.6, 0.6, 1.0, sRGB));
        spectrum.window.grabWindow();
        QCOMPARE(counter.frames, 1);
        spectrum.item->setSize({180.0, 150.0});
        spectrum.window.grabWindow();
        QCOMPARE(counter.frames, 2);
        view.setDelegate(&spectrum.item->spectrum().renderer());
    }

    void oneElementWithTwoAxes()
    {
        SpectrumWindow spectrum;
        const SomeColor red(1.0, 0.0, 0.0, 1.0, sRGB);
        spectrum.state.selectedColor.set(red);
        QAccessibleInterface *element = QAccessible::queryAccessibleInterface(spectrum.item);
        QVERIFY(element);
        QCOMPARE(element->text(QAccessible::Name), QStringLiteral("Color Spectrum"));
        // The very first name of a process arrives later.
        QTRY_COMPARE(element->text(QAccessible::Value),
                     QString::fromStdString(model::colorDescription(red.platformColor())));
        QCOMPARE(element->childCount(), 2);
        for (int index = 0; index < 2; ++index) {
            QAccessibleInterface *axis = element->child(index);
            QCOMPARE(element->indexOfChild(axis), index);
            QCOMPARE(axis->parent(), element);
            QVERIFY(!axis->text(QAccessible::Name).isEmpty());
        }
        QCOMPARE(element->child(2), nullptr);
        QCOMPARE(element->child(-1), nullptr);
        QCOMPARE(element->child(1)->valueInterface()->currentValue().toDouble(), 50.0);
    }

    void axesPickFinally()
    {
        SpectrumWindow spectrum;
        QTest::mouseClick(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(180, 150));
        QAccessibleInterface *element = QAccessible::queryAccessibleInterface(spectrum.item);
        StateWrites writes(spectrum.state);
        element->child(0)->valueInterface()->setCurrentValue(120.0);
        QCOMPARE(writes.take(), QStringLiteral("color"));
        QCOMPARE(spectrum.item->pickPlace(), QPointF(180.0, 100.0));
        element->child(1)->actionInterface()->doAction(QAccessibleActionInterface::decreaseAction());
        QCOMPARE(writes.take(), QStringLiteral("color"));
        QVERIFY(isNear(spectrum.item->pickPlace(), {183.6, 100.0}));
        element->child(0)->valueInterface()->setCurrentValue(qQNaN());
        QCOMPARE(writes.take(), QString());
    }

    void newColorIsAnnounced()
    {
        // As if an assistive technology were running; there is no public way to say so.
        QGuiApplicationPrivate::platformIntegration()->accessibility()->setActive(true);
        SpectrumWindow spectrum;
        QVERIFY(QAccessible::queryAccessibleInterface(spectrum.item));
        QAccessible::installUpdateHandler(recordDescription);
        QTest::mousePress(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(90, 100));
        const QString name =
            QString::fromStdString(model::colorDescription(spectrum.state.selectedColor()->platformColor()));
        QVERIFY(spokenDescriptions().contains(name));
        spokenDescriptions().clear();
        QTest::mouseMove(&spectrum.window, SpectrumWindow::at(90, 100));
        QVERIFY(spokenDescriptions().isEmpty());
        QTest::mouseRelease(&spectrum.window, Qt::LeftButton, {}, SpectrumWindow::at(90, 100));
        QAccessible::installUpdateHandler(nullptr);
    }

private:
    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
};

QTEST_MAIN(SpectrumTest)
#include "tst_spectrum.moc"
