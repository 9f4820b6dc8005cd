#include "apps/gallery/gallery.h"
#include "apps/gallery/galleryoptions.h"
#include "apps/gallery/picturebook.h"
#include "apps/gallery/tourscript.h"

#include <QDir>
#include <QGuiApplication>
#include <QQmlApplicationEngine>
#include <QTemporaryDir>

#include <cstdio>

using namespace favrin::gallery;

namespace {

/** Sets a variable of the environment that the user has not set. */
void setDefault(const char *variable, const char *value)
{
    if (!qEnvironmentVariableIsSet(variable))
        qputenv(variable, value);
}

void prepareEnvironment()
{
    if (qEnvironmentVariableIsEmpty("DISPLAY") && qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY"))
        setDefault("QT_QPA_PLATFORM", "offscreen");
    // Qt otherwise waits 5 ms before each frame, which a drag over the picker would show.
    setDefault("QT_QPA_UPDATE_IDLE_TIME", "0");
}

QQuickWindow *loadWindow(QQmlApplicationEngine &engine, Gallery &gallery)
{
    engine.addImportPath(QStringLiteral("qrc:/qt/qml"));
    engine.setInitialProperties({{QStringLiteral("gallery"), QVariant::fromValue(&gallery)}});
    engine.load(QUrl(QStringLiteral("qrc:/qt/qml/Favrin/Gallery/Main.qml")));
    const QList<QObject *> roots = engine.rootObjects();
    return roots.isEmpty() ? nullptr : qobject_cast<QQuickWindow *>(roots.constFirst());
}

/** False when there is nowhere to put what the tour leaves. */
bool startTour(QQuickWindow *window, Gallery &gallery, const GalleryOptions &options, Tour &tour)
{
    const QString folder = QDir(*options.tourFolder).absolutePath();
    if (!QDir().mkpath(folder)) {
        std::fprintf(stderr, "The folder '%s' cannot be made.\n", qUtf8Printable(folder));
        return false;
    }
    auto *script = new TourScript(window, &gallery, folder, &tour);
    if (options.onlyScaledPicture) {
        script->addScaledPicture();
    } else {
        script->addEverything();
        (new PictureBook(folder, &tour))->addEverything();
    }
    QObject::connect(&tour, &Tour::finished, qApp, &QCoreApplication::exit, Qt::QueuedConnection);
    tour.start();
    return true;
}

} // namespace

int main(int argc, char *argv[])
{
    prepareEnvironment();
    QGuiApplication app(argc, argv);
    QGuiApplication::setApplicationDisplayName(QStringLiteral("Broadside"));

    const ParsedOptions parsed = parseOptions(QCoreApplication::arguments());
    if (!parsed.options) {
        std::fprintf(parsed.isMistake ? stderr : stdout, "%s\n", qUtf8Printable(parsed.text));
        return parsed.isMistake ? 2 : 0;
    }
    // Pictures shall look the same everywhere, and without a display there is no other way to draw.
    if (parsed.options->tourFolder || QGuiApplication::platformName() == QStringLiteral("offscreen"))
        QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);

    // What the tour finds and leaves is its own: a picker of a user who has never opened one.
    QTemporaryDir tourData;
    if (parsed.options->tourFolder)
        qputenv("XDG_DATA_HOME", QFile::encodeName(tourData.path()));

    FVColorPickerViewController::startServiceAhead();
    Gallery gallery;
    QQmlApplicationEngine engine;
    QQuickWindow *window = loadWindow(engine, gallery);
    if (!window)
        return 1;
    window->show();

    Tour tour;
    if (!parsed.options->tourFolder)
        gallery.presenter()->present(window);
    else if (!startTour(window, gallery, *parsed.options, tour))
        return 1;
    return QGuiApplication::exec();
}
