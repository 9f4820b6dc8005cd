#include "support/pseudolocale.h"

#include <QAccessible>
#include <QQuickItem>

#include <algorithm>

namespace {

/** Points; text is measured in fractions that nobody sees. */
constexpr double tolerance = 0.5;

QString textOf(const QQuickItem &item)
{
    return item.property("text").toString();
}

bool isLabel(const QQuickItem &item)
{
    return item.inherits("QQuickText") && !textOf(item).isEmpty();
}

bool isInput(const QQuickItem &item)
{
    return item.inherits("QQuickTextInput") || item.inherits("QQuickTextEdit");
}

bool isShown(const QQuickItem &item)
{
    for (const QQuickItem *ancestor = &item; ancestor; ancestor = ancestor->parentItem()) {
        if (!ancestor->isVisible() || ancestor->opacity() == 0.0)
            return false;
    }
    return true;
}

QList<const QQuickItem *> shownItems(const QQuickItem &item)
{
    QList<const QQuickItem *> items;
    if (isShown(item))
        items << &item;
    for (const auto *child : item.childItems())
        items << shownItems(*child);
    return items;
}

/** Whether every letter stands in brackets. */
bool isTranslated(const QString &text)
{
    int depth = 0;
    for (const QChar character : text) {
        depth += character == u'[';
        depth -= character == u']';
        if (depth <= 0 && character.isLetter())
            return false;
    }
    return depth == 0;
}

QString described(const QQuickItem &item, QLatin1StringView fault)
{
    QString place;
    for (const QQuickItem *ancestor = &item; ancestor; ancestor = ancestor->parentItem())
        place += u' ' + QString::fromLatin1(ancestor->metaObject()->className()).section(u'_', 0, 0);
    return QStringLiteral("\"%1\" %2:%3").arg(textOf(item), fault, place);
}

/** What the lines of a text cover, in the item's own coordinates. */
QRectF paintedRect(const QQuickItem &item)
{
    const QSizeF size(item.property("contentWidth").toDouble(), item.property("contentHeight").toDouble());
    const auto horizontal = item.property("effectiveHorizontalAlignment").toInt();
    const auto vertical = item.property("verticalAlignment").toInt();
    const double left = item.property("leftPadding").toDouble();
    const double top = item.property("topPadding").toDouble();
    const QSizeF room(item.width() - left - item.property("rightPadding").toDouble(),
                      item.height() - top - item.property("bottomPadding").toDouble());
    double x = left;
    if (horizontal == Qt::AlignRight)
        x += room.width() - size.width();
    else if (horizontal == Qt::AlignHCenter)
        x += (room.width() - size.width()) / 2.0;
    double y = top;
    if (vertical == Qt::AlignBottom)
        y += room.height() - size.height();
    else if (vertical == Qt::AlignVCenter)
        y += (room.height() - size.height()) / 2.0;
    return {QPointF(x, y), size};
}

bool holds(const QRectF &room, const QRectF &rect)
{
    return room.adjusted(-tolerance, -tolerance, tolerance, tolerance).contains(rect);
}

bool isBound(const QQuickItem &item, const QQuickItem &root)
{
    return &item == &root || item.clip() || item.inherits("QQuickAbstractButton");
}

/** The part of the scene that @p rect of @p item can be seen in, as far as @p root. */
bool fitsInto(const QQuickItem &root, const QQuickItem &item, QRectF rect)
{
    const QQuickItem *of = &item;
    for (const QQuickItem *ancestor = &item; ancestor; ancestor = ancestor->parentItem()) {
        QRectF room(0.0, 0.0, ancestor->width(), ancestor->height());
        if (const QQuickItem *scroller = ancestor->parentItem(); scroller && scroller->inherits("QQuickFlickable")) {
            // The content of what scrolls; the text comes into view wherever the scroller itself is.
            room.setSize({std::max(scroller->property("contentWidth").toDouble(), scroller->width()),
                          std::max(scroller->property("contentHeight").toDouble(), scroller->height())});
            if (!holds(room, of->mapRectToItem(ancestor, rect)))
                return false;
            of = scroller;
            rect = QRectF(0.0, 0.0, scroller->width(), scroller->height());
        } else if (isBound(*ancestor, root) && !holds(room, of->mapRectToItem(ancestor, rect))) {
            return false;
        }
        if (ancestor == &root)
            break;
    }
    return true;
}

QLatin1StringView clippingOf(const QQuickItem &root, const QQuickItem &item)
{
    if (item.property("truncated").toBool())
        return QLatin1StringView("is elided");
    const QRectF painted = paintedRect(item);
    if (painted.width() > item.width() + tolerance || painted.height() > item.height() + tolerance)
        return QLatin1StringView("is larger than its item");
    // An input scrolls to its cursor.
    return isInput(item) || fitsInto(root, item, painted) ? QLatin1StringView() : QLatin1StringView("is cut off");
}

QStringList faultsOfSpeech(QAccessibleInterface &interface)
{
    QStringList faults;
    const bool isTyped = interface.role() == QAccessible::EditableText;
    for (const auto kind : {QAccessible::Name, QAccessible::Description, QAccessible::Help, QAccessible::Value}) {
        const QString text = interface.text(kind);
        if (!(isTyped && kind == QAccessible::Value) && !isTranslated(text))
            faults << QStringLiteral("\"%1\" is spoken by role %2").arg(text).arg(interface.role(), 0, 16);
    }
    // Children that are items are found by themselves; items that say nothing have no interface to be found through.
    for (int index = 0; index < interface.childCount(); ++index) {
        QAccessibleInterface *child = interface.child(index);
        if (child && child->isValid() && !qobject_cast<QQuickItem *>(child->object()))
            faults << faultsOfSpeech(*child);
    }
    return faults;
}

} // namespace

QStringList untranslatedTexts(const QQuickItem &item)
{
    QStringList faults;
    for (const auto *text : shownItems(item)) {
        if (isLabel(*text) && !isTranslated(textOf(*text)))
            faults << described(*text, QLatin1StringView("is not translated"));
    }
    return faults;
}

QStringList clippedTexts(const QQuickItem &item)
{
    QStringList faults;
    for (const auto *text : shownItems(item)) {
        if (!isLabel(*text) && !isInput(*text))
            continue;
        if (const auto fault = clippingOf(item, *text); !fault.isEmpty())
            faults << described(*text, fault);
    }
    return faults;
}

QStringList untranslatedSpeech(const QQuickItem &item)
{
    QStringList faults;
    for (const auto *shown : shownItems(item)) {
        auto *interface = QAccessible::queryAccessibleInterface(const_cast<QQuickItem *>(shown));
        if (interface && interface->isValid() && !interface->state().invisible)
            faults << faultsOfSpeech(*interface);
    }
    return faults;
}
