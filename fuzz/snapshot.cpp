// Any property list as a snapshot file: it is shown as a tree, and its logs are played.

#include "LogGenerator/LogTechnology.h"
#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/Services.h"
#include "recordings/SeekableLog.h"
#include "recordings/SnapshotTree.h"
#include "ui/tree/OrvaneModelNode.h"

#include <cstdint>
#include <cstdlib>

namespace
{

using namespace orvane;

void require(bool holds)
{
    if (!holds)
        std::abort();
}

// Every node is found. A row has a value, a group has none.
std::size_t walk(const SnapshotTree& tree, const OrvaneModelNode& node)
{
    std::size_t nodes = 1;
    require((node.value() == nullptr) == (node.childNodes() != nullptr));
    if (const auto* children = node.childNodes())
        for (const NodePointer& child : *children)
            nodes += walk(tree, *child);
    return nodes;
}

void play(const std::shared_ptr<ByteSource>& log)
{
    const ByteView bytes = log->bytes(0, static_cast<std::size_t>(log->size()));
    const auto technology = technologyOfLog(bytes);
    if (!technology)
        return;
    SeekableLog timeline(log, "fuzzed.dlf", *technology);
    while (timeline.readSlice()) {
    }
    const PropertyValue atEnd = timeline.display().deepCopy();
    timeline.moveTo(timeline.duration() / 2);
    timeline.moveToNextServingCell();
    timeline.moveTo(LogTime(0));
    timeline.moveTo(timeline.duration());
    require(timeline.display() == atEnd);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static DirectoryResources resources(ORVANE_RESOURCES);
    Services::current().setResources(&resources);
    const auto snapshot = snapshotFrom(readPropertyList({data, size}).value);
    if (!snapshot)
        return 0;
    const SnapshotTree tree(*snapshot);
    require(walk(tree, *tree.root()) > snapshot->entries.size());
    for (const Snapshot::Entry& entry : snapshot->entries) {
        require(!entry.secondsOfDate || entry.isoDate().has_value());
        if (entry.log)
            play(entry.log);
    }
    return 0;
}
