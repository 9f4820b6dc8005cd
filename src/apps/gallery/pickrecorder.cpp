#include "apps/gallery/pickrecorder.h"

#include <nlohmann/json.hpp>

namespace favrin::gallery {

PickRecorder::PickRecorder(const QString &path, QObject *parent) : QObject(parent), m_file(path)
{
    if (!m_file.open(QIODevice::WriteOnly | QIODevice::Truncate | QIODevice::Text))
        qWarning("picks are not recorded: %s: %s", qUtf8Printable(path), qUtf8Printable(m_file.errorString()));
}

void PickRecorder::record(const FVColor &color, const QString &colorspace, bool isVolatile)
{
    (isVolatile ? m_volatilePicks : m_finalPicks) += 1;
    m_file.write(pickLine(color, colorspace, isVolatile) + '\n');
    m_file.flush();
}

QByteArray pickLine(const FVColor &color, const QString &colorspace, bool isVolatile)
{
    const auto orNull = [&color](double component) {
        return color.isValid() ? nlohmann::ordered_json(component) : nlohmann::ordered_json();
    };
    const nlohmann::ordered_json line = {
        {"r", orNull(color.red())},
        {"g", orNull(color.green())},
        {"b", orNull(color.blue())},
        {"a", orNull(color.alpha())},
        {"colorSpace",
         colorspace.isEmpty() ? nlohmann::ordered_json() : nlohmann::ordered_json(colorspace.toStdString())},
        {"volatile", isVolatile},
    };
    return QByteArray::fromStdString(line.dump());
}

} // namespace favrin::gallery
