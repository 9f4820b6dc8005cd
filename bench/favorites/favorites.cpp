// Times what the number of favorites costs: one change of the list, from the state to the strip that shows it; storing
// such a change; and opening the strip with what is stored.

#include "favorites/favoritecolorpickerview.h"
#include "favorites/listdifference.h"
#include "service/colorpickerstate.h"
#include "service/favoritesstore.h"
#include "theme/theme.h"

#include <benchmark/benchmark.h>

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QTemporaryDir>

#include <utility>

using namespace favrin;
using namespace favrin::favorites;
using model::SomeColor;
using ColorList = std::vector<SomeColor>;

namespace {

constexpr QSizeF stripSize(270.0, 78.0);
constexpr int swatchesPerPage = 12;

ColorList colors(std::int64_t count)
{
    ColorList list;
    for (std::int64_t i = 0; i < count; ++i)
        list.emplace_back(double(i % 256) / 255.0, double(i / 256) / 255.0, 0.5, 1.0, SomeColor::ColorSpace::sRGB);
    return list;
}

std::pair<ColorList, ColorList> withAndWithout(std::int64_t count, double place)
{
    const ColorList with = colors(count);
    ColorList without = with;
    without.erase(without.begin() + static_cast<std::ptrdiff_t>(place * double(count - 1)));
    return {with, without};
}

/** Made once: what the strip is made from is in the program. */
QQmlComponent &viewComponent()
{
    static QQmlEngine engine;
    engine.addImportPath(QStringLiteral("qrc:/qt/qml"));
    static QQmlComponent component(&engine,
                                   QUrl(QStringLiteral("qrc:/qt/qml/Favrin/Favorites/FavoriteColorPickerView.qml")));
    return component;
}

/** The strip in a window that is shown. */
class Strip
{
public:
    explicit Strip(ColorList favorites) : m_state(std::move(favorites))
    {
        m_view.reset(qobject_cast<FavoriteColorPickerView *>(viewComponent().createWithInitialProperties({
            {QStringLiteral("colorPickerState"), QVariant::fromValue(&m_state)},
            {QStringLiteral("model"), QVariant::fromValue(&m_model)},
            {QStringLiteral("swatchesPerPage"), swatchesPerPage},
            {QStringLiteral("width"), stripSize.width()},
            {QStringLiteral("height"), stripSize.height()},
        })));
        m_view->setParentItem(m_window.contentItem());
        m_window.resize(stripSize.toSize());
        m_window.show();
    }

    void show(const ColorList &favorites)
    {
        m_state.favoriteColors.set(favorites);
        while (m_view->coordinator().dataSource().rowCount() != static_cast<int>(favorites.size()))
            QCoreApplication::processEvents();
    }
    QImage frame() { return m_window.grabWindow(); }

private:
    service::ColorPickerState m_state;
    FavoriteColorPickerModel m_model;
    QQuickWindow m_window;
    std::unique_ptr<FavoriteColorPickerView> m_view;
};

/** @param place of the favorite that comes and goes: 0 the first, 1 the last */
void change(benchmark::State &state, double place)
{
    const auto [with, without] = withAndWithout(state.range(0), place);
    Strip strip(with);
    bool isThere = true;
    for (auto _ : state) {
        isThere = !isThere;
        strip.show(isThere ? with : without);
    }
}

void changeAndDraw(benchmark::State &state)
{
    const auto [with, without] = withAndWithout(state.range(0), 0.5);
    Strip strip(with);
    bool isThere = true;
    for (auto _ : state) {
        isThere = !isThere;
        strip.show(isThere ? with : without);
        benchmark::DoNotOptimize(strip.frame());
    }
}

void difference(benchmark::State &state)
{
    const auto [with, without] = withAndWithout(state.range(0), 0.5);
    const service::ColorPickerState before(with);
    const service::ColorPickerState after(without);
    const ItemList from = itemList(before, swatchesPerPage, {});
    const ItemList to = itemList(after, swatchesPerPage, {});
    for (auto _ : state)
        benchmark::DoNotOptimize(listDifference(from, to));
}

/** Stored favorites in a folder of their own. */
struct Stored
{
    explicit Stored(const ColorList &list) { store.saveFavoriteColors(list, true); }

    QTemporaryDir folder;
    platform::UserDefaults defaults{folder.filePath(QStringLiteral("defaults.sqlite")).toStdString()};
    service::FavoritesStore store{defaults};
};

void storeChange(benchmark::State &state)
{
    const auto [with, without] = withAndWithout(state.range(0), 1.0);
    Stored stored(with);
    bool isThere = true;
    for (auto _ : state) {
        isThere = !isThere;
        stored.store.saveFavoriteColors(isThere ? with : without, true);
    }
}

void load(benchmark::State &state)
{
    const Stored stored(colors(state.range(0)));
    for (auto _ : state)
        benchmark::DoNotOptimize(stored.store.favoriteColors(true));
}

void loadAndDraw(benchmark::State &state)
{
    const Stored stored(colors(state.range(0)));
    for (auto _ : state) {
        Strip strip(stored.store.favoriteColors(true));
        benchmark::DoNotOptimize(strip.frame());
    }
}

void sizes(benchmark::internal::Benchmark *bench)
{
    bench->Arg(10)->Arg(1000)->Arg(10'000)->Unit(benchmark::kMicrosecond);
}

BENCHMARK(difference)->Apply(sizes);
BENCHMARK_CAPTURE(change, first, 0.0)->Apply(sizes);
BENCHMARK_CAPTURE(change, last, 1.0)->Apply(sizes);
BENCHMARK(changeAndDraw)->Apply(sizes);
// Time that passes, since most of it is the disk's.
BENCHMARK(storeChange)->Apply(sizes)->UseRealTime();
BENCHMARK(load)->Apply(sizes);
BENCHMARK(loadAndDraw)->Apply(sizes);

} // namespace

int main(int argc, char *argv[])
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    const QGuiApplication application(argc, argv);
    theme::Theme::instance().setReduceMotion(true);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
