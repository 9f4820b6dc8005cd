#include "platform/strings/languagematch.h"

#include <unicode/localematcher.h>

namespace favrin::platform {

namespace {

icu::Locale localeOf(std::string_view tag, UErrorCode &status)
{
    return icu::Locale::forLanguageTag(icu::StringPiece(tag.data(), static_cast<int32_t>(tag.size())), status);
}

} // namespace

std::string bestLanguage(std::string_view desired, const std::vector<std::string> &supported)
{
    UErrorCode status = U_ZERO_ERROR;
    const icu::Locale wanted = localeOf(desired, status);
    std::vector<icu::Locale> locales;
    locales.reserve(supported.size());
    for (const std::string &tag : supported)
        locales.push_back(localeOf(tag, status));
    if (U_FAILURE(status) || wanted.isBogus())
        return {};
    const auto matcher = icu::LocaleMatcher::Builder()
                             .setSupportedLocales(locales.begin(), locales.end())
                             .setNoDefaultLocale()
                             .build(status);
    const auto result = matcher.getBestMatchResult(wanted, status);
    const int32_t index = U_SUCCESS(status) ? result.getSupportedIndex() : -1;
    return index < 0 ? std::string() : supported[static_cast<std::size_t>(index)];
}

} // namespace favrin::platform
