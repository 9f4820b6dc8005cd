#include "apps/eyedropper/pickerprocess.h"

#include "apps/eyedropper/pickerlines.h"

#include <chrono>
#include <utility>

namespace favrin::eyedropper {

namespace {

using namespace std::chrono_literals;

/** So long a picking process may take to leave when it is told to. */
constexpr auto farewellPatience = 1s;

} // namespace

PickerProcess::PickerProcess(QString program, QObject *parent) : QObject(parent), m_program(std::move(program))
{
    m_process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    connect(&m_process, &QProcess::readyReadStandardOutput, this, &PickerProcess::readLines);
    connect(&m_process, &QProcess::finished, this, [this] {
        readLines();
        end();
    });
    connect(&m_process, &QProcess::errorOccurred, this, [this](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart) {
            qWarning("The eyedropper cannot be shown: %s", qPrintable(m_process.errorString()));
            end();
        }
    });
    m_patience.setSingleShot(true);
    m_patience.setInterval(farewellPatience);
    connect(&m_patience, &QTimer::timeout, &m_process, &QProcess::kill);
}

PickerProcess::~PickerProcess()
{
    abandon();
}

void PickerProcess::abandon()
{
    m_process.disconnect(this);
    m_process.kill();
    // A killed process leaves at once, and with it what it shows over the screen.
    m_process.waitForFinished();
}

void PickerProcess::start(const QString &displayIdentifier)
{
    m_process.start(m_program, {QStringLiteral("--pick"), displayIdentifier});
}

void PickerProcess::floatPicker()
{
    write(pickerlines::floatRequest);
}

void PickerProcess::cancel()
{
    write(pickerlines::cancelRequest);
    m_patience.start();
}

void PickerProcess::write(const char *line)
{
    m_process.write(line);
    m_process.write("\n");
}

void PickerProcess::readLines()
{
    while (m_process.canReadLine())
        takeLine(m_process.readLine().trimmed());
    if (m_process.bytesAvailable() > pickerlines::longestLine)
        m_process.kill();
}

void PickerProcess::takeLine(const QByteArray &line)
{
    if (line == pickerlines::floated) {
        Q_EMIT floated();
        return;
    }
    const auto color = pickerlines::colorFromLine(line);
    if (color && !std::exchange(m_hasPicked, true))
        Q_EMIT picked(*color);
}

void PickerProcess::end()
{
    m_patience.stop();
    if (!std::exchange(m_hasEnded, true))
        Q_EMIT ended();
}

} // namespace favrin::eyedropper
