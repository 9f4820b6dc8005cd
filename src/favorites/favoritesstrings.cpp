#include "favorites/favoritesstrings.h"

#include "platform/strings/localizedstring.h"
#include "theme/theme.h"

namespace favrin::favorites {

FavoritesStrings::FavoritesStrings(QObject *parent) : QObject(parent)
{
    connect(&theme::Theme::instance(), &theme::Theme::localeChanged, this, &FavoritesStrings::localeChanged);
}

QString FavoritesStrings::favorites()
{
    return QString::fromStdString(
        platform::localizedString("Favorites", "Label for the container of the added favorite colors"));
}

QString FavoritesStrings::deleteCommand()
{
    return QString::fromStdString(platform::localizedString("Delete", "Command that deletes a favorite color"));
}

} // namespace favrin::favorites
