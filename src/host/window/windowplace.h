#pragma once

#include "host/session/pickerplace.h"

#include <QPointer>

namespace favrin::host {

class RemoteViewWindow;

/**
 * A window of its own as the place of a picker, which fills it. Whoever made the window shows it, when the picker has
 * drawn; before that it has the size that the picker prefers, as far as the screen allows.
 */
class WindowPlace : public PickerPlace
{
    Q_OBJECT

public:
    explicit WindowPlace(RemoteViewWindow &window);

    PresentationStyle style() const override { return PresentationStyle::Presented; }
    QWindow *window() const override;
    QSizeF surroundingSize() const override;
    QRectF rectangle() const override;

    void setSession(RemoteViewSession *session) override;
    /** The window has it whenever it is active. */
    void takeFocus() override {}
    void setPreferredContentSize(QSizeF size) override;
    void setAppearance(bool dark) override;
    void reveal(bool) override {}

private:
    QPointer<RemoteViewWindow> m_window;
};

} // namespace favrin::host
