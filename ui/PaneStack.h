#pragma once

#include "ui/OrvanePaneController.h"

#include <functional>
#include <string>

namespace orvane
{

// The pane in front; null where something else, or nothing, is.
OrvanePaneController* topPane(const NavigationController& navigation);

// Reloads every pane of the stack, from the root upwards: the root with `root`, any other with the
// node that `nodeAtPath` finds at its path. Where it finds none, the pane and all above it are
// popped, and the walk stops.
void reloadPanes(NavigationController& navigation, const NodePointer& root,
                 const std::function<NodePointer(const std::string& path)>& nodeAtPath);

} // namespace orvane
