#include "apps/tool/toolmain.h"
#include "apps/tool/pickertool.h"
#include "apps/tool/windowparent.h"
#include "host/session/remotepicker.h"
#include "host/session/serviceahead.h"

#include <QGuiApplication>

#include <csignal>
#include <cstdio>
#include <cstdlib>

namespace host = favrin::host;
using namespace favrin::tool;

namespace {

void say(const QString &text)
{
    std::fprintf(stderr, "favrin-color-picker: %s\n", qUtf8Printable(text));
}

bool printLine(const std::string &line)
{
    return std::fprintf(stdout, "%s\n", line.c_str()) >= 0 && std::fflush(stdout) == 0;
}

QtMessageHandler previousMessageHandler = nullptr;

/** Qt leaves with status 1 when its display goes, which would say that the user cancelled. */
void failWithTheDisplay(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    previousMessageHandler(type, context, message);
    if (message.startsWith(u"The Wayland connection") || message.startsWith(u"The X11 connection broke"))
        std::_Exit(static_cast<int>(ExitStatus::Failed));
}

QStringList texts(int count, char **arguments)
{
    QStringList list;
    for (int i = 0; i < count; ++i)
        list.append(QString::fromLocal8Bit(arguments[i]));
    return list;
}

/** The user wants no display: pictures only, as tests do. */
bool isOffscreenWanted()
{
    return qgetenv("QT_QPA_PLATFORM").startsWith("offscreen");
}

/** The platforms to try, best first. The last one always starts, and tells that the others did not. */
QByteArray platforms(const ParentHandle &parent)
{
    QByteArrayList list;
    if (const QByteArray wanted = qgetenv("QT_QPA_PLATFORM"); !wanted.isEmpty()) {
        list.append(wanted);
    } else {
        if (!qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY"))
            list.append("wayland");
        if (!qEnvironmentVariableIsEmpty("DISPLAY"))
            list.insert(std::holds_alternative<X11Window>(parent) ? 0 : list.size(), "xcb");
    }
    list.append("offscreen");
    return list.join(';');
}

/** What Qt must know before it starts: nothing that the first frame does not need. */
void prepareEnvironment(const ParentHandle &parent)
{
    qputenv("QT_QPA_PLATFORM", platforms(parent));
    QGuiApplication::setApplicationName(QStringLiteral("favrin-color-picker"));
    QGuiApplication::setApplicationDisplayName(QStringLiteral("Favrin Color Picker"));
    QGuiApplication::setDesktopFileName(QStringLiteral("com.quenta.favrin.ColorPicker"));
}

} // namespace

int favrinColorPickerMain(int argc, char *argv[], favrin::host::LaunchedService *service)
{
    // A reader that has left is an error of writing, not the end of this process.
    std::signal(SIGPIPE, SIG_IGN);
    const ParsedOptions parsed = parseOptions(texts(argc, argv));
    if (!parsed.options) {
        if (parsed.status == ExitStatus::Chosen)
            return static_cast<int>(printLine(parsed.text.toStdString()) ? ExitStatus::Chosen : ExitStatus::Failed);
        say(parsed.text);
        return static_cast<int>(parsed.status);
    }
    const bool isDisplayNeeded = !isOffscreenWanted();
    previousMessageHandler = qInstallMessageHandler(failWithTheDisplay);
    prepareEnvironment(parsed.options->parent);
    host::ServiceAhead::instance().adopt(std::move(*service));
    int onlyTheName = 1;
    QGuiApplication application(onlyTheName, argv);
    if (isDisplayNeeded && QGuiApplication::platformName() == u"offscreen") {
        say(QStringLiteral("there is no display to show the picker on"));
        return static_cast<int>(ExitStatus::Failed);
    }

    PickerTool tool(*parsed.options, std::make_unique<host::RemotePicker>(), printLine, [&parsed](QWindow &window) {
        const QString problem = attach(window, parsed.options->parent);
        if (!problem.isEmpty())
            say(problem);
    });
    QObject::connect(&tool, &PickerTool::ended, &application, [](ExitStatus status, const QString &reason) {
        if (!reason.isEmpty())
            say(reason);
        QCoreApplication::exit(static_cast<int>(status));
    });
    tool.start();
    return QGuiApplication::exec();
}
