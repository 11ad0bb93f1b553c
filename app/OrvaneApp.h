#pragma once

#include "app/OrvaneModel.h"
#include "platform/FileSystem.h"
#include "ui/Pane.h"
#include "ui/SnapshotFile.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// Saving is offered where this path exists, below the file system's root.
inline constexpr const char* kInstallMarker =
    "/Tarnwell/Library/PreferenceBundles/Carrier Settings.bundle";

// The application object: owns the model, starts the monitor, keeps the status line of the visible
// pane current, reloads the panes after each refresh, and decides whether saving is offered.
class OrvaneApp final : public ModelObserver
{
public:
    // All are referred to and must outlive the application.
    OrvaneApp(ModelEnvironment environment, const FileSystem& files, PaneStack& panes);

    // Shows the root pane as connecting and queues the first connection attempt.
    void applicationDidFinishLaunching();
    // Ends the monitor.
    void applicationWillTerminate();

    // Whether saving is offered: decided once, at the start, by the install marker.
    [[nodiscard]] bool allowSaveButton() const { return _allowSaveButton; }
    // Saves a snapshot of this moment with the description. Nothing where saving is not offered.
    std::optional<SnapshotResult> saveSnapshot(const std::string& description);

    // A pane is about to be shown.
    void navigationControllerWillShow(Pane& pane);
    void updateStatusForViewController(Pane& pane);
    void updateViewControllerFromModel() override;
    void monitorStartEnded() override;

private:
    void getSaveButtonPref();

    ModelEnvironment _environment;
    const FileSystem& _files;
    PaneStack& _panes;
    std::shared_ptr<OrvaneModel> _model;
    std::string updateMessage;
    bool _allowSaveButton = false;
};

} // namespace orvane
