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

NodePointer makeNode(std::string_view name, const PropertyValue& value, PathDictionary& paths,
                     const std::string& path)
{
    NodePointer node;
    if (isDisplayGroup(value)) {
        std::optional<ArrayLock::Guard> guard;
        if (value.asArray())
            guard.emplace();
        std::vector<NodePointer> children;
        forEachDisplayChild(value, [&](std::string_view childName, const PropertyValue& child) {
            children.push_back(makeNode(childName, child, paths, pathByAppending(path, childName)));
        });
        node = std::make_shared<OrvaneModelTreeNode>(std::string(name), std::move(children));
    } else {
        const bool isReading = value.asReading() || value.asTextReading();
        node = std::make_shared<OrvaneModelLeafNode>(std::string(name), displayText(value),
                                                     isReading ? value : PropertyValue());
    }
    // Deliberate: of siblings with one name, the later one is found under their path; both stay in
    // the tree.
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
