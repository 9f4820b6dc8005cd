#pragma once

#include <QObject>
#include <QString>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::shell {

/** The texts of the frame around the tabs, in the user's language. */
class ShellStrings : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_SINGLETON
    Q_PROPERTY(QString close READ close NOTIFY localeChanged FINAL)
    Q_PROPERTY(QString colorPickerType READ colorPickerType NOTIFY localeChanged FINAL)
    Q_PROPERTY(QString copy READ copy NOTIFY localeChanged FINAL)
    Q_PROPERTY(QString eyedropper READ eyedropper NOTIFY localeChanged FINAL)
    Q_PROPERTY(QString eyedropperAlternatives READ eyedropperAlternatives NOTIFY localeChanged FINAL)

public:
    explicit ShellStrings(QObject *parent = nullptr);

    static QString close();
    static QString colorPickerType();
    static QString copy();
    static QString eyedropper();
    /** The other words by which somebody who speaks to the computer may mean the eyedropper. */
    static QString eyedropperAlternatives();
    static QString selectedColor();

Q_SIGNALS:
    void localeChanged();
};

} // namespace favrin::shell
