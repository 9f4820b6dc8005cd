#include "platform/input/onepointerdrag.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTest>

using namespace favrin::platform;

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
        [this](QPointF place) { m_log.append(QStringLiteral("%1,%2").arg(place.x()).arg(place.y())); },
        [this] { m_log.append(QStringLiteral("end")); },
    };
};

} // namespace

class OnePointerDragTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void dragsFromPressToRelease_data();
    void dragsFromPressToRelease();
    void furtherPointersAreIgnored();
    void otherMouseButtonsAreIgnored();
    void lossEndsTheDrag_data();
    void lossEndsTheDrag();
    void flickableDoesNotTakeItOver_data();
    void flickableDoesNotTakeItOver();

private:
    enum class Device { Finger, Mouse };

    static void addDevices();
    void press(Device device, QPoint place);
    void move(Device device, QPoint place);
    void release(Device device, QPoint place);
    QTest::QTouchEventSequence touch() { return QTest::touchEvent(m_window.get(), m_touch.get()); }

    std::unique_ptr<QPointingDevice> m_touch{QTest::createTouchDevice()};
    std::unique_ptr<QQuickWindow> m_window;
    DraggedItem *m_item = nullptr;
};

void OnePointerDragTest::initTestCase()
{
    // Every move counts here; the toolkit would merge those of one frame.
    qputenv("QML_NO_TOUCH_COMPRESSION", "1");
}

void OnePointerDragTest::init()
{
    m_window = std::make_unique<QQuickWindow>();
    m_window->resize(400, 340);
    m_item = new DraggedItem(m_window->contentItem());
    m_item->setPosition({20.0, 20.0});
    m_window->show();
    m_window->requestActivate();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
}

void OnePointerDragTest::cleanup()
{
    m_window.reset();
}

void OnePointerDragTest::addDevices()
{
    QTest::addColumn<int>("device");
    QTest::newRow("finger") << static_cast<int>(Device::Finger);
    QTest::newRow("mouse") << static_cast<int>(Device::Mouse);
}

void OnePointerDragTest::press(Device device, QPoint place)
{
    if (device == Device::Finger)
        touch().press(0, place);
    else
        QTest::mousePress(m_window.get(), Qt::LeftButton, {}, place);
}

void OnePointerDragTest::move(Device device, QPoint place)
{
    if (device == Device::Finger)
        touch().move(0, place);
    else
        QTest::mouseMove(m_window.get(), place);
}

void OnePointerDragTest::release(Device device, QPoint place)
{
    if (device == Device::Finger)
        touch().release(0, place);
    else
        QTest::mouseRelease(m_window.get(), Qt::LeftButton, {}, place);
}

void OnePointerDragTest::dragsFromPressToRelease_data()
{
    addDevices();
}

void OnePointerDragTest::dragsFromPressToRelease()
{
    QFETCH(int, device);
    const auto pointer = static_cast<Device>(device);
    press(pointer, {30, 40});
    QCOMPARE(m_item->take(), QStringLiteral("10,20"));
    QVERIFY(m_item->isDragged());
    QVERIFY(m_item->hasActiveFocus());
    // Beyond the edges too.
    move(pointer, {5, 399});
    release(pointer, {5, 399});
    QCOMPARE(m_item->take(), QStringLiteral("-15,379 end"));
    QVERIFY(!m_item->isDragged());
    press(pointer, {40, 40});
    QCOMPARE(m_item->take(), QStringLiteral("20,20"));
    release(pointer, {40, 40});
}

void OnePointerDragTest::furtherPointersAreIgnored()
{
    touch().press(0, QPoint(30, 40));
    m_item->take();
    touch().stationary(0).press(1, QPoint(200, 200));
    touch().stationary(0).move(1, QPoint(210, 210));
    QMouseEvent click(QEvent::MouseButtonPress, {1.0, 1.0}, {1.0, 1.0}, Qt::LeftButton, Qt::LeftButton, {});
    QCoreApplication::sendEvent(m_item, &click);
    QCOMPARE(m_item->take(), QString());
    touch().move(0, QPoint(40, 50)).stationary(1);
    QCOMPARE(m_item->take(), QStringLiteral("20,30"));
    touch().stationary(0).release(1, QPoint(210, 210));
    QCOMPARE(m_item->take(), QString());
    touch().release(0, QPoint(40, 50));
    QCOMPARE(m_item->take(), QStringLiteral("end"));
}

void OnePointerDragTest::otherMouseButtonsAreIgnored()
{
    QTest::mouseClick(m_window.get(), Qt::RightButton, {}, {50, 50});
    QCOMPARE(m_item->take(), QString());
}

void OnePointerDragTest::lossEndsTheDrag_data()
{
    QTest::addColumn<int>("device");
    QTest::addColumn<QString>("loss");
    for (const char *loss : {"cancelled", "hidden", "disabled", "grabbed"}) {
        QTest::addRow("finger %s", loss) << static_cast<int>(Device::Finger) << QString::fromLatin1(loss);
        if (qstrcmp(loss, "cancelled") != 0)
            QTest::addRow("mouse %s", loss) << static_cast<int>(Device::Mouse) << QString::fromLatin1(loss);
    }
}

void OnePointerDragTest::lossEndsTheDrag()
{
    QFETCH(int, device);
    QFETCH(QString, loss);
    const auto pointer = static_cast<Device>(device);
    press(pointer, {30, 40});
    m_item->take();
    if (loss == u"cancelled") {
        QTouchEvent cancel(QEvent::TouchCancel, m_touch.get());
        QCoreApplication::sendEvent(m_window.get(), &cancel);
    } else if (loss == u"hidden") {
        m_item->setVisible(false);
    } else if (loss == u"disabled") {
        m_item->setEnabled(false);
    } else if (pointer == Device::Finger) {
        m_item->ungrabTouchPoints();
    } else {
        m_item->ungrabMouse();
    }
    QCOMPARE(m_item->take(), QStringLiteral("end"));
    release(pointer, {30, 40});
    QCOMPARE(m_item->take(), QString());
}

void OnePointerDragTest::flickableDoesNotTakeItOver_data()
{
    addDevices();
}

void OnePointerDragTest::flickableDoesNotTakeItOver()
{
    QFETCH(int, device);
    const auto pointer = static_cast<Device>(device);
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
    QCOMPARE(m_item->take(), QStringLiteral("10,280 10,240 10,200 10,160 10,120 10,80 end"));
    QCOMPARE(flickable->property("contentY").toDouble(), 0.0);
    // The item belongs to the window; the flickable goes before it.
    m_item->setParentItem(m_window->contentItem());
}

QTEST_MAIN(OnePointerDragTest)
#include "tst_onepointerdrag.moc"
