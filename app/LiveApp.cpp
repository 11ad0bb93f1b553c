#include "app/LiveApp.h"

#include "platform/base/PropertyValue.h"
#include "platform/services/Services.h"

#include <utility>

namespace orvane
{

namespace
{

constexpr const char* kConnecting = "Connecting...";
constexpr const char* kNoModem = "No modem";
// Deliberate: the first status has no dots, all later ones have.
constexpr const char* kFirstStatus = "Connecting";
constexpr const char* kUpdatedFormat = "'Updated' yyyy-MM-dd 'at' HH:mm:ss";
constexpr const char* kShowSignalStrengthKey = "HSShowGSMRSSI";

} // namespace

LiveApp::LiveApp(ModelEnvironment environment, const FileSystem& files,
                 PreferencesStore& preferences)
    : _environment(std::move(environment)), _files(files), _preferences(preferences)
{
}

void LiveApp::applicationDidFinishLaunching()
{
    getSaveButtonPref();
    _model = std::make_shared<OrvaneModel>(_environment, this);
    updateMessage = kConnecting;
    _dateFormatter = std::make_unique<DateFormatter>(kUpdatedFormat);
    beginShowing({kFirstStatus, true});
    _environment.queue.async([weak = std::weak_ptr(_model)] {
        if (const auto model = weak.lock())
            model->restartMonitor();
    });
}

void LiveApp::applicationWillTerminate()
{
    _setGSMRSSI(false);
    updateMessage.clear();
    _dateFormatter.reset();
    endShowing();
    _model.reset();
}

void LiveApp::_setGSMRSSI(bool isShown)
{
    _preferences.setValue(kHomeScreenDomain, kShowSignalStrengthKey,
                          PropertyValue::boolean(isShown));
    _preferences.synchronize(kHomeScreenDomain);
    _preferences.postChangeNotice(kHomeScreenDomain, kShowSignalStrengthKey);
}

void LiveApp::getSaveButtonPref() { _allowSaveButton = _files.exists(kInstallMarker); }

std::optional<SnapshotResult> LiveApp::saveSnapshot(const std::string& description)
{
    if (!_allowSaveButton || !_model)
        return std::nullopt;
    return writeSnapshotFile(_files, _model->getSaveContents(),
                             Services::current().clock().secondsSince1970(), description);
}

LiveApp::Status LiveApp::status() const
{
    if (!_model || !_model->isConnected())
        return {kConnecting, true};
    return {_model->isModemMissing() ? kNoModem : updateMessage, false};
}

void LiveApp::updateViewControllerFromModel()
{
    if (!_model)
        return;
    showTree();
    if (_model->isConnected() && _dateFormatter) {
        const Clock& clock = Services::current().clock();
        updateMessage = _dateFormatter->stringFromDate(clock.secondsSince1970(), clock);
    }
    showStatus();
}

// Shown at once, because no refresh comes while there is no data.
void LiveApp::modemPresenceChanged()
{
    if (_model)
        showStatus();
}

void LiveApp::monitorStartEnded()
{
    // A lost or regained connection shows at once, although no refresh runs now. Attempts that fail
    // in between do not flicker.
    if (_model && showsBusy() == _model->isConnected())
        showStatus();
}

} // namespace orvane
