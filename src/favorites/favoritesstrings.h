#pragma once

#include <QObject>
#include <QString>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::favorites {

/** The texts of the strip, in the user's language. */
class FavoritesStrings : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_SINGLETON
    Q_PROPERTY(QString favorites READ favorites NOTIFY localeChanged FINAL)
    Q_PROPERTY(QString deleteCommand READ deleteCommand NOTIFY localeChanged FINAL)

public:
    explicit FavoritesStrings(QObject *parent = nullptr);

    static QString favorites();
    static QString deleteCommand();

Q_SIGNALS:
    void localeChanged();
};

} // namespace favrin::favorites
