#pragma once

#include "dlf/DlfReader.h"

namespace orvane
{

// What is read of a log in one turn of the main queue: some milliseconds' worth.
class LogSlice
{
public:
    static constexpr std::uint64_t kBytes = 1 << 20;

    // The reader is referred to.
    explicit LogSlice(const DlfReader& reader) : _reader(reader), _start(reader.position()) {}

    // Whether the slice has room for one more item. Ask once for each.
    [[nodiscard]] bool goesOn()
    {
        return ++_items <= kItems && _reader.position() - _start < kBytes;
    }

private:
    static constexpr int kItems = 1000;

    const DlfReader& _reader;
    std::uint64_t _start;
    int _items = 0;
};

} // namespace orvane
