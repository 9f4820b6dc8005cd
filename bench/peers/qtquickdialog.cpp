// Qt Quick Dialogs' color dialog, drawn by the processor like the picker: as a program of its own, or with --opening
// timed from open() in a running app to the first frame with it. One JSON object is printed.

#include <QElapsedTimer>
#include <QGuiApplication>
#include <QQmlApplicationEngine>
#include <QQmlComponent>
#include <QQuickWindow>
#include <QTimer>

#include <cstdio>
#include <cstring>
#include <memory>

namespace {

const char *const windowSource = R"(
import QtQuick
Window { width: 900; height: 700; visible: true }
)";
const char *const dialogSource = R"(
import QtQuick.Dialogs
ColorDialog { options: ColorDialog.ShowAlphaChannel | ColorDialog.DontUseNativeDialog }
)";

void rest(int milliseconds)
{
    QEventLoop loop;
    QTimer::singleShot(milliseconds, &loop, &QEventLoop::quit);
    loop.exec();
}

QObject *make(QQmlEngine &engine, const char *source, const QVariantMap &properties)
{
    QQmlComponent component(&engine);
    component.setData(source, QUrl(QStringLiteral("qrc:/peer.qml")));
    QObject *object = component.createWithInitialProperties(properties);
    if (!object)
        std::fprintf(stderr, "%s\n", qPrintable(component.errorString()));
    return object;
}

} // namespace

int main(int argc, char *argv[])
{
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    QGuiApplication application(argc, argv);
    QQmlEngine engine;
    const std::unique_ptr<QObject> root(make(engine, windowSource, {}));
    auto *window = qobject_cast<QQuickWindow *>(root.get());
    if (!window)
        return 1;
    const bool isTimed = argc > 1 && !std::strcmp(argv[1], "--opening");
    int frames = 0;
    QObject::connect(window, &QQuickWindow::frameSwapped, window, [&frames] { ++frames; });
    if (isTimed)
        rest(300);
    QElapsedTimer clock;
    clock.start();
    const std::unique_ptr<QObject> dialog(
        make(engine, dialogSource, {{QStringLiteral("parentWindow"), QVariant::fromValue<QWindow *>(window)}}));
    if (!dialog)
        return 1;
    QMetaObject::invokeMethod(dialog.get(), "open");
    if (!isTimed)
        return QGuiApplication::exec();
    const int before = frames;
    while (frames == before)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    std::printf("{\"first\": %.3f}\n", double(clock.nsecsElapsed()) / 1e6);
    std::fflush(stdout);
    std::_Exit(0);
}
