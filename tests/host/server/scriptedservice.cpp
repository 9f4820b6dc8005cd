#include "scriptedservice.h"

#include <cerrno>
#include <cstring>

#include <poll.h>
#include <sys/mman.h>
#include <unistd.h>

// Like a service that is killed, the scripted one leaves its proxies behind; the leak checker shall not mind them.
extern "C" __attribute__((visibility("default"))) const char *__lsan_default_suppressions()
{
    return "leak:libwayland-client.so\n";
}

namespace {

ScriptedService &self(void *data)
{
    return *static_cast<ScriptedService *>(data);
}

std::string text(const char *value)
{
    return value ? value : "(null)";
}

template<class... Values>
std::string line(const char *name, Values... values)
{
    std::string result = name;
    ((result += ' ', result += std::to_string(values)), ...);
    return result;
}

int fixed(wl_fixed_t value)
{
    return wl_fixed_to_int(value);
}

std::vector<double> numbersOf(const wl_array *array)
{
    std::vector<double> numbers(array->size / sizeof(double));
    if (!numbers.empty())
        std::memcpy(numbers.data(), array->data, array->size);
    return numbers;
}

} // namespace

ScriptedService::ScriptedService(int descriptor) : display(wl_display_connect_to_fd(descriptor))
{
    static const wl_registry_listener listener = {
        [](void *data, wl_registry *, std::uint32_t name, const char *interface, std::uint32_t version) {
            self(data).globals[interface] = {name, version};
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
    listenToView();
    listenToInput();
    listenToShell();
    listenToTextAndData();
}

void ScriptedService::makeToplevel()
{
    static const xdg_surface_listener surfaceListener = {
        [](void *data, xdg_surface *, std::uint32_t serial) { self(data).configureSerials.push_back(serial); }};
    static const xdg_toplevel_listener toplevelListener = [] {
        xdg_toplevel_listener listener = {};
        listener.configure = [](void *data, xdg_toplevel *, std::int32_t width, std::int32_t height, wl_array *states) {
            self(data).note(line("configure", width, height, states->size / sizeof(std::uint32_t)));
        };
        listener.close = [](void *data, xdg_toplevel *) { self(data).note("close"); };
        return listener;
    }();
    surface = wl_compositor_create_surface(compositor);
    xdgSurface = xdg_wm_base_get_xdg_surface(shell, surface);
    xdg_surface_add_listener(xdgSurface, &surfaceListener, this);
    toplevel = xdg_surface_get_toplevel(xdgSurface);
    xdg_toplevel_add_listener(toplevel, &toplevelListener, this);
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
    static const wl_buffer_listener listener = {[](void *data, wl_buffer *) { self(data).note("release"); }};
    wl_buffer_add_listener(buffer, &listener, this);
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

void ScriptedService::listenToView()
{
    static const favrin_remote_view_v1_listener listener = [] {
        favrin_remote_view_v1_listener l = {};
        using View = favrin_remote_view_v1;
        l.presentation_context = [](void *d, View *, std::uint32_t v) { self(d).note(line("context", v)); };
        l.appearance = [](void *d, View *, std::uint32_t v) { self(d).note(line("appearance", v)); };
        l.layout_direction = [](void *d, View *, std::uint32_t v) { self(d).note(line("direction", v)); };
        l.text_size_category = [](void *d, View *, std::uint32_t v) { self(d).note(line("text_size", v)); };
        l.display = [](void *d, View *, std::uint32_t v, const char *id) {
            self(d).note(line("display", v) + " " + id);
        };
        l.locale = [](void *d, View *, const char *name) { self(d).note("locale " + text(name)); };
        l.accessibility_options = [](void *d, View *, std::uint32_t v) { self(d).note(line("accessibility", v)); };
        l.traits_done = [](void *d, View *) { self(d).note("traits_done"); };
        l.title = [](void *d, View *, const char *value) { self(d).title = value; };
        l.suggested_colors = [](void *d, View *, const char *space, wl_array *colors) {
            self(d).note("colors " + text(space));
            self(d).colorRuns.push_back(numbersOf(colors));
        };
        l.options = [](void *d, View *, std::uint32_t v) { self(d).note(line("options", v)); };
        l.grid_style = [](void *d, View *, std::int32_t v) { self(d).note(line("grid_style", v)); };
        l.host_window = [](void *d, View *, wl_array *values) { self(d).geometry = numbersOf(values); };
        l.configuration_done = [](void *d, View *) { self(d).note("configuration_done"); };
        l.set_selected_color = [](void *d, View *, wl_array *color, const char *space, const char *colorspace) {
            self(d).note("color " + text(space) + " " + text(colorspace));
            self(d).colorRuns.push_back(numbersOf(color));
        };
        l.prepare_for_display = [](void *d, View *, std::uint32_t serial) { self(d).note(line("prepare", serial)); };
        l.present = [](void *d, View *) { self(d).note("present"); };
        l.color_picker_did_finish = [](void *d, View *) { self(d).note("finish"); };
        return l;
    }();
    favrin_remote_view_v1_add_listener(view, &listener, this);
}

void ScriptedService::listenToInput()
{
    static const wl_pointer_listener pointers = [] {
        wl_pointer_listener l = {};
        l.enter = [](void *d, wl_pointer *, std::uint32_t serial, wl_surface *, wl_fixed_t x, wl_fixed_t y) {
            self(d).inputSerial = serial;
            self(d).note(line("pointer enter", fixed(x), fixed(y)));
        };
        l.leave = [](void *d, wl_pointer *, std::uint32_t, wl_surface *) { self(d).note("pointer leave"); };
        l.motion = [](void *d, wl_pointer *, std::uint32_t, wl_fixed_t x, wl_fixed_t y) {
            self(d).note(line("pointer motion", fixed(x), fixed(y)));
        };
        l.button = [](void *d, wl_pointer *, std::uint32_t serial, std::uint32_t, std::uint32_t button,
                      std::uint32_t state) {
            self(d).inputSerial = serial;
            self(d).note(line("pointer button", button, state));
        };
        l.axis = [](void *d, wl_pointer *, std::uint32_t, std::uint32_t axis, wl_fixed_t value) {
            self(d).note(line("pointer axis", axis, fixed(value)));
        };
        l.frame = [](void *d, wl_pointer *) { self(d).note("pointer frame"); };
        l.axis_source = [](void *d, wl_pointer *, std::uint32_t source) {
            self(d).note(line("pointer source", source));
        };
        l.axis_stop = [](void *d, wl_pointer *, std::uint32_t, std::uint32_t axis) {
            self(d).note(line("pointer stop", axis));
        };
        l.axis_discrete = [](void *d, wl_pointer *, std::uint32_t axis, std::int32_t clicks) {
            self(d).note(line("pointer discrete", axis, clicks));
        };
        return l;
    }();
    static const wl_keyboard_listener keyboards = [] {
        wl_keyboard_listener l = {};
        l.keymap = [](void *d, wl_keyboard *, std::uint32_t format, std::int32_t descriptor, std::uint32_t size) {
            self(d).note(line("keyboard keymap", format));
            void *memory = ::mmap(nullptr, size, PROT_READ, MAP_PRIVATE, descriptor, 0);
            self(d).keymap = memory == MAP_FAILED ? "" : static_cast<const char *>(memory);
            ::munmap(memory, size);
            self(d).keymapIsWritable = ::pwrite(descriptor, "x", 1, 0) == 1;
            ::close(descriptor);
        };
        l.enter = [](void *d, wl_keyboard *, std::uint32_t serial, wl_surface *, wl_array *keys) {
            self(d).inputSerial = serial;
            self(d).note(line("keyboard enter", keys->size / sizeof(std::uint32_t)));
        };
        l.leave = [](void *d, wl_keyboard *, std::uint32_t, wl_surface *) { self(d).note("keyboard leave"); };
        l.key = [](void *d, wl_keyboard *, std::uint32_t serial, std::uint32_t, std::uint32_t key,
                   std::uint32_t state) {
            self(d).inputSerial = serial;
            self(d).note(line("keyboard key", key, state));
        };
        l.modifiers = [](void *d, wl_keyboard *, std::uint32_t, std::uint32_t depressed, std::uint32_t latched,
                         std::uint32_t locked, std::uint32_t group) {
            self(d).note(line("keyboard modifiers", depressed, latched, locked, group));
        };
        l.repeat_info = [](void *d, wl_keyboard *, std::int32_t rate, std::int32_t delay) {
            self(d).note(line("keyboard repeat", rate, delay));
        };
        return l;
    }();
    static const wl_touch_listener touches = [] {
        wl_touch_listener l = {};
        l.down = [](void *d, wl_touch *, std::uint32_t serial, std::uint32_t, wl_surface *, std::int32_t id,
                    wl_fixed_t x, wl_fixed_t y) {
            self(d).inputSerial = serial;
            self(d).note(line("touch down", id, fixed(x), fixed(y)));
        };
        l.up = [](void *d, wl_touch *, std::uint32_t, std::uint32_t, std::int32_t id) {
            self(d).note(line("touch up", id));
        };
        l.motion = [](void *d, wl_touch *, std::uint32_t, std::int32_t id, wl_fixed_t x, wl_fixed_t y) {
            self(d).note(line("touch motion", id, fixed(x), fixed(y)));
        };
        l.frame = [](void *d, wl_touch *) { self(d).note("touch frame"); };
        l.cancel = [](void *d, wl_touch *) { self(d).note("touch cancel"); };
        return l;
    }();
    static const wl_seat_listener seats = {
        .capabilities = [](void *d, wl_seat *, std::uint32_t all) { self(d).note(line("seat offers", all)); },
        .name = [](void *, wl_seat *, const char *) {}};
    wl_seat_add_listener(seat, &seats, this);
    wl_pointer_add_listener(pointer, &pointers, this);
    wl_keyboard_add_listener(keyboard, &keyboards, this);
    wl_touch_add_listener(touch, &touches, this);
}

void ScriptedService::listenToShell()
{
    static const xdg_wm_base_listener listener = {[](void *data, xdg_wm_base *pinging, std::uint32_t serial) {
        self(data).note("ping");
        if (self(data).answersPings)
            xdg_wm_base_pong(pinging, serial);
    }};
    xdg_wm_base_add_listener(shell, &listener, this);
}

void ScriptedService::listenToTextAndData()
{
    static const zwp_text_input_v1_listener texts = [] {
        zwp_text_input_v1_listener l = {};
        using Input = zwp_text_input_v1;
        l.enter = [](void *d, Input *, wl_surface *) { self(d).note("text enter"); };
        l.leave = [](void *d, Input *) { self(d).note("text leave"); };
        l.modifiers_map = [](void *, Input *, wl_array *) {};
        l.input_panel_state = [](void *d, Input *, std::uint32_t state) { self(d).note(line("text panel", state)); };
        l.preedit_string = [](void *d, Input *, std::uint32_t serial, const char *shown, const char *commit) {
            self(d).note(line("text preedit", serial) + " " + shown + " " + commit);
        };
        l.preedit_styling = [](void *, Input *, std::uint32_t, std::uint32_t, std::uint32_t) {};
        l.preedit_cursor = [](void *d, Input *, std::int32_t index) { self(d).note(line("text cursor", index)); };
        l.commit_string = [](void *d, Input *, std::uint32_t serial, const char *committed) {
            self(d).note(line("text commit", serial) + " " + committed);
        };
        l.delete_surrounding_text = [](void *d, Input *, std::int32_t index, std::uint32_t length) {
            self(d).note(line("text delete", index, length));
        };
        return l;
    }();
    static const wl_data_offer_listener offers = [] {
        wl_data_offer_listener l = {};
        l.offer = [](void *d, wl_data_offer *, const char *type) { self(d).note("offer " + text(type)); };
        return l;
    }();
    static const wl_data_device_listener devices = [] {
        wl_data_device_listener l = {};
        l.data_offer = [](void *d, wl_data_device *, wl_data_offer *offer) {
            wl_data_offer_add_listener(offer, &offers, d);
        };
        l.selection = [](void *d, wl_data_device *, wl_data_offer *offer) {
            self(d).note(offer ? "selection" : "selection none");
            self(d).dataOffer = offer;
        };
        return l;
    }();
    zwp_text_input_v1_add_listener(textInput, &texts, this);
    wl_data_device_add_listener(dataDevice, &devices, this);
}
