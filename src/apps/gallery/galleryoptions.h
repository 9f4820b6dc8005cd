#pragma once

#include <QString>
#include <QStringList>

#include <optional>

namespace favrin::gallery {

/** What the command line asks for. */
struct GalleryOptions
{
    /** Where the tour leaves its pictures; without one the app is for a person. */
    std::optional<QString> tourFolder;
    /** Of the tour, only the one picture at the window's own scale factor. */
    bool onlyScaledPicture = false;
};

/** The options in @p arguments, or a text for whoever typed them: the mistake, or the help that was asked for. */
struct ParsedOptions
{
    std::optional<GalleryOptions> options;
    QString text;
    bool isMistake = false;
};

ParsedOptions parseOptions(const QStringList &arguments);

} // namespace favrin::gallery
