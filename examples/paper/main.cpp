#include <FavrinColorPicker/fvcolorpickerviewcontroller.h>

#include <QGuiApplication>
#include <QQmlApplicationEngine>

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    // The picker's process starts while the window loads.
    FVColorPickerViewController::startServiceAhead();

    QQmlApplicationEngine engine;
    // Where the library's QML module is; Qt 6.5 and later look there by themselves.
    engine.addImportPath(QStringLiteral("qrc:/qt/qml"));
    engine.load(QUrl(QStringLiteral("qrc:/Main.qml")));
    return engine.rootObjects().isEmpty() ? 1 : QGuiApplication::exec();
}
