#pragma once

#include "app/LogPlayer.h"
#include "recordings/OpenedRecording.h"
#include "recordings/SnapshotTree.h"
#include "screens/toolkit/NavigationController.h"
#include "screens/toolkit/Window.h"
#include "ui/OrvanePaneController.h"
#include "ui/Shell.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// The application object for a recording. It shows the panes of a log and plays it, or the panes of
// a snapshot: its entries lead to the displays that were saved, and its log is played while one of
// the log's panes is shown. The status line shows the time of the recording. Playback controls are
// shown with the panes of a log.
class RecordingApp final : public Shell, public NavigationControllerDelegate
{
public:
    struct Environment {
        MainQueue& queue;
        LogPlayer::Now now;
        const FileSystem& files;
        // The file as a whole cannot be shown: one line that says why and what to do. Not called
        // by the constructor; the application may be gone afterwards.
        std::function<void(const std::string& text)> onFailure;
    };

    // Everything passed by reference must outlive the application. The recording must have no
    // error.
    RecordingApp(Environment environment, OpenedRecording recording, RecordingSettings settings);
    ~RecordingApp() override;

    // Shows the root pane and begins to read.
    void applicationDidFinishLaunching();
    // Takes the window off the screen.
    void applicationWillTerminate();

    // The player of the log that is shown, otherwise null.
    [[nodiscard]] LogPlayer* player() const { return _player.get(); }

    // A recording cannot be saved again.
    [[nodiscard]] bool allowSaveButton() const override { return false; }
    void showSaveView() override {}
    void closeSaveView() override {}
    [[nodiscard]] MainQueue& mainQueue() override { return _environment.queue; }
    [[nodiscard]] const FileSystem& files() const override { return _environment.files; }

    void willShowViewController(NavigationController& navigation, ViewController& controller,
                                bool animated) override;

private:
    void playLog(const std::string& path, std::shared_ptr<ByteSource> log);
    void stopLog();
    void playerChanged();
    void reload();
    void updateStatus(OrvanePaneController& pane) const;
    [[nodiscard]] NodePointer nodeAtPath(const std::string& path);
    [[nodiscard]] NodePointer logNode(const std::string& path);

    Environment _environment;
    OpenedRecording _recording;
    RecordingSettings _settings;
    std::optional<SnapshotTree> _snapshot;
    std::string _playerPath; // of the pane that shows the whole of the log
    std::unique_ptr<LogPlayer> _player;
    NodePointer _shownNodes; // of the player
    std::unique_ptr<Window> _window;
    std::shared_ptr<NavigationController> _navigation;
};

} // namespace orvane
