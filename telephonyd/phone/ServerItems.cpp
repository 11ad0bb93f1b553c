#include "telephonyd/phone/ServerItems.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"

#include <cmath>

namespace orvane
{

PhoneMessage serverItem(std::uint16_t number, const PropertyValue& value)
{
    return {PhoneMessage::Kind::Server, number, xmlPropertyListBytes(value).value_or(Bytes())};
}

PropertyValue simFiles()
{
    const auto data = [](Bytes bytes) { return PropertyValue::data(std::move(bytes)); };
    return PropertyValue::dictionaryOf({
        {"kSimFile_ICCID",    "89001012345678901234"                                                  },
        {"kSimFile_MSISDN",   "+12025550123"                                                          },
        {"kSimFile_MBDN",     "+12025550199"                                                          },
        {"kSimFile_HPPLMN",   "60 minutes"                                                            },
        {"kSimFile_LOCI",     data({0x4A, 0x01, 0x33, 0xC0, 0x00, 0xF1, 0x10, 0x10, 0x05, 0xFF, 0x00})},
        {"kSimFile_PSLOCI",   data({0xC0, 0x51, 0x2E, 0x07, 0xFF, 0xFF, 0xFF, 0x00, 0xF1, 0x10, 0x10,
                                  0x05, 0x01, 0x00})                       },
        {"kSimFile_ACC",      data({0x00, 0x08})                                                      },
        {"kSimFile_AD",       data({0x00, 0x00, 0x00, 0x02})                                          },
        {"kSimFile_FPLMN",    "001 02"                                                                },
        {"kSimFile_AHPLMN",   "001 01"                                                                },
        {"kSimFile_RATMODE",  "Automatic"                                                             },
        {"kSimFile_PNN",      "Test Network"                                                          },
        {"kSimFile_OPL",      "001 01"                                                                },
        {"kSimFile_OPLMNAcT", "001 01 LTE"                                                            },
    });
}

PropertyValue listedCell(const char* technology, bool isServing,
                         std::initializer_list<std::pair<const char*, double>> numbers)
{
    PropertyValue cell = PropertyValue::dictionaryOf({
        {kTSCellMonitorCellRadioAccessTechnology, technology                       },
        {kTSCellMonitorCellType,
         isServing ? kTSCellMonitorCellTypeServing : kTSCellMonitorCellTypeNeighbor},
        {kTSCellMonitorMCC,                       PropertyValue::integer(1)        },
        {kTSCellMonitorMNC,                       PropertyValue::integer(1)        },
    });
    for (const auto& [key, number] : numbers)
        cell.asDictionary()->set(key, PropertyValue::integer(std::lround(number)));
    return cell;
}

} // namespace orvane
