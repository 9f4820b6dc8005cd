#include "apps/tool/tooloptions.h"

#include "model/csscolor.h"

#include <QCommandLineParser>

#include <algorithm>

namespace favrin::tool {

using model::SomeColor;

namespace {

constexpr auto helpText = R"(Usage: favrin-color-picker [options]
Opens a color picker and prints the color that the user chooses.

  -c, --color COLOR     begin with this color: any CSS form, or "none"
  -t, --title TEXT      headline of the picker
  -s, --suggest [NAME=]COLOR
                        propose a color; may be given many times
      --no-opacity      choose opaque colors only
      --allow-none      let the user choose no color, printed as "none"
  -f, --format FORMAT   hex, hex8, css, json, or a template such as "{red8} {green8} {blue8}"
      --live            print one line of JSON for every pick while the picker is open
  -p, --parent WINDOW   belong to this window: x11:ID or wayland:HANDLE
      --timeout SECONDS give up after this time
  -h, --help            print this text
  -v, --version         print the version

Exit status: 0 chosen, 1 cancelled, 2 wrong usage, 3 failed, 5 timeout. See favrin-color-picker(1).)";

/** Longer than anybody waits, and short enough for a timer. */
constexpr double longestTimeout = 1'000'000;

struct CommandLine
{
    const QCommandLineOption color{{QStringLiteral("c"), QStringLiteral("color")}, {}, QStringLiteral("COLOR")};
    const QCommandLineOption title{{QStringLiteral("t"), QStringLiteral("title")}, {}, QStringLiteral("TEXT")};
    const QCommandLineOption suggest{{QStringLiteral("s"), QStringLiteral("suggest")}, {}, QStringLiteral("COLOR")};
    const QCommandLineOption noOpacity{QStringLiteral("no-opacity")};
    const QCommandLineOption allowNone{QStringLiteral("allow-none")};
    const QCommandLineOption format{{QStringLiteral("f"), QStringLiteral("format")}, {}, QStringLiteral("FORMAT")};
    const QCommandLineOption live{QStringLiteral("live")};
    const QCommandLineOption parent{{QStringLiteral("p"), QStringLiteral("parent")}, {}, QStringLiteral("WINDOW")};
    const QCommandLineOption timeout{QStringLiteral("timeout"), {}, QStringLiteral("SECONDS")};
    const QCommandLineOption help{{QStringLiteral("h"), QStringLiteral("help")}};
    const QCommandLineOption version{{QStringLiteral("v"), QStringLiteral("version")}};
    QCommandLineParser parser;

    CommandLine()
    {
        parser.addOptions({color, title, suggest, noOpacity, allowNone, format, live, parent, timeout, help, version});
    }
};

ParsedOptions mistake(const QString &text)
{
    return {.options = {}, .text = text, .status = ExitStatus::Usage};
}

std::optional<SomeColor> parsedColor(const QString &text)
{
    return model::colorFromCssText(text.toStdString(), SomeColor::ColorSpace::sRGB);
}

/** Everything before the last "=" is the name, which may hold any character; no color holds one. */
std::optional<Suggestion> parsedSuggestion(const QString &text)
{
    const auto separator = text.lastIndexOf(u'=');
    const auto color = parsedColor(text.mid(separator + 1));
    if (!color)
        return std::nullopt;
    return Suggestion{*color, text.left(std::max<qsizetype>(separator, 0)).toStdString()};
}

std::optional<std::chrono::milliseconds> parsedTimeout(const QString &text)
{
    bool isNumber = false;
    const double seconds = text.toDouble(&isNumber);
    if (!isNumber || !(seconds > 0) || seconds > longestTimeout)
        return std::nullopt;
    return std::chrono::ceil<std::chrono::milliseconds>(std::chrono::duration<double>(seconds));
}

/** Empty when the colors are good, else what is wrong with them. */
QString readColors(const CommandLine &line, ToolOptions &options)
{
    if (line.parser.isSet(line.color)) {
        const auto text = line.parser.value(line.color);
        const auto color = parsedColor(text);
        if (!color && text != u"none")
            return QStringLiteral("'%1' is not a color").arg(text);
        if (!color && !options.allowsNoColor)
            return QStringLiteral("the color 'none' needs --allow-none");
        options.color = color;
    }
    const auto suggestions = line.parser.values(line.suggest);
    for (const auto &text : suggestions) {
        const auto suggestion = parsedSuggestion(text);
        if (!suggestion)
            return QStringLiteral("'%1' is not a color to suggest").arg(text);
        options.suggestions.push_back(*suggestion);
    }
    return {};
}

/** Empty when the form of the answer is clear, else what is wrong with it. */
QString readFormat(const CommandLine &line, ToolOptions &options)
{
    if (!line.parser.isSet(line.format)) {
        if (!options.allowsOpacity)
            options.format = OutputFormat::hex();
        return {};
    }
    if (options.reportsLive)
        return QStringLiteral("--live prints JSON and takes no --format");
    const auto text = line.parser.value(line.format);
    const auto format = OutputFormat::parsed(text.toStdString());
    if (!format)
        return QStringLiteral("'%1' is neither a format nor a template").arg(text);
    options.format = *format;
    return {};
}

/** Empty when parent and timeout are good, else what is wrong with them. */
QString readSurroundings(const CommandLine &line, ToolOptions &options)
{
    if (line.parser.isSet(line.parent)) {
        const auto text = line.parser.value(line.parent);
        const auto parent = parsedParentHandle(text);
        if (!parent)
            return QStringLiteral("'%1' is not a parent window, which is x11:ID or wayland:HANDLE").arg(text);
        options.parent = *parent;
    }
    if (line.parser.isSet(line.timeout)) {
        const auto text = line.parser.value(line.timeout);
        options.timeout = parsedTimeout(text);
        if (!options.timeout)
            return QStringLiteral("'%1' is not a time in seconds").arg(text);
    }
    return {};
}

} // namespace

ParsedOptions parseOptions(const QStringList &arguments)
{
    CommandLine line;
    if (!line.parser.parse(arguments))
        return mistake(line.parser.errorText());
    if (line.parser.isSet(line.help))
        return {.options = {}, .text = QString::fromLatin1(helpText)};
    if (line.parser.isSet(line.version))
        return {.options = {}, .text = QStringLiteral("favrin-color-picker " FAVRIN_VERSION)};
    const auto positional = line.parser.positionalArguments();
    if (!positional.isEmpty())
        return mistake(QStringLiteral("unexpected argument '%1'").arg(positional.constFirst()));

    ToolOptions options;
    options.title = line.parser.value(line.title);
    options.allowsOpacity = !line.parser.isSet(line.noOpacity);
    options.allowsNoColor = line.parser.isSet(line.allowNone);
    options.reportsLive = line.parser.isSet(line.live);
    for (const auto &read : {readColors, readFormat, readSurroundings}) {
        const QString wrong = read(line, options);
        if (!wrong.isEmpty())
            return mistake(wrong);
    }
    return {.options = options, .text = {}};
}

} // namespace favrin::tool
