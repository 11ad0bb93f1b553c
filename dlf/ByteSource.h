#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>

namespace orvane
{

// Where the reader of a log takes the bytes from: a file of any length, of which only a window need
// be in memory.
class ByteSource
{
public:
    virtual ~ByteSource() = default;
    // In bytes. Becomes less where bytes turn out not to be there any more, never more.
    [[nodiscard]] virtual std::uint64_t size() const = 0;
    // The bytes from `position` on: `count` of them or more, or all up to the end where there are
    // fewer. They stay until the next call.
    [[nodiscard]] virtual ByteView bytes(std::uint64_t position, std::size_t count) = 0;
};

// Bytes in memory, not owned.
class MemorySource final : public ByteSource
{
public:
    explicit MemorySource(ByteView content) : _content(content) {}

    [[nodiscard]] std::uint64_t size() const override { return _content.size(); }
    [[nodiscard]] ByteView bytes(std::uint64_t position, std::size_t) override
    {
        return position < _content.size() ? _content.subspan(position) : ByteView();
    }

private:
    ByteView _content;
};

} // namespace orvane
