// The life of the hosted picker's view.

#include "service/fvcolorpickerserviceviewcontroller.h"

#include "service/colorpickerlog.h"

#include <QQuickItem>
#include <QVariant>

namespace favrin::service {

namespace {

/** The keyboard follows a downward drag. */
constexpr int interactiveKeyboardDismissal = 2;

void clearBackground(QQuickItem *view)
{
    if (view->inherits("QQuickRectangle"))
        view->setProperty("color", QColor(Qt::transparent));
}

/** Content that is scrolled beyond the edges stays visible there. */
void adjustScrollView(QQuickItem *scrollView)
{
    scrollView->setClip(false);
    if (scrollView->metaObject()->indexOfProperty("keyboardDismissMode") >= 0)
        scrollView->setProperty("keyboardDismissMode", interactiveKeyboardDismissal);
}

} // namespace

std::unique_ptr<QQuickItem> FVColorPickerServiceViewController::loadView()
{
    auto root = m_makeRootView ? m_makeRootView(&m_colorPickerState) : nullptr;
    if (!root) {
        colorPickerLog().error("The picker's root view could not be made; the picker stays empty");
        root = std::make_unique<QQuickItem>();
    }
    return root;
}

void FVColorPickerServiceViewController::viewWillAppear()
{
    ViewController::viewWillAppear();
    clearBackground(view());
    const auto subviews = view()->childItems();
    if (!subviews.isEmpty() && subviews.first()->inherits("QQuickFlickable"))
        adjustScrollView(subviews.first());
}

void FVColorPickerServiceViewController::viewWillLayoutSubviews()
{
    ViewController::viewWillLayoutSubviews();
    const QSizeF frame = view()->size();
    const QSizeF known = m_colorPickerState.size();
    // Not QSizeF's own comparison, which lets small differences pass.
    if (frame.width() != known.width() || frame.height() != known.height())
        m_colorPickerState.size.set(frame);
}

void FVColorPickerServiceViewController::viewDidLayoutSubviews()
{
    ViewController::viewDidLayoutSubviews();
    if (auto *parent = front())
        parent->updatePreferredContentSize();
}

void FVColorPickerServiceViewController::viewDidDisappear()
{
    ViewController::viewDidDisappear();
    // Of a gesture that was still going on, the last color goes out once more as final.
    m_colorPickerState.isVolatile.set(false);
}

} // namespace favrin::service
