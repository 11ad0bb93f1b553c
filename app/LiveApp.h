#pragma once

#include "app/OrvaneModel.h"
#include "platform/services/DateFormatter.h"
#include "platform/services/FileSystem.h"
#include "platform/services/PreferencesStore.h"
#include "ui/SnapshotFile.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// Saving is offered where this path exists, below the file system's root.
inline constexpr const char* kInstallMarker =
    "/Tarnwell/Library/PreferenceBundles/Carrier Settings.bundle";

// The live view without anything that shows it: owns the model, starts and ends the monitor, makes
// the texts of the status, decides whether saving is offered and saves. OrvaneApp shows it in
// panes, PrintingApp prints it.
class LiveApp : public ModelObserver
{
public:
    // All must outlive the application.
    LiveApp(ModelEnvironment environment, const FileSystem& files, PreferencesStore& preferences);
    LiveApp(const LiveApp&) = delete;
    LiveApp& operator=(const LiveApp&) = delete;

    // Shows that it is connecting, and queues the first connection attempt.
    void applicationDidFinishLaunching();
    // Ends what shows it, then the monitor.
    void applicationWillTerminate();

    // Saves a snapshot of this moment. nullopt where saving is not offered.
    std::optional<SnapshotResult> saveSnapshot(const std::string& description);

    void updateViewControllerFromModel() final;
    void monitorStartEnded() final;
    void modemPresenceChanged() final;

protected:
    struct Status {
        std::string text;
        bool isBusy;
    };

    // The launch: shows `first`, then the status of now.
    virtual void beginShowing(const Status& first) = 0;
    virtual void endShowing() = 0;
    // Shows the model's tree. The status comes next.
    virtual void showTree() = 0;
    virtual void showStatus() = 0;
    // Whether the status that is shown is that of a connection attempt; nullopt where none is
    // shown.
    [[nodiscard]] virtual std::optional<bool> showsBusy() const = 0;

    // The status of now.
    [[nodiscard]] Status status() const;
    // Null before the launch and after the end.
    [[nodiscard]] const std::shared_ptr<OrvaneModel>& model() const { return _model; }
    // Decided once, at the launch, by the install marker.
    [[nodiscard]] bool isSavingOffered() const { return _allowSaveButton; }
    [[nodiscard]] MainQueue& queue() const { return _environment.queue; }
    [[nodiscard]] const FileSystem& fileSystem() const { return _files; }

private:
    void getSaveButtonPref();
    void _setGSMRSSI(bool isShown);

    ModelEnvironment _environment;
    const FileSystem& _files;
    PreferencesStore& _preferences;

    std::shared_ptr<OrvaneModel> _model;
    std::unique_ptr<DateFormatter> _dateFormatter;
    std::string updateMessage;
    bool _allowSaveButton = false;
};

} // namespace orvane
