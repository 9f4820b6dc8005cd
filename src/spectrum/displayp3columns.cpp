#include "spectrum/displayp3columns.h"

#include <algorithm>

namespace favrin::spectrum {

namespace {

using Columns = DisplayP3Columns;

constexpr std::size_t red = 0;
constexpr std::size_t green = 1;
constexpr std::size_t blue = 2;

/** The opaque pixel of the bytes of red and green at two places. */
inline std::uint32_t redAndGreenPixel(const DisplayP3Bytes &bytes, float redPlace, float greenPlace)
{
    return 0xff000000U | (bytes.byteInBits16(redPlace) & 0xff0000U) |
           ((bytes.byteInBits16(greenPlace) >> 8U) & 0xff00U);
}

// In each of the following two, first comes what the vector units do, and then the looking up, which they cannot.

// Blue is the same primary in both spaces: its light leaves red and green alone.
[[gnu::always_inline]] inline void writeBlue(const Columns::Run &run, const Columns::HueParts &hue,
                                             const DisplayP3Bytes &bytes, std::uint32_t *pixels)
{
    const float gain = DisplayP3Bytes::fromLinearSRGB()[blue][blue];
    Columns::Values places;
    for (std::size_t i = 0; i < places.size(); ++i) {
        const float light = DisplayP3Bytes::light(lit(hue.component, run.bases[i], run.factors[i]));
        places[i] = run.places[blue][i] + gain * light;
    }
    for (std::size_t i = 0; i < places.size(); ++i)
        pixels[i] = run.redAndGreen[i] | (bytes.byteInBits16(places[i]) >> 16U);
}

[[gnu::always_inline]] inline void writeAll(const Columns::Run &run, const Columns::HueParts &hue,
                                            const DisplayP3Bytes &bytes, std::uint32_t *pixels)
{
    const auto &matrix = DisplayP3Bytes::fromLinearSRGB();
    const std::array gains = {matrix[red][hue.moving], matrix[green][hue.moving], matrix[blue][hue.moving]};
    std::array<Columns::Values, 3> places;
    for (std::size_t i = 0; i < places[red].size(); ++i) {
        const float light = DisplayP3Bytes::light(lit(hue.component, run.bases[i], run.factors[i]));
        places[red][i] = run.places[red][i] + gains[red] * light;
        places[green][i] = run.places[green][i] + gains[green] * light;
        places[blue][i] = run.places[blue][i] + gains[blue] * light;
    }
    for (std::size_t i = 0; i < places[red].size(); ++i) {
        pixels[i] =
            redAndGreenPixel(bytes, places[red][i], places[green][i]) | (bytes.byteInBits16(places[blue][i]) >> 16U);
    }
}

[[gnu::always_inline]] inline void writeRun(const Columns::Run &run, const Columns::HueParts &hue,
                                            const DisplayP3Bytes &bytes, std::uint32_t *pixels)
{
    if (hue.moving == blue)
        writeBlue(run, hue, bytes, pixels);
    else
        writeAll(run, hue, bytes, pixels);
}

using WriteRun = void (*)(const Columns::Run &run, const Columns::HueParts &hue, const DisplayP3Bytes &bytes,
                          std::uint32_t *pixels);

// The wider vector units of most processors make this a third faster, and give the same pixels.
#if defined(__x86_64__)
[[gnu::target("avx2")]] void writeRunByAVX2(const Columns::Run &run, const Columns::HueParts &hue,
                                            const DisplayP3Bytes &bytes, std::uint32_t *pixels)
{
    writeRun(run, hue, bytes, pixels);
}

WriteRun runWriter()
{
    return __builtin_cpu_supports("avx2") ? writeRunByAVX2 : writeRun;
}
#else
WriteRun runWriter()
{
    return writeRun;
}
#endif

} // namespace

DisplayP3Columns::HueParts::HueParts(const FieldColor &hue)
{
    const std::array components = {hue.r, hue.g, hue.b};
    full = static_cast<std::size_t>(std::ranges::max_element(components) - components.begin());
    zero = static_cast<std::size_t>(std::ranges::min_element(components) - components.begin());
    moving = red + green + blue - full - zero;
    component = components[moving];
}

DisplayP3Columns::DisplayP3Columns(const FieldColumns &columns)
    : m_count(columns.bases.size()), m_runs((m_count + runLength - 1) / runLength)
{
    // The last column stands in for those that the last run lacks.
    for (std::size_t i = 0; i < m_runs.size() * runLength; ++i) {
        const std::size_t column = std::min(i, m_count - 1);
        m_runs[i / runLength].bases[i % runLength] = columns.bases[column];
        m_runs[i / runLength].factors[i % runLength] = columns.factors[column];
    }
}

void DisplayP3Columns::setFixedParts(Run &run, const HueParts &hue) const
{
    const auto &matrix = DisplayP3Bytes::fromLinearSRGB();
    for (std::size_t i = 0; i < runLength; ++i) {
        const float full = DisplayP3Bytes::light(lit(1.0F, run.bases[i], run.factors[i]));
        const float zero = DisplayP3Bytes::light(lit(0.0F, run.bases[i], run.factors[i]));
        for (std::size_t row = 0; row < matrix.size(); ++row) {
            run.places[row][i] =
                DisplayP3Bytes::lightZero + matrix[row][hue.full] * full + matrix[row][hue.zero] * zero;
        }
        run.redAndGreen[i] = redAndGreenPixel(m_bytes, run.places[red][i], run.places[green][i]);
    }
}

void DisplayP3Columns::writeRow(const FieldColor &hue, std::uint32_t *pixels)
{
    static const WriteRun write = runWriter();
    const HueParts parts(hue);
    if (!m_fixed || !parts.hasFixedPartsOf(*m_fixed)) {
        for (Run &run : m_runs)
            setFixedParts(run, parts);
        m_fixed = parts;
    }
    const std::size_t whole = m_count / runLength;
    for (std::size_t i = 0; i < whole; ++i)
        write(m_runs[i], parts, m_bytes, pixels + i * runLength);
    if (whole < m_runs.size()) {
        Pixels last;
        write(m_runs[whole], parts, m_bytes, last.data());
        std::copy_n(last.begin(), m_count - whole * runLength, pixels + whole * runLength);
    }
}

} // namespace favrin::spectrum
