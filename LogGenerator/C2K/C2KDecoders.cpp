#include "LogGenerator/C2K/C2KDecoders.h"

namespace orvane
{

std::span<const C2KDecoder> c2kDecoders()
{
    static constexpr C2KDecoder kDecoders[] = {
        {0x108A, decodeFingers        },
        {0x1183, decodeEvdoSummary    },
        {0x1192, decodeForwardDataRate},
        {0x12B6, decodeEvdoActiveSet  },
        {0x119C, decodeOneXStatus     },
        {0x119D, decodeTrafficErrors  },
        {0x127E, decodeReverseDataRate},
        {0x134F, decodeSystemIdentity },
    };
    return kDecoders;
}

PropertyValue newSortedRows()
{
    return PropertyValue::dictionaryOf({
        {"_sorted", "_sorted"}
    });
}

} // namespace orvane
