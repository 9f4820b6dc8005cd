#pragma once

#include "favorites/favoritecell.h"

namespace favrin::favorites {

/** Length of the slash in a cell of a given height, in points. */
double slashLength(double cellHeight, bool selected);

/** A pale disc crossed by a red slash: clears the selection. */
class RemoveColorCell : public FavoriteCell
{
    Q_OBJECT

public:
    using FavoriteCell::FavoriteCell;

    QString accessibilityLabel() const override;

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
};

} // namespace favrin::favorites
