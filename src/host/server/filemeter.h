#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <utility>

#include <wayland-server-core.h>

namespace favrin::host::server {

/**
 * Counts the open files that came with the client's messages and that no request has taken, and complains past
 * limits::strayFiles.
 *
 * libwayland keeps up to a thousand of them, which is about as many as most apps may have open at all. It tells nobody
 * what it received, so this looks at the socket before it does, and at the requests as they pass.
 */
class FileMeter
{
public:
    using Complaint = std::function<void(const std::string &what)>;

    explicit FileMeter(Complaint complaint) : m_complaint(std::move(complaint)) {}
    /** With a new client. */
    void begin();
    /** Right before libwayland reads from the socket. */
    void willRead(int socket);
    void requestArrived(const wl_protocol_logger_message &message);
    /** After libwayland has handled what it read. */
    void check();

private:
    Complaint m_complaint;
    std::size_t m_received = 0;
    std::size_t m_taken = 0;
};

} // namespace favrin::host::server
