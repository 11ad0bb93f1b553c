#include "ui/OrvaneModelNode.h"

#include "platform/ArrayLock.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr const char* kSortedKey = "_sorted";
constexpr const char* kRootName = "Orvane";
constexpr const char* kUnknownValue = "(unknown)";

NodePointer makeNode(std::string_view name, const PropertyValue& value, PathDictionary& paths,
                     const std::string& path);

// "01;Serving Cell" is shown as "Serving Cell"; a key of any other number of parts is kept whole.
std::string_view shownName(std::string_view key)
{
    const std::size_t separator = key.find(';');
    if (separator == std::string_view::npos || key.find(';', separator + 1) != key.npos)
        return key;
    return key.substr(separator + 1);
}

void appendChild(std::vector<NodePointer>& children, std::string_view name,
                 const PropertyValue& value, PathDictionary& paths, const std::string& path)
{
    if (NodePointer child = makeNode(name, value, paths, pathByAppending(path, name)))
        children.push_back(std::move(child));
}

std::vector<NodePointer> childrenOf(const PropertyDictionary& dictionary, PathDictionary& paths,
                                    const std::string& path)
{
    using Entry = const std::pair<std::string, PropertyValue>*;
    std::vector<Entry> entries;
    for (const auto& entry : dictionary)
        entries.push_back(&entry);
    const bool isSorted = dictionary.contains(kSortedKey);
    // By characters, not by numbers: "10;Y" stands before "2;X".
    if (isSorted)
        std::sort(entries.begin(), entries.end(),
                  [](Entry left, Entry right) { return left->first < right->first; });
    std::vector<NodePointer> children;
    for (const Entry entry : entries)
        if (entry->first != kSortedKey)
            appendChild(children, isSorted ? shownName(entry->first) : entry->first, entry->second,
                        paths, path);
    return children;
}

std::vector<NodePointer> childrenOf(const PropertyArray& array, PathDictionary& paths,
                                    const std::string& path)
{
    std::vector<NodePointer> children;
    const ArrayLock::Guard guard;
    for (const PropertyValue& element : array)
        appendChild(children, std::to_string(children.size()), element, paths, path);
    return children;
}

NodePointer makeNode(std::string_view name, const PropertyValue& value, PathDictionary& paths,
                     const std::string& path)
{
    NodePointer node;
    if (const std::string* text = value.asString())
        node = std::make_shared<OrvaneModelLeafNode>(std::string(name), *text);
    else if (const PropertyDictionary* dictionary = value.asDictionary())
        node = std::make_shared<OrvaneModelTreeNode>(std::string(name),
                                                     childrenOf(*dictionary, paths, path));
    else if (const PropertyArray* array = value.asArray())
        node = std::make_shared<OrvaneModelTreeNode>(std::string(name),
                                                     childrenOf(*array, paths, path));
    else
        node = std::make_shared<OrvaneModelLeafNode>(std::string(name), kUnknownValue);
    // Of siblings with one name, the later one is found under their path; both stay in the tree.
    // This is meant.
    paths[path] = node;
    return node;
}

} // namespace

NodePointer OrvaneModelNode::makeTreeFromObject(const PropertyValue& object, PathDictionary& paths)
{
    return makeNode(kRootName, object, paths, "/");
}

std::string pathByAppending(std::string_view path, std::string_view component)
{
    std::string whole(path);
    whole += '/';
    whole += component;
    const auto isDoubled = [](char left, char right) { return left == '/' && right == '/'; };
    whole.erase(std::unique(whole.begin(), whole.end(), isDoubled), whole.end());
    if (whole.size() > 1 && whole.back() == '/')
        whole.pop_back();
    return whole;
}

} // namespace orvane
