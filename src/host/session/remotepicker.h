#pragma once

#include "host/session/picker.h"

#include <QTimer>

namespace favrin::host {

class RemoteViewSession;
class ServiceWatch;

/**
 * One picker of an app through all its presentations: an explicit state, one function for each change of it, and what
 * travels to the service in every one of them. GUI thread.
 */
class RemotePicker : public Picker
{
    Q_OBJECT

public:
    explicit RemotePicker(QObject *parent = nullptr);
    ~RemotePicker() override;

    void setSelectedColor(const std::optional<platform::Color> &color) override;
    /** The wishes completed by what the window and the application say. */
    remote::Traits traits() const;
    QSizeF hostWindowSize() const override;
    double keyboardSpace() const override;

    void present(const MakePlace &makePlace) override;
    void dismiss() override;
    PickerPlace *place() const override { return m_place.get(); }
    bool isEyedropperAvailable() override;
    /** For tests and for those who watch the process; 0 while none runs. */
    qint64 serviceProcessIdentifier() const;

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void wishesDidChange() override { scheduleUpdate(); }

private:
    void connectSession();
    void connectSurroundings();
    void followService();
    void servicePrepared(quint32 serial);
    void serviceDrew();
    void serviceFinished();
    void serviceEnded(const QString &error);
    void tearDown();
    void scheduleUpdate();
    void sendUpdate();
    bool isDark() const;

    std::optional<platform::Color> m_selectedColor;
    bool m_selectedColorIsSet = false;
    std::unique_ptr<RemoteViewSession> m_session;
    std::unique_ptr<ServiceWatch> m_watch;
    std::unique_ptr<PickerPlace> m_place;
    QTimer m_farewell;
    quint32 m_serial = 0;
    bool m_updateScheduled = false;
    std::optional<remote::Traits> m_sentTraits;
    std::optional<remote::Configuration> m_sentConfiguration;
    bool m_watchesEyedropper = false;
};

} // namespace favrin::host
