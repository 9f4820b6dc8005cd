#include "service/fvcolorpickerserviceviewcontroller.h"

#include "../shared/table.h"
#include "model/colorcoding.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QTemporaryDir>
#include <QTest>
#include <QThread>

using namespace favrin;
using namespace favrin::service;
using model::SomeColor;
using namespace Qt::StringLiterals;

namespace {

const SomeColor red(1, 0, 0, 1, SomeColor::ColorSpace::sRGB);
const SomeColor translucentBlue(0, 0, 1, 0.5, SomeColor::ColorSpace::sRGB);

struct Pick
{
    std::optional<platform::Color> color;
    bool isVolatile;
    bool operator==(const Pick &) const = default;
};

/** A front that writes down what it hears. */
class RecordedFront : public platform::ViewController, public HostedPickerParent
{
public:
    RecordedFront() = default;

    void pickerDidSelectColor(const std::optional<platform::Color> &color, bool isVolatile) override
    {
        picks.push_back({color, isVolatile});
    }
    void pickerDidShowEyedropper(EyedropperSelectionBlock selection, EyedropperDismissBlock dismiss) override
    {
        messages << u"show"_s;
        selectionBlock = std::move(selection);
        dismissBlock = std::move(dismiss);
    }
    void pickerDidFloatEyeDropper() override { messages << u"float"_s; }
    void pickerDidCancelEyeDropper() override { messages << u"cancel"_s; }
    void colorPickerDidFinish() override { messages << u"finish"_s; }
    void updatePreferredContentSize() override { ++sizeRequests; }

    std::vector<Pick> picks;
    QStringList messages;
    EyedropperSelectionBlock selectionBlock;
    EyedropperDismissBlock dismissBlock;
    int sizeRequests = 0;

protected:
    std::unique_ptr<QQuickItem> loadView() override { return std::make_unique<QQuickItem>(); }
};

/** A parent that is not the front. */
class Stranger : public platform::ViewController
{
public:
    Stranger() = default;

protected:
    std::unique_ptr<QQuickItem> loadView() override { return std::make_unique<QQuickItem>(); }
};

constexpr char rootView[] = R"(
    import QtQuick
    Rectangle {
        color: "red"
        implicitWidth: 320; implicitHeight: 500
        Flickable { objectName: "scroll"; clip: true; property int keyboardDismissMode: 0 }
    }
)";

void onAnotherThread(const std::function<void()> &work)
{
    std::unique_ptr<QThread> thread(QThread::create(work));
    thread->start();
    thread->wait();
}

} // namespace

class TestHostedPicker : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        const QString file = m_folder.filePath(u"%1.sqlite"_s.arg(m_files++));
        m_defaults = std::make_unique<platform::UserDefaults>(file.toStdString());
        makePicker();
    }

    void cleanup()
    {
        m_front.reset();
        m_defaults.reset();
    }

    void theHostsOwnColorIsNotEchoed()
    {
        QVERIFY(m_front->picks.empty());
        m_picker->setSelectedColor(red.platformColor(), std::string(platformName(red.colorSpace)));
        QVERIFY(state().selectedColor() == red);
        m_picker->setSelectedColor(std::nullopt, std::nullopt);
        QVERIFY(!state().hasSelectedColor());
        QVERIFY(m_front->picks.empty());

        // The same color again by the user is news to the host, each time.
        state().setColorBinding(red);
        state().setColorBinding(red);
        state().selectedColor.set(std::nullopt);
        QCOMPARE(
            m_front->picks,
            (std::vector<Pick>{{red.platformColor(), false}, {red.platformColor(), false}, {std::nullopt, false}}));
    }

    void aDragEndsWithAFinalPick()
    {
        state().setColorBinding(red);
        m_front->picks.clear();
        state().isVolatile.set(true);
        state().setColorBinding(translucentBlue);
        state().isVolatile.set(true);
        state().setColorBinding(red);
        state().isVolatile.set(false);
        state().isVolatile.set(false);
        QCOMPARE(m_front->picks, (std::vector<Pick>{{red.platformColor(), true},
                                                    {translucentBlue.platformColor(), true},
                                                    {red.platformColor(), true},
                                                    {red.platformColor(), false}}));
    }

    void hostColorsComeIntoTheNamedSpace_data()
    {
        using Space = SomeColor::ColorSpace;
        addRows<QString, int>({
            {"sRGB", u"kTQColorSpaceSRGB"_s, int(Space::sRGB)},
            {"Display P3", u"kTQColorSpaceDisplayP3"_s, int(Space::displayP3)},
            {"unknown", u"kTQColorSpaceLinearSRGB"_s, int(model::deviceDefaultColorSpace())},
            {"none", {}, int(model::deviceDefaultColorSpace())},
        });
    }
    void hostColorsComeIntoTheNamedSpace()
    {
        const auto [name, space] = row<QString, int>();
        const auto text = name.isNull() ? std::nullopt : std::optional(name.toStdString());
        m_picker->setSelectedColor(translucentBlue.platformColor(), text);
        QVERIFY(state().selectedColor() ==
                SomeColor(translucentBlue.platformColor(), static_cast<SomeColor::ColorSpace>(space)));
        QCOMPARE(state().selectedColor()->a, 0.5);
    }

    void withoutAlphaTheHostsColorBecomesOpaque()
    {
        m_picker->setConfiguration({.showsAlpha = false, .allowsNoColor = true});
        m_picker->setSelectedColor(translucentBlue.platformColor(), std::nullopt);
        QCOMPARE(state().selectedColor()->a, 1.0);
    }

    void aPickerThatMayNotBeEmptyStartsWithTheFallbackSilently()
    {
        m_picker->setConfiguration({.allowsNoColor = true});
        QVERIFY(!state().hasSelectedColor());
        m_picker->setConfiguration({.allowsNoColor = false});
        QVERIFY(state().selectedColor() == state().fallbackColor());
        QVERIFY(m_front->picks.empty());

        state().setColorBinding(red);
        m_picker->setConfiguration({.allowsNoColor = false});
        QVERIFY(state().selectedColor() == red);
    }

    void theSameConfigurationTwiceAssignsOnceWhatViewsRedrawFor()
    {
        QHash<QString, int> deliveries;
        const auto count = [&](const char *field) {
            return [&deliveries, name = QString::fromLatin1(field)](const auto &) { ++deliveries[name]; };
        };
        std::vector<platform::Subscription> subscriptions;
        subscriptions.push_back(state().showsAlpha.publisher().sink(count("alpha")));
        subscriptions.push_back(state().showsEyedropper.publisher().sink(count("eyedropper")));
        subscriptions.push_back(state().suggestedColors.publisher().sink(count("suggested")));
        subscriptions.push_back(state().isEmbedded.publisher().sink(count("embedded")));
        subscriptions.push_back(state().title.publisher().sink(count("title")));
        subscriptions.push_back(state().overrideColorScheme.publisher().sink(count("scheme")));
        deliveries.clear();

        const remote::Configuration configuration{.showsAlpha = false,
                                                  .showsEyedropper = false,
                                                  .suggestedColors = {{red.platformColor()}},
                                                  .isEmbedded = true};
        m_picker->setConfiguration(configuration);
        m_picker->setConfiguration(configuration);
        QCOMPARE(deliveries, (QHash<QString, int>{{u"alpha"_s, 1},
                                                  {u"eyedropper"_s, 1},
                                                  {u"suggested"_s, 1},
                                                  {u"embedded"_s, 1},
                                                  {u"title"_s, 2},
                                                  {u"scheme"_s, 2}}));
    }

    void theConfigurationReachesTheState()
    {
        const SomeColor wide(0, 1, 0, 1, SomeColor::ColorSpace::displayP3);
        m_picker->setConfiguration({.title = "Paint",
                                    .suggestedColors = {{wide.platformColor(), platform::Color::black()}},
                                    .shouldUseDarkGridInDarkMode = true});
        QCOMPARE(state().title(), std::string("Paint"));
        QVERIFY(state().enableDarkGrid());
        QVERIFY(state().suggestedColors() ==
                ColorPickerState::ColorList({wide.inSRGB(), SomeColor(0, 0, 0, 1, SomeColor::ColorSpace::sRGB)}));

        m_picker->setConfiguration({.suggestedColors = {std::vector<platform::Color>()}});
        QCOMPARE(state().title(), std::string("Colors"));
        QVERIFY(state().suggestedColors() == ColorPickerState::ColorList());
        m_picker->setConfiguration({});
        QVERIFY(!state().suggestedColors());
    }

    void gridStyles_data()
    {
        addRows<int, int>({
            {"unspecified", 0, -1},
            {"light", 1, int(ColorScheme::Light)},
            {"dark", 2, int(ColorScheme::Dark)},
            {"a number without meaning changes nothing", 3, int(ColorScheme::Dark)},
            {"a negative one neither", -1, int(ColorScheme::Dark)},
        });
    }
    void gridStyles()
    {
        const auto [style, scheme] = row<int, int>();
        state().overrideColorScheme.set(ColorScheme::Dark);
        m_picker->setConfiguration({.userInterfaceStyleForGrid = style});
        const auto found = state().overrideColorScheme();
        QCOMPARE(found ? int(*found) : -1, scheme);
    }

    void switchingAlphaOffAndOnKeepsTranslucentFavorites()
    {
        state().favoriteColors.set({red, translucentBlue});
        m_picker->setConfiguration({.showsAlpha = false});
        QVERIFY(state().favoriteColors() == ColorPickerState::ColorList({red}));
        m_picker->setConfiguration({.showsAlpha = true});
        QVERIFY(state().favoriteColors() == ColorPickerState::ColorList({red, translucentBlue}));
    }

    void theEyedroppersColorArrivesOnTheMainThreadAndIsReported()
    {
        state().eyedropperShowing.set(false);
        QVERIFY(m_front->messages.isEmpty());
        state().eyedropperShowing.set(true);
        QCOMPARE(m_front->messages, QStringList{u"show"_s});

        bool animated = false;
        connect(&state(), &ColorPickerState::selectedColorChanged, this,
                [&] { animated = state().animatesChanges() && QThread::currentThread() == thread(); });
        onAnotherThread([this] { m_front->selectionBlock(translucentBlue.platformColor()); });
        QVERIFY(!state().hasSelectedColor());
        QTRY_VERIFY(state().selectedColor() == translucentBlue);
        QVERIFY(animated);
        QCOMPARE(m_front->picks, (std::vector<Pick>{{translucentBlue.platformColor(), false}}));

        onAnotherThread([this] { m_front->dismissBlock(); });
        QVERIFY(state().eyedropperShowing());
        QTRY_VERIFY(!state().eyedropperShowing());
    }

    void everyFloatIsPassedOn()
    {
        state().eyedropperIsFloating.set(true);
        state().eyedropperIsFloating.set(true);
        state().eyedropperIsFloating.set(false);
        QCOMPARE(m_front->messages, (QStringList{u"float"_s, u"float"_s}));
    }

    void theEndOfThePresentationGoesToTheFront()
    {
        state().performClose();
        m_picker->colorPickerDidFinish();
        QCOMPARE(m_front->messages, (QStringList{u"finish"_s, u"finish"_s}));
        bool prepared = false;
        m_picker->prepareForDisplay([&] { prepared = true; });
        QVERIFY(prepared);
    }

    void actionsOutliveThePicker()
    {
        state().eyedropperShowing.set(true);
        const auto close = state().close();
        const auto select = m_front->selectionBlock;
        const auto dismiss = m_front->dismissBlock;
        m_front.reset();
        close();
        select(red.platformColor());
        dismiss();
        QCoreApplication::processEvents();
    }

    void aStrangerHearsNothing()
    {
        Stranger stranger;
        auto owned = std::make_unique<FVColorPickerServiceViewController>(nullptr, *m_defaults);
        auto *picker = owned.get();
        stranger.addChild(std::move(owned));
        auto &alone = picker->colorPickerState();
        alone.setColorBinding(red);
        alone.eyedropperShowing.set(true);
        alone.eyedropperIsFloating.set(true);
        alone.performClose();
        QVERIFY(alone.selectedColor() == red);
    }

    void theRootViewIsAdjustedWhenItAppears()
    {
        const auto *scroll = m_picker->view()->childItems().first();
        QVERIFY(scroll->clip());
        m_front->setAppeared(true);
        QVERIFY(!scroll->clip());
        QCOMPARE(scroll->property("keyboardDismissMode").toInt(), 2);
        QCOMPARE(m_picker->view()->property("color").value<QColor>().alpha(), 0);
    }

    void layoutPassesTellTheSizeAndAskForThePreferredOne()
    {
        std::vector<QSizeF> sizes;
        const auto subscription = state().size.publisher().sink([&](QSizeF size) { sizes.push_back(size); });
        sizes.clear();
        m_picker->view()->setSize({360, 500});
        m_picker->layoutNow();
        QCOMPARE(sizes, (std::vector<QSizeF>{{360, 500}}));
        const int requests = m_front->sizeRequests;
        QVERIFY(requests > 0);
        m_picker->layoutNow();
        QCOMPARE(sizes.size(), std::size_t(1));
        QCOMPARE(m_front->sizeRequests, requests + 1);
    }

    void disappearingDuringADragEndsIt()
    {
        m_front->setAppeared(true);
        state().isVolatile.set(true);
        state().setColorBinding(red);
        m_front->picks.clear();
        m_front->setAppeared(false);
        QVERIFY(!state().isVolatile());
        QCOMPARE(m_front->picks, (std::vector<Pick>{{red.platformColor(), false}}));
    }

    void theTabIsKept_data()
    {
        addRows<QString, int>({
            {"sliders", u"Sliders"_s, int(Tab::sliders)},
            {"lower case", u"sliders"_s, int(Tab::grid)},
            {"nothing", {}, int(Tab::grid)},
        });
    }
    void theTabIsKept()
    {
        const auto [stored, tab] = row<QString, int>();
        if (stored.isNull())
            m_defaults->remove("selectedTab");
        else
            m_defaults->set("selectedTab", stored.toStdString());
        makePicker();
        QCOMPARE(int(state().selectedTab()), tab);
        QCOMPARE(m_defaults->string("selectedTab"), std::string(rawValue(static_cast<Tab>(tab))));

        state().selectedTab.set(Tab::spectrum);
        makePicker();
        QCOMPARE(state().selectedTab(), Tab::spectrum);
    }

    void favoritesAreSavedOnEveryChange()
    {
        QCOMPARE(state().favoriteColors().size(), std::size_t(5));
        state().favoriteColors.set({red});
        makePicker();
        QVERIFY(state().favoriteColors() == ColorPickerState::ColorList({red}));
    }

    void aPickerMadeAheadOfTimeCatchesUp()
    {
        FavoritesStore(*m_defaults).saveFavoriteColors({red}, true);
        m_defaults->set("selectedTab", std::string("Spectrum"));
        m_picker->reloadPersistedValues();
        QVERIFY(state().favoriteColors() == ColorPickerState::ColorList({red}));
        QCOMPARE(state().selectedTab(), Tab::spectrum);

        int announced = 0;
        const auto subscription = state().objectWillChange().sink([&](platform::Nothing) { ++announced; });
        m_picker->reloadPersistedValues();
        QCOMPARE(announced, 0);
    }

private:
    FVColorPickerServiceViewController *makePicker()
    {
        m_front = std::make_unique<RecordedFront>();
        auto makeRootView = [this](ColorPickerState *) {
            QQmlComponent component(&m_engine);
            component.setData(rootView, QUrl());
            return std::unique_ptr<QQuickItem>(qobject_cast<QQuickItem *>(component.create()));
        };
        m_picker = new FVColorPickerServiceViewController(makeRootView, *m_defaults);
        m_front->addChild(std::unique_ptr<platform::ViewController>(m_picker));
        return m_picker;
    }
    ColorPickerState &state() { return m_picker->colorPickerState(); }

    QTemporaryDir m_folder;
    int m_files = 0;
    QQmlEngine m_engine;
    std::unique_ptr<platform::UserDefaults> m_defaults;
    std::unique_ptr<RecordedFront> m_front;
    FVColorPickerServiceViewController *m_picker = nullptr;
};

QTEST_MAIN(TestHostedPicker)
#include "tst_hostedpicker.moc"
