// Times what typing and dragging on the sliders tab cost: formatting and parsing per call, making the formatters of a
// locale, painting a track, and a step of a drag from the event to the written color and to the finished frame.

#include "sliders/cpslider.h"
#include "sliders/hexfieldrules.h"
#include "sliders/integerslidercontrolstyle.h"
#include "sliders/percentageslidercontrolstyle.h"
#include "sliders/sliderrules.h"
#include "sliders/slidertrack.h"

#include <benchmark/benchmark.h>

#include <QGuiApplication>
#include <QMouseEvent>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickWindow>

#include <memory>

using namespace favrin;
using namespace favrin::sliders;
using model::SomeColor;

namespace {

constexpr double scale = 3.0;
const SomeColor color(0.2, 0.4, 0.6, 0.5, SomeColor::ColorSpace::displayP3);

void format(benchmark::State &state, const SliderControlStyle &style)
{
    double value = 0.0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(style.floatToTextMapping(value));
        value = value < 1.0 ? value + 0.001 : 0.0;
    }
}

void parse(benchmark::State &state, const SliderControlStyle &style)
{
    const QString text = style.floatToTextMapping(0.42);
    for (auto _ : state)
        benchmark::DoNotOptimize(style.textToFloatMapping(text));
}

void makeFormatter(benchmark::State &state)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(platform::NumberFormatter(platform::NumberFormatter::Style::Percent, "de"));
}

void pasteColor(benchmark::State &state)
{
    const TextEdit edit = {{0, 6}, QStringLiteral("color(display-p3 0.1569 0.3743 0.9561)")};
    for (auto _ : state)
        benchmark::DoNotOptimize(withColorAsDigits(QStringLiteral("0061FD"), edit, SomeColor::ColorSpace::sRGB));
}

void paintTrack(benchmark::State &state, ColorComponent::Name component)
{
    service::ColorPickerState pickerState({});
    pickerState.selectedColor.set(color);
    SliderTrack track;
    track.setComponent(component);
    track.setColorPickerState(&pickerState);
    track.setSize({236.0, trackHeight});
    for (auto _ : state)
        benchmark::DoNotOptimize(track.render(scale));
}

/** The sliders in a window, with the red one being dragged. */
class Drag
{
public:
    Drag()
    {
        m_state.selectedColor.set(color);
        m_engine.addImportPath(QStringLiteral("qrc:/qt/qml"));
        QQmlComponent component(&m_engine, QUrl(QStringLiteral("qrc:/qt/qml/Favrin/Sliders/RGBAView.qml")));
        m_view.reset(qobject_cast<QQuickItem *>(component.createWithInitialProperties(
            {{QStringLiteral("colorPickerState"), QVariant::fromValue(&m_state)}})));
        m_view->setParentItem(m_window.contentItem());
        m_view->setSize({328.0, 273.0});
        m_window.resize(328, 273);
        m_window.show();
        m_red = m_view->findChild<CPSlider *>();
        send(QEvent::MouseButtonPress, 100.0);
        m_window.grabWindow();
    }

    void step()
    {
        m_x = m_x < 200.0 ? m_x + 1.0 : 20.0;
        send(QEvent::MouseMove, m_x);
    }
    QImage frame() { return m_window.grabWindow(); }

private:
    void send(QEvent::Type type, double x)
    {
        const QPointF position = m_red->mapToScene(QPointF(x, trackHeight / 2.0));
        const auto button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, position, position, button, Qt::LeftButton, {});
        QCoreApplication::sendEvent(&m_window, &event);
    }

    service::ColorPickerState m_state = service::ColorPickerState({});
    QQmlEngine m_engine;
    QQuickWindow m_window;
    std::unique_ptr<QQuickItem> m_view;
    CPSlider *m_red = nullptr;
    double m_x = 100.0;
};

void dragStepToColor(benchmark::State &state)
{
    Drag drag;
    for (auto _ : state)
        drag.step();
}

void dragStepToFrame(benchmark::State &state)
{
    Drag drag;
    for (auto _ : state) {
        drag.step();
        benchmark::DoNotOptimize(drag.frame());
    }
}

BENCHMARK_CAPTURE(format, integer, IntegerSliderControlStyle());
BENCHMARK_CAPTURE(format, percentage, PercentageSliderControlStyle());
BENCHMARK_CAPTURE(parse, integer, IntegerSliderControlStyle());
BENCHMARK_CAPTURE(parse, percentage, PercentageSliderControlStyle());
BENCHMARK(makeFormatter);
BENCHMARK(pasteColor);
BENCHMARK_CAPTURE(paintTrack, red, ColorComponent::Red)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(paintTrack, opacity, ColorComponent::Opacity)->Unit(benchmark::kMicrosecond);
BENCHMARK(dragStepToColor)->Unit(benchmark::kMicrosecond);
BENCHMARK(dragStepToFrame)->Unit(benchmark::kMicrosecond);

} // namespace

int main(int argc, char *argv[])
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    if (qEnvironmentVariableIsEmpty("QT_SCALE_FACTOR"))
        qputenv("QT_SCALE_FACTOR", "3");
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    const QGuiApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
