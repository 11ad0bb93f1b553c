#pragma once

#include "recordings/Snapshot.h"
#include "ui/tree/OrvaneModelNode.h"

#include <map>
#include <memory>
#include <string>

namespace orvane
{

// A snapshot as a tree: rows for description and time, and a group for each entry with the display
// as it was. The group of a log is empty; a player fills it.
class SnapshotTree
{
public:
    explicit SnapshotTree(const Snapshot& snapshot);

    [[nodiscard]] const NodePointer& root() const { return _root; }
    // The node under that path or null.
    [[nodiscard]] NodePointer nodeAtPath(const std::string& path) const;

    // The group of the entry that the path is in (or leads to): its own path, when it was saved and
    // its log, if that is what it holds. Null for the root and the rows beside the groups.
    struct Group {
        std::string path;
        std::string date;
        std::shared_ptr<ByteSource> log;
    };
    [[nodiscard]] const Group* groupOf(const std::string& path) const;

private:
    NodePointer _root;
    PathDictionary _nodes;
    std::map<std::string, Group> _groups; // by path
};

// Whether the path is that of the group or of something in it.
bool isWithin(const std::string& path, const std::string& group);

} // namespace orvane
