#include "app/RecordingApp.h"

#include "screens/toolkit/Screen.h"
#include "ui/PaneStack.h"

#include <utility>
#include <vector>

namespace orvane
{

namespace
{

constexpr const char* kRootPath = "/";
constexpr const char* kReading = "Reading...";

} // namespace

RecordingApp::RecordingApp(Environment environment, OpenedRecording recording,
                           RecordingSettings settings)
    : _environment(std::move(environment)), _recording(std::move(recording)),
      _settings(std::move(settings))
{
    if (_recording.snapshot)
        _snapshot.emplace(*_recording.snapshot);
}

RecordingApp::~RecordingApp()
{
    stopLog();
    // The stack may have other owners, and must not call this object any more.
    if (_navigation)
        _navigation->setDelegate(nullptr);
}

void RecordingApp::applicationDidFinishLaunching()
{
    _window = std::make_unique<Window>(Screen::main().bounds());
    if (_recording.log)
        playLog(kRootPath, _recording.log);
    const auto root =
        std::make_shared<OrvanePaneController>(nodeAtPath(kRootPath), kRootPath, *this);
    updateStatus(*root);
    _navigation = std::make_shared<NavigationController>(root);
    _navigation->setDelegate(this);
    _window->setRootViewController(_navigation);
    _window->addSubview(_navigation->view());
    _window->makeKeyAndVisible();
}

void RecordingApp::applicationWillTerminate()
{
    stopLog();
    if (_window)
        _window->orderOut();
    _window.reset();
}

void RecordingApp::playLog(const std::string& path, std::shared_ptr<ByteSource> log)
{
    _playerPath = path;
    _player = std::make_unique<LogPlayer>(_environment.queue, _environment.now, std::move(log),
                                          _settings, [this] { playerChanged(); });
    _shownNodes = nullptr;
    Screen::main().setPlayback(_player.get());
}

void RecordingApp::stopLog()
{
    if (!_player)
        return;
    Screen::main().setPlayback(nullptr);
    _player.reset();
    _shownNodes = nullptr;
}

void RecordingApp::willShowViewController(NavigationController&, ViewController& controller, bool)
{
    auto* pane = dynamic_cast<OrvanePaneController*>(&controller);
    if (!pane)
        return;
    // A snapshot's log is played while one of its panes is shown.
    if (_snapshot) {
        const SnapshotTree::Group* group = _snapshot->groupOf(pane->path());
        const bool isLog = group && group->log;
        if (_player && !(isLog && group->path == _playerPath))
            stopLog();
        if (isLog && !_player)
            playLog(group->path, group->log);
    }
    updateStatus(*pane);
}

void RecordingApp::playerChanged()
{
    if (const auto& failure = _player->failure()) {
        if (_recording.log) {
            _environment.onFailure(*failure);
            return;
        }
        Screen::main().showAlert(
            std::make_unique<AlertView>("The log cannot be played", *failure, "Close"));
    }
    if (_navigation)
        reload();
    Screen::main().setNeedsUpdate();
}

void RecordingApp::reload()
{
    if (_player->topLevelNodes() != _shownNodes) {
        _shownNodes = _player->topLevelNodes();
        reloadPanes(*_navigation, nodeAtPath(kRootPath),
                    [this](const std::string& path) { return nodeAtPath(path); });
    }
    if (OrvanePaneController* pane = topPane(*_navigation))
        updateStatus(*pane);
}

void RecordingApp::updateStatus(OrvanePaneController& pane) const
{
    if (_player && isWithin(pane.path(), _playerPath)) {
        const bool isReading = !_player->isReady() && !_player->failure();
        pane.setStatus(isReading ? kReading : _player->positionText(), isReading);
        return;
    }
    const SnapshotTree::Group* group = _snapshot ? _snapshot->groupOf(pane.path()) : nullptr;
    if (group)
        pane.setStatus(group->date, false);
    else
        pane.setStatus(_recording.snapshot ? _recording.snapshot->timestamp : "", false);
}

NodePointer RecordingApp::nodeAtPath(const std::string& path)
{
    if (_player && isWithin(path, _playerPath))
        return logNode(path);
    return _snapshot ? _snapshot->nodeAtPath(path) : nullptr;
}

// The player's tree, with its root at the player's path.
NodePointer RecordingApp::logNode(const std::string& path)
{
    if (_playerPath == kRootPath)
        return path == kRootPath ? _player->topLevelNodes() : _player->nodeAtPath(path);
    if (path != _playerPath)
        return _player->nodeAtPath(path.substr(_playerPath.size()));
    // Named like the entry, and a group even while it is empty.
    const NodePointer root = _player->topLevelNodes();
    const auto* children = root ? root->childNodes() : nullptr;
    return std::make_shared<OrvaneModelTreeNode>(_snapshot->nodeAtPath(path)->displayName(),
                                                 children ? *children : std::vector<NodePointer>());
}

} // namespace orvane
