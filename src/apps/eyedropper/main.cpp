#include "apps/eyedropper/eyedropperservice.h"

#include <QCoreApplication>

#include <cstdio>

namespace {

constexpr int noBus = 1;
constexpr int nameTaken = 2;

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication application(argc, argv);
    QDBusConnection bus = QDBusConnection::sessionBus();
    if (!bus.isConnected()) {
        std::fputs("favrin-eyedropper-service: there is no session bus\n", stderr);
        return noBus;
    }
    const QString picker = QCoreApplication::applicationDirPath() + QStringLiteral("/favrin-eyedropper-picker");
    favrin::eyedropper::EyedropperService service(bus, picker);
    if (!service.start()) {
        std::fputs("favrin-eyedropper-service: another eyedropper service runs already\n", stderr);
        return nameTaken;
    }
    // The service of a session ends with it.
    bus.connect({}, QStringLiteral("/org/freedesktop/DBus/Local"), QStringLiteral("org.freedesktop.DBus.Local"),
                QStringLiteral("Disconnected"), &application, SLOT(quit()));
    return QCoreApplication::exec();
}
