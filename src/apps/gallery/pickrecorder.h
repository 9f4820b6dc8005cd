#pragma once

#include "host/fvcolor.h"

#include <QFile>
#include <QObject>

namespace favrin::gallery {

/** Writes every pick as one JSON object on a line of its own, in the order of arrival. */
class PickRecorder : public QObject
{
    Q_OBJECT

public:
    explicit PickRecorder(const QString &path, QObject *parent = nullptr);

    /** False when the file cannot be written. */
    bool isOpen() const { return m_file.isOpen(); }
    int volatilePicks() const { return m_volatilePicks; }
    int finalPicks() const { return m_finalPicks; }

    void record(const FVColor &color, const QString &colorspace, bool isVolatile);

private:
    QFile m_file;
    int m_volatilePicks = 0;
    int m_finalPicks = 0;
};

/** The JSON object of one pick; all numbers and the space are null for no color. */
QByteArray pickLine(const FVColor &color, const QString &colorspace, bool isVolatile);

} // namespace favrin::gallery
