#pragma once

#include "LogGenerator/VRNLogGenerator.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// The generator for CDMA 1x and 1xEV-DO. It has no sections: a lookup made from its template leads
// from the state keys that decoders publish to the rows that show them.
class C2KLogGenerator final : public VRNLogGenerator
{
public:
    static std::unique_ptr<LogGenerator> generator();

    void updateState(PropertyDictionary& state, ByteView data) override;
    PropertyValue generateLogUsingState(PropertyDictionary& state) override;
    // Asks for the eight codes that are decoded, and for nothing of the server's own.
    [[nodiscard]] PropertyValue getStartCommand() const override;

    // Builds the display, and the lookup of its rows, from a template: dictionaries are groups,
    // strings name the state key that their row shows, "_sorted" is kept, all else is ignored.
    static void processTemplate(const PropertyDictionary& displayTemplate,
                                const PropertyValue& storeDisplayIntoDict,
                                PropertyDictionary& storeLookupIntoDict);
    // The display, built on the first call; absent (with an error line) without a template.
    static PropertyValue getDisplayFromState(PropertyDictionary& state);
    // Unframes the packet and hands it to the decoder of its code.
    void updateFromLog(ByteView packet, const PropertyValue& usingLookup,
                       PropertyDictionary& usingState);
};

} // namespace orvane
