#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/services/PreferencesStore.h"

#include <chrono>
#include <map>
#include <string>

namespace orvane
{

// Preferences as INI files: DOMAIN.ini below "orvane-preferences" in the user's configuration
// directory ($XDG_CONFIG_HOME, else ~/.config). A notice is the signal "Changed" of the interface
// "org.orvane.Preferences", from the object "/org/orvane/Preferences", with domain and key, on the
// session bus where there is one.
//
// Neither a file that another program has locked, nor one that is a pipe, nor a bus that does not
// answer keeps a call for longer than kPatience; an error line then says what was not done.
class QtPreferencesStore final : public PreferencesStore
{
public:
    static constexpr std::chrono::milliseconds kPatience{500};

    QtPreferencesStore();
    ~QtPreferencesStore() override;

    void setValue(const std::string& domain, const std::string& key,
                  const PropertyValue& value) override;
    void synchronize(const std::string& domain) override;
    void postChangeNotice(const std::string& domain, const std::string& key) override;

private:
    // What was set and is not written yet, by domain.
    std::map<std::string, PropertyDictionary> _unwritten;
};

} // namespace orvane
