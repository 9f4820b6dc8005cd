#pragma once

#include "apps/tool/exitstatus.h"
#include "apps/tool/tooloptions.h"
#include "host/session/picker.h"
#include "host/window/remoteviewwindow.h"

#include <QTimer>

#include <functional>
#include <memory>

namespace favrin::tool {

/**
 * One question to the user: a window with the picker in it, and the answer. The window is made by start() and shown
 * when the picker has drawn. GUI thread.
 */
class PickerTool : public QObject
{
    Q_OBJECT

public:
    /** Writes one line of the answer; false when nobody can read it. */
    using Print = std::function<bool(const std::string &line)>;
    /** Makes the window belong to another one, once it is shown. */
    using Attach = std::function<void(QWindow &window)>;

    PickerTool(ToolOptions options, std::unique_ptr<host::Picker> picker, Print print, Attach attach = {});
    ~PickerTool() override;

    void start();
    QWindow *window() { return m_window.get(); }

Q_SIGNALS:
    /** Once. @p reason is for a person, and empty unless the tool failed. */
    void ended(favrin::tool::ExitStatus status, const QString &reason);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void configurePicker();
    void show();
    void takePick(const Choice &choice, bool isVolatile);
    void finish();
    void end(ExitStatus status, const QString &reason = {});
    std::string nameOf(const Choice &color) const;

    const ToolOptions m_options;
    const Print m_print;
    const Attach m_attach;
    std::unique_ptr<host::RemoteViewWindow> m_window;
    /** Goes before the window that it is in. */
    const std::unique_ptr<host::Picker> m_picker;
    QTimer m_timeout;
    /** The last final pick; unset while there is none. */
    std::optional<Choice> m_chosen;
    /** The last thing that the user did was to press Escape. */
    bool m_escaped = false;
    bool m_ended = false;
};

} // namespace favrin::tool
