#include "telephonyd/StartCommand.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/services/SystemLog.h"

namespace orvane
{

namespace
{

constexpr std::int64_t kMostCode = 0xFFFF;

std::set<std::uint32_t> codesUnder(const PropertyValue& command, const char* key)
{
    std::set<std::uint32_t> codes;
    const PropertyValue& value = command[key];
    if (value.isAbsent())
        return codes;
    const PropertyArray* array = value.asArray();
    std::size_t unusable = 0;
    if (array)
        for (const PropertyValue& element : *array) {
            const auto code = element.asInteger();
            if (code && *code >= 0 && *code <= kMostCode)
                codes.insert(static_cast<std::uint32_t>(*code));
            else
                ++unusable;
        }
    if (!array)
        logError("%s of a start command is of type %s; no codes are taken from it", key,
                 value.typeName());
    else if (unusable > 0)
        logError("%s of a start command holds %zu entries that are not codes", key, unusable);
    return codes;
}

} // namespace

LogSelection selectionOfStartCommand(const PropertyValue& command)
{
    return {codesUnder(command, kSetModemLogCodesKey), codesUnder(command, kSetExtraCodesKey)};
}

} // namespace orvane
