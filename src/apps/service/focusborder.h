#pragma once

#include "remote/records.h"

#include <QObject>

#include <functional>
#include <optional>

class QQuickWindow;

namespace favrin::apps {

/**
 * The way of the keyboard focus in and out of a window that is shown among elements of a host: behind the last element
 * the Tab key leads out, and it leads in to the first one; backward the other way round. Main thread.
 */
class FocusBorder : public QObject
{
    Q_OBJECT

public:
    /** @param leave takes the focus out; false where there is nowhere to go, so that it goes round in the window */
    FocusBorder(QQuickWindow &window, std::function<bool(remote::FocusDirection)> leave);

    void enter(remote::FocusDirection direction);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool isAtBorder(remote::FocusDirection direction) const;
    void enterNow();

    QQuickWindow &m_window;
    std::function<bool(remote::FocusDirection)> m_leave;
    /**
     * How the focus came in, until the user does something: the window learns late, and perhaps only after it lost the
     * keyboard once more, that it has the keyboard, and forgets meanwhile where the focus came from.
     */
    std::optional<remote::FocusDirection> m_entry;
};

} // namespace favrin::apps
