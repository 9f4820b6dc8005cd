#include "spectrum/displayp3bytes.h"

#include "platform/color/rgbconversion.h"

namespace favrin::spectrum {

DisplayP3Bytes::DisplayP3Bytes()
{
    for (std::size_t column = 0; column < m_rows.size(); ++column) {
        platform::Triple unit = {};
        unit[column] = 1.0;
        const platform::Triple converted = platform::linearSRGBToLinearDisplayP3(unit);
        for (std::size_t row = 0; row < m_rows.size(); ++row)
            m_rows[row][column] = static_cast<float>(converted[row] * encodedCount);
    }
    for (std::size_t i = 0; i < m_decoded.size(); ++i)
        m_decoded[i] = static_cast<float>(platform::decodedSRGB(static_cast<double>(i) / decodedCount));
    for (std::size_t i = 0; i < m_encoded.size(); ++i)
        m_encoded[i] = static_cast<float>(platform::encodedSRGB(static_cast<double>(i) / encodedCount) * 255.0 + 0.5);
}

const DisplayP3Bytes &DisplayP3Bytes::instance()
{
    static const DisplayP3Bytes tables;
    return tables;
}

} // namespace favrin::spectrum
