#pragma once

#include "app/LiveApp.h"
#include "screens/toolkit/NavigationController.h"
#include "screens/toolkit/Window.h"
#include "ui/OrvanePaneController.h"
#include "ui/OrvaneSaveViewController.h"
#include "ui/Shell.h"

#include <memory>
#include <optional>

namespace orvane
{

// The application object of the front ends with panes: owns the window, the navigation stack of
// panes and the save screen, keeps the status line of the visible pane current and reloads the
// panes after each refresh.
class OrvaneApp final : public LiveApp, public Shell, public NavigationControllerDelegate
{
public:
    using LiveApp::LiveApp;
    ~OrvaneApp() override;

    [[nodiscard]] bool allowSaveButton() const override { return isSavingOffered(); }
    void showSaveView() override;
    void closeSaveView() override;
    // The save screen while it is shown, otherwise null.
    [[nodiscard]] OrvaneSaveViewController* saveView() const { return saveViewController.get(); }

    [[nodiscard]] MainQueue& mainQueue() override { return queue(); }
    [[nodiscard]] const FileSystem& files() const override { return fileSystem(); }

    void willShowViewController(NavigationController& navigation, ViewController& controller,
                                bool animated) override;
    void updateStatusForViewController(OrvanePaneController& pane);

private:
    void beginShowing(const Status& first) override;
    void endShowing() override;
    void showTree() override;
    void showStatus() override;
    [[nodiscard]] std::optional<bool> showsBusy() const override;

    std::unique_ptr<Window> window;
    std::shared_ptr<NavigationController> _navController;
    std::shared_ptr<OrvaneSaveViewController> saveViewController;
};

} // namespace orvane
