#include "recordings/SnapshotTree.h"

#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

constexpr const char* kDescriptionRow = "Description";
constexpr const char* kTimestampRow = "Saved";

// By description and date, each name once.
std::string nameOf(const Snapshot::Entry& entry, const PropertyDictionary& taken)
{
    std::string name = entry.description;
    if (!entry.date.empty() && name.find(entry.date) == std::string::npos)
        name += (name.empty() ? "" : " ") + ("(" + entry.date + ")");
    if (name.empty())
        name = "Entry";
    std::string unique = name;
    for (int i = 2; taken.contains(unique); ++i)
        unique = name + " " + std::to_string(i);
    return unique;
}

} // namespace

SnapshotTree::SnapshotTree(const Snapshot& snapshot)
{
    const PropertyValue rows = PropertyValue::dictionaryOf({
        {kDescriptionRow, snapshot.description},
        {kTimestampRow,   snapshot.timestamp  }
    });
    for (const Snapshot::Entry& entry : snapshot.entries) {
        const std::string name = nameOf(entry, *rows.asDictionary());
        rows.asDictionary()->set(name,
                                 entry.display ? entry.display : PropertyValue::newDictionary());
        const std::string path = pathByAppending("/", name);
        _groups[path] = {path, entry.date, entry.log};
    }
    _root = OrvaneModelNode::makeTreeFromObject(rows, _nodes);
}

NodePointer SnapshotTree::nodeAtPath(const std::string& path) const
{
    const auto found = _nodes.find(path);
    return found == _nodes.end() ? nullptr : found->second;
}

const SnapshotTree::Group* SnapshotTree::groupOf(const std::string& path) const
{
    for (const auto& [groupPath, group] : _groups)
        if (isWithin(path, groupPath))
            return &group;
    return nullptr;
}

bool isWithin(const std::string& path, const std::string& group)
{
    return path.starts_with(group) &&
           (path.size() == group.size() || group == "/" || path[group.size()] == '/');
}

} // namespace orvane
