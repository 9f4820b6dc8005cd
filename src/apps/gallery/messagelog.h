#pragma once

#include "host/fvcolor.h"

#include <QAbstractListModel>
#include <QtQmlIntegration/qqmlintegration.h>

#include <deque>

namespace favrin::gallery {

/** Everything the picker told the app, newest first; beyond a thousand messages the oldest go. */
class MessageLog : public QAbstractListModel
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("The gallery owns the log")

    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    enum class Kind { VolatilePick, FinalPick, Eyedropper, Finish, Failure };
    Q_ENUM(Kind)

    enum Role { NumberRole = Qt::UserRole, KindRole, TitleRole, DetailRole, ColorRole };

    static constexpr std::size_t capacity = 1000;

    using QAbstractListModel::QAbstractListModel;

    int rowCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;
    int count() const { return static_cast<int>(m_messages.size()); }

    void addPick(const FVColor &color, const QString &colorspace, bool isVolatile);
    void add(Kind kind, const QString &title, const QString &detail = {});
    Q_INVOKABLE void clear();

Q_SIGNALS:
    void countChanged();

private:
    struct Message
    {
        Kind kind;
        QString title;
        QString detail;
        FVColor color;
        /** Counts from 1 since the start. */
        int number;
    };

    void insert(Message message);

    std::deque<Message> m_messages;
    int m_received = 0;
};

} // namespace favrin::gallery
