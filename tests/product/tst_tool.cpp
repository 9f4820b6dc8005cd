#include "apps/tool/pickertool.h"
#include "fake/fvcolorpickerscript.h"
#include "fake/scriptedpicker.h"

#include <QSignalSpy>
#include <QTest>

using namespace favrin::tool;

Q_DECLARE_METATYPE(FVColorPickerScript)

namespace {

const FVColor ink(27 / 255.0, 42 / 255.0, 65 / 255.0);
const FVColor leaf(0.2, 0.6, 0.3, 0.5, FVColor::displayP3Name());

/** One run of the tool with a picker that plays a script. */
class Run
{
public:
    Run(const QString &options, const FVColorPickerScript &script)
    {
        script.play();
        QStringList arguments = {QStringLiteral("favrin-color-picker")};
        if (!options.isEmpty())
            arguments += options.split(u' ');
        auto parsed = parseOptions(arguments);
        tool = std::make_unique<PickerTool>(*parsed.options, std::make_unique<favrin::fake::ScriptedPicker>(),
                                            [this](const std::string &line) {
                                                lines.append(QString::fromStdString(line));
                                                if (onLine)
                                                    onLine();
                                                return isReadable;
                                            });
        QObject::connect(tool.get(), &PickerTool::ended, tool.get(), [this](ExitStatus value, const QString &) {
            status = value;
            ++ends;
        });
    }

    std::unique_ptr<PickerTool> tool;
    QStringList lines;
    bool isReadable = true;
    std::function<void()> onLine;
    std::optional<ExitStatus> status;
    int ends = 0;
};

} // namespace

class TestTool : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { FVColorPickerScript::clear(); }

    void printsAndLeaves_data()
    {
        QTest::addColumn<QString>("options");
        QTest::addColumn<FVColorPickerScript>("script");
        QTest::addColumn<int>("status");
        QTest::addColumn<QString>("output");
        using Script = FVColorPickerScript;
        QTest::newRow("chosen") << "" << Script().pick(leaf).pick(ink).finish() << 0 << "#1b2a41ff";
        QTest::newRow("chosen, by format")
            << "-f css" << Script().drag({ink, leaf}).finish() << 0 << "color(display-p3 0.2 0.6 0.3 / 0.5)";
        QTest::newRow("chosen, a suggestion")
            << "-s Ink=#1b2a41 -s Snow=white -f {name}" << Script().pick(ink).finish() << 0 << "Ink";
        QTest::newRow("chosen, close to a suggestion")
            << "-s Ink=#1b2a42 -f <{name}>" << Script().pick(ink).finish() << 0 << "<>";
        QTest::newRow("chosen, no color") << "--allow-none" << Script().pickNoColor().finish() << 0 << "none";
        QTest::newRow("chosen, sampled once")
            << "--live" << Script().sample(ink).finish() << 0
            << R"({"color":{"space":"srgb","components":[0.10588235294117647,0.16470588235294117,0.2549019607843137],"alpha":1.0,"hex":"#1b2a41"},"volatile":false})";
        QTest::newRow("closed without a pick") << "-c red" << Script().finish() << 1 << "";
        QTest::newRow("the process ends") << "" << Script().pick(ink).terminate(QStringLiteral("signal 9")) << 3 << "";
        QTest::newRow("time is up") << "--timeout 0.05" << Script().pick(ink) << 5 << "";
        QTest::newRow("live") << "--live --allow-none" << Script().drag({FVColor(), FVColor()}).finish() << 0
                              << "{\"color\":null,\"volatile\":true}\n{\"color\":null,\"volatile\":true}\n"
                                 "{\"color\":null,\"volatile\":false}";
    }

    void printsAndLeaves()
    {
        QFETCH(QString, options);
        QFETCH(FVColorPickerScript, script);
        QFETCH(int, status);
        QFETCH(QString, output);
        Run run(options, script);
        run.tool->start();
        QTRY_VERIFY(run.status);
        QCOMPARE(static_cast<int>(*run.status), status);
        QCOMPARE(run.lines.join(u'\n'), output);
        QCOMPARE(run.ends, 1);
    }

    void escapeCancelsWhatWasPicked()
    {
        Run run(QStringLiteral("--live"), FVColorPickerScript().pick(ink).finish());
        run.onLine = [&run] { QTest::keyClick(run.tool->window(), Qt::Key_Escape); };
        run.tool->start();
        QTRY_VERIFY(run.status);
        QCOMPARE(*run.status, ExitStatus::Cancelled);
    }

    void escapeIsForgottenWhenTheUserGoesOn()
    {
        Run run(QStringLiteral("--live"), FVColorPickerScript().pick(ink).finish());
        run.onLine = [&run] {
            QTest::keyClick(run.tool->window(), Qt::Key_Escape);
            QTest::mouseClick(run.tool->window(), Qt::LeftButton, {}, QPoint(5, 5));
        };
        run.tool->start();
        QTRY_VERIFY(run.status);
        QCOMPARE(*run.status, ExitStatus::Chosen);
    }

    void closingTheWindowCancels()
    {
        Run run({}, FVColorPickerScript().pick(ink));
        run.tool->start();
        QTRY_VERIFY(run.tool->window()->isVisible());
        run.tool->window()->close();
        QTRY_VERIFY(run.status);
        QCOMPARE(*run.status, ExitStatus::Cancelled);
        QVERIFY(run.lines.isEmpty());
    }

    void failsWhenNobodyReads_data()
    {
        QTest::addColumn<QString>("options");
        QTest::newRow("at the end") << "";
        QTest::newRow("at a pick") << "--live";
    }

    void failsWhenNobodyReads()
    {
        QFETCH(QString, options);
        Run run(options, FVColorPickerScript().pick(ink).finish());
        run.isReadable = false;
        run.tool->start();
        QTRY_VERIFY(run.status);
        QCOMPARE(*run.status, ExitStatus::Failed);
        QCOMPARE(run.ends, 1);
    }
};

QTEST_MAIN(TestTool)
#include "tst_tool.moc"
