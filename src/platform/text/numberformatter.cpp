#include "platform/text/numberformatter.h"

#include <unicode/decimfmt.h>
#include <unicode/locid.h>

#include <cmath>

namespace favrin::platform {

struct NumberFormatter::Format
{
    /** Null where the library has no data. */
    std::unique_ptr<icu::DecimalFormat> decimal;
};

namespace {

icu::Locale icuLocale(const std::string &name)
{
    UErrorCode status = U_ZERO_ERROR;
    icu::Locale locale = icu::Locale::forLanguageTag(name, status);
    if (U_FAILURE(status) || !*locale.getLanguage())
        locale = icu::Locale::createCanonical(name.c_str());
    return locale.isBogus() ? icu::Locale::getEnglish() : locale;
}

UNumberFormatStyle icuStyle(NumberFormatter::Style style)
{
    return style == NumberFormatter::Style::Percent ? UNUM_PERCENT : UNUM_DECIMAL;
}

std::unique_ptr<icu::NumberFormat> numberFormat(NumberFormatter::Style style, const icu::Locale &locale)
{
    UErrorCode status = U_ZERO_ERROR;
    std::unique_ptr<icu::NumberFormat> format(icu::NumberFormat::createInstance(locale, icuStyle(style), status));
    return U_SUCCESS(status) ? std::move(format) : nullptr;
}

std::unique_ptr<icu::DecimalFormat> decimalFormat(NumberFormatter::Style style, const icu::Locale &locale)
{
    auto format = numberFormat(style, locale);
    auto *decimal = dynamic_cast<icu::DecimalFormat *>(format.get());
    if (!decimal)
        return nullptr;
    format.release();
    decimal->setMinimumFractionDigits(0);
    decimal->setMaximumFractionDigits(0);
    decimal->setGroupingUsed(false);
    decimal->setParseIntegerOnly(true);
    decimal->setRoundingMode(icu::NumberFormat::kRoundHalfEven);
    return std::unique_ptr<icu::DecimalFormat>(decimal);
}

std::u16string plain(const icu::UnicodeString &text)
{
    return {text.getBuffer(), static_cast<std::size_t>(text.length())};
}

} // namespace

NumberFormatter::NumberFormatter(Style style, const std::string &locale)
    : m_format(std::make_unique<Format>(Format{decimalFormat(style, icuLocale(locale))}))
{
    // A locale may ask for digits that do not exist.
    if (!m_format->decimal)
        m_format->decimal = decimalFormat(style, icu::Locale::getEnglish());
}

NumberFormatter::~NumberFormatter() = default;

std::optional<std::u16string> NumberFormatter::string(double number) const
{
    if (!m_format->decimal || !std::isfinite(number))
        return std::nullopt;
    icu::UnicodeString text;
    // No minus sign before a zero, nor before what is rounded to one.
    const bool isZero = std::nearbyint(number * m_format->decimal->getMultiplier()) == 0.0;
    m_format->decimal->format(isZero ? 0.0 : number, text);
    return plain(text);
}

std::optional<double> NumberFormatter::number(std::u16string_view text) const
{
    if (!m_format->decimal || text.empty() || text.size() > static_cast<std::size_t>(INT32_MAX))
        return std::nullopt;
    const auto length = static_cast<int32_t>(text.size());
    icu::Formattable result;
    icu::ParsePosition position(0);
    m_format->decimal->parse(icu::UnicodeString(false, text.data(), length), result, position);
    if (position.getIndex() != length)
        return std::nullopt;
    UErrorCode status = U_ZERO_ERROR;
    const double number = result.getDouble(status);
    return U_SUCCESS(status) && !std::isnan(number) ? std::optional(number) : std::nullopt;
}

std::u16string NumberFormatter::percentSymbol() const
{
    const icu::DecimalFormatSymbols *symbols =
        m_format->decimal ? m_format->decimal->getDecimalFormatSymbols() : nullptr;
    return symbols ? plain(symbols->getConstSymbol(icu::DecimalFormatSymbols::kPercentSymbol)) : std::u16string();
}

} // namespace favrin::platform
