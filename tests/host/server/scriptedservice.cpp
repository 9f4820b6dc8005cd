#include "scriptedservice.h"

#include <cctype>
#include <cerrno>
#include <cstring>
#include <set>

#include <poll.h>
#include <sys/mman.h>
#include <unistd.h>

// Like a service that is killed, the scripted one leaves its proxies behind; the leak checker shall not mind them.
extern "C" __attribute__((visibility("default"))) const char *__lsan_default_suppressions()
{
    return "leak:libwayland-client.so\n";
}

namespace {

std::string prefixOf(std::string_view interface)
{
    for (const std::string_view device : {"wl_pointer", "wl_keyboard", "wl_touch", "wl_seat"}) {
        if (interface == device)
            return std::string(device.substr(3)) + ' ';
    }
    return interface == zwp_text_input_v1_interface.name ? "text " : "";
}

/** How many arguments an event begins with that differ from run to run: serials and times. */
std::size_t stampsOf(std::string_view event)
{
    static const std::set<std::string_view> both = {"button", "key", "down", "up"};
    static const std::set<std::string_view> one = {"enter", "leave", "motion", "axis", "axis_stop", "modifiers"};
    return both.contains(event) ? 2 : one.contains(event) ? 1 : 0;
}

/** As it is noted; descriptors and objects that are there are not. */
std::string textOf(char type, const wl_argument &argument)
{
    switch (type) {
    case 'i':
        return ' ' + std::to_string(argument.i);
    case 'u':
        return ' ' + std::to_string(argument.u);
    case 'f':
        return ' ' + std::to_string(wl_fixed_to_int(argument.f));
    case 's':
        return std::string(" ") + (argument.s ? argument.s : "(null)");
    case 'o':
        return argument.o ? "" : " none";
    default:
        return "";
    }
}

std::vector<double> numbersOf(const wl_array *array)
{
    std::vector<double> numbers(array->size / sizeof(double));
    if (!numbers.empty())
        std::memcpy(numbers.data(), array->data, array->size);
    return numbers;
}

} // namespace

int ScriptedService::hear(const void *, void *target, std::uint32_t, const wl_message *message, wl_argument *arguments)
{
    auto *proxy = static_cast<wl_proxy *>(target);
    auto &service = *static_cast<ScriptedService *>(wl_proxy_get_user_data(proxy));
    const std::string_view interface = wl_proxy_get_class(proxy);
    std::string line = prefixOf(interface) + message->name;
    const std::size_t stamps = stampsOf(message->name);
    std::size_t index = 0;
    for (const char type : std::string_view(message->signature)) {
        if (!std::isalpha(type))
            continue;
        const wl_argument &argument = arguments[index++];
        if (type == 'a' && interface == favrin_remote_view_v1_interface.name)
            service.numbers[message->name].push_back(numbersOf(argument.a));
        else if (type == 'a')
            line += ' ' + std::to_string(argument.a->size / sizeof(std::uint32_t));
        else if (index > stamps)
            line += textOf(type, argument);
        // What follows is its size.
        if (type == 'h')
            break;
    }
    if (stamps == 2)
        service.inputSerial = arguments[0].u;
    if (interface == xdg_surface_interface.name)
        service.configureSerials.push_back(arguments[0].u);
    else
        service.events.push_back(line);
    service.react(message->name, arguments);
    return 0;
}

void ScriptedService::react(std::string_view event, const wl_argument *arguments)
{
    if (event == "ping" && answersPings) {
        xdg_wm_base_pong(shell, arguments[0].u);
    } else if (event == "keymap") {
        void *memory = ::mmap(nullptr, arguments[2].u, PROT_READ, MAP_PRIVATE, arguments[1].h, 0);
        keymap = memory == MAP_FAILED ? "" : static_cast<const char *>(memory);
        ::munmap(memory, arguments[2].u);
        keymapIsWritable = ::pwrite(arguments[1].h, "x", 1, 0) == 1;
        ::close(arguments[1].h);
    } else if (event == "data_offer") {
        listenTo(arguments[0].o);
    } else if (event == "selection") {
        dataOffer = reinterpret_cast<wl_data_offer *>(arguments[0].o);
    } else if (event == "send") {
        static_cast<void>(!::write(arguments[1].h, "service", 7));
        ::close(arguments[1].h);
    }
}

ScriptedService::ScriptedService(int descriptor) : display(wl_display_connect_to_fd(descriptor))
{
    static const wl_registry_listener listener = {
        [](void *data, wl_registry *, std::uint32_t name, const char *interface, std::uint32_t version) {
            static_cast<ScriptedService *>(data)->globals[interface] = {name, version};
        },
        [](void *, wl_registry *, std::uint32_t) {},
    };
    registry = wl_display_get_registry(display);
    wl_registry_add_listener(registry, &listener, this);
}

ScriptedService::~ScriptedService()
{
    wl_display_disconnect(display);
}

void ScriptedService::flush()
{
    wl_display_flush(display);
}

bool ScriptedService::read()
{
    while (wl_display_prepare_read(display) != 0) {
        if (wl_display_dispatch_pending(display) < 0)
            return false;
    }
    pollfd waiting = {wl_display_get_fd(display), POLLIN, 0};
    if (::poll(&waiting, 1, 0) <= 0) {
        wl_display_cancel_read(display);
        return false;
    }
    return wl_display_read_events(display) == 0 && wl_display_dispatch_pending(display) > 0;
}

void ScriptedService::listenTo(void *proxy)
{
    wl_proxy_add_dispatcher(static_cast<wl_proxy *>(proxy), hear, nullptr, this);
}

void ScriptedService::bindAll()
{
    const auto bind = [this](const wl_interface &interface) {
        const auto [name, version] = globals[interface.name];
        return wl_registry_bind(registry, name, &interface, version);
    };
    compositor = static_cast<wl_compositor *>(bind(wl_compositor_interface));
    shm = static_cast<wl_shm *>(bind(wl_shm_interface));
    seat = static_cast<wl_seat *>(bind(wl_seat_interface));
    bind(wl_output_interface);
    shell = static_cast<xdg_wm_base *>(bind(xdg_wm_base_interface));
    textInputManager = static_cast<zwp_text_input_manager_v1 *>(bind(zwp_text_input_manager_v1_interface));
    dataDeviceManager = static_cast<wl_data_device_manager *>(bind(wl_data_device_manager_interface));
    view = static_cast<favrin_remote_view_v1 *>(bind(favrin_remote_view_v1_interface));
    pointer = wl_seat_get_pointer(seat);
    keyboard = wl_seat_get_keyboard(seat);
    touch = wl_seat_get_touch(seat);
    textInput = zwp_text_input_manager_v1_create_text_input(textInputManager);
    dataDevice = wl_data_device_manager_get_data_device(dataDeviceManager, seat);
    for (void *proxy :
         std::initializer_list<void *>{view, seat, pointer, keyboard, touch, shell, textInput, dataDevice})
        listenTo(proxy);
}

void ScriptedService::makeToplevel()
{
    surface = wl_compositor_create_surface(compositor);
    xdgSurface = xdg_wm_base_get_xdg_surface(shell, surface);
    listenTo(xdgSurface);
    toplevel = xdg_surface_get_toplevel(xdgSurface);
    listenTo(toplevel);
    wl_surface_commit(surface);
}

void ScriptedService::acknowledge()
{
    for (const std::uint32_t serial : configureSerials)
        xdg_surface_ack_configure(xdgSurface, serial);
    configureSerials.clear();
}

wl_shm_pool *ScriptedService::makePool(int bytes, int *descriptor)
{
    const int memory = ::memfd_create("scripted", MFD_CLOEXEC);
    if (::ftruncate(memory, bytes) != 0)
        return nullptr;
    wl_shm_pool *pool = wl_shm_create_pool(shm, memory, bytes);
    if (descriptor)
        *descriptor = memory;
    else
        ::close(memory);
    return pool;
}

wl_buffer *ScriptedService::makeBuffer(int width, int height, std::uint32_t pixel, std::uint32_t format)
{
    int memory = -1;
    wl_shm_pool *pool = makePool(width * height * 4, &memory);
    const std::vector<std::uint32_t> pixels(static_cast<std::size_t>(width * height), pixel);
    static_cast<void>(!::write(memory, pixels.data(), pixels.size() * 4));
    ::close(memory);
    wl_buffer *buffer = wl_shm_pool_create_buffer(pool, 0, width, height, width * 4, format);
    wl_shm_pool_destroy(pool);
    listenTo(buffer);
    return buffer;
}

void ScriptedService::commit(wl_buffer *buffer, int width, int height)
{
    wl_surface_attach(surface, buffer, 0, 0);
    wl_surface_damage_buffer(surface, 0, 0, width, height);
    wl_surface_commit(surface);
}

std::vector<std::string> ScriptedService::eventsOf(const std::string &prefix) const
{
    std::vector<std::string> found;
    for (const std::string &event : events) {
        if (event.starts_with(prefix))
            found.push_back(event);
    }
    return found;
}
