#include "apps/gallery/poster.h"

#include <QColor>

namespace favrin::gallery {

Poster::Poster(QObject *parent)
    : QAbstractListModel(parent)
    , m_fills{
          FVColor(0.965, 0.933, 0.871),
          // Outside sRGB: on a wide display the sun is the brightest thing on the page.
          FVColor(0.957, 0.357, 0.220, 1.0, FVColor::displayP3Name()),
          FVColor(0.184, 0.447, 0.451),
          FVColor(0.086, 0.235, 0.341),
          FVColor(0.098, 0.129, 0.192),
      }
{
}

int Poster::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : partCount;
}

QVariant Poster::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid)) {
        return {};
    }
    const auto part = static_cast<Part>(index.row());
    switch (role) {
    case PartRole:
        return QVariant::fromValue(part);
    case NameRole:
        return name(part);
    case ColorRole:
        return shown(part);
    default:
        return {};
    }
}

QHash<int, QByteArray> Poster::roleNames() const
{
    return {{PartRole, "part"}, {NameRole, "name"}, {ColorRole, "color"}};
}

QList<FVColor> Poster::colors() const
{
    QList<FVColor> colors(m_fills.begin(), m_fills.end());
    colors.removeIf([](const FVColor &color) { return !color.isValid(); });
    return colors;
}

void Poster::setSelectedFill(const FVColor &fill)
{
    if (fill == selectedFill())
        return;
    const auto row = static_cast<int>(m_selectedPart);
    m_fills[static_cast<std::size_t>(row)] = fill;
    Q_EMIT dataChanged(index(row), index(row), {ColorRole});
    Q_EMIT fillsChanged();
    Q_EMIT selectedFillChanged();
}

void Poster::setSelectedPart(Part part)
{
    const auto row = static_cast<int>(part);
    if (part == m_selectedPart || row < 0 || row >= partCount)
        return;
    m_selectedPart = part;
    Q_EMIT selectedPartChanged();
    Q_EMIT selectedFillChanged();
}

QString Poster::name(Part part)
{
    switch (part) {
    case Part::Paper:
        return tr("Paper");
    case Part::Sun:
        return tr("Sun");
    case Part::Hills:
        return tr("Hills");
    case Part::Water:
        return tr("Water");
    case Part::Ink:
        return tr("Ink");
    }
    return {};
}

QColor Poster::shown(Part part) const
{
    const FVColor color = fill(part);
    return color.isValid() ? color.toQColor() : QColor(Qt::transparent);
}

} // namespace favrin::gallery
