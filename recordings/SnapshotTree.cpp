#include "recordings/SnapshotTree.h"

#include "platform/base/PropertyValue.h"
#include "ui/tree/DisplayWalk.h"

#include <unordered_map>

namespace orvane
{

namespace
{

constexpr const char* kDescriptionRow = "Description";
constexpr const char* kTimestampRow = "Saved";

// Names the entries by description and date, each name once.
class EntryNames
{
public:
    explicit EntryNames(const PropertyDictionary& taken) : _taken(taken) {}

    std::string nameOf(const Snapshot::Entry& entry)
    {
        std::string name = entry.description;
        if (!entry.date.empty() && name.find(entry.date) == std::string::npos)
            name += (name.empty() ? "" : " ") + ("(" + entry.date + ")");
        if (name.empty())
            name = "Entry";
        name = shownName(name);
        std::string unique = name;
        // Entries of one name go on counting where the one before stopped.
        for (std::size_t& count = _counts.try_emplace(name, 1).first->second;
             _taken.contains(unique);)
            unique = name + " " + std::to_string(++count);
        return unique;
    }

private:
    const PropertyDictionary& _taken;
    std::unordered_map<std::string, std::size_t> _counts;
};

} // namespace

SnapshotTree::SnapshotTree(const Snapshot& snapshot)
{
    const PropertyValue rows = PropertyValue::dictionaryOf({
        {kDescriptionRow, snapshot.description},
        {kTimestampRow,   snapshot.timestamp  }
    });
    EntryNames names(*rows.asDictionary());
    for (const Snapshot::Entry& entry : snapshot.entries) {
        const std::string name = names.nameOf(entry);
        rows.asDictionary()->set(name,
                                 entry.display ? entry.display : PropertyValue::newDictionary());
        const std::string path = pathByAppending("/", name);
        _groups[path] = {path, entry.date, entry.log};
    }
    _root = OrvaneModelNode::makeTreeFromObject(rows, _nodes);
}

NodePointer SnapshotTree::nodeAtPath(const std::string& path) const { return _nodes.at(path); }

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
