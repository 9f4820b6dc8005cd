#pragma once

#include "platform/shapes/crisppainteditem.h"
#include "theme/symbolpaths.h"

#include <QColor>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::theme {

/** One of the picker's own symbols in one color, as large as the item: a vector shape, crisp at every scale. */
class Symbol : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(Kind kind READ kind WRITE setKind NOTIFY kindChanged REQUIRED FINAL)
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged REQUIRED FINAL)

public:
    enum Kind {
        Disc = static_cast<int>(SymbolKind::Disc),
        Cross = static_cast<int>(SymbolKind::Cross),
        Eyedropper = static_cast<int>(SymbolKind::Eyedropper),
        CheckMark = static_cast<int>(SymbolKind::CheckMark),
        UpDownChevrons = static_cast<int>(SymbolKind::UpDownChevrons),
    };
    Q_ENUM(Kind)

    explicit Symbol(QQuickItem *parent = nullptr);

    Kind kind() const { return m_kind; }
    void setKind(Kind kind);
    QColor color() const { return m_color; }
    void setColor(const QColor &color);

Q_SIGNALS:
    void kindChanged();
    void colorChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    Kind m_kind = Disc;
    QColor m_color;
};

} // namespace favrin::theme
