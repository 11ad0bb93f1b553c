#include "app/OrvaneApp.h"

#include "platform/base/PropertyValue.h"
#include "platform/services/Services.h"
#include "screens/toolkit/Screen.h"
#include "ui/PaneStack.h"

#include <utility>

namespace orvane
{

namespace
{

constexpr const char* kConnecting = "Connecting...";
// Without the dots, unlike ever after. This is meant.
constexpr const char* kFirstStatus = "Connecting";
constexpr const char* kUpdatedFormat = "'Updated' yyyy-MM-dd 'at' HH:mm:ss";
constexpr const char* kShowSignalStrengthKey = "HSShowGSMRSSI";

} // namespace

OrvaneApp::OrvaneApp(ModelEnvironment environment, const FileSystem& files,
                     PreferencesStore& preferences, MakeRootPane makeRootPane)
    : _environment(std::move(environment)), _files(files), _preferences(preferences),
      _makeRootPane(std::move(makeRootPane))
{
    if (!_makeRootPane)
        _makeRootPane = [](Shell& shell) {
            return std::make_shared<OrvanePaneController>(nullptr, "/", shell);
        };
}

OrvaneApp::~OrvaneApp()
{
    // Others may own the stack as well.
    if (_navController)
        _navController->setDelegate(nullptr);
}

void OrvaneApp::applicationDidFinishLaunching()
{
    getSaveButtonPref();
    window = std::make_unique<Window>(Screen::main().bounds());
    _model = std::make_shared<OrvaneModel>(_environment, this);
    updateMessage = kConnecting;
    _dateFormatter = std::make_unique<DateFormatter>(kUpdatedFormat);
    const auto root = _makeRootPane(*this);
    root->setStatus(kFirstStatus, true);
    _navController = std::make_shared<NavigationController>(root);
    _navController->setDelegate(this);
    window->setRootViewController(_navController);
    window->addSubview(_navController->view());
    window->makeKeyAndVisible();
    _environment.queue.async([weak = std::weak_ptr(_model)] {
        if (const auto model = weak.lock())
            model->restartMonitor();
    });
}

void OrvaneApp::applicationWillTerminate()
{
    _setGSMRSSI(false);
    updateMessage.clear();
    _dateFormatter.reset();
    saveViewController.reset();
    if (window)
        window->orderOut();
    window.reset();
    _model.reset();
}

void OrvaneApp::_setGSMRSSI(bool isShown)
{
    _preferences.setValue(kHomeScreenDomain, kShowSignalStrengthKey,
                          PropertyValue::boolean(isShown));
    _preferences.synchronize(kHomeScreenDomain);
    _preferences.postChangeNotice(kHomeScreenDomain, kShowSignalStrengthKey);
}

void OrvaneApp::getSaveButtonPref() { _allowSaveButton = _files.exists(kInstallMarker); }

void OrvaneApp::showSaveView()
{
    if (saveViewController || !_model || !_navController)
        return;
    const auto saveView =
        OrvaneSaveViewController::withSaveHistory(_model->getSaveContents(), *this);
    // Without its interface file there would be nothing to see and no way back; the front end has
    // told so.
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

std::optional<SnapshotResult> OrvaneApp::saveSnapshot(const std::string& description)
{
    if (!_allowSaveButton || !_model)
        return std::nullopt;
    return writeSnapshotFile(_files, _model->getSaveContents(),
                             Services::current().clock().secondsSince1970(), description);
}

void OrvaneApp::willShowViewController(NavigationController&, ViewController& controller, bool)
{
    if (auto* pane = dynamic_cast<OrvanePaneController*>(&controller))
        updateStatusForViewController(*pane);
}

void OrvaneApp::updateStatusForViewController(OrvanePaneController& pane)
{
    if (_model && _model->isConnected())
        pane.setStatus(updateMessage, false);
    else
        pane.setStatus(kConnecting, true);
}

void OrvaneApp::updateViewControllerFromModel()
{
    if (!_model || !_navController)
        return;
    reloadPanes(*_navController, _model->topLevelNodes(),
                [this](const std::string& path) { return _model->nodeAtPath(path); });
    if (_model->isConnected() && _dateFormatter) {
        const Clock& clock = Services::current().clock();
        updateMessage = _dateFormatter->stringFromDate(clock.secondsSince1970(), clock);
    }
    if (OrvanePaneController* pane = topPane(*_navController))
        updateStatusForViewController(*pane);
}

void OrvaneApp::monitorStartEnded()
{
    if (!_model || !_navController)
        return;
    // A lost or regained connection shows at once, although no refresh runs now; attempts that fail
    // in between do not flicker.
    OrvanePaneController* pane = topPane(*_navController);
    if (pane && pane->isBusy() == _model->isConnected())
        updateStatusForViewController(*pane);
}

} // namespace orvane
