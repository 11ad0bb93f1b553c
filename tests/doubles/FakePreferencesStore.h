#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/services/PreferencesStore.h"

#include <functional>
#include <string>
#include <vector>

namespace orvane
{

// Records its calls in order, as texts.
class FakePreferencesStore final : public PreferencesStore
{
public:
    void setValue(const std::string& domain, const std::string& key,
                  const PropertyValue& value) override
    {
        if (onSet)
            onSet();
        notes.push_back("set " + domain + " " + key + " " +
                        (value.asBoolean() == true ? "true" : "false"));
    }
    void synchronize(const std::string& domain) override
    {
        notes.push_back("synchronize " + domain);
    }
    void postChangeNotice(const std::string& domain, const std::string& key) override
    {
        notes.push_back("notice " + domain + " " + key);
    }

    std::vector<std::string> notes;
    std::function<void()> onSet; // called before a value is noted
};

} // namespace orvane
