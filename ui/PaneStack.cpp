#include "ui/PaneStack.h"

#include "screens/toolkit/NavigationController.h"

namespace orvane
{

OrvanePaneController* topPane(const NavigationController& navigation)
{
    return dynamic_cast<OrvanePaneController*>(navigation.topViewController());
}

void reloadPanes(NavigationController& navigation, const NodePointer& root,
                 const std::function<NodePointer(const std::string& path)>& nodeAtPath)
{
    const auto controllers = navigation.viewControllers();
    for (std::size_t index = 0; index < controllers.size(); ++index) {
        auto* pane = dynamic_cast<OrvanePaneController*>(controllers[index].get());
        if (!pane)
            continue;
        const NodePointer node = index == 0 ? root : nodeAtPath(pane->path());
        if (index > 0 && !node) {
            navigation.popToViewController(*controllers[index - 1], true);
            return;
        }
        pane->reloadWithNode(node);
    }
}

} // namespace orvane
