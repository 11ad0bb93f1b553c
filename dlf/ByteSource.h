#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>

namespace orvane
{

// The bytes of a log: a file of any length, of which only a window has to be in memory.
class ByteSource
{
public:
    virtual ~ByteSource() = default;
    // In bytes. Becomes less if bytes turn out to be gone, never more.
    [[nodiscard]] virtual std::uint64_t size() const = 0;
    // The bytes from `position` on: `count` or more, or all up to the end if there are fewer. They
    // stay valid until the next call.
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
