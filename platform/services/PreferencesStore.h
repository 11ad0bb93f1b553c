#pragma once

#include "platform/base/PropertyValue.h"

#include <string>

namespace orvane
{

// Preferences of applications, one domain for each, and the notice that makes an application read
// its own again. A failure is logged in one error line.
class PreferencesStore
{
public:
    virtual ~PreferencesStore() = default;
    virtual void setValue(const std::string& domain, const std::string& key,
                          const PropertyValue& value) = 0;
    // Writes what was set to where others read it.
    virtual void synchronize(const std::string& domain) = 0;
    // Tells whoever listens that the value of that key has changed.
    virtual void postChangeNotice(const std::string& domain, const std::string& key) = 0;
};

// The domain of the home screen's shell.
inline constexpr const char* kHomeScreenDomain = "home-screen";

} // namespace orvane
