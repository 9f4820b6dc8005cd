#include "service/colorpickerstate.h"

#include "../shared/table.h"

#include <QLoggingCategory>
#include <QSignalSpy>
#include <QTest>

using namespace favrin;
using namespace favrin::service;
using model::SomeColor;
using namespace Qt::StringLiterals;

namespace {

const SomeColor red(1, 0, 0, 1, SomeColor::ColorSpace::sRGB);
const SomeColor blue(0, 0, 1, 0.5, SomeColor::ColorSpace::displayP3);

int debugEntries = 0;

void countDebugEntries(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (type == QtDebugMsg && QByteArray(context.category) == "com.quenta.favrin.ColorPicker.ColorPicker" &&
        message == u"ColorPickerState will change"_s)
        ++debugEntries;
}

struct Assignment
{
    const char *field;
    std::function<void(ColorPickerState &)> assign;
    const char *signal;
};

/** Each assigns the value that the field has already. */
std::vector<Assignment> assignments()
{
    using State = ColorPickerState;
    return {
        {"selectedColor", [](State &s) { s.selectedColor.set(std::nullopt); }, SIGNAL(selectedColorChanged())},
        {"fallbackColor", [](State &s) { s.fallbackColor.set(s.fallbackColor()); }, SIGNAL(fallbackColorChanged())},
        {"allowsNoColor", [](State &s) { s.allowsNoColor.set(false); }, SIGNAL(allowsNoColorChanged())},
        {"isVolatile", [](State &s) { s.isVolatile.set(false); }, SIGNAL(isVolatileChanged())},
        {"selectedTab", [](State &s) { s.selectedTab.set(Tab::grid); }, SIGNAL(selectedTabChanged())},
        {"favoriteColors", [](State &s) { s.favoriteColors.set({}); }, SIGNAL(favoriteColorsChanged())},
        {"title", [](State &s) { s.title.set("Colors"); }, SIGNAL(titleChanged())},
        {"showsAlpha", [](State &s) { s.showsAlpha.set(true); }, SIGNAL(showsAlphaChanged())},
        {"showsEyedropper", [](State &s) { s.showsEyedropper.set(true); }, SIGNAL(showsEyedropperChanged())},
        {"suggestedColors", [](State &s) { s.suggestedColors.set(std::nullopt); }, SIGNAL(suggestedColorsChanged())},
        {"eyedropperShowing", [](State &s) { s.eyedropperShowing.set(false); }, SIGNAL(eyedropperShowingChanged())},
        {"eyedropperIsFloating", [](State &s) { s.eyedropperIsFloating.set(false); },
         SIGNAL(eyedropperIsFloatingChanged())},
        {"useLandscapeLayout", [](State &s) { s.useLandscapeLayout.set(false); }, SIGNAL(useLandscapeLayoutChanged())},
        {"isEmbedded", [](State &s) { s.isEmbedded.set(false); }, SIGNAL(isEmbeddedChanged())},
        {"isPopover", [](State &s) { s.isPopover.set(false); }, SIGNAL(isPopoverChanged())},
        {"size", [](State &s) { s.size.set(QSizeF(0, 0)); }, SIGNAL(sizeChanged())},
        {"close", [](State &s) { s.close.set(nullptr); }, SIGNAL(closeChanged())},
        {"enableDarkGrid", [](State &s) { s.enableDarkGrid.set(false); }, SIGNAL(enableDarkGridChanged())},
        {"overrideColorScheme", [](State &s) { s.overrideColorScheme.set(std::nullopt); },
         SIGNAL(overrideColorSchemeChanged())},
    };
}

} // namespace

class TestColorPickerState : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void anAssignmentIsAnnouncedThenDeliveredThenStored()
    {
        ColorPickerState state({});
        QStringList events;
        const auto note = [&](const char *event) {
            events << QString::fromLatin1(event) + QLatin1Char(state.hasSelectedColor() ? '+' : '-');
        };
        auto whole = state.objectWillChange().sink([&](platform::Nothing) { note("announced"); });
        auto field = state.selectedColor.publisher().sink(
            [&](const ColorPickerState::OptionalColor &color) { note(color ? "delivered" : "current"); });
        connect(&state, &ColorPickerState::selectedColorChanged, &state, [&] { note("signalled"); });

        state.selectedColor.set(red);
        QCOMPARE(events, (QStringList{u"current-"_s, u"announced-"_s, u"delivered-"_s, u"signalled+"_s}));
    }

    void everyAssignmentIsAnnouncedLoggedAndSignalledOnce_data()
    {
        QTest::addColumn<int>("index");
        const auto all = assignments();
        for (std::size_t index = 0; index < all.size(); ++index)
            QTest::newRow(all[index].field) << static_cast<int>(index);
    }
    void everyAssignmentIsAnnouncedLoggedAndSignalledOnce()
    {
        QFETCH(int, index);
        const Assignment assignment = assignments()[static_cast<std::size_t>(index)];
        ColorPickerState state({});
        int announced = 0;
        auto whole = state.objectWillChange().sink([&](platform::Nothing) { ++announced; });
        QSignalSpy signalled(&state, assignment.signal);

        QLoggingCategory::setFilterRules(u"com.quenta.favrin.ColorPicker.ColorPicker.debug=true"_s);
        debugEntries = 0;
        const auto previous = qInstallMessageHandler(countDebugEntries);
        assignment.assign(state);
        qInstallMessageHandler(previous);
        QLoggingCategory::setFilterRules(QString());

        QCOMPARE(announced, 1);
        QCOMPARE(debugEntries, 1);
        QCOMPARE(signalled.size(), 1);
    }

    void theColorBindingFallsBackAndWritesTheSelection()
    {
        ColorPickerState state({});
        QVERIFY(!state.hasSelectedColor());
        QCOMPARE(state.colorBinding(), SomeColor(0, 0, 0, 1, model::deviceDefaultColorSpace()));
        state.fallbackColor.set(blue);
        QCOMPARE(state.colorBinding(), blue);
        state.setColorBinding(red);
        QVERIFY(state.hasSelectedColor());
        QCOMPARE(*state.selectedColor(), red);
        QCOMPARE(state.fallbackColor(), blue);
    }

    void finalColorFollowsTheSelectionFromItsCurrentValueOn()
    {
        ColorPickerState state({});
        std::vector<std::optional<platform::Color>> received;
        auto subscription = state.finalColor().sink([&](const auto &color) { received.push_back(color); });
        QCOMPARE(&state.finalColor(), &state.finalColor());
        QCOMPARE(received.size(), std::size_t(1));
        QVERIFY(!received.back());
        state.selectedColor.set(blue);
        QVERIFY(received.back() == blue.platformColor());
        state.selectedColor.set(std::nullopt);
        QVERIFY(!received.back());
        QCOMPARE(received.size(), std::size_t(3));
    }

    void tabsComeFromTheirExactRawStringsOnly_data()
    {
        addRows<QString, int>({
            {"grid", u"Grid"_s, int(Tab::grid)},
            {"spectrum", u"Spectrum"_s, int(Tab::spectrum)},
            {"sliders", u"Sliders"_s, int(Tab::sliders)},
            {"lower case", u"grid"_s, -1},
            {"space", u"Grid "_s, -1},
            {"empty", {}, -1},
        });
    }
    void tabsComeFromTheirExactRawStringsOnly()
    {
        const auto [text, tab] = row<QString, int>();
        const auto found = tabFromRawValue(text.toStdString());
        QCOMPARE(found ? int(*found) : -1, tab);
        ColorPickerState state({});
        state.selectedTab.set(Tab::sliders);
        state.setSelectedTabName(text);
        QCOMPARE(state.selectedTabName(), found ? text : u"Sliders"_s);
    }

    void theCloseActionMayEndTheState()
    {
        auto state = std::make_unique<ColorPickerState>(ColorPickerState::ColorList());
        state->performClose();
        state->close.set([&state] { state.reset(); });
        state->performClose();
        QVERIFY(!state);
    }
};

QTEST_GUILESS_MAIN(TestColorPickerState)
#include "tst_colorpickerstate.moc"
