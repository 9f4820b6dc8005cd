#pragma once

#include "host/session/pickerplace.h"
#include "remote/records.h"

#include <QLocale>
#include <QObject>
#include <QSizeF>

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace favrin::host {

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
 * What stands behind the public class, which is a thin face of this one: what the app wishes, an explicit state, and
 * what the picker says. GUI thread.
 */
class Picker : public QObject
{
    Q_OBJECT

public:
    enum class State { NotRunning, Starting, Ready, Stopping, Failed };

    /** The picker of the library that is linked: a remote one, or one that plays a script for an app's tests. */
    static std::unique_ptr<Picker> create();

    State state() const { return m_state; }
    bool isPresented() const { return m_state == State::Starting || m_state == State::Ready; }
    const PickerWishes &wishes() const { return m_wishes; }
    /** Changes what the app asks for; the picker hears of it before this turn of the event loop ends. */
    template<class Change>
    void change(Change change)
    {
        change(m_wishes);
        wishesDidChange();
    }
    /** The color that the picker shows, without an echo; none for no color. */
    virtual void setSelectedColor(const std::optional<platform::Color> &color) = 0;
    virtual QSizeF hostWindowSize() const = 0;
    virtual double keyboardSpace() const = 0;

    using MakePlace = std::function<std::unique_ptr<PickerPlace>()>;

    /** Nothing happens while one is presented. The place is made when the last one has been left. */
    virtual void present(const MakePlace &makePlace) = 0;
    virtual void dismiss() = 0;
    /** Where it is presented, or null. */
    virtual PickerPlace *place() const = 0;
    /** Whether an eyedropper can work here, as far as it is known; the first call starts to find out. */
    virtual bool isEyedropperAvailable() = 0;

Q_SIGNALS:
    void stateChanged();
    void picked(const std::optional<favrin::platform::Color> &color, const std::optional<std::string> &colorspace,
                bool isVolatile);
    void eyedropperShown();
    void eyedropperFloated();
    void eyedropperDismissed();
    void eyedropperAvailableChanged();
    void finished();
    void terminated(const QString &error);
    void respondingChanged(bool responding);
    void preferredContentSizeChanged(QSizeF size);
    void materialChanged(bool wanted);
    void surroundingsChanged();

protected:
    using QObject::QObject;

    void setState(State state);
    void setEmbedded(bool embedded) { m_wishes.configuration.isEmbedded = embedded; }
    virtual void wishesDidChange() = 0;

private:
    State m_state = State::NotRunning;
    PickerWishes m_wishes;
};

} // namespace favrin::host
