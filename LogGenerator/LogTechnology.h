#pragma once

#include "dlf/DlfReader.h"
#include "platform/base/Bytes.h"

#include <cstdint>
#include <optional>
#include <string>
#include <unordered_map>

namespace orvane
{

// Finds the technology of a recording by the log codes of its items.
class TechnologyFinder
{
public:
    // Items of the server, and version reports, count for no technology.
    void take(const DlfItem& item);
    // The technology constant of the generator that knows most of the items taken; of equals the
    // one with fewer codes of its own. Nothing when none knows any. Generators that need a template
    // are asked only where the process's resources have it.
    [[nodiscard]] std::optional<std::string> technology() const;

private:
    std::unordered_map<std::uint16_t, std::uint64_t> _itemsByCode;
};

// The technology of all items that the reader still has to read.
std::optional<std::string> technologyOfItems(DlfReader reader);
// The technology of a whole recording in memory.
std::optional<std::string> technologyOfLog(ByteView file);

} // namespace orvane
