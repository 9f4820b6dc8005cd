#include "platform/input/onepointerdrag.h"

#include "../../shared/table.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTest>

#include <functional>

using namespace favrin::platform;
using namespace Qt::StringLiterals;

namespace {

/** An item of 360 × 300 points that writes down what its drag tells: the place, or "end". */
class DraggedItem : public QQuickItem
{
public:
    explicit DraggedItem(QQuickItem *parent) : QQuickItem(parent) { setSize({360.0, 300.0}); }

    QString take() { return std::exchange(m_log, {}).join(u' '); }
    bool isDragged() const { return m_drag.isActive(); }

protected:
    void mousePressEvent(QMouseEvent *event) override { m_drag.mousePress(*event); }
    void mouseMoveEvent(QMouseEvent *event) override { m_drag.mouseMove(*event); }
    void mouseReleaseEvent(QMouseEvent *) override { m_drag.mouseUngrab(); }
    void mouseUngrabEvent() override { m_drag.mouseUngrab(); }
    void touchEvent(QTouchEvent *event) override { m_drag.touch(*event); }
    void touchUngrabEvent() override { m_drag.touchUngrab(); }

private:
    QStringList m_log;
    OnePointerDrag m_drag{
        *this,
        [this](QPointF place) { m_log.append(u"%1,%2"_s.arg(place.x()).arg(place.y())); },
        [this] { m_log.append(u"end"_s); },
    };
};

} // namespace

class OnePointerDragTest : public QObject
{
    Q_OBJECT

    enum class Device { Finger, Mouse };

private Q_SLOTS:
    void initTestCase()
    {
        // Every move counts here; the toolkit would merge those of one frame.
        qputenv("QML_NO_TOUCH_COMPRESSION", "1");
    }

    void init()
    {
        m_window = std::make_unique<QQuickWindow>();
        m_window->resize(400, 340);
        m_item = new DraggedItem(m_window->contentItem());
        m_item->setPosition({20.0, 20.0});
        m_window->show();
        m_window->requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    }

    void cleanup() { m_window.reset(); }

    void dragsFromPressToRelease_data() { addDevices(); }
    void dragsFromPressToRelease()
    {
        const auto [pointer] = row<Device>();
        press(pointer, {30, 40});
        QCOMPARE(m_item->take(), u"10,20"_s);
        QVERIFY(m_item->isDragged());
        QVERIFY(m_item->hasActiveFocus());
        // Beyond the edges too.
        move(pointer, {5, 399});
        release(pointer, {5, 399});
        QCOMPARE(m_item->take(), u"-15,379 end"_s);
        QVERIFY(!m_item->isDragged());
        press(pointer, {40, 40});
        QCOMPARE(m_item->take(), u"20,20"_s);
        release(pointer, {40, 40});
    }

    void furtherPointersAreIgnored()
    {
        touch().press(0, QPoint(30, 40));
        m_item->take();
        touch().stationary(0).press(1, QPoint(200, 200));
        touch().stationary(0).move(1, QPoint(210, 210));
        QMouseEvent click(QEvent::MouseButtonPress, {1.0, 1.0}, {1.0, 1.0}, Qt::LeftButton, Qt::LeftButton, {});
        QCoreApplication::sendEvent(m_item, &click);
        QCOMPARE(m_item->take(), QString());
        touch().move(0, QPoint(40, 50)).stationary(1);
        QCOMPARE(m_item->take(), u"20,30"_s);
        touch().stationary(0).release(1, QPoint(210, 210));
        QCOMPARE(m_item->take(), QString());
        touch().release(0, QPoint(40, 50));
        QCOMPARE(m_item->take(), u"end"_s);
    }

    void otherMouseButtonsAreIgnored()
    {
        QTest::mouseClick(m_window.get(), Qt::RightButton, {}, {50, 50});
        QCOMPARE(m_item->take(), QString());
    }

    void lossEndsTheDrag_data()
    {
        using enum Device;
        using Loss = std::function<void()>;
        const Loss hide = [this] { m_item->setVisible(false); };
        const Loss disable = [this] { m_item->setEnabled(false); };
        addRows<Device, Loss>({
            {"finger cancelled", Finger,
             [this] {
                 QTouchEvent cancel(QEvent::TouchCancel, m_touch.get());
                 QCoreApplication::sendEvent(m_window.get(), &cancel);
             }},
            {"finger hidden", Finger, hide},
            {"finger disabled", Finger, disable},
            {"finger grabbed", Finger, [this] { m_item->ungrabTouchPoints(); }},
            {"mouse hidden", Mouse, hide},
            {"mouse disabled", Mouse, disable},
            {"mouse grabbed", Mouse, [this] { m_item->ungrabMouse(); }},
        });
    }
    void lossEndsTheDrag()
    {
        const auto [pointer, lose] = row<Device, std::function<void()>>();
        press(pointer, {30, 40});
        m_item->take();
        lose();
        QCOMPARE(m_item->take(), u"end"_s);
        release(pointer, {30, 40});
        QCOMPARE(m_item->take(), QString());
    }

    void flickableDoesNotTakeItOver_data() { addDevices(); }
    void flickableDoesNotTakeItOver()
    {
        const auto [pointer] = row<Device>();
        QQmlEngine engine;
        QQmlComponent component(&engine);
        component.setData("import QtQuick; Flickable { width: 400; height: 340; contentHeight: 900 }", {});
        std::unique_ptr<QQuickItem> flickable(qobject_cast<QQuickItem *>(component.create()));
        QVERIFY2(flickable, qPrintable(component.errorString()));
        flickable->setParentItem(m_window->contentItem());
        m_item->setParentItem(flickable->property("contentItem").value<QQuickItem *>());
        press(pointer, {30, 300});
        for (int y = 260; y > 90; y -= 40)
            move(pointer, {30, y});
        release(pointer, {30, 100});
        QCOMPARE(m_item->take(), u"10,280 10,240 10,200 10,160 10,120 10,80 end"_s);
        QCOMPARE(flickable->property("contentY").toDouble(), 0.0);
        // The item belongs to the window; the flickable goes before it.
        m_item->setParentItem(m_window->contentItem());
    }

private:
    static void addDevices() { addRows<Device>({{"finger", Device::Finger}, {"mouse", Device::Mouse}}); }

    /** What the pointer does, both as a finger and as a mouse. */
    void press(Device device, QPoint place)
    {
        device == Device::Finger ? void(touch().press(0, place))
                                 : QTest::mousePress(m_window.get(), Qt::LeftButton, {}, place);
    }
    void move(Device device, QPoint place)
    {
        device == Device::Finger ? void(touch().move(0, place)) : QTest::mouseMove(m_window.get(), place);
    }
    void release(Device device, QPoint place)
    {
        device == Device::Finger ? void(touch().release(0, place))
                                 : QTest::mouseRelease(m_window.get(), Qt::LeftButton, {}, place);
    }
    QTest::QTouchEventSequence touch() { return QTest::touchEvent(m_window.get(), m_touch.get()); }

    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
    std::unique_ptr<QQuickWindow> m_window;
    DraggedItem *m_item = nullptr;
};

QTEST_MAIN(OnePointerDragTest)
#include "tst_onepointerdrag.moc"
