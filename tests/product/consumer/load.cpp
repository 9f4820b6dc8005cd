// load IMPORT_PATH FILE...: makes the object that each QML file describes.
#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>

#include <cstdio>
#include <memory>

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QQmlEngine engine;
    const QStringList arguments = QCoreApplication::arguments();
    engine.addImportPath(arguments.value(1));
    for (const QString &file : arguments.mid(2)) {
        QQmlComponent component(&engine, QUrl::fromLocalFile(file));
        const std::unique_ptr<QObject> object(component.create());
        if (!object) {
            std::fputs(qUtf8Printable(component.errorString()), stderr);
            return 1;
        }
    }
    return arguments.size() > 2 ? 0 : 1;
}
