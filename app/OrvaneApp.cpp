#include "app/OrvaneApp.h"

#include "screens/toolkit/Screen.h"
#include "ui/PaneStack.h"

namespace orvane
{

OrvaneApp::~OrvaneApp()
{
    // The stack may have other owners, and must not call this object any more.
    if (_navController)
        _navController->setDelegate(nullptr);
}

void OrvaneApp::beginShowing(const Status& first)
{
    window = std::make_unique<Window>(Screen::main().bounds());
    const auto root = std::make_shared<OrvanePaneController>(nullptr, "/", *this);
    root->setStatus(first.text, first.isBusy);
    _navController = std::make_shared<NavigationController>(root);
    _navController->setDelegate(this);
    window->setRootViewController(_navController);
    window->addSubview(_navController->view());
    window->makeKeyAndVisible();
}

void OrvaneApp::endShowing()
{
    saveViewController.reset();
    if (window)
        window->orderOut();
    window.reset();
}

void OrvaneApp::showSaveView()
{
    if (saveViewController || !model() || !_navController)
        return;
    const auto saveView =
        OrvaneSaveViewController::withSaveHistory(model()->getSaveContents(), *this);
    // Without its interface file the screen would be empty and could not be left. The front end has
    // logged the error.
    if (!saveView->view())
        return;
    saveViewController = saveView;
    _navController->presentModalViewController(saveViewController, true);
}

void OrvaneApp::closeSaveView()
{
    if (!saveViewController)
        return;
    if (_navController)
        _navController->dismissModalViewController(true);
    saveViewController.reset();
}

void OrvaneApp::willShowViewController(NavigationController&, ViewController& controller, bool)
{
    if (auto* pane = dynamic_cast<OrvanePaneController*>(&controller))
        updateStatusForViewController(*pane);
}

void OrvaneApp::updateStatusForViewController(OrvanePaneController& pane)
{
    const Status now = status();
    pane.setStatus(now.text, now.isBusy);
}

void OrvaneApp::showTree()
{
    reloadPanes(*_navController, model()->topLevelNodes(),
                [this](const std::string& path) { return model()->nodeAtPath(path); });
}

void OrvaneApp::showStatus()
{
    if (OrvanePaneController* pane = topPane(*_navController))
        updateStatusForViewController(*pane);
}

std::optional<bool> OrvaneApp::showsBusy() const
{
    const OrvanePaneController* pane = topPane(*_navController);
    return pane ? std::optional(pane->isBusy()) : std::nullopt;
}

} // namespace orvane
