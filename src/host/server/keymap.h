#pragma once

#include "host/server/remoteviewserver.h"

#include <memory>
#include <string>

struct xkb_context;
struct xkb_keymap;

namespace favrin::host::server {

/** The meaning of the keys: an XKB keymap, compiled when it is first needed. */
class Keymap
{
public:
    struct Names
    {
        std::string rules;
        std::string model;
        std::string layout;
        std::string variant;
        std::string options;
    };

    Keymap();
    ~Keymap();

    /** False, and the old keymap stays, when the text or the names make no keymap. An empty text is the default keymap.
     */
    bool setText(const std::string &text);
    bool setNames(const Names &names);

    /** As an XKB text; empty when this machine has no keymaps. */
    const std::string &text() const;
    /** A key of layout @p group, or of any other one, that types @p keysym. */
    std::optional<RemoteViewServer::KeyCode> keyCodeForKeysym(std::uint32_t keysym, std::uint32_t group) const;

private:
    struct ContextDeleter
    {
        void operator()(xkb_context *context) const;
    };
    struct KeymapDeleter
    {
        void operator()(xkb_keymap *keymap) const;
    };
    using Compiled = std::unique_ptr<xkb_keymap, KeymapDeleter>;

    Compiled compile(const Names &names) const;
    bool adopt(Compiled keymap) const;
    xkb_keymap *keymap() const;

    std::unique_ptr<xkb_context, ContextDeleter> m_context;
    mutable Compiled m_keymap;
    mutable std::string m_text;
};

} // namespace favrin::host::server
