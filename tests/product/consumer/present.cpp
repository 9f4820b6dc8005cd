// Presents a picker, and prints the service that it came from once it is on screen.
#include <FavrinColorPicker/fvcolorpickerviewcontroller.h>

#include <QGuiApplication>

#include <cstdio>

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QQuickWindow window;
    window.resize(400, 700);
    window.show();
    FVColorPickerViewController picker;
    QObject::connect(&picker, &FVColorPickerViewController::stateChanged, &picker, [&picker] {
        if (picker.state() == FVColorPickerViewController::State::Ready)
            picker.dismiss();
    });
    QObject::connect(&picker, &FVColorPickerViewController::colorPickerDidFinish, &app, [] {
        std::puts(qUtf8Printable(FVColorPickerViewController::servicePath()));
        QCoreApplication::quit();
    });
    QObject::connect(&picker, &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError, &app,
                     [](const QString &error) {
                         std::fputs(qUtf8Printable(error), stderr);
                         QCoreApplication::exit(1);
                     });
    picker.present(&window);
    return QGuiApplication::exec();
}
