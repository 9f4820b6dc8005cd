#include "favorites/pagecontrol.h"

#include "favorites/pagedots.h"
#include "theme/theme.h"

#include <QPainter>

#include <algorithm>

namespace favrin::favorites {

using theme::Theme;

PageControl::PageControl(QQuickItem *parent) : CrispPaintedItem(parent)
{
    setVisible(false);
    connect(&Theme::instance(), &Theme::colorsChanged, this, [this] { repaint(); });
    connect(&Theme::instance(), &Theme::layoutDirectionChanged, this, [this] { repaint(); });
}

void PageControl::setFavoriteColorPickerModel(FavoriteColorPickerModel *model)
{
    if (model == m_model)
        return;
    if (m_model)
        m_model->disconnect(this);
    m_model = model;
    if (model) {
        for (const auto change :
             {&FavoriteColorPickerModel::numberOfPagesChanged, &FavoriteColorPickerModel::currentPageChanged,
              &FavoriteColorPickerModel::pageControlPendingPageChanged})
            connect(model, change, this, &PageControl::followModel);
    }
    followModel();
    Q_EMIT favoriteColorPickerModelChanged();
}

void PageControl::followModel()
{
    // While a page is pending, the indicator shows the page that the user asked for.
    if (m_model && !m_model->pageControlPendingPage())
        show(m_model->numberOfPages(), m_model->currentPage());
}

void PageControl::show(int numberOfPages, int currentPage)
{
    if (numberOfPages == m_numberOfPages && currentPage == m_currentPage)
        return;
    m_numberOfPages = numberOfPages;
    m_currentPage = currentPage;
    setVisible(numberOfPages > 1);
    repaint();
    Q_EMIT pageChanged();
}

void PageControl::setValue(int value)
{
    selectPage(std::clamp(value, minimumValue(), std::max(maximumValue(), minimumValue())) - 1);
}

void PageControl::tap(double x)
{
    const double position = Theme::instance().isMirrored() ? width() - x : x;
    selectPage(pageAtPosition(position, m_numberOfPages, m_currentPage, width()));
}

void PageControl::beginDrag()
{
    m_dragStartPage = m_currentPage;
}

void PageControl::drag(double translation)
{
    const double distance = Theme::instance().isMirrored() ? -translation : translation;
    selectPage(pageAfterDrag(distance, m_dragStartPage, m_numberOfPages, width()));
}

void PageControl::selectPage(int page)
{
    if (page == m_currentPage || !m_model)
        return;
    show(m_numberOfPages, page);
    m_model->pageControlPendingPage.set(page);
}

void PageControl::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const Theme &theme = Theme::instance();
    painter.setPen(Qt::NoPen);
    for (const PageDot &dot : pageDots(m_numberOfPages, m_currentPage, width())) {
        const double center = theme.isMirrored() ? width() - dot.center : dot.center;
        const double radius = pageDotDiameter * dot.scale * devicePixelRatio / 2.0;
        painter.setBrush(dot.page == m_currentPage ? theme.label() : theme.secondaryLabel());
        painter.drawEllipse(QPointF(center * devicePixelRatio, size.height() / 2.0), radius, radius);
    }
}

} // namespace favrin::favorites
