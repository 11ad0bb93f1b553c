#pragma once

#include "platform/base/PropertyValue.h"

#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace orvane
{

class OrvaneModelNode;

// Nodes are shared: by their parent, by the path dictionary and by a pane that still shows one
// after the tree was dropped. They never change.
using NodePointer = std::shared_ptr<const OrvaneModelNode>;

// Finds the nodes of a tree by their paths ("/Serving Cell Info/Cell Identity"; the root's is "/").
// It holds the tree and no path: the paths of all nodes can be far larger than the tree.
class PathDictionary
{
public:
    // The node under that path; null if there is none. Of several nodes under one path, a parent
    // comes before its children, and of siblings the later one first.
    [[nodiscard]] NodePointer at(std::string_view path) const;
    void clear() { _root = nullptr; }

private:
    friend class OrvaneModelNode;
    NodePointer _root;
};

// A named node of the display tree.
class OrvaneModelNode
{
public:
    explicit OrvaneModelNode(std::string displayName) : name(std::move(displayName)) {}
    virtual ~OrvaneModelNode() = default;

    [[nodiscard]] const std::string& displayName() const { return name; }
    // Null for a row: only groups have child nodes, possibly none.
    [[nodiscard]] virtual const std::vector<NodePointer>* childNodes() const { return nullptr; }
    // The shown value; null for a group.
    [[nodiscard]] virtual const std::string* value() const { return nullptr; }
    // The reading that the value shows; absent where it shows none.
    [[nodiscard]] virtual PropertyValue reading() const { return {}; }

    // Turns a display into a tree whose root is named "Orvane", the tree of `paths` from then on.
    // An absent display gives a leaf of the value "(unknown)".
    static NodePointer makeTreeFromObject(const PropertyValue& object, PathDictionary& paths);

private:
    std::string name;
};

// A row: a name and the value shown.
class OrvaneModelLeafNode final : public OrvaneModelNode
{
public:
    OrvaneModelLeafNode(std::string displayName, std::string value, PropertyValue reading = {})
        : OrvaneModelNode(std::move(displayName)), string(std::move(value)),
          _reading(std::move(reading))
    {
    }
    [[nodiscard]] const std::string* value() const override { return &string; }
    [[nodiscard]] PropertyValue reading() const override { return _reading; }

private:
    std::string string;
    PropertyValue _reading;
};

// A group of nodes, possibly without any.
class OrvaneModelTreeNode final : public OrvaneModelNode
{
public:
    OrvaneModelTreeNode(std::string displayName, std::vector<NodePointer> children)
        : OrvaneModelNode(std::move(displayName)), _childNodes(std::move(children))
    {
    }
    [[nodiscard]] const std::vector<NodePointer>* childNodes() const override
    {
        return &_childNodes;
    }

private:
    std::vector<NodePointer> _childNodes;
};

// The path with the component appended: exactly one "/" between them, none doubled or trailing.
std::string pathByAppending(std::string_view path, std::string_view component);

} // namespace orvane
