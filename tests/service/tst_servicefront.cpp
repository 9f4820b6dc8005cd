#include "service/fvcolorpickerservicefront.h"
#include "service/fvcolorpickerserviceviewcontroller.h"

#include "../shared/table.h"
#include "recordedhost.h"

#include <QQuickItem>
#include <QQuickWindow>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

using namespace favrin;
using namespace favrin::service;
using model::SomeColor;
using remote::BackgroundEffect;
using namespace Qt::StringLiterals;

namespace {

const SomeColor red(1, 0, 0, 1, SomeColor::ColorSpace::sRGB);
const SomeColor wideGreen(0, 1, 0, 1, SomeColor::ColorSpace::displayP3);
const std::string sRGBName(platform::colorspacename::sRGB);
const std::string displayP3Name(platform::colorspacename::displayP3);

const QString touchReleased = u"touch released"_s;

QString touchStates(const QTouchEvent &event)
{
    return event.touchPointStates().testFlag(QEventPoint::Released) ? touchReleased : u"touch"_s;
}

/** A view that writes down what the user does to it. */
class TestView : public QQuickItem
{
public:
    using QQuickItem::setImplicitSize;
    TestView()
    {
        setAcceptedMouseButtons(Qt::LeftButton);
        setAcceptTouchEvents(true);
        setImplicitSize(320, 500);
        setFocus(true);
    }
    QStringList events;

protected:
    void mousePressEvent(QMouseEvent *) override { events << u"press"_s; }
    void mouseReleaseEvent(QMouseEvent *) override { events << u"release"_s; }
    void touchEvent(QTouchEvent *event) override
    {
        events << touchStates(*event);
        event->accept();
    }
    void keyPressEvent(QKeyEvent *) override { events << u"key"_s; }
    void inputMethodEvent(QInputMethodEvent *) override { events << u"text"_s; }
};

class RecordedClient : public EyedropperClient
{
public:
    explicit RecordedClient(QStringList &messages) : m_messages(messages) {}
    void invoke(const std::string &display) override { m_messages << u"begin "_s + QString::fromStdString(display); }
    void floatEyedropper() override { m_messages << u"float it"_s; }
    void cancel() override { m_messages << u"cancel it"_s; }

private:
    QStringList &m_messages;
};

QStringList words(const char *text)
{
    return QString::fromLatin1(text).split(u", "_s, Qt::SkipEmptyParts);
}

} // namespace

class TestServiceFront : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        const QString file = m_folder.filePath(u"%1.sqlite"_s.arg(m_files++));
        m_defaults = std::make_unique<platform::UserDefaults>(file.toStdString());
        platform::viewcontrollerregistry::registerClass(hostedPickerClassName, [this] {
            return std::make_unique<FVColorPickerServiceViewController>(
                [this](ColorPickerState *) {
                    auto view = std::make_unique<TestView>();
                    m_childView = view.get();
                    return view;
                },
                *m_defaults);
        });
        m_host = RecordedHost();
        m_front = std::make_unique<FVColorPickerServiceFront>([this] { return &m_host; });
    }

    void cleanup()
    {
        m_front.reset();
        m_defaults.reset();
    }

    void picksCarryTheNameOfTheirSpace()
    {
        state().isVolatile.set(true);
        state().setColorBinding(wideGreen);
        state().isVolatile.set(false);
        state().selectedColor.set(std::nullopt);
        const auto green = wideGreen.platformColor();
        // The first is what the drag begins with: no color yet.
        QCOMPARE(m_host.picks, (std::vector<RecordedHost::Pick>{{std::nullopt, std::nullopt, true},
                                                                {green, displayP3Name, true},
                                                                {green, displayP3Name, false},
                                                                {std::nullopt, std::nullopt, false}}));
    }

    void aConfigurationBeforeTheViewIsNotLost()
    {
        m_front->setConfiguration({.title = "Paint"});
        QCOMPARE(state().title(), std::string("Paint"));
    }

    void preparingIsAnsweredAtOnce()
    {
        int answers = 0;
        m_front->prepareForDisplay([&] { ++answers; });
        QCOMPARE(answers, 1);
        QCOMPARE(lastSize(), QSizeF(360, 500));
        m_front->prepareForDisplay(nullptr);
    }

    void thePreferredSizeFollowsWindowAndView()
    {
        QCOMPARE(m_front->preferredContentSize(), QSizeF(0, 0));
        m_front->setConfiguration({.hostWindowWidth = 1024, .hostWindowHeight = 768});
        QCOMPARE(lastSize(), QSizeF(568, 500));
        QVERIFY(state().useLandscapeLayout());

        setPresentationContext(platform::PresentationContext::Popover);
        m_front->updatePreferredContentSize();
        QCOMPARE(lastSize(), QSizeF(360, 500));
        QVERIFY(!state().useLandscapeLayout());

        m_childView->setImplicitSize(0, 0);
        m_front->updatePreferredContentSize();
        QCOMPARE(lastSize(), QSizeF(360, 768));

        m_front->setConfiguration({.hostWindowWidth = qQNaN(), .hostWindowHeight = -qInf()});
        QCOMPARE(lastSize(), QSizeF(360, 0));
        m_front->setConfiguration({.hostWindowWidth = 1e300, .hostWindowHeight = 1e299});
        QCOMPARE(lastSize(), QSizeF(360, 16384));
    }

    void layoutChangesOfTheViewUpdateThePreferredSize()
    {
        QQuickWindow window;
        m_front->view()->setParentItem(window.contentItem());
        window.show();
        m_front->layoutNow();
        QCOMPARE(m_host.sizes, (std::vector<QSizeF>{{360, 500}}));
        m_childView->setImplicitHeight(510);
        m_front->layoutNow();
        QCOMPARE(m_host.sizes.size(), std::size_t(1));
        m_childView->setImplicitHeight(515);
        QTRY_COMPARE(lastSize(), QSizeF(360, 515));
    }

    void theBackgroundIsTheHostsInPopoverAndEmbedded_data()
    {
        addRows<int, bool, bool>({
            {"presented", 1, false, true},
            {"unspecified", 0, false, true},
            {"popover", 3, false, false},
            {"embedded", 1, true, false},
            {"embedded in a popover", 3, true, false},
        });
    }
    void theBackgroundIsTheHostsInPopoverAndEmbedded()
    {
        const auto [context, embedded, material] = row<int, bool, bool>();
        m_front->view();
        QCOMPARE(m_host.effects, std::vector{BackgroundEffect::ThickMaterial});
        setPresentationContext(static_cast<platform::PresentationContext>(context));
        m_front->setConfiguration({.isEmbedded = embedded});
        m_front->setConfiguration({.isEmbedded = embedded});
        QCOMPARE(m_host.effects.back(), material ? BackgroundEffect::ThickMaterial : BackgroundEffect::None);
        QCOMPARE(m_host.effects.size(), std::size_t(material ? 1 : 2));
        QCOMPARE(state().isPopover(), context == 3);
    }

    void theKeyboardsRoomIsLeftFree_data()
    {
        addRows<double, double>({
            {"none", 0.0, 600.0},
            {"keyboard", 300.0, 300.0},
            {"taller than the picker", 900.0, 0.0},
            {"negative", -50.0, 600.0},
            {"not a number", qQNaN(), 600.0},
            {"infinite", qInf(), 600.0},
        });
    }
    void theKeyboardsRoomIsLeftFree()
    {
        const auto [space, height] = row<double, double>();
        m_front->view()->setSize({360, 600});
        m_front->setConfiguration({.keyboardSpace = space});
        QCOMPARE(m_childView->size(), QSizeF(360, height));
        QCOMPARE(m_childView->position(), QPointF(0, 0));
        QVERIFY(state().size() == QSizeF(360, height));
    }

    void anEyedropperUseGoesItsWayInOrder()
    {
        auto &eyedropper = m_front->eyedropper();
        eyedropper.setClient(std::make_unique<RecordedClient>(m_host.messages));
        eyedropper.setDisplayIdentifier("display 7");

        state().eyedropperShowing.set(true);
        QVERIFY(!m_front->isInteractionEnabled());
        state().eyedropperIsFloating.set(true);
        eyedropper.eyedropperDidFloat();
        eyedropper.eyedropperDidSelectColor(red.platformColor());
        QTRY_VERIFY(state().selectedColor() == red);
        QVERIFY(!m_front->isInteractionEnabled());
        eyedropper.eyedropperDidDismiss();
        QVERIFY(m_front->isInteractionEnabled());
        QTRY_VERIFY(!state().eyedropperShowing());

        QCOMPARE(m_host.messages, words("begin display 7, show, float it, float, pick, pick, dismiss"));
        QCOMPARE(m_host.picks, (std::vector<RecordedHost::Pick>{{red.platformColor(), std::nullopt, false},
                                                                {red.platformColor(), sRGBName, false}}));

        // The actions are gone: a late color reaches the host alone.
        eyedropper.eyedropperDidSelectColor(wideGreen.platformColor());
        QCoreApplication::processEvents();
        QVERIFY(state().selectedColor() == red);
        m_front->pickerDidCancelEyeDropper();
        QCOMPARE(m_host.messages.last(), u"cancel it"_s);
    }

    void withoutAServiceTheEyedropperIsDismissedAtOnce()
    {
        state().eyedropperShowing.set(true);
        QVERIFY(m_front->isInteractionEnabled());
        QCOMPARE(m_host.messages, words("show, dismiss"));
        QTRY_VERIFY(!state().eyedropperShowing());
        state().eyedropperIsFloating.set(true);
        QCOMPARE(m_host.messages, words("show, dismiss"));
    }

    void reportsWithoutARequestStillReachTheHost()
    {
        m_front->eyedropper().eyedropperDidSelectColor(red.platformColor());
        m_front->eyedropper().eyedropperDidDismiss();
        QCOMPARE(m_host.messages, words("pick, dismiss"));
    }

    void whileTheEyedropperShowsOnlyTheOldTouchGoesOn()
    {
        m_front->eyedropper().setClient(std::make_unique<RecordedClient>(m_host.messages));
        QQuickWindow window;
        show(window);
        const std::unique_ptr<QPointingDevice> screen(QTest::createTouchDevice());

        QTest::touchEvent(&window, screen.get()).press(1, {50, 50}, &window);
        state().eyedropperShowing.set(true);
        QTest::touchEvent(&window, screen.get()).stationary(1).press(2, {80, 80}, &window);
        QTest::touchEvent(&window, screen.get()).stationary(1).release(2, {80, 80}, &window);
        QTest::touchEvent(&window, screen.get()).release(1, {50, 50}, &window);
        QVERIFY(m_childView->events.contains(touchReleased));
        m_childView->events.clear();
        QTest::touchEvent(&window, screen.get()).press(3, {50, 50}, &window);
        QTest::touchEvent(&window, screen.get()).release(3, {50, 50}, &window);
        QVERIFY(m_childView->events.isEmpty());
    }

    void whileTheEyedropperShowsMouseAndKeysAreEaten()
    {
        m_front->eyedropper().setClient(std::make_unique<RecordedClient>(m_host.messages));
        QQuickWindow window;
        show(window);
        const auto sendText = [&] {
            QInputMethodEvent event(u"\u3042"_s, {});
            QCoreApplication::sendEvent(m_childView, &event);
        };

        QTest::mousePress(&window, Qt::LeftButton, {}, {50, 50});
        state().eyedropperShowing.set(true);
        QTest::mouseRelease(&window, Qt::LeftButton, {}, {50, 50});
        QCOMPARE(m_childView->events, words("press, release"));

        QTest::mouseClick(&window, Qt::LeftButton, {}, {50, 50});
        QTest::keyClick(&window, Qt::Key_A);
        sendText();
        QCOMPARE(m_childView->events, words("press, release"));

        m_front->eyedropper().eyedropperDidDismiss();
        QTest::mouseClick(&window, Qt::LeftButton, {}, {50, 50});
        QTest::keyClick(&window, Qt::Key_A);
        sendText();
        QCOMPARE(m_childView->events, words("press, release, press, release, key, text"));
    }

    void withoutAHostNothingIsSent()
    {
        m_front = std::make_unique<FVColorPickerServiceFront>([]() -> remote::RemoteHost * { return nullptr; });
        m_front->setConfiguration({});
        state().setColorBinding(red);
        state().eyedropperShowing.set(true);
        state().performClose();
        QVERIFY(state().selectedColor() == red);
    }

    void withoutAHostedPickerTheFrontStaysAlive()
    {
        platform::viewcontrollerregistry::registerClass(hostedPickerClassName, {});
        QTest::ignoreMessage(QtCriticalMsg, "No hosted picker is registered; the picker stays empty");
        m_front->setConfiguration({.hostWindowHeight = 400});
        m_front->setSelectedColor(red.platformColor(), sRGBName);
        int answers = 0;
        m_front->prepareForDisplay([&] { ++answers; });
        QCOMPARE(answers, 1);
        QCOMPARE(lastSize(), QSizeF(360, 400));
        m_front->colorPickerDidFinish();
        QCOMPARE(m_host.messages, words("finish"));
    }

private:
    void show(QQuickWindow &window)
    {
        window.resize(360, 600);
        m_front->view()->setParentItem(window.contentItem());
        m_front->view()->setSize({360, 600});
        m_front->layoutNow();
        window.show();
        window.requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(&window));
        m_childView->forceActiveFocus();
    }

    void setPresentationContext(platform::PresentationContext context)
    {
        auto traits = m_front->traits();
        traits.presentationContext = context;
        m_front->setTraits(traits);
    }

    ColorPickerState &state()
    {
        m_front->view();
        return static_cast<FVColorPickerServiceViewController *>(m_front->childViewController())->colorPickerState();
    }
    QSizeF lastSize() const { return m_host.sizes.empty() ? QSizeF() : m_host.sizes.back(); }

    QTemporaryDir m_folder;
    int m_files = 0;
    std::unique_ptr<platform::UserDefaults> m_defaults;
    TestView *m_childView = nullptr;
    RecordedHost m_host;
    std::unique_ptr<FVColorPickerServiceFront> m_front;
};

QTEST_MAIN(TestServiceFront)
#include "tst_servicefront.moc"
