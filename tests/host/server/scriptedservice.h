#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "favrin-remote-view-v1-client-protocol.h"
#include "text-input-unstable-v1-client-protocol.h"
#include "xdg-shell-client-protocol.h"
#include <wayland-client.h>

/**
 * The other end of the socket, done by hand on libwayland-client: does exactly what a test tells it, right or wrong,
 * and keeps every event as a line of text: what kind of device it is of, its name, and its arguments without serials,
 * times and objects.
 */
class ScriptedService
{
public:
    explicit ScriptedService(int descriptor);
    ~ScriptedService();
    ScriptedService(const ScriptedService &) = delete;
    ScriptedService &operator=(const ScriptedService &) = delete;

    /** Sends what was asked for; true when there was anything. */
    void flush();
    /** Handles the events that are there; false when there are none. */
    bool read();
    /** Binds everything that is offered, at the version offered. */
    void bindAll();
    /** Makes the toplevel; its first configure comes after the next exchange. */
    void makeToplevel();
    /** Answers the configure events so far. */
    void acknowledge();

    /** Pixels of one color. The caller destroys it. */
    wl_buffer *makeBuffer(int width, int height, std::uint32_t pixel, std::uint32_t format = WL_SHM_FORMAT_ARGB8888);
    /** A pool of this many bytes over @p descriptor, or over new memory for -1. */
    wl_shm_pool *makePool(int bytes, int *descriptor = nullptr);
    /** Attaches, damages everything, and commits. */
    void commit(wl_buffer *buffer, int width, int height);

    /** Lines that begin with @p prefix. */
    std::vector<std::string> eventsOf(const std::string &prefix) const;
    /** Notes the events of this one too. */
    void listenTo(void *proxy);

    wl_display *display;
    wl_registry *registry = nullptr;
    std::map<std::string, std::pair<std::uint32_t, std::uint32_t>> globals;
    wl_compositor *compositor = nullptr;
    wl_shm *shm = nullptr;
    wl_seat *seat = nullptr;
    wl_pointer *pointer = nullptr;
    wl_keyboard *keyboard = nullptr;
    wl_touch *touch = nullptr;
    xdg_wm_base *shell = nullptr;
    zwp_text_input_manager_v1 *textInputManager = nullptr;
    zwp_text_input_v1 *textInput = nullptr;
    wl_data_device_manager *dataDeviceManager = nullptr;
    wl_data_device *dataDevice = nullptr;
    wl_data_offer *dataOffer = nullptr;
    favrin_remote_view_v1 *view = nullptr;
    wl_surface *surface = nullptr;
    xdg_surface *xdgSurface = nullptr;
    xdg_toplevel *toplevel = nullptr;

    std::vector<std::string> events;
    std::vector<std::uint32_t> configureSerials;
    std::uint32_t inputSerial = 0;
    bool answersPings = true;
    /** The arrays of the picker's own events, by their names. */
    std::map<std::string, std::vector<std::vector<double>>> numbers;
    std::string keymap;
    bool keymapIsWritable = false;

private:
    static int hear(const void *, void *target, std::uint32_t, const wl_message *message, wl_argument *arguments);
    void react(std::string_view event, const wl_argument *arguments);
};
