#pragma once

#include "host/fvcolor.h"

#include <QAbstractListModel>
#include <QtQmlIntegration/qqmlintegration.h>

#include <array>

namespace favrin::gallery {

/** The document of the app: a poster of a few parts, each with a fill, one of them selected. */
class Poster : public QAbstractListModel
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("The gallery owns the poster")

    Q_PROPERTY(QColor paper READ paper NOTIFY fillsChanged)
    Q_PROPERTY(QColor sun READ sun NOTIFY fillsChanged)
    Q_PROPERTY(QColor hills READ hills NOTIFY fillsChanged)
    Q_PROPERTY(QColor water READ water NOTIFY fillsChanged)
    Q_PROPERTY(QColor ink READ ink NOTIFY fillsChanged)
    Q_PROPERTY(Part selectedPart READ selectedPart WRITE setSelectedPart NOTIFY selectedPartChanged)
    Q_PROPERTY(QString selectedName READ selectedName NOTIFY selectedPartChanged)
    Q_PROPERTY(QColor selectedColor READ selectedColor NOTIFY selectedFillChanged)

public:
    enum class Part { Paper, Sun, Hills, Water, Ink };
    Q_ENUM(Part)

    enum Role { PartRole = Qt::UserRole, NameRole, ColorRole };

    explicit Poster(QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

    /** The fill as the picker gave it; no color leaves the part out. */
    FVColor fill(Part part) const { return m_fills[static_cast<std::size_t>(part)]; }
    /** Every fill that is a color. */
    QList<FVColor> colors() const;
    FVColor selectedFill() const { return fill(m_selectedPart); }
    void setSelectedFill(const FVColor &fill);

    QColor paper() const { return shown(Part::Paper); }
    QColor sun() const { return shown(Part::Sun); }
    QColor hills() const { return shown(Part::Hills); }
    QColor water() const { return shown(Part::Water); }
    QColor ink() const { return shown(Part::Ink); }

    Part selectedPart() const { return m_selectedPart; }
    void setSelectedPart(Part part);
    QString selectedName() const { return name(m_selectedPart); }
    QColor selectedColor() const { return shown(m_selectedPart); }

    static QString name(Part part);

Q_SIGNALS:
    void fillsChanged();
    void selectedPartChanged();
    void selectedFillChanged();

private:
    static constexpr int partCount = 5;

    QColor shown(Part part) const;

    std::array<FVColor, partCount> m_fills;
    Part m_selectedPart = Part::Sun;
};

} // namespace favrin::gallery
