#include "favorites/favoritesstrings.h"

#include "platform/strings/localizedstring.h"

namespace favrin::favorites {

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
