#pragma once

#include "favorites/favoritecell.h"

namespace favrin::favorites {

/** A gray disc with a plus sign: adds the selected color to the favorites. It draws no selection. */
class AddColorCell : public FavoriteCell
{
    Q_OBJECT

public:
    using FavoriteCell::FavoriteCell;

    QString accessibilityLabel() const override;
    bool saysSelected() const override { return false; }

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
};

} // namespace favrin::favorites
