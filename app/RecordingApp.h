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

// The application object for a recording: shows the panes of a log that is played, or of a snapshot
// whose entries lead to the displays as they were and whose log is played while one is inside of
// it. The status line has the time of the recording; the screen's playback controls go with the
// panes of a log.
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

    // What is referred to must outlive the application. The recording is one without an error.
    RecordingApp(Environment environment, OpenedRecording recording, RecordingSettings settings);
    ~RecordingApp() override;

    // Shows the root pane and begins to read.
    void applicationDidFinishLaunching();
    // Takes the window off the screen.
    void applicationWillTerminate();

    // The player of the log that is shown; null where none is.
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
