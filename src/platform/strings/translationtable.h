#pragma once

#include <QString>

namespace favrin::platform {

/**
 * Installs the translations of the table "Localizable" for @p locale (BCP 47, such as "de" or "pt-BR") as the string
 * table and yields the tag of the language they are in.
 *
 * Translations are the resources ":/favrin/translations/Localizable_<tag>.qm"; in a file the context is "Localizable"
 * and the source text the key. Of these the language is taken that readers of @p locale read best, so that "de-AT"
 * finds "de"; when none comes near, or @p locale is no tag, English. Of all files only that one is read.
 *
 * Without even English the table is removed, so that every key yields itself, and the tag is empty. Main thread.
 */
QString installTranslations(QStringView locale);

} // namespace favrin::platform
