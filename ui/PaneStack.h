#pragma once

#include "ui/OrvanePaneController.h"

#include <functional>
#include <string>

namespace orvane
{

// The pane in front; null if something else is in front, or nothing.
OrvanePaneController* topPane(const NavigationController& navigation);

// Reloads every pane of the stack from the root upwards: the root with `root`, each other pane with
// the node that `nodeAtPath` finds at its path. If there is none, removes that pane and all above
// it from the stack, and stops.
void reloadPanes(NavigationController& navigation, const NodePointer& root,
                 const std::function<NodePointer(const std::string& path)>& nodeAtPath);

} // namespace orvane
