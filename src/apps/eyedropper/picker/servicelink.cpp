#include "apps/eyedropper/picker/servicelink.h"

#include "apps/eyedropper/pickerlines.h"

#include <array>
#include <cerrno>
#include <cstdio>

#include <unistd.h>

namespace favrin::eyedropper {

namespace {

void writeLine(const QByteArray &line)
{
    std::fprintf(stdout, "%s\n", line.constData());
    std::fflush(stdout);
}

} // namespace

ServiceLink::ServiceLink(QObject *parent) : QObject(parent), m_input(STDIN_FILENO, QSocketNotifier::Read)
{
    connect(&m_input, &QSocketNotifier::activated, this, &ServiceLink::read);
}

ServiceLink::~ServiceLink() = default;

void ServiceLink::sendFloated()
{
    writeLine(pickerlines::floated);
}

void ServiceLink::sendColor(const platform::Color &color)
{
    if (const auto line = pickerlines::colorLine(color))
        writeLine(*line);
}

void ServiceLink::read()
{
    std::array<char, 256> bytes;
    const auto count = ::read(STDIN_FILENO, bytes.data(), bytes.size());
    if (count < 0 && (errno == EINTR || errno == EAGAIN))
        return;
    m_received.append(bytes.data(), std::max<qsizetype>(count, 0));
    for (auto end = m_received.indexOf('\n'); end >= 0; end = m_received.indexOf('\n')) {
        takeLine(m_received.first(end));
        m_received.remove(0, end + 1);
    }
    if (count <= 0 || m_received.size() > pickerlines::longestLine) {
        m_input.setEnabled(false);
        Q_EMIT cancelRequested();
    }
}

void ServiceLink::takeLine(const QByteArray &line)
{
    if (line == pickerlines::floatRequest)
        Q_EMIT floatRequested();
    else if (line == pickerlines::cancelRequest)
        Q_EMIT cancelRequested();
}

} // namespace favrin::eyedropper
