#include "apps/eyedropper/picker/loupepicking.h"
#include "apps/eyedropper/picker/pickingmethod.h"
#include "apps/eyedropper/picker/portalpicking.h"
#include "apps/eyedropper/picker/servicelink.h"
#include "platform/strings/translationtable.h"

#include <QGuiApplication>
#include <QLocale>
#include <QScreen>

#include <algorithm>
#include <cstdio>

using namespace favrin::eyedropper;

namespace {

constexpr int success = 0;
constexpr int failure = 1;
constexpr int misuse = 2;

/** Pixels a point beyond what the display itself asks for. */
double takeScaleFactor()
{
    bool isNumber = false;
    const double factor = qEnvironmentVariable("QT_SCALE_FACTOR").toDouble(&isNumber);
    // The loupe shows single pixels: the toolkit must count in them.
    qunsetenv("QT_SCALE_FACTOR");
    qunsetenv("QT_SCREEN_SCALE_FACTORS");
    qputenv("QT_ENABLE_HIGHDPI_SCALING", "0");
    return isNumber ? factor : 1;
}

double scaleOf(double factor)
{
    const double density = QGuiApplication::primaryScreen()->logicalDotsPerInch() / 96;
    return std::clamp(factor * density, 1.0, 4.0);
}

int run(Picking &picking)
{
    ServiceLink link;
    QObject::connect(&link, &ServiceLink::floatRequested, &picking, &Picking::floatPicking);
    QObject::connect(&link, &ServiceLink::cancelRequested, &picking, &Picking::cancel);
    QObject::connect(&picking, &Picking::floated, &link, &ServiceLink::sendFloated);
    QObject::connect(&picking, &Picking::picked, &link, &ServiceLink::sendColor);
    const auto leave = [](PickingEnd how) { QCoreApplication::exit(how == PickingEnd::Failed ? failure : success); };
    // Later: it may end before the event loop has begun.
    QObject::connect(&picking, &Picking::ended, qApp, leave, Qt::QueuedConnection);
    picking.start();
    return QCoreApplication::exec();
}

int pickThroughLoupe(int &argc, char **argv, const QString &display)
{
    qputenv("QT_QPA_PLATFORM", "xcb");
    const double factor = takeScaleFactor();
    QGuiApplication application(argc, argv);
    favrin::platform::installTranslations(QLocale().bcp47Name());
    LoupePicking picking(display, scaleOf(factor));
    return run(picking);
}

int pickThroughPortal(int &argc, char **argv)
{
    QCoreApplication application(argc, argv);
    PortalPicking picking(QDBusConnection::sessionBus());
    return run(picking);
}

int check(int &argc, char **argv, PickingMethod method)
{
    if (method == PickingMethod::Loupe)
        return success;
    QCoreApplication application(argc, argv);
    ScreenshotPortal portal(QDBusConnection::sessionBus());
    QObject::connect(&portal, &ScreenshotPortal::answered, &application,
                     [&portal] { QCoreApplication::exit(portal.canPickColor() ? success : failure); });
    portal.ask();
    return QCoreApplication::exec();
}

} // namespace

int main(int argc, char *argv[])
{
    // The toolkit takes options too, and what stands behind ours comes from whoever called the service.
    int ownNameOnly = 1;
    const QString option = QString::fromLocal8Bit(argc > 1 ? argv[1] : "");
    const PickingMethod method = pickingMethod(Session::current());
    if (option == u"--check" && argc == 2)
        return check(ownNameOnly, argv, method);
    if (option != u"--pick" || argc != 3) {
        std::fputs("usage: favrin-eyedropper-picker --check | --pick DISPLAY\n"
                   "Started by favrin-eyedropper-service, not by hand.\n",
                   stderr);
        return misuse;
    }
    const QString display = QString::fromLocal8Bit(argv[2]);
    return method == PickingMethod::Loupe ? pickThroughLoupe(ownNameOnly, argv, display)
                                          : pickThroughPortal(ownNameOnly, argv);
}
