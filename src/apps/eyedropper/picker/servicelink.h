#pragma once

#include "platform/color/color.h"

#include <QByteArray>
#include <QObject>
#include <QSocketNotifier>

namespace favrin::eyedropper {

/** The picking process's lines to and from the service that started it, over standard input and output. */
class ServiceLink : public QObject
{
    Q_OBJECT

public:
    explicit ServiceLink(QObject *parent = nullptr);
    ~ServiceLink() override;

    void sendFloated();
    void sendColor(const platform::Color &color);

Q_SIGNALS:
    void floatRequested();
    /** The service wants this process to leave, or has gone itself. */
    void cancelRequested();

private:
    void read();
    void takeLine(const QByteArray &line);

    QSocketNotifier m_input;
    QByteArray m_received;
};

} // namespace favrin::eyedropper
