#include "fake/fvcolorpickerscript.h"
#include "host/fvcolorpickerviewcontroller.h"

#include <QSignalSpy>
#include <QTest>

using Picker = FVColorPickerViewController;
using State = Picker::State;

namespace {

const FVColor red(1, 0, 0);
const FVColor vivid(0.9, 0.1, 0.2, 0.5, FVColor::displayP3Name());

/** Everything that a picker says, in its order, as words. */
class Listener : public QObject
{
public:
    explicit Listener(Picker &picker)
    {
        connect(&picker, &Picker::stateChanged, this,
                [this, &picker] { words.append(QStringLiteral("state%1").arg(static_cast<int>(picker.state()))); });
        connect(&picker, &Picker::pickerDidSelectColor, this,
                [this](const FVColor &color, const QString &space, bool isVolatile) {
                    words.append(
                        QStringLiteral("%1%2%3").arg(isVolatile ? QStringLiteral("drag") : QStringLiteral("pick"),
                                                     color.isValid() ? QString::number(color.red()) : QString(),
                                                     space.isEmpty() ? QStringLiteral("?") : QString()));
                });
        connect(&picker, &Picker::pickerDidShowEyedropper, this, [this] { words.append(QStringLiteral("show")); });
        connect(&picker, &Picker::pickerDidFloatEyedropper, this, [this] { words.append(QStringLiteral("float")); });
        connect(&picker, &Picker::pickerDidDismissEyedropper, this, [this] { words.append(QStringLiteral("gone")); });
        connect(&picker, &Picker::colorPickerDidFinish, this, [this] { words.append(QStringLiteral("finished")); });
        connect(&picker, &Picker::colorPickerViewServiceDidTerminateWithError, this,
                [this](const QString &error) { words.append(error); });
    }

    QString text() const { return words.join(u' '); }

    QStringList words;
};

} // namespace

Q_DECLARE_METATYPE(FVColorPickerScript)

class TestFake : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { FVColorPickerScript::clear(); }

    void saysWhatAPickerWouldSay_data()
    {
        QTest::addColumn<FVColorPickerScript>("script");
        QTest::addColumn<QString>("expected");
        using Script = FVColorPickerScript;
        QTest::newRow("nothing") << Script() << "state1 state2";
        QTest::newRow("a drag ends with its last color, final")
            << Script().drag({red, vivid}).finish() << "state1 state2 drag1 drag0.9 pick0.9 state0 finished";
        QTest::newRow("an empty drag") << Script().drag({}).finish() << "state1 state2 state0 finished";
        QTest::newRow("no color") << Script().pickNoColor().finish() << "state1 state2 pick? state0 finished";
        QTest::newRow("a sample comes twice") << Script().sample(red) << "state1 state2 show float pick1? pick1 gone";
        QTest::newRow("the end of the process")
            << Script().pick(red).terminate(QStringLiteral("signal-9")) << "state1 state2 pick1 state4 signal-9";
    }

    void saysWhatAPickerWouldSay()
    {
        QFETCH(FVColorPickerScript, script);
        QFETCH(QString, expected);
        script.play();
        QQuickWindow window;
        Picker picker;
        picker.setAllowsNoColor(true);
        const Listener listener(picker);
        picker.present(&window);
        QCOMPARE(listener.text(), QStringLiteral("state1"));
        QTRY_COMPARE(listener.text(), expected);
    }

    void reportsColorsBitForBit()
    {
        FVColorPickerScript().pick(vivid).play();
        QQuickWindow window;
        Picker picker;
        QSignalSpy picks(&picker, &Picker::pickerDidSelectColor);
        picker.present(&window);
        QTRY_COMPARE(picks.size(), 1);
        QCOMPARE(picks.constFirst().at(0).value<FVColor>(), vivid);
        QCOMPARE(picks.constFirst().at(1).toString(), FVColor::displayP3Name());
        QCOMPARE(picker.selectedColor(), vivid);
    }

    void leavesOutWhatTheAppDoesNotAllow()
    {
        FVColorPickerScript().pickNoColor().pick(red).play();
        QQuickWindow window;
        Picker picker;
        const Listener listener(picker);
        QTest::ignoreMessage(QtWarningMsg,
                             "FVColorPickerScript: this picker does not allow no color, so none is picked");
        picker.present(&window);
        QTRY_COMPARE(listener.text(), QStringLiteral("state1 state2 pick1"));
    }

    void playsOneScriptForEachPresentation()
    {
        FVColorPickerScript().pick(red).play();
        FVColorPickerScript().pick(vivid).finish().play();
        QQuickWindow window;
        Picker picker;
        picker.present(&window);
        picker.present(&window);
        QTRY_COMPARE(picker.selectedColor(), red);
        QCOMPARE(FVColorPickerScript::waiting(), 1);
        picker.dismiss();
        QCOMPARE(picker.state(), State::Stopping);
        QTRY_COMPARE(picker.state(), State::NotRunning);
        picker.present(&window);
        QTRY_COMPARE(picker.state(), State::NotRunning);
        QCOMPARE(picker.selectedColor(), vivid);
        QCOMPARE(FVColorPickerScript::waiting(), 0);
    }

    void stopsWhenTheAppDismissesInAPick()
    {
        FVColorPickerScript().pick(red).pick(vivid).play();
        QQuickWindow window;
        Picker picker;
        const Listener listener(picker);
        connect(&picker, &Picker::pickerDidSelectColor, &picker, &Picker::dismiss);
        QTest::ignoreMessage(QtWarningMsg, "FVColorPickerScript: 1 steps are left after the end of the picker");
        picker.present(&window);
        QTRY_COMPARE(listener.text(), QStringLiteral("state1 state2 pick1 state3 state0 finished"));
    }

    void takesPlaceInTheApp()
    {
        QQuickWindow window;
        window.resize(800, 900);
        auto container = std::make_unique<QQuickItem>(window.contentItem());
        container->setSize(QSizeF(300, 500));
        Picker picker;
        picker.embed(container.get());
        QVERIFY(picker.view());
        QCOMPARE(picker.view()->parentItem(), container.get());
        QCOMPARE(picker.view()->size(), QSizeF(300, 500));
        QTRY_COMPARE(picker.state(), State::Ready);
        container.reset();
        QTRY_COMPARE(picker.state(), State::NotRunning);
        QVERIFY(!picker.view());
    }
};

QTEST_MAIN(TestFake)
#include "tst_fake.moc"
