#include "service/colorpickerstate.h"

#include <QLoggingCategory>
#include <QSignalSpy>
#include <QTest>

using namespace favrin;
using namespace favrin::service;
using model::SomeColor;

namespace {

const SomeColor red(1, 0, 0, 1, SomeColor::ColorSpace::sRGB);
const SomeColor blue(0, 0, 1, 0.5, SomeColor::ColorSpace::displayP3);

int debugEntries = 0;

void countDebugEntries(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (type == QtDebugMsg && QByteArray(context.category) == "com.quenta.favrin.ColorPicker.ColorPicker" &&
        message == QStringLiteral("ColorPickerState will change"))
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
    void anAssignmentIsAnnouncedThenDeliveredThenStored();
    void everyAssignmentIsAnnouncedLoggedAndSignalledOnce_data();
    void everyAssignmentIsAnnouncedLoggedAndSignalledOnce();
    void theColorBindingFallsBackAndWritesTheSelection();
    void finalColorFollowsTheSelectionFromItsCurrentValueOn();
    void tabsComeFromTheirExactRawStringsOnly_data();
    void tabsComeFromTheirExactRawStringsOnly();
    void theCloseActionMayEndTheState();
};

void TestColorPickerState::anAssignmentIsAnnouncedThenDeliveredThenStored()
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
    QCOMPARE(events, (QStringList{QStringLiteral("current-"), QStringLiteral("announced-"),
                                  QStringLiteral("delivered-"), QStringLiteral("signalled+")}));
}

void TestColorPickerState::everyAssignmentIsAnnouncedLoggedAndSignalledOnce_data()
{
    QTest::addColumn<int>("index");
    const auto all = assignments();
    for (std::size_t index = 0; index < all.size(); ++index)
        QTest::newRow(all[index].field) << static_cast<int>(index);
}

void TestColorPickerState::everyAssignmentIsAnnouncedLoggedAndSignalledOnce()
{
    QFETCH(int, index);
    const Assignment assignment = assignments()[static_cast<std::size_t>(index)];
    ColorPickerState state({});
    int announced = 0;
    auto whole = state.objectWillChange().sink([&](platform::Nothing) { ++announced; });
    QSignalSpy signalled(&state, assignment.signal);

    QLoggingCategory::setFilterRules(QStringLiteral("com.quenta.favrin.ColorPicker.ColorPicker.debug=true"));
    debugEntries = 0;
    const auto previous = qInstallMessageHandler(countDebugEntries);
    assignment.assign(state);
    qInstallMessageHandler(previous);
    QLoggingCategory::setFilterRules(QString());

    QCOMPARE(announced, 1);
    QCOMPARE(debugEntries, 1);
    QCOMPARE(signalled.size(), 1);
}

void TestColorPickerState::theColorBindingFallsBackAndWritesTheSelection()
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

void TestColorPickerState::finalColorFollowsTheSelectionFromItsCurrentValueOn()
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

void TestColorPickerState::tabsComeFromTheirExactRawStringsOnly_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("tab");
    QTest::newRow("grid") << QStringLiteral("Grid") << int(Tab::grid);
    QTest::newRow("spectrum") << QStringLiteral("Spectrum") << int(Tab::spectrum);
    QTest::newRow("sliders") << QStringLiteral("Sliders") << int(Tab::sliders);
    QTest::newRow("lower case") << QStringLiteral("grid") << -1;
    QTest::newRow("space") << QStringLiteral("Grid ") << -1;
    QTest::newRow("empty") << QString() << -1;
}

void TestColorPickerState::tabsComeFromTheirExactRawStringsOnly()
{
    QFETCH(QString, text);
    QFETCH(int, tab);
    const auto found = tabFromRawValue(text.toStdString());
    QCOMPARE(found ? int(*found) : -1, tab);
    ColorPickerState state({});
    state.selectedTab.set(Tab::sliders);
    state.setSelectedTabName(text);
    QCOMPARE(state.selectedTabName(), found ? text : QStringLiteral("Sliders"));
}

void TestColorPickerState::theCloseActionMayEndTheState()
{
    auto state = std::make_unique<ColorPickerState>(ColorPickerState::ColorList());
    state->performClose();
    state->close.set([&state] { state.reset(); });
    state->performClose();
    QVERIFY(!state);
}

QTEST_GUILESS_MAIN(TestColorPickerState)
#include "tst_colorpickerstate.moc"
