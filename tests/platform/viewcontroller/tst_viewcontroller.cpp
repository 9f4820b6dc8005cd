#include "platform/viewcontroller/viewcontroller.h"

#include "../../shared/table.h"

#include <QQuickWindow>
#include <QSignalSpy>
#include <QtTest>

using namespace favrin::platform;
using namespace Qt::StringLiterals;

namespace {

/** Writes down what it hears. */
class Controller : public ViewController
{
public:
    Controller(QString name, QStringList &log) : m_name(std::move(name)), m_log(log) {}

    std::function<void(Controller &)> onLoad;
    std::function<void(Controller &)> onLayout;
    int passes = 0;

protected:
    std::unique_ptr<QQuickItem> loadView() override
    {
        note("load");
        auto item = std::make_unique<QQuickItem>();
        item->setSize({100, 100});
        return item;
    }
    void viewDidLoad() override
    {
        note("loaded");
        if (onLoad)
            onLoad(*this);
    }
    void viewWillAppear() override { note("appear"); }
    void viewDidDisappear() override { note("disappear"); }
    void viewWillLayoutSubviews() override { note("will layout"); }
    void viewDidLayoutSubviews() override
    {
        note("did layout");
        ++passes;
        if (onLayout)
            onLayout(*this);
    }
    void traitsDidChange(const std::optional<TraitCollection> &previous) override
    {
        note(!previous ? "first traits" : "traits");
    }

private:
    void note(const char *what) { m_log << m_name + u' ' + QString::fromLatin1(what); }

    QString m_name;
    QStringList &m_log;
};

using Cause = std::function<void(Controller &)>;

} // namespace

/** What controllers hear, in which order, and when they lay out. */
class ViewControllerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_window = std::make_unique<QQuickWindow>();
        m_window->resize(300, 300);
        m_parent = std::make_unique<Controller>(u"p"_s, m_log);
        m_child = nullptr;
        m_log.clear();
    }
    void cleanup()
    {
        m_parent.reset();
        m_window.reset();
    }

    void appearance_data()
    {
        addRows<bool, QString>({
            {"child first", false, u"p load, p loaded, c load, c loaded, p appear, c appear"_s},
            {"child joins later", true, u"p load, p loaded, p appear, c load, c loaded, c appear"_s},
        });
    }
    void appearance()
    {
        const auto [appearedBefore, heard] = row<bool, QString>();
        m_parent->setAppeared(appearedBefore);
        m_parent->view();
        join();
        m_parent->setAppeared(true);
        m_parent->setAppeared(true);
        QCOMPARE(takeLog(), heard);
        QVERIFY(m_child->hasAppeared());
        m_parent->setAppeared(false);
        m_parent->setAppeared(false);
        QCOMPARE(takeLog(), u"c disappear, p disappear"_s);
    }

    void traitsReachWhoeverHasOthers()
    {
        const TraitCollection popover{PresentationContext::Popover, UserInterfaceStyle::Dark};
        join();
        takeLog();
        m_parent->setTraits(m_parent->traits());
        QCOMPARE(takeLog(), u"p first traits, c first traits"_s);
        m_parent->setTraits(popover);
        m_parent->setTraits(popover);
        QCOMPARE(takeLog(), u"p traits, c traits"_s);
        auto late = std::make_unique<Controller>(u"l"_s, m_log);
        QVERIFY(m_parent->addChild(std::move(late))->traits() == popover);
        QCOMPARE(takeLog(), u"l first traits"_s);
    }

    void preferredContentSize_data()
    {
        addRows<QSizeF, int>({
            {"same", {360, 500}, 0},
            {"hardly another", {360, 500 + 1e-13}, 1},
            {"none", {0, 0}, 1},
            {"negative", {-1, 5}, 0},
            {"endless", {qInf(), 5}, 0},
            {"not a number", {5, qQNaN()}, 0},
        });
    }
    void preferredContentSize()
    {
        const auto [size, announcements] = row<QSizeF, int>();
        m_parent->setPreferredContentSize({360, 500});
        const QSignalSpy spy(m_parent.get(), &ViewController::preferredContentSizeChanged);
        m_parent->setPreferredContentSize(size);
        QCOMPARE(spy.count(), announcements);
        QCOMPARE(m_parent->preferredContentSize(), announcements ? size : QSizeF(360, 500));
    }

    void whatCausesAPass_data()
    {
        addRows<Cause, int>({
            {"nothing", [](auto &) {}, 0},
            {"many requests",
             [](auto &controller) {
                 for (int count = 0; count < 10; ++count)
                     controller.setNeedsLayout();
             },
             1},
            {"another size",
             [](auto &controller) {
                 controller.view()->setSize({50, 60});
             },
             1},
            {"the same size",
             [](auto &controller) {
                 controller.view()->setSize({100, 100});
             },
             0},
            {"implicit size", [](auto &controller) { controller.view()->setImplicitHeight(9); }, 1},
            {"request and at once",
             [](auto &controller) {
                 controller.setNeedsLayout();
                 controller.layoutNow();
             },
             1},
        });
    }
    void whatCausesAPass()
    {
        const auto [cause, passes] = row<Cause, int>();
        show();
        m_parent->passes = 0;
        cause(*m_parent);
        waitForFrames(2);
        QCOMPARE(m_parent->passes, passes);
    }

    void passRunsOnTheMainThreadBeforeTheFrame()
    {
        show();
        m_parent->passes = 0;
        int passesAtSync = -1;
        QThread *thread = nullptr;
        m_parent->onLayout = [&](Controller &) { thread = QThread::currentThread(); };
        connect(
            m_window.get(), &QQuickWindow::beforeSynchronizing, this,
            [&] {
                if (passesAtSync < 0)
                    passesAtSync = m_parent->passes;
            },
            Qt::DirectConnection);
        m_parent->setNeedsLayout();
        QTRY_COMPARE(passesAtSync, 1);
        QCOMPARE(thread, qApp->thread());
    }

    void requestsDuringAPass_data()
    {
        addRows<int, int, int>({
            {"none", 0, 1, 1},
            {"one", 1, 2, 2},
            {"two", 2, 2, 3},
            {"many", 9, 2, 10},
        });
    }
    void requestsDuringAPass()
    {
        const auto [asked, passesAtOnce, passesInAll] = row<int, int, int>();
        int requests = asked;
        show();
        m_parent->passes = 0;
        m_parent->onLayout = [&](Controller &controller) {
            if (requests-- <= 0)
                return;
            controller.setNeedsLayout();
            controller.layoutNow();
        };
        m_parent->layoutNow();
        QCOMPARE(m_parent->passes, passesAtOnce);
        QTRY_COMPARE(m_parent->passes, passesInAll);
        waitForFrames(2);
        QCOMPARE(m_parent->passes, passesInAll);
    }

    void aControllerThatNeverRestsLeavesTheEventLoopAlive()
    {
        show();
        m_parent->onLayout = [](Controller &controller) { controller.setNeedsLayout(); };
        bool alive = false;
        m_parent->setNeedsLayout();
        waitForFrames(3);
        QMetaObject::invokeMethod(
            this, [&] { alive = true; }, Qt::QueuedConnection);
        QTRY_VERIFY(alive);
    }

    void childrenFollowTheirParentInOnePass()
    {
        show();
        join();
        m_child->view()->setParentItem(m_parent->view());
        waitForFrames(2);
        takeLog();
        m_parent->onLayout = [this](Controller &) { m_child->view()->setSize({10, 10}); };
        m_parent->layoutNow();
        QCOMPARE(takeLog(), u"p will layout, p did layout, c will layout, c did layout"_s);
        m_child->setNeedsLayout();
        waitForFrames(2);
        QCOMPARE(takeLog(), u"c will layout, c did layout"_s);
    }

    void aViewOutsideAnyWindowWaits()
    {
        m_parent->setNeedsLayout();
        m_parent->layoutNow();
        QCOMPARE(m_parent->passes, 0);
        m_parent->view();
        QCoreApplication::processEvents();
        QCOMPARE(m_parent->passes, 0);
        show();
        QCOMPARE(m_parent->passes, 1);
    }

    void childrenGoBeforeTheViewAndWithoutAParent()
    {
        struct Leaving : Controller
        {
            using Controller::Controller;
            ~Leaving() override { *hadParent = parentController() != nullptr; }
            bool *hadParent = nullptr;
        };
        bool hadParent = true;
        auto child = std::make_unique<Leaving>(u"c"_s, m_log);
        child->hadParent = &hadParent;
        const QPointer<QQuickItem> childView = child->view();
        childView->setParentItem(m_parent->view());
        m_parent->addChild(std::move(child));
        m_parent.reset();
        QVERIFY(!hadParent);
        QVERIFY(!childView);
    }

private:
    void join()
    {
        auto child = std::make_unique<Controller>(u"c"_s, m_log);
        m_child = child.get();
        m_parent->addChild(std::move(child));
        m_child->view();
        m_child->didMoveToParent(m_parent.get());
    }
    void show()
    {
        m_parent->view()->setParentItem(m_window->contentItem());
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        waitForFrames(2);
    }
    void waitForFrames(int count)
    {
        for (int frame = 0; frame < count; ++frame) {
            QSignalSpy spy(m_window.get(), &QQuickWindow::frameSwapped);
            m_window->update();
            QVERIFY(spy.wait());
        }
    }
    QString takeLog() { return std::exchange(m_log, {}).join(u", "_s); }

    std::unique_ptr<QQuickWindow> m_window;
    std::unique_ptr<Controller> m_parent;
    Controller *m_child = nullptr;
    QStringList m_log;
};

QTEST_MAIN(ViewControllerTest)
#include "tst_viewcontroller.moc"
