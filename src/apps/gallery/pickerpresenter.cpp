#include "apps/gallery/pickerpresenter.h"

namespace favrin::gallery {

using State = FVColorPickerViewController::State;

PickerPresenter::PickerPresenter(FVColorPickerViewController *picker, QObject *parent)
    : QObject(parent), m_picker(picker)
{
    connect(picker, &FVColorPickerViewController::stateChanged, this, &PickerPresenter::readyChanged);
    connect(picker, &FVColorPickerViewController::preferredContentSizeChanged, this,
            &PickerPresenter::preferredContentSizeChanged);
    // Queued: the picker is through with its presentation only when its signal has returned.
    connect(picker, &FVColorPickerViewController::colorPickerDidFinish, this, &PickerPresenter::ended,
            Qt::QueuedConnection);
    connect(picker, &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError, this,
            &PickerPresenter::ended, Qt::QueuedConnection);
}

bool PickerPresenter::isReady() const
{
    return m_presentation != Presentation::None && !m_switching && m_picker->state() == State::Ready;
}

void PickerPresenter::present(QQuickWindow *window)
{
    request(Presentation::Presented, window);
}

void PickerPresenter::presentPopover(QQuickItem *anchor)
{
    request(Presentation::Popover, anchor);
}

void PickerPresenter::embed(QQuickItem *container)
{
    request(Presentation::Embedded, container);
}

void PickerPresenter::dismiss()
{
    request(Presentation::None, nullptr);
}

void PickerPresenter::request(Presentation presentation, QObject *place)
{
    if (presentation == m_presentation && place == m_place)
        return;
    const bool wasShown = m_presentation != Presentation::None && !m_switching;
    m_presentation = presentation;
    m_place = place;
    if (wasShown) {
        m_switching = true;
        m_picker->dismiss();
    } else if (!m_switching) {
        start();
    }
    Q_EMIT presentationChanged();
    Q_EMIT readyChanged();
}

void PickerPresenter::start()
{
    if (auto *window = qobject_cast<QQuickWindow *>(m_place); window && m_presentation == Presentation::Presented) {
        m_picker->present(window);
    } else if (auto *item = qobject_cast<QQuickItem *>(m_place); item && m_presentation == Presentation::Popover) {
        m_picker->presentPopover(item);
    } else if (item && m_presentation == Presentation::Embedded) {
        m_picker->embed(item);
    }
}

void PickerPresenter::ended()
{
    // Said by a presentation that another one has followed already.
    if (m_picker->isPresented())
        return;
    FVColorPickerViewController::startServiceAhead();
    if (m_switching) {
        m_switching = false;
        start();
    } else {
        m_presentation = Presentation::None;
        m_place = nullptr;
    }
    Q_EMIT presentationChanged();
    Q_EMIT readyChanged();
}

} // namespace favrin::gallery
