#include "apps/gallery/galleryoptions.h"

#include <QCommandLineParser>

namespace favrin::gallery {

namespace {

QString defaultTourFolder()
{
    return QStringLiteral("build/tour");
}

/** The parser knows options with a value and without one, but not "--tour" beside "--tour=DIR". */
QStringList withTourFolder(QStringList arguments)
{
    for (QString &argument : arguments) {
        if (argument == QStringLiteral("--tour"))
            argument += u'=' + defaultTourFolder();
    }
    return arguments;
}

} // namespace

ParsedOptions parseOptions(const QStringList &arguments)
{
    const QCommandLineOption help({QStringLiteral("h"), QStringLiteral("help")}, QStringLiteral("Shows this text."));
    const QCommandLineOption tour(QStringLiteral("tour"),
                                  QStringLiteral("Plays a tour by itself and leaves pictures and the list of picks in "
                                                 "DIR, %1 unless given.")
                                      .arg(defaultTourFolder()),
                                  QStringLiteral("DIR"));
    const QCommandLineOption onlyScaled(QStringLiteral("only-scaled-picture"),
                                        QStringLiteral("Of the tour, takes only the picture of a scaled window."));
    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("A poster to color, for trying the color picker in an app."));
    parser.addOptions({help, tour, onlyScaled});

    if (!parser.parse(withTourFolder(arguments)))
        return {.options = {}, .text = parser.errorText(), .isMistake = true};
    if (!parser.positionalArguments().isEmpty())
        return {.options = {},
                .text = QStringLiteral("Unexpected argument '%1'.").arg(parser.positionalArguments().constFirst()),
                .isMistake = true};
    if (parser.isSet(help))
        return {.options = {}, .text = parser.helpText()};

    GalleryOptions options;
    if (parser.isSet(tour))
        options.tourFolder = parser.value(tour);
    options.onlyScaledPicture = parser.isSet(onlyScaled);
    return {.options = options, .text = {}};
}

} // namespace favrin::gallery
