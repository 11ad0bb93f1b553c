#include "app/OrvaneApp.h"

#include "platform/Services.h"

#include <utility>

namespace orvane
{

namespace
{

constexpr const char* kConnecting = "Connecting...";

} // namespace

OrvaneApp::OrvaneApp(ModelEnvironment environment, const FileSystem& files, PaneStack& panes)
    : _environment(std::move(environment)), _files(files), _panes(panes)
{
}

void OrvaneApp::applicationDidFinishLaunching()
{
    getSaveButtonPref();
    _model = std::make_shared<OrvaneModel>(_environment, this);
    updateMessage = kConnecting;
    for (Pane* pane : _panes.panes()) {
        // Without the dots, unlike ever after. This is meant.
        pane->setStatus("Connecting", true);
        navigationControllerWillShow(*pane);
    }
    _environment.queue.async([weak = std::weak_ptr(_model)] {
        if (const auto model = weak.lock())
            model->restartMonitor();
    });
}

void OrvaneApp::applicationWillTerminate()
{
    updateMessage.clear();
    _model.reset();
}

void OrvaneApp::getSaveButtonPref() { _allowSaveButton = _files.exists(kInstallMarker); }

std::optional<SnapshotResult> OrvaneApp::saveSnapshot(const std::string& description)
{
    if (!_allowSaveButton || !_model)
        return std::nullopt;
    return writeSnapshotFile(_files, _model->getSaveContents(),
                             Services::current().clock().secondsSince1970(), description);
}

void OrvaneApp::navigationControllerWillShow(Pane& pane) { updateStatusForViewController(pane); }

void OrvaneApp::updateStatusForViewController(Pane& pane)
{
    if (_model && _model->isConnected())
        pane.setStatus(updateMessage, false);
    else
        pane.setStatus(kConnecting, true);
}

void OrvaneApp::updateViewControllerFromModel()
{
    if (!_model)
        return;
    const Pane* below = nullptr;
    for (Pane* pane : _panes.panes()) {
        const NodePointer node = below ? _model->nodeAtPath(pane->path()) : _model->topLevelNodes();
        if (below && !node) {
            _panes.popToPane(*below);
            break;
        }
        pane->reloadWithNode(node);
        below = pane;
    }
    if (_model->isConnected())
        updateMessage = updatedText(Services::current().clock());
    if (const auto panes = _panes.panes(); !panes.empty())
        updateStatusForViewController(*panes.back());
}

void OrvaneApp::monitorStartEnded()
{
    // A lost or regained connection shows at once, although no refresh runs now; attempts that fail
    // in between do not flicker.
    const auto panes = _panes.panes();
    if (panes.empty() || !_model || panes.back()->isLoading() == !_model->isConnected())
        return;
    updateStatusForViewController(*panes.back());
}

} // namespace orvane
