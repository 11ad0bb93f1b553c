#include "LogGenerator/DictionaryResource.h"

#include "platform/plist/PropertyList.h"
#include "platform/services/Resources.h"
#include "platform/services/SystemLog.h"

#include <string>

namespace orvane
{

PropertyValue loadDictionaryResource(const Resources& resources, std::string_view name)
{
    const std::optional<Bytes> content = resources.load(name, "plist");
    if (!content)
        return {};
    const PropertyListResult result = readPropertyList(*content);
    if (!result.value) {
        logError("Resource \"%s\" cannot be read: %s", std::string(name).c_str(),
                 result.error.c_str());
        return {};
    }
    return result.value.asDictionary() ? result.value : PropertyValue();
}

} // namespace orvane
