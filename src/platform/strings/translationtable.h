#pragma once

#include <QStringView>

namespace favrin::platform {

enum class TranslationLoading { Loaded, NotFound };

/**
 * Installs the translations of the table "Localizable" for @p locale (BCP 47, such as "de" or "pt-BR") as the string
 * table. They are the resource ":/favrin/translations/Localizable_<locale>.qm"; without one for the whole tag, its
 * leading subtags are tried, so that "de-AT" finds "de". In the file the context is "Localizable" and the source text
 * the key.
 *
 * Without a file, or for a tag that is none, the table is removed, so that every key yields itself. Main thread.
 */
TranslationLoading installTranslations(QStringView locale);

} // namespace favrin::platform
