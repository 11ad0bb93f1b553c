#include "ui/tree/OrvaneModelNode.h"

#include "platform/base/ArrayLock.h"
#include "ui/tree/DisplayWalk.h"

#include <algorithm>
#include <optional>

namespace orvane
{

namespace
{

constexpr const char* kRootName = "Orvane";

NodePointer makeNode(std::string_view name, const PropertyValue& value)
{
    if (!isDisplayGroup(value)) {
        const bool isReading = value.asReading() || value.asTextReading();
        return std::make_shared<OrvaneModelLeafNode>(std::string(name), displayText(value),
                                                     isReading ? value : PropertyValue());
    }
    std::optional<ArrayLock::Guard> guard;
    if (value.asArray())
        guard.emplace();
    std::vector<NodePointer> children;
    forEachDisplayChild(value, [&](std::string_view childName, const PropertyValue& child) {
        children.push_back(makeNode(childName, child));
    });
    return std::make_shared<OrvaneModelTreeNode>(std::string(name), std::move(children));
}

// The node that `rest` leads to from the node: "" or "/NAME/...". A name may hold slashes itself.
NodePointer nodeBelow(const NodePointer& node, std::string_view rest)
{
    if (rest.empty())
        return node;
    const auto* children = node->childNodes();
    if (!children)
        return nullptr;
    // Deliberate: of siblings with one name, the later one is found under their path; both stay in
    // the tree.
    for (auto child = children->rbegin(); child != children->rend(); ++child) {
        const std::string step = pathByAppending("", (*child)->displayName());
        const std::size_t length = step.size() > 1 ? step.size() : 0; // an empty name is no step
        const bool leadsThere = length == 0 || (rest.starts_with(step) &&
                                                (rest.size() == length || rest[length] == '/'));
        if (leadsThere)
            if (const NodePointer found = nodeBelow(*child, rest.substr(length)))
                return found;
    }
    return nullptr;
}

} // namespace

NodePointer OrvaneModelNode::makeTreeFromObject(const PropertyValue& object, PathDictionary& paths)
{
    paths._root = makeNode(kRootName, object);
    return paths._root;
}

NodePointer PathDictionary::at(std::string_view path) const
{
    if (!_root || !path.starts_with('/'))
        return nullptr;
    return nodeBelow(_root, path.size() == 1 ? std::string_view() : path);
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
