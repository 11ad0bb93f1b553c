// Any file. Items lie inside it, one after the other, and every byte is counted.

#include "dlf/DlfReader.h"
#include "dlf/DlfTime.h"
#include "platform/base/LogMessage.h"

#include <cstdint>
#include <cstdlib>

namespace
{

void require(bool holds)
{
    if (!holds)
        std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const orvane::ByteView file(data, size);
    orvane::DlfReader reader(file);
    std::uint64_t end = 0;
    std::uint64_t placed = 0;
    while (const auto item = reader.next()) {
        require(item->position >= end && item->bytes.size() >= 12 && item->logCode != 0);
        require(item->type == 1 || item->type == 0xFF);
        end = item->position + item->bytes.size();
        require(end <= size && item->bytes.data() == data + item->position);
        require(item->bytes[0] + 256U * item->bytes[1] == item->bytes.size());
        require(item->bytes[2] + 256U * item->bytes[3] == item->logCode);
        placed += item->bytes.size();
        require(placed == reader.placedBytes());
        require(placed + reader.separatorBytes() + reader.unplacedBytes() == end);
        require(orvane::dlfSecondsSince1970(item->timestamp) >= orvane::kLogEpochSeconds);
    }
    require(!reader.next());
    require(placed + reader.separatorBytes() + reader.unplacedBytes() == size);

    std::uint64_t last = 0;
    std::uint64_t unplaced = 0;
    for (const auto& range : reader.unplacedRanges()) {
        require(range.length > 0 && range.position >= last);
        last = range.position + range.length;
        require(last <= size);
        unplaced += range.length;
    }
    const bool listed = reader.unplacedRangeCount() == reader.unplacedRanges().size();
    require(listed ? unplaced == reader.unplacedBytes() : unplaced < reader.unplacedBytes());
    return 0;
}
