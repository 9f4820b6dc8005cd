#pragma once

#include "recordingdelegate.h"
#include "scriptedservice.h"

#include <QDir>
#include <QtTest>

#include <poll.h>

/** A server and a scripted service that has bound everything. */
class PresentedPair
{
public:
    enum class Start { Unbound, Bound, Mapped };

    explicit PresentedPair(Start start = Start::Bound) : server(delegate), service(server.openConnection())
    {
        server.configure(20, 10, 1);
        exchange();
        if (start == Start::Unbound)
            return;
        service.bindAll();
        exchange();
        if (start == Start::Mapped)
            map();
    }

    /** Until neither side has anything more to say. */
    void exchange()
    {
        for (bool active = true; active;) {
            service.flush();
            pollfd waiting = {server.fileDescriptor(), POLLIN, 0};
            active = ::poll(&waiting, 1, 0) > 0;
            if (active)
                server.dispatch();
            server.flush();
            active |= service.read();
        }
    }

    void map()
    {
        service.makeToplevel();
        exchange();
        service.acknowledge();
        wl_buffer *buffer = service.makeBuffer(20, 10, 0xff000000);
        service.commit(buffer, 20, 10);
        exchange();
        server.frameWasShown(1);
        exchange();
        service.events.clear();
    }

    /** What the service heard of this kind of device: "enter 1 2, frame". */
    QString heard(const std::string &device) const
    {
        QStringList words;
        for (const std::string &event : service.eventsOf(device + ' '))
            words << QString::fromStdString(event.substr(device.size() + 1));
        return words.join(QStringLiteral(", "));
    }
    /** What its owner was told. */
    QString told() const { return delegate.calls.join(QStringLiteral(", ")); }

    /** "interface code" of the error that the service was told, or "" for none. */
    std::string protocolError() const
    {
        const wl_interface *interface = nullptr;
        if (wl_display_get_error(service.display) != EPROTO)
            return "";
        const std::uint32_t code = wl_display_get_protocol_error(service.display, &interface, nullptr);
        return std::string(interface ? interface->name : "") + " " + std::to_string(code);
    }

    /** Lets the timer run out that tells of an end which was noticed while nothing was read. */
    void exchangeUntilClosed() { QTRY_VERIFY((exchange(), !delegate.closes.empty())); }

    RecordingDelegate delegate;
    favrin::host::server::RemoteViewServer server;
    ScriptedService service;
};

/** Compares the number of open files before and after each test. */
class ServerTest : public QObject
{
    Q_OBJECT

public:
    static int openFiles() { return static_cast<int>(QDir(QStringLiteral("/proc/self/fd")).count()); }

private Q_SLOTS:
    void init() { m_before = openFiles(); }
    void cleanup() { QCOMPARE(openFiles(), m_before); }

private:
    int m_before = 0;
};
