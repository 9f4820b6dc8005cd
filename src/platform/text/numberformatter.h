#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace favrin::platform {

/**
 * Writes and reads numbers as people of one locale do: their digits, their percent sign and its spacing. Immutable,
 * usable on any thread; making one takes a while, so keep it. Text is UTF-16.
 */
class NumberFormatter
{
public:
    enum class Style {
        /** Whole numbers without grouping. */
        Integer,
        /** Whole percentages: 0.5 is 50 %. */
        Percent
    };

    /** @param locale BCP 47, or the locale's ICU name; one that is not known gets its language's or English habits. */
    NumberFormatter(Style style, const std::string &locale);
    ~NumberFormatter();
    NumberFormatter(const NumberFormatter &) = delete;
    NumberFormatter &operator=(const NumberFormatter &) = delete;

    /** @p number rounded to what the style shows, decimal ties to even. None where the locale gives no text. */
    std::optional<std::u16string> string(double number) const;

    /**
     * The number that the whole of @p text is; digits of any script count. None for any other text. A number too large
     * for exactness comes out rounded, never wrapped.
     */
    std::optional<double> number(std::u16string_view text) const;

    /** The locale's percent sign with what belongs to it, such as a direction mark. */
    std::u16string percentSymbol() const;

private:
    struct Format;
    std::unique_ptr<Format> m_format;
};

} // namespace favrin::platform
