#include "fuzzinput.h"
#include "host/server/remoteviewserver.h"
#include "remote/limits.h"
#include "remote/wirecolor.h"

#include <array>
#include <cmath>

#include <sys/mman.h>
#include <sys/socket.h>
#include <unistd.h>

using namespace favrin::host::server;
using namespace favrin::remote;

namespace {

/** A host that believes nothing: checks what the server vouches for, and touches every pixel. */
class Host : public RemoteViewServerDelegate
{
public:
    void frameDidArrive(const Frame &frame) override
    {
        require(frame.width > 0 && frame.height > 0 && frame.stride >= 4 * frame.width, "a frame has a shape");
        for (int y = 0; y < frame.height; ++y) {
            const auto *row = frame.pixels + std::ptrdiff_t(y) * frame.stride;
            for (int x = 0; x < 4 * frame.width; x += 64)
                sum += row[x];
        }
        for (const auto &part : frame.damage) {
            require(part.x >= 0 && part.y >= 0 && part.width > 0 && part.height > 0 &&
                        part.x + part.width <= frame.width && part.y + part.height <= frame.height,
                    "damage lies in the frame");
        }
    }
    void surfaceDidUnmap() override {}
    void serviceIsReady() override {}
    void serviceDidPrepare(std::uint32_t) override {}
    void pickerDidSelectColor(const std::optional<favrin::platform::Color> &color, const std::optional<std::string> &,
                              bool) override
    {
        require(!color || isFinite(*color), "a picked color is finite");
    }
    void pickerDidShowEyedropper() override {}
    void pickerDidFloatEyedropper() override {}
    void pickerDidDismissEyedropper() override {}
    void colorPickerDidFinish() override {}
    void preferredContentSizeDidChange(double width, double height) override
    {
        require(width >= 0 && width <= limits::largestSize && height >= 0 && height <= limits::largestSize,
                "a preferred size is in range");
    }
    void backgroundEffectDidChange(BackgroundEffect) override {}
    void textInputDidChange(const TextInputState &) override {}
    void serviceDidOfferClipboard(const std::vector<std::string> &) override {}
    void serviceWantsClipboard(const std::string &, int descriptor) override { ::close(descriptor); }
    void cursorDidChange(const std::string &) override {}
    void serviceResponsivenessDidChange(bool) override {}
    void focusDidLeave(FocusDirection) override {}
    void connectionDidClose(CloseReason, const std::string &) override
    {
        require(!closed, "a connection ends once");
        closed = true;
    }

    unsigned sum = 0;
    bool closed = false;
};

void send(int socket, std::span<const std::uint8_t> bytes, int file)
{
    union {
        cmsghdr header;
        std::array<char, CMSG_SPACE(sizeof(int))> space;
    } control = {};
    iovec data = {const_cast<std::uint8_t *>(bytes.data()), bytes.size()};
    msghdr message = {};
    message.msg_iov = &data;
    message.msg_iovlen = 1;
    if (file >= 0) {
        message.msg_control = &control;
        message.msg_controllen = sizeof control;
        cmsghdr *header = CMSG_FIRSTHDR(&message);
        header->cmsg_level = SOL_SOCKET;
        header->cmsg_type = SCM_RIGHTS;
        header->cmsg_len = CMSG_LEN(sizeof(int));
        std::memcpy(CMSG_DATA(header), &file, sizeof file);
    }
    static_cast<void>(!::sendmsg(socket, &message, MSG_DONTWAIT | MSG_NOSIGNAL));
}

void drain(int socket)
{
    std::array<char, 4096> bytes;
    while (::recv(socket, bytes.data(), bytes.size(), MSG_DONTWAIT) > 0) {
    }
}

void act(RemoteViewServer &server, std::uint8_t what, std::uint32_t time)
{
    switch (what % 12) {
    case 0:
        return server.frameWasShown(time);
    case 1:
        return server.pointerMotion(time, what, 3);
    case 2:
        return server.pointerButton(time, 0x110, what % 8 > 3);
    case 3:
        return server.keyboardKey(time, 30, what % 8 > 3);
    case 4:
        return server.touchDown(time, what % 3, 1, 1);
    case 5:
        return server.touchUp(time, what % 3);
    case 6:
        return server.commitText("x");
    case 7:
        return server.configure(what, 10, 1 + what % 4);
    case 8:
        return server.setClipboard({"text/plain"});
    case 9:
        return server.ping();
    case 10:
        return server.sendPrepareForDisplay(time);
    default:
        return server.sendPresent();
    }
}

} // namespace

/** Parts of a session: what the service writes, with or without a file behind it, and what the host does in between. */
int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    Host host;
    RemoteViewServer server(host);
    server.configure(20, 10, 1);
    const int socket = server.openConnection();
    server.pointerEnter(1, 1);
    server.keyboardEnter();
    std::uint32_t time = 0;
    for (FuzzInput input(data, size); !input.isEmpty() && !host.closed;) {
        const auto kind = input.number<std::uint8_t>();
        if (kind % 3 == 0) {
            act(server, kind / 3, ++time);
        } else {
            const bool hasFile = kind % 3 == 2;
            const int file = hasFile ? ::memfd_create("fuzz", MFD_CLOEXEC) : -1;
            if (hasFile)
                static_cast<void>(!::ftruncate(file, 256 * (kind / 3)));
            send(socket, input.take(input.number<std::uint16_t>() % 4096), file);
            if (hasFile)
                ::close(file);
        }
        server.dispatch();
        server.flush();
        drain(socket);
    }
    ::close(socket);
    for (int turn = 0; turn < 3; ++turn)
        server.dispatch();
    require(host.closed, "the end of a service is told");
    return 0;
}
