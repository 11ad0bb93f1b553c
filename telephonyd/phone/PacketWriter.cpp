#include "telephonyd/phone/PacketWriter.h"

#include <algorithm>
#include <cmath>

namespace orvane
{

PacketWriter& PacketWriter::put(std::uint32_t value, unsigned width)
{
    _usedBits = 0;
    for (unsigned i = 0; i < width; ++i)
        _bytes.push_back(static_cast<std::uint8_t>(value >> 8 * i & 0xFF));
    return *this;
}

PacketWriter& PacketWriter::skip(std::size_t count)
{
    _usedBits = 0;
    _bytes.resize(_bytes.size() + count);
    return *this;
}

PacketWriter& PacketWriter::bits(std::uint32_t value, unsigned width)
{
    for (unsigned i = 0; i < width; ++i) {
        if (_usedBits == 0)
            _bytes.push_back(0);
        const unsigned bit = value >> i & 1U;
        _bytes.back() = static_cast<std::uint8_t>(_bytes.back() | bit << _usedBits);
        _usedBits = (_usedBits + 1) % 8;
    }
    return *this;
}

PacketWriter& PacketWriter::append(ByteView bytes)
{
    _usedBits = 0;
    _bytes.insert(_bytes.end(), bytes.begin(), bytes.end());
    return *this;
}

std::uint32_t rawValue(double value, double zero, double step, unsigned width)
{
    const double most = std::exp2(width) - 1;
    return static_cast<std::uint32_t>(std::clamp(std::round((value - zero) / step), 0.0, most));
}

} // namespace orvane
