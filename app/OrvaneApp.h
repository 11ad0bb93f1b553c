#pragma once

#include "app/OrvaneModel.h"
#include "platform/services/DateFormatter.h"
#include "platform/services/FileSystem.h"
#include "platform/services/PreferencesStore.h"
#include "screens/toolkit/NavigationController.h"
#include "screens/toolkit/Window.h"
#include "ui/OrvanePaneController.h"
#include "ui/OrvaneSaveViewController.h"
#include "ui/Shell.h"
#include "ui/SnapshotFile.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// Saving is offered where this path exists, below the file system's root.
inline constexpr const char* kInstallMarker =
    "/Tarnwell/Library/PreferenceBundles/Carrier Settings.bundle";

// The application object: owns the window, the navigation stack of panes and the model, starts the
// monitor, keeps the status line of the visible pane current, reloads the panes after each refresh,
// decides whether saving is offered and opens the save screen.
class OrvaneApp final : public ModelObserver, public Shell, public NavigationControllerDelegate
{
public:
    using MakeRootPane = std::function<std::shared_ptr<OrvanePaneController>(Shell& shell)>;

    // All are referred to and must outlive the application. `makeRootPane` is for front ends whose
    // root pane is one of their own; without it a plain one without a node is made.
    OrvaneApp(ModelEnvironment environment, const FileSystem& files, PreferencesStore& preferences,
              MakeRootPane makeRootPane = nullptr);
    ~OrvaneApp() override;

    // Shows the root pane as connecting and queues the first connection attempt.
    void applicationDidFinishLaunching();
    // Ends the monitor and takes the window off the screen.
    void applicationWillTerminate();

    // Whether saving is offered: decided once, at the start, by the install marker.
    [[nodiscard]] bool allowSaveButton() const override { return _allowSaveButton; }
    void showSaveView() override;
    void closeSaveView() override;
    // The save screen, while it is shown; else null.
    [[nodiscard]] OrvaneSaveViewController* saveView() const { return saveViewController.get(); }
    // Saves a snapshot of this moment without the save screen. Nothing where saving is not offered.
    std::optional<SnapshotResult> saveSnapshot(const std::string& description);

    [[nodiscard]] MainQueue& mainQueue() override { return _environment.queue; }
    [[nodiscard]] const FileSystem& files() const override { return _files; }

    void willShowViewController(NavigationController& navigation, ViewController& controller,
                                bool animated) override;
    void updateStatusForViewController(OrvanePaneController& pane);
    void updateViewControllerFromModel() override;
    void monitorStartEnded() override;

private:
    void getSaveButtonPref();
    void _setGSMRSSI(bool isShown);

    ModelEnvironment _environment;
    const FileSystem& _files;
    PreferencesStore& _preferences;
    MakeRootPane _makeRootPane;

    std::unique_ptr<Window> window;
    std::shared_ptr<OrvaneModel> _model;
    std::shared_ptr<NavigationController> _navController;
    std::unique_ptr<DateFormatter> _dateFormatter;
    std::shared_ptr<OrvaneSaveViewController> saveViewController;
    std::string updateMessage;
    bool _allowSaveButton = false;
};

} // namespace orvane
