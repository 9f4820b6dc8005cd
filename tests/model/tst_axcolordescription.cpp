#include "model/axcolordescription.h"

#include <QTest>

#include <deque>
#include <memory>
#include <thread>

using namespace favrin;
using model::AXColorDescription;
using model::SomeColor;

namespace {

class ManualQueue final : public platform::Queue
{
public:
    void async(std::function<void()> work) override { m_work.push_back(std::move(work)); }
    void runAll()
    {
        while (!m_work.empty()) {
            auto work = std::move(m_work.front());
            m_work.pop_front();
            work();
        }
    }
    std::size_t size() const { return m_work.size(); }

private:
    std::deque<std::function<void()>> m_work;
};

const SomeColor red(1, 0, 0, 1, SomeColor::ColorSpace::sRGB);
const SomeColor blue(0, 0, 1, 1, SomeColor::ColorSpace::sRGB);

// One view, with everything its description needs.
struct Stage
{
    ManualQueue background;
    ManualQueue main;
    model::ColorNamingReadiness readiness;
    int changes = 0;

    std::unique_ptr<AXColorDescription> view()
    {
        return std::make_unique<AXColorDescription>(
            background, main, [this] { ++changes; }, readiness);
    }
    void deliver()
    {
        background.runAll();
        main.runAll();
    }
};

} // namespace

class AXColorDescriptionTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void saysThatThereIsNoColor()
    {
        Stage stage;
        const auto view = stage.view();
        QCOMPARE(view->evaluate(std::nullopt), std::string("No color selected"));
        QCOMPARE(stage.background.size(), std::size_t(0));
        view->evaluate(red);
        view->evaluate(std::nullopt);
        stage.deliver();
        QCOMPARE(stage.changes, 0);
        stage.readiness.becomeReady();
        QCOMPARE(view->evaluate(std::nullopt), std::string("No color selected"));
    }

    void firstNameComesLater()
    {
        Stage stage;
        const auto view = stage.view();
        QCOMPARE(view->evaluate(red), std::string());
        stage.deliver();
        QCOMPARE(stage.changes, 1);
        QCOMPARE(view->published(), std::string("bright red"));
        QCOMPARE(view->evaluate(red), std::string("bright red"));
        QCOMPARE(stage.background.size(), std::size_t(0));
    }

    void nextViewIsNamedAtOnce()
    {
        Stage stage;
        const auto first = stage.view();
        first->evaluate(red);
        stage.deliver();
        const auto second = stage.view();
        QCOMPARE(second->evaluate(blue), std::string("bright blue"));
        QCOMPARE(second->published(), std::string());
        QCOMPARE(stage.changes, 1);
    }

    void laterColorReplacesTheSubscription()
    {
        Stage stage;
        const auto view = stage.view();
        view->evaluate(red);
        view->evaluate(blue);
        stage.deliver();
        QCOMPARE(stage.changes, 1);
        QCOMPARE(view->published(), std::string("bright blue"));
    }

    void endedViewStoresNothing()
    {
        Stage stage;
        auto view = stage.view();
        view->evaluate(red);
        stage.background.runAll();
        view.reset();
        stage.main.runAll();
        QCOMPARE(stage.changes, 0);
        QVERIFY(!stage.readiness.isReady());
    }

    void flagIsSetOnTheMainQueue()
    {
        Stage stage;
        const auto view = stage.view();
        view->evaluate(red);
        std::thread([&stage] { stage.background.runAll(); }).join();
        QVERIFY(!stage.readiness.isReady());
        QCOMPARE(view->evaluate(std::nullopt), std::string("No color selected"));
        view->evaluate(blue);
        stage.deliver();
        QVERIFY(stage.readiness.isReady());
        QVERIFY(!model::ColorNamingReadiness::process().isReady());
    }
};

QTEST_APPLESS_MAIN(AXColorDescriptionTest)
#include "tst_axcolordescription.moc"
