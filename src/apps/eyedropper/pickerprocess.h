#pragma once

#include "platform/color/color.h"

#include <QProcess>
#include <QTimer>

namespace favrin::eyedropper {

/**
 * The process that shows the eyedropper and samples. Whatever becomes of it, ended() comes exactly once after start():
 * when it is done, when it crashes, when it cannot be started, and when it has to be ended because it does not listen.
 */
class PickerProcess : public QObject
{
    Q_OBJECT

public:
    explicit PickerProcess(QString program, QObject *parent = nullptr);
    ~PickerProcess() override;

    void start(const QString &displayIdentifier);
    void floatPicker();
    void cancel();
    /** Ends it at once, and for its owner silently. */
    void abandon();

Q_SIGNALS:
    void floated();
    /** At most once. */
    void picked(const favrin::platform::Color &color);
    void ended();

private:
    void readLines();
    void takeLine(const QByteArray &line);
    void write(const char *line);
    void end();

    QString m_program;
    QProcess m_process;
    QTimer m_patience;
    bool m_hasPicked = false;
    bool m_hasEnded = false;
};

} // namespace favrin::eyedropper
