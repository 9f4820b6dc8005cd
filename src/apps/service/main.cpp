#include "apps/service/pickerservice.h"
#include "apps/service/serviceconfinement.h"
#include "service/fvcolorpickerserviceviewcontroller.h"
#include "shell/colorpickerviewfactory.h"
#include "theme/theme.h"

#include <QFontMetricsF>
#include <QGuiApplication>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTimer>

#include <cstdio>
#include <thread>

using favrin::theme::Theme;

namespace {

constexpr int noHost = 3;
QtMessageHandler previousMessageHandler = nullptr;

/** What Qt must know before it starts: the host's private server, drawing by the processor, frames without waiting. */
void prepareEnvironment()
{
    qputenv("QT_QPA_PLATFORM", "wayland");
    qputenv("QT_QUICK_BACKEND", "software");
    qputenv("QSG_RENDER_LOOP", "basic");
    qputenv("QT_WAYLAND_DISABLE_WINDOWDECORATION", "1");
    qputenv("QT_WAYLAND_SHELL_INTEGRATION", "xdg-shell");
    qputenv("QT_WAYLAND_TEXT_INPUT_PROTOCOL", "zwp_text_input_v1");
    // The toolkit's idle wait before each frame would cost every step of a drag 5 ms.
    qputenv("QT_QPA_UPDATE_IDLE_TIME", "0");
    qunsetenv("QT_IM_MODULE");
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
}

/** A host that leaves is the ordinary end of this process; the platform plugin's complaint about it is noise. */
void dropFarewell(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (!message.startsWith(u"The Wayland connection broke"))
        previousMessageHandler(type, context, message);
}

/** One after the other, so that nothing else has to wait for all of them. */
void prepareFonts(QList<QFont> fonts)
{
    if (fonts.isEmpty())
        return;
    QFontMetricsF(fonts.takeLast()).height();
    QTimer::singleShot(0, qGuiApp, [fonts] { prepareFonts(fonts); });
}

/**
 * Looks the fonts up beside the main thread. That makes those of the picker when it can, since each thread has its own;
 * most likely it is waiting for the views then.
 */
std::jthread fontLookUp()
{
    return std::jthread([] {
        QFontMetricsF(QFont()).height();
        QMetaObject::invokeMethod(
            qGuiApp, [] { prepareFonts(Theme::usualFonts()); }, Qt::QueuedConnection);
    });
}

} // namespace

int main(int argc, char *argv[])
{
    bool isSocket = false;
    const int socket = qEnvironmentVariableIntValue("WAYLAND_SOCKET", &isSocket);
    if (!isSocket || socket < 0) {
        std::fputs("favrin-color-picker-service: started by applications that show a color picker, not by hand\n",
                   stderr);
        return noHost;
    }
    previousMessageHandler = qInstallMessageHandler(dropFarewell);
    // Before anything is read from the host and before there is a second thread.
    favrin::apps::confineService(socket);
    prepareEnvironment();
    QGuiApplication application(argc, argv);
    QGuiApplication::setApplicationName(QStringLiteral("favrin-color-picker-service"));
    QGuiApplication::setDesktopFileName(QStringLiteral("favrin-color-picker"));
    // Items start with this font until they have heard of their own: so it should be one that is needed anyhow.
    QGuiApplication::setFont(Theme::usualFonts().constFirst());
    const std::jthread fonts = fontLookUp();
    // The host shows its own pointer; loading a theme of pointers here would cost the first touch of a drag 20 ms.
    QGuiApplication::setOverrideCursor(Qt::BlankCursor);

    QQmlEngine engine;
    favrin::shell::ColorPickerViewFactory views(engine, favrin::shell::ColorPickerViewFactory::Loading::Beside);
    favrin::service::FVColorPickerServiceViewController::registerClass(
        [&views](favrin::service::ColorPickerState *state) { return views.create(*state); });
    auto *display = favrin::remote::client::qtWaylandDisplay();
    if (!display)
        return noHost;
    favrin::apps::PickerService service(display);
    QObject::connect(&service, &favrin::apps::PickerService::hostIsMissing, &application,
                     [] { QCoreApplication::exit(noHost); });
    views.whenLoaded([&service] { service.viewsDidLoad(); });
    return QGuiApplication::exec();
}
