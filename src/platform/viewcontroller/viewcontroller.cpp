#include "platform/viewcontroller/viewcontroller.h"

#include <cmath>
#include <utility>

namespace favrin::platform {

namespace {

/** Invisible; lets the scene graph call back before each frame for which it was polished. */
class LayoutItem : public QQuickItem
{
public:
    LayoutItem(QQuickItem *view, std::function<void()> layOut) : QQuickItem(view), m_layOut(std::move(layOut))
    {
        setVisible(false);
    }

protected:
    void updatePolish() override { m_layOut(); }

private:
    std::function<void()> m_layOut;
};

bool isLength(double value)
{
    return std::isfinite(value) && value >= 0.0;
}

} // namespace

ViewController::ViewController() = default;

ViewController::~ViewController()
{
    for (const auto &child : m_children)
        child->m_parent = nullptr;
    m_children.clear();
    delete m_view;
}

QQuickItem *ViewController::view()
{
    if (!m_view) {
        m_view = loadView().release();
        watchView();
        viewDidLoad();
    }
    return m_view;
}

void ViewController::watchView()
{
    if (!m_view)
        return;
    // Made after the view's own children, so that their places in the stack stay as they are.
    m_layoutItem = new LayoutItem(m_view, [this] {
        if (m_layoutPending)
            layoutNow();
    });
    connect(m_view, &QQuickItem::widthChanged, this, &ViewController::setNeedsLayout);
    connect(m_view, &QQuickItem::heightChanged, this, &ViewController::setNeedsLayout);
    connect(m_view, &QQuickItem::implicitWidthChanged, this, &ViewController::setNeedsLayout);
    connect(m_view, &QQuickItem::implicitHeightChanged, this, &ViewController::setNeedsLayout);
    setNeedsLayout();
}

ViewController *ViewController::addChild(std::unique_ptr<ViewController> child)
{
    if (!child)
        return nullptr;
    auto *const added = child.get();
    added->m_parent = this;
    m_children.push_back(std::move(child));
    if (m_traitsDelivered)
        added->deliverTraits(m_traits);
    return added;
}

void ViewController::didMoveToParent(ViewController *parent)
{
    if (parent && parent->hasAppeared())
        setAppeared(true);
}

void ViewController::setTraits(const TraitCollection &traits)
{
    // A copy: it may be the traits of a controller that changes below.
    deliverTraits(TraitCollection(traits));
}

void ViewController::deliverTraits(const TraitCollection &traits)
{
    if (!m_traitsDelivered || m_traits != traits) {
        const auto previous = m_traitsDelivered ? std::optional(m_traits) : std::nullopt;
        m_traits = traits;
        m_traitsDelivered = true;
        traitsDidChange(previous);
    }
    // By index: hearing of new traits may add children.
    for (std::size_t index = 0; index < m_children.size(); ++index)
        m_children[index]->deliverTraits(traits);
}

void ViewController::traitsDidChange(const std::optional<TraitCollection> &) {}

void ViewController::setPreferredContentSize(QSizeF size)
{
    if (!isLength(size.width()) || !isLength(size.height()))
        return;
    // Not QSizeF's own comparison, which lets small differences pass.
    if (size.width() == m_preferredContentSize.width() && size.height() == m_preferredContentSize.height())
        return;
    m_preferredContentSize = size;
    Q_EMIT preferredContentSizeChanged();
}

void ViewController::setAppeared(bool appeared)
{
    if (appeared == m_appeared)
        return;
    if (appeared) {
        view();
        m_appeared = true;
        viewWillAppear();
    }
    for (std::size_t index = 0; index < m_children.size(); ++index)
        m_children[index]->setAppeared(appeared);
    if (!appeared) {
        m_appeared = false;
        viewDidDisappear();
    }
}

void ViewController::setNeedsLayout()
{
    m_layoutPending = true;
    // A pass under way looks for requests when it ends.
    if (m_layoutItem && !m_inLayoutPass)
        m_layoutItem->polish();
}

void ViewController::layoutNow()
{
    if (!m_view || m_inLayoutPass) {
        m_layoutPending = true;
        return;
    }
    runLayoutPass();
    if (m_layoutPending)
        runLayoutPass();
    // In a later turn of the event loop: polishing now would have the scene graph come back before this frame.
    if (m_layoutPending)
        QMetaObject::invokeMethod(this, &ViewController::setNeedsLayout, Qt::QueuedConnection);
}

void ViewController::runLayoutPass()
{
    m_layoutPending = false;
    m_inLayoutPass = true;
    viewWillLayoutSubviews();
    viewDidLayoutSubviews();
    for (std::size_t index = 0; index < m_children.size(); ++index) {
        if (m_children[index]->m_layoutPending)
            m_children[index]->layoutNow();
    }
    m_inLayoutPass = false;
}

} // namespace favrin::platform
