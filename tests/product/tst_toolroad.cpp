#include "apps/tool/pickertool.h"
#include "host/session/remotepicker.h"

#include <QGuiApplication>
#include <QScreen>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

using namespace favrin::tool;

namespace {

/** The tool's window with the real picker in it. Places are those of a picker that is higher than wide. */
class Run
{
public:
    explicit Run(const QStringList &options = {})
    {
        QStringList arguments = {QStringLiteral("favrin-color-picker"), QStringLiteral("--live")};
        tool = std::make_unique<PickerTool>(*parseOptions(arguments + options).options,
                                            std::make_unique<favrin::host::RemotePicker>(),
                                            [this](const std::string &line) {
                                                lines.append(QString::fromStdString(line));
                                                return true;
                                            });
        QObject::connect(tool.get(), &PickerTool::ended, tool.get(),
                         [this](ExitStatus value, const QString &) { status = value; });
        tool->start();
    }

    QWindow &window() const { return *tool->window(); }
    bool isShown() const { return window().isExposed(); }
    QPoint swatch(int row, int column) const
    {
        const double cell = (window().width() - 32) / 12.0;
        return QPointF(16 + (column + 0.5) * cell, 107 + (row + 0.5) * cell).toPoint();
    }
    QPoint closeButton() const { return {window().width() - 31, 28}; }
    QPoint opacityField() const
    {
        const double grid = (window().width() - 32) / 1.2;
        return QPointF(window().width() - 54, 107 + grid + 58).toPoint();
    }
    QRgb pixel(QPoint place) const
    {
        const QImage picture = window().screen()->grabWindow(window().winId()).toImage();
        return picture.rect().contains(place) ? picture.pixel(place) : 0;
    }
    bool lastIsFinal() const { return !lines.isEmpty() && lines.last().contains(u"\"volatile\":false"); }
    QString hex() const
    {
        return lines.isEmpty() ? QString() : lines.last().section(QStringLiteral("\"hex\":\""), 1).left(7);
    }

    std::unique_ptr<PickerTool> tool;
    QStringList lines;
    std::optional<ExitStatus> status;
};

} // namespace

/** From the tool's window to the picker's process and back, all of it real: only the display is missing. */
class ToolRoadTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_data.isValid());
        qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(m_data.filePath(QStringLiteral("defaults.sqlite"))));
        qputenv("FAVRIN_COLOR_PICKER_SERVICE", FAVRIN_SERVICE);
    }

    void aFingerAndAMousePick_data()
    {
        QTest::addColumn<bool>("isTouch");
        QTest::newRow("finger") << true;
        QTest::newRow("mouse") << false;
    }

    void aFingerAndAMousePick()
    {
        QFETCH(bool, isTouch);
        Run run;
        QTRY_VERIFY(run.isShown());
        const std::array<QPoint, 3> places = {run.swatch(3, 5), run.swatch(3, 8), run.swatch(4, 10)};
        if (isTouch) {
            auto touch = QTest::touchEvent(&run.window(), m_touchScreen.get(), false);
            touch.press(0, places[0]).commit();
            QTRY_COMPARE(run.hex(), QStringLiteral("#b51a00"));
            touch.move(0, places[1]).commit();
            QTRY_COMPARE(run.hex(), QStringLiteral("#a67b01"));
            touch.release(0, places[2]).commit();
        } else {
            QTest::mousePress(&run.window(), Qt::LeftButton, {}, places[0]);
            QTRY_COMPARE(run.hex(), QStringLiteral("#b51a00"));
            QTest::mouseMove(&run.window(), places[1]);
            QTRY_COMPARE(run.hex(), QStringLiteral("#a67b01"));
            QTest::mouseRelease(&run.window(), Qt::LeftButton, {}, places[2]);
        }
        QTRY_VERIFY(run.lastIsFinal());
        QCOMPARE(run.hex(), QStringLiteral("#c3d117"));
        QTest::mouseClick(&run.window(), Qt::LeftButton, {}, run.closeButton());
        QTRY_VERIFY(run.status);
        QCOMPARE(*run.status, ExitStatus::Chosen);
    }

    void keysAreTyped()
    {
        Run run({QStringLiteral("--color=#c3d117")});
        QTRY_VERIFY(run.isShown());
        run.window().requestActivate();
        QTRY_VERIFY(run.window().isActive());
        QTest::mouseClick(&run.window(), Qt::LeftButton, {}, run.opacityField());
        QTest::keyClick(&run.window(), Qt::Key_A, Qt::ControlModifier);
        for (const char key : {'5', '0'})
            QTest::keyClick(&run.window(), key);
        QTest::keyClick(&run.window(), Qt::Key_Return);
        QTRY_VERIFY(run.lastIsFinal());
        QVERIFY2(run.lines.last().contains(u"\"alpha\":0.5"), qPrintable(run.lines.last()));
    }

    void thePictureFollowsTheWindow()
    {
        Run run;
        QTRY_VERIFY(run.isShown());
        const QRgb yellow = qRgb(0xf5, 0xec, 0x00);
        QTRY_COMPARE(run.pixel(run.swatch(4, 9)), yellow);
        // The window is no larger than what is in it.
        QVERIFY(run.window().height() < 660);

        run.window().resize(480, 800);
        QTRY_COMPARE(run.pixel(run.swatch(4, 9)), yellow);
        // What the picker draws nothing on is the panel's.
        QTRY_COMPARE(run.pixel(QPoint(476, 796)), qRgb(0xf2, 0xf2, 0xf6));
        QTest::mouseClick(&run.window(), Qt::LeftButton, {}, run.swatch(4, 9));
        QTRY_COMPARE(run.hex(), QStringLiteral("#f5ec00"));

        // Hidden and shown again it is whole.
        run.window().hide();
        QTRY_VERIFY(!run.isShown());
        run.window().show();
        QTRY_VERIFY(run.isShown());
        QTRY_COMPARE(run.pixel(run.swatch(4, 9)), yellow);
    }

private:
    QTemporaryDir m_data;
    const std::unique_ptr<QPointingDevice> m_touchScreen{QTest::createTouchDevice()};
};

QTEST_MAIN(ToolRoadTest)
#include "tst_toolroad.moc"
