#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/services/PreferencesStore.h"

#include <map>
#include <memory>
#include <string>

class QSettings;

namespace orvane
{

// Preferences as INI files: DOMAIN.ini below "orvane-preferences" in the user's configuration
// directory ($XDG_CONFIG_HOME, else ~/.config). A notice is the signal "Changed" of the interface
// "org.orvane.Preferences", from the object "/org/orvane/Preferences", with domain and key, on the
// session bus where there is one.
class QtPreferencesStore final : public PreferencesStore
{
public:
    QtPreferencesStore();
    ~QtPreferencesStore() override;

    void setValue(const std::string& domain, const std::string& key,
                  const PropertyValue& value) override;
    void synchronize(const std::string& domain) override;
    void postChangeNotice(const std::string& domain, const std::string& key) override;

private:
    QSettings& settings(const std::string& domain);

    // What was set and is not written yet, by domain.
    std::map<std::string, std::unique_ptr<QSettings>> _open;
};

} // namespace orvane
