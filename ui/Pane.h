#pragma once

#include "ui/OrvaneModelNode.h"

#include <optional>
#include <string>
#include <vector>

namespace orvane
{

// What the shell asks of each thing on its stack that shows one node of the display tree.
class Pane
{
public:
    virtual ~Pane() = default;
    // The path of the node that it shows; "/" for the root.
    [[nodiscard]] virtual std::string path() const = 0;
    // Shows another node; null for none.
    virtual void reloadWithNode(NodePointer node) = 0;
    // The status text (nothing is taken as an empty one) and whether the busy indicator turns.
    virtual void setStatus(std::optional<std::string> status, bool isLoading) = 0;
    [[nodiscard]] virtual bool isLoading() const = 0;
};

// The navigation stack as the shell sees it: panes from the root upwards.
class PaneStack
{
public:
    virtual ~PaneStack() = default;
    [[nodiscard]] virtual std::vector<Pane*> panes() const = 0;
    // Removes every pane above the given one.
    virtual void popToPane(const Pane& pane) = 0;
};

// A stack of the root pane alone, for front ends that show the whole tree at once.
class SinglePaneStack final : public PaneStack
{
public:
    explicit SinglePaneStack(Pane& root) : _root(root) {}
    [[nodiscard]] std::vector<Pane*> panes() const override { return {&_root}; }
    void popToPane(const Pane&) override {}

private:
    Pane& _root;
};

} // namespace orvane
