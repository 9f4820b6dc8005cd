#pragma once

#include "apps/tool/exitstatus.h"
#include "apps/tool/outputformat.h"
#include "apps/tool/parenthandle.h"

#include <QString>
#include <QStringList>

#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace favrin::tool {

/** A color that the caller proposes; its name is printed when the user chooses it. */
struct Suggestion
{
    model::SomeColor color;
    std::string name;
};

/** What the command line asks for. */
struct ToolOptions
{
    /** The color to begin with; unset when none was given, no color when that is what was given. */
    std::optional<Choice> color;
    /** Null shows the picker's own. */
    QString title;
    std::vector<Suggestion> suggestions;
    bool allowsOpacity = true;
    bool allowsNoColor = false;
    bool reportsLive = false;
    OutputFormat format = OutputFormat::hexWithOpacity();
    ParentHandle parent;
    std::optional<std::chrono::milliseconds> timeout;
};

/** The options in a command line, or a text for whoever typed it: the mistake, or the help that was asked for. */
struct ParsedOptions
{
    std::optional<ToolOptions> options;
    QString text;
    ExitStatus status = ExitStatus::Chosen;
};

/** @p arguments begins with the program's name. Needs no application object. */
ParsedOptions parseOptions(const QStringList &arguments);

} // namespace favrin::tool
