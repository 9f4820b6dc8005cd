#pragma once

#include <QDBusConnection>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

/** A message bus of its own for one test, with a folder of services that it can start. */
class PrivateBus
{
public:
    /** What else the started services find in their environment. */
    bool start(const QStringList &environment = {})
    {
        write(m_folder.filePath(QStringLiteral("bus.conf")),
              QStringLiteral("<busconfig><type>session</type><listen>unix:dir=%1</listen><auth>EXTERNAL</auth>"
                             "<servicedir>%1</servicedir><policy context='default'><allow send_destination='*'/>"
                             "<allow receive_sender='*'/><allow own='*'/></policy></busconfig>")
                  .arg(m_folder.path()));
        m_daemon.setEnvironment(QProcess::systemEnvironment() + environment);
        m_daemon.start(QStringLiteral("dbus-daemon"),
                       {QStringLiteral("--config-file=") + m_folder.filePath(QStringLiteral("bus.conf")),
                        QStringLiteral("--nofork"), QStringLiteral("--nopidfile"),
                        QStringLiteral("--print-address=1")});
        if (!m_daemon.waitForReadyRead())
            return false;
        m_address = QString::fromUtf8(m_daemon.readLine()).trimmed();
        return !m_address.isEmpty();
    }
    ~PrivateBus() { stop(); }

    void stop()
    {
        m_daemon.kill();
        m_daemon.waitForFinished();
    }

    QString address() const { return m_address; }

    /** Lets the bus start @p command for whoever asks for the name. */
    void addService(const QString &name, const QString &command)
    {
        write(m_folder.filePath(name + QStringLiteral(".service")),
              QStringLiteral("[D-BUS Service]\nName=%1\nExec=%2\n").arg(name, command));
    }

    /** A new connection of the test's own. */
    QDBusConnection connection() const
    {
        static int count = 0;
        return QDBusConnection::connectToBus(m_address, QStringLiteral("test-%1").arg(++count));
    }

private:
    static void write(const QString &path, const QString &text)
    {
        QFile file(path);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(text.toUtf8());
    }

    QTemporaryDir m_folder;
    QProcess m_daemon;
    QString m_address;
};
