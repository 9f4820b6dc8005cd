#pragma once

#include "host/presentationlayout.h"
#include "remote/records.h"

#include <QLocale>
#include <QObject>
#include <QPointer>
#include <QSizeF>
#include <QTimer>

#include <memory>
#include <optional>
#include <string>

class QQuickItem;

namespace favrin::host {

class Presentation;
class RemoteViewItem;
class RemoteViewSession;

/** What the app asked for; what it left open is taken from the window and the application. */
struct PickerWishes
{
    remote::Configuration configuration;
    remote::Appearance appearance = remote::Appearance::Unspecified;
    remote::TextSizeCategory textSizeCategory = remote::TextSizeCategory::Large;
    remote::DisplayGamut displayGamut = remote::DisplayGamut::SRGB;
    bool reduceMotion = false;
    bool increaseContrast = false;
    std::optional<Qt::LayoutDirection> layoutDirection;
    std::optional<QLocale> locale;
    std::optional<QSizeF> hostWindowSize;
    std::optional<double> keyboardSpace;
};

/**
 * One picker of an app through all its presentations: an explicit state, one function for each change of it, and what
 * travels to the service in every one of them. The public class is a thin face of this one. GUI thread.
 */
class RemotePicker : public QObject
{
    Q_OBJECT

public:
    enum class State { NotRunning, Starting, Ready, Stopping, Failed };

    explicit RemotePicker(QObject *parent = nullptr);
    ~RemotePicker() override;

    State state() const { return m_state; }
    bool isPresented() const { return m_state == State::Starting || m_state == State::Ready; }
    const PickerWishes &wishes() const { return m_wishes; }
    /** Changes what the app asks for; the service hears of it before this turn of the event loop ends. */
    template<class Change>
    void change(Change change)
    {
        change(m_wishes);
        scheduleUpdate();
    }
    /** The color that the picker shows, without an echo; none for no color. */
    void setSelectedColor(const std::optional<platform::Color> &color);
    /** The wishes completed by what the window and the application say. */
    remote::Traits traits() const;
    QSizeF hostWindowSize() const;
    double keyboardSpace() const;

    void present(PresentationStyle style, QQuickItem &place);
    void dismiss();

    RemoteViewItem *view() const;
    /** For tests and for those who watch the process; 0 while none runs. */
    qint64 serviceProcessIdentifier() const;

Q_SIGNALS:
    void stateChanged();
    void picked(const std::optional<favrin::platform::Color> &color, const std::optional<std::string> &colorspace,
                bool isVolatile);
    void eyedropperShown();
    void eyedropperFloated();
    void eyedropperDismissed();
    void finished();
    void terminated(const QString &error);
    void preferredContentSizeChanged(QSizeF size);
    void materialChanged(bool wanted);
    void surroundingsChanged();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void setState(State state);
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

    State m_state = State::NotRunning;
    PickerWishes m_wishes;
    std::optional<platform::Color> m_selectedColor;
    bool m_selectedColorIsSet = false;
    std::unique_ptr<RemoteViewSession> m_session;
    std::unique_ptr<Presentation> m_presentation;
    QTimer m_farewell;
    quint32 m_serial = 0;
    bool m_updateScheduled = false;
    std::optional<remote::Traits> m_sentTraits;
    std::optional<remote::Configuration> m_sentConfiguration;
};

} // namespace favrin::host
