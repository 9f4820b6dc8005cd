#pragma once

#include "favorites/favoritecell.h"
#include "platform/color/color.h"

#include <functional>

namespace favrin::favorites {

/** The black upper left half behind a translucent color; the other half is white. */
QPainterPath blackHalf(const QRectF &bounds);

/** A swatch with one color. A translucent one lies over a half that is black and a half that is white. */
class FavoriteColorWellCell : public FavoriteCell
{
    Q_OBJECT

public:
    using FavoriteCell::FavoriteCell;

    const platform::Color &color() const { return m_color; }
    void setColor(const platform::Color &color);

    /** What the delete command does; none where the color cannot be deleted. */
    void setOnDelete(std::function<void()> onDelete) { m_onDelete = std::move(onDelete); }
    bool canDelete() const { return static_cast<bool>(m_onDelete); }
    /** The delete command. */
    void performDelete();

    QString accessibilityLabel() const override;

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    platform::Color m_color = platform::Color::black();
    std::function<void()> m_onDelete;
};

} // namespace favrin::favorites
