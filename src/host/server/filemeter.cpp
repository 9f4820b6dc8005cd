#include "host/server/filemeter.h"

#include "host/server/serverlimits.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <string_view>

#include <sys/socket.h>
#include <unistd.h>

namespace favrin::host::server {

namespace {

/** What libwayland reads at a time, and how many files the kernel passes with one message. */
constexpr std::size_t readBytes = 4096;
constexpr std::size_t filesOfOneMessage = 253;

/** The files of a message that was looked at are open a second time, and closed here. */
std::size_t countAndClose(const cmsghdr &header)
{
    const std::size_t count = (header.cmsg_len - CMSG_LEN(0)) / sizeof(int);
    for (std::size_t index = 0; index < count; ++index) {
        int file = -1;
        std::memcpy(&file, CMSG_DATA(&header) + index * sizeof file, sizeof file);
        ::close(file);
    }
    return count;
}

} // namespace

void FileMeter::begin()
{
    m_received = 0;
    m_taken = 0;
}

void FileMeter::willRead(int socket)
{
    std::array<char, readBytes> bytes;
    alignas(cmsghdr) std::array<char, CMSG_SPACE(filesOfOneMessage * sizeof(int))> control;
    iovec data = {bytes.data(), bytes.size()};
    msghdr message = {};
    message.msg_iov = &data;
    message.msg_iovlen = 1;
    message.msg_control = control.data();
    message.msg_controllen = control.size();
    if (::recvmsg(socket, &message, MSG_PEEK | MSG_DONTWAIT | MSG_CMSG_CLOEXEC) <= 0)
        return;
    for (cmsghdr *header = CMSG_FIRSTHDR(&message); header; header = CMSG_NXTHDR(&message, header)) {
        if (header->cmsg_level == SOL_SOCKET && header->cmsg_type == SCM_RIGHTS)
            m_received += countAndClose(*header);
    }
}

void FileMeter::requestArrived(const wl_protocol_logger_message &message)
{
    const std::string_view signature = message.message->signature;
    m_taken += static_cast<std::size_t>(std::ranges::count(signature, 'h'));
}

void FileMeter::check()
{
    if (m_received > m_taken + limits::strayFiles)
        m_complaint("more than " + std::to_string(limits::strayFiles) + " files that no request takes");
}

} // namespace favrin::host::server
