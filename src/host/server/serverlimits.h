#pragma once

#include <array>
#include <cstddef>
#include <string_view>

/**
 * What one service may hold or ask of its host. Beyond these numbers it is disconnected (CloseReason::LimitExceeded),
 * unless the line says otherwise. Requests need no limit of their own: one dispatch() reads at most 4,096 bytes.
 */
namespace favrin::host::server::limits {

struct ObjectLimit
{
    std::string_view interface;
    std::size_t count;
};

/** Live objects of one interface. */
inline constexpr std::array<ObjectLimit, 9> objects = {{
    {"wl_surface", 64},
    {"wl_region", 64},
    {"wl_shm_pool", 64},
    {"wl_buffer", 64},
    {"wl_callback", 256},
    {"xdg_popup", 16},
    {"wl_data_source", 16},
    {"wl_data_offer", 16},
    {"zwp_text_input_v1", 16},
}};
/** Live objects of all interfaces that are not listed above, together. */
inline constexpr std::size_t objectsOfOtherKinds = 64;

/** Shared memory mapped into the host: two 4K screens, five times buffered. */
inline constexpr std::size_t sharedMemoryBytes = 384u * 1024u * 1024u;

/** Open files that came with the service's messages and that no request of it has taken. */
inline constexpr std::size_t strayFiles = 64;

/** Damage rectangles of one frame; more of them become their bounding box. */
inline constexpr std::size_t damageRectangles = 16;

/** Of one clipboard offer, either way; what the host offers beyond them is left out. */
inline constexpr std::size_t mimeTypes = 32;

/** A text field's surroundings; bounded by the largest message anyway. */
inline constexpr std::size_t surroundingTextBytes = 4096;
/** Of one committed or composed text; the host's text is cut. */
inline constexpr std::size_t inputTextBytes = 16384;
/** Of one event; longer texts travel in several. */
inline constexpr std::size_t inputTextBytesPerEvent = 2048;

/** An XKB keymap of the host; a longer one is refused. */
inline constexpr std::size_t keymapBytes = 1024u * 1024u;

/** Kernel bytes that the service has not read yet: from here on, motion is held back. */
inline constexpr int unreadForMotion = 64 * 1024;
/** Kernel bytes that must stay free for events which may not be held back. */
inline constexpr int reserveForEvents = 16 * 1024;

/** Offers of the host's clipboard that the service has not let go of; a new one waits until there are fewer. */
inline constexpr std::size_t clipboardOffers = 8;
/** Questions of prepare_for_display that may be open at a time. */
inline constexpr std::size_t openPreparations = 64;

} // namespace favrin::host::server::limits
