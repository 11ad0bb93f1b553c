#pragma once

#include "LogGenerator/LogGenerator.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// The generator of the channel on which the telephony server itself streams cell information: every
// message is one property list, which is simplified and shown as it is, replacing the one before.
// Numbers must come as strings.
class GSMLogGenerator final : public LogGenerator
{
public:
    static std::unique_ptr<LogGenerator> generator();

    // Throws InternalInconsistency, storing nothing, for a message that cannot be read or holds
    // anything but dictionaries, arrays and strings.
    void updateState(PropertyDictionary& state, ByteView data) override;
    PropertyValue generateLogUsingState(PropertyDictionary& state) override;
    [[nodiscard]] PropertyValue getStartCommand() const override;
    // The history's snapshots, oldest first.
    PropertyValue getSaveContentsFromState(PropertyDictionary& state) override;

    // One-entry dictionaries collapse into their value (one level), arrays lose their first
    // element.
    static PropertyValue processObject(const PropertyValue& object);
    // The only value of a dictionary with one entry; absent for anything else.
    static PropertyValue canCollapse(const PropertyValue& value);
};

} // namespace orvane
