#include "host/server/keymap.h"

#include "host/server/serverlimits.h"

#include <cstdlib>

#include <xkbcommon/xkbcommon.h>

namespace favrin::host::server {

namespace {

/** XKB counts keys from here. */
constexpr std::uint32_t evdevOffset = 8;

bool types(xkb_keymap *keymap, xkb_keycode_t key, xkb_layout_index_t layout, xkb_level_index_t level,
           std::uint32_t keysym)
{
    const xkb_keysym_t *syms = nullptr;
    return xkb_keymap_key_get_syms_by_level(keymap, key, layout, level, &syms) == 1 && syms[0] == keysym;
}

std::optional<RemoteViewServer::KeyCode> search(xkb_keymap *keymap, xkb_layout_index_t layout, std::uint32_t keysym)
{
    // Few modifiers come first, so that a key that types the symbol as it is wins over one that needs shift.
    for (xkb_level_index_t level = 0; level < 8; ++level) {
        for (xkb_keycode_t key = xkb_keymap_min_keycode(keymap); key <= xkb_keymap_max_keycode(keymap); ++key) {
            if (key < evdevOffset || level >= xkb_keymap_num_levels_for_key(keymap, key, layout) ||
                !types(keymap, key, layout, level, keysym))
                continue;
            xkb_mod_mask_t modifiers = 0;
            if (level == 0 || xkb_keymap_key_get_mods_for_level(keymap, key, layout, level, &modifiers, 1) == 1)
                return RemoteViewServer::KeyCode{key - evdevOffset, modifiers};
        }
    }
    return std::nullopt;
}

} // namespace

void Keymap::ContextDeleter::operator()(xkb_context *context) const
{
    xkb_context_unref(context);
}

void Keymap::KeymapDeleter::operator()(xkb_keymap *keymap) const
{
    xkb_keymap_unref(keymap);
}

Keymap::Keymap() : m_context(xkb_context_new(XKB_CONTEXT_NO_FLAGS))
{
    if (m_context)
        xkb_context_set_log_level(m_context.get(), XKB_LOG_LEVEL_CRITICAL);
}

Keymap::~Keymap() = default;

bool Keymap::setText(const std::string &text)
{
    if (text.empty())
        return setNames({});
    if (!m_context || text.size() > limits::keymapBytes)
        return false;
    return adopt(Compiled(xkb_keymap_new_from_buffer(m_context.get(), text.data(), text.size(),
                                                     XKB_KEYMAP_FORMAT_TEXT_V1, XKB_KEYMAP_COMPILE_NO_FLAGS)));
}

bool Keymap::setNames(const Names &names)
{
    return adopt(compile(names));
}

const std::string &Keymap::text() const
{
    keymap();
    return m_text;
}

std::optional<RemoteViewServer::KeyCode> Keymap::keyCodeForKeysym(std::uint32_t keysym, std::uint32_t group) const
{
    if (!keymap())
        return std::nullopt;
    if (const auto found = search(keymap(), group, keysym))
        return found;
    for (xkb_layout_index_t layout = 0; layout < xkb_keymap_num_layouts(keymap()); ++layout) {
        if (const auto found = search(keymap(), layout, keysym))
            return found;
    }
    return std::nullopt;
}

Keymap::Compiled Keymap::compile(const Names &names) const
{
    if (!m_context)
        return nullptr;
    // An empty text is taken for a name, a null pointer for the default.
    const auto orDefault = [](const std::string &name) { return name.empty() ? nullptr : name.c_str(); };
    const xkb_rule_names rules = {orDefault(names.rules), orDefault(names.model), orDefault(names.layout),
                                  orDefault(names.variant), orDefault(names.options)};
    return Compiled(xkb_keymap_new_from_names(m_context.get(), &rules, XKB_KEYMAP_COMPILE_NO_FLAGS));
}

bool Keymap::adopt(Compiled keymap) const
{
    char *text = keymap ? xkb_keymap_get_as_string(keymap.get(), XKB_KEYMAP_FORMAT_TEXT_V1) : nullptr;
    if (!text)
        return false;
    m_text = text;
    std::free(text);
    m_keymap = std::move(keymap);
    return true;
}

xkb_keymap *Keymap::keymap() const
{
    if (!m_keymap)
        adopt(compile({}));
    return m_keymap.get();
}

} // namespace favrin::host::server
