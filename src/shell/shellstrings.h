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
    Q_PROPERTY(QString close READ close CONSTANT FINAL)
    Q_PROPERTY(QString colorPickerType READ colorPickerType CONSTANT FINAL)

public:
    QString close() const;
    QString colorPickerType() const;
};

} // namespace favrin::shell
