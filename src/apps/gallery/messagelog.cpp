#include "apps/gallery/messagelog.h"

#include <QColor>

#include <algorithm>
#include <cmath>

namespace favrin::gallery {

namespace {

QString hexText(const FVColor &color)
{
    const auto byte = [](double component) { return std::lround(std::clamp(component, 0.0, 1.0) * 255.0); };
    return QStringLiteral("#%1%2%3")
        .arg(byte(color.red()), 2, 16, QLatin1Char('0'))
        .arg(byte(color.green()), 2, 16, QLatin1Char('0'))
        .arg(byte(color.blue()), 2, 16, QLatin1Char('0'))
        .toUpper();
}

QString numbersText(const FVColor &color, const QString &colorspace)
{
    const auto number = [](double component) { return QString::number(component, 'f', 3); };
    return QStringLiteral("%1 %2 %3 · %4 · %5")
        .arg(number(color.red()), number(color.green()), number(color.blue()), QString::number(color.alpha(), 'f', 2),
             colorspace.isEmpty() ? QStringLiteral("–") : colorspace);
}

} // namespace

int MessageLog::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : count();
}

QVariant MessageLog::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid)) {
        return {};
    }
    const Message &message = m_messages[static_cast<std::size_t>(index.row())];
    switch (role) {
    case NumberRole:
        return message.number;
    case KindRole:
        return QVariant::fromValue(message.kind);
    case TitleRole:
        return message.title;
    case DetailRole:
        return message.detail;
    case ColorRole:
        return message.color.isValid() ? message.color.toQColor() : QColor(Qt::transparent);
    default:
        return {};
    }
}

QHash<int, QByteArray> MessageLog::roleNames() const
{
    return {
        {NumberRole, "number"}, {KindRole, "kind"}, {TitleRole, "title"}, {DetailRole, "detail"}, {ColorRole, "color"},
    };
}

void MessageLog::addPick(const FVColor &color, const QString &colorspace, bool isVolatile)
{
    insert({
        .kind = isVolatile ? Kind::VolatilePick : Kind::FinalPick,
        .title = color.isValid() ? hexText(color) : tr("No color"),
        .detail = color.isValid() ? numbersText(color, colorspace) : QString(),
        .color = color,
        .number = 0,
    });
}

void MessageLog::add(Kind kind, const QString &title, const QString &detail)
{
    insert({.kind = kind, .title = title, .detail = detail, .color = {}, .number = 0});
}

void MessageLog::clear()
{
    if (m_messages.empty())
        return;
    beginResetModel();
    m_messages.clear();
    endResetModel();
    Q_EMIT countChanged();
}

void MessageLog::insert(Message message)
{
    if (m_messages.size() == capacity) {
        beginRemoveRows({}, count() - 1, count() - 1);
        m_messages.pop_back();
        endRemoveRows();
    }
    message.number = ++m_received;
    beginInsertRows({}, 0, 0);
    m_messages.push_front(std::move(message));
    endInsertRows();
    Q_EMIT countChanged();
}

} // namespace favrin::gallery
