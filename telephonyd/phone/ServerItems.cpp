#include "telephonyd/phone/ServerItems.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"

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

namespace
{

// From the addresses that are kept for examples.
std::string exampleAddress(unsigned number)
{
    return "192.0.2." + std::to_string(1 + number % 254);
}

} // namespace

PropertyValue dataConnection(const char* accessPointName, const char* qosClass, unsigned number)
{
    return PropertyValue::dictionaryOf({
        {"APN",        accessPointName       },
        {"IP Address", exampleAddress(number)},
        {"State",      "Active"              },
        {"QCI",        qosClass              },
    });
}

PropertyValue packetDataContext(const char* accessPointName, const char* trafficClass,
                                unsigned accessPointId, unsigned number)
{
    return PropertyValue::dictionaryOf({
        {"APN",           accessPointName              },
        {"IP Address",    exampleAddress(number)       },
        {"State",         "Active"                     },
        {"NSAPI",         std::to_string(accessPointId)},
        {"Traffic Class", trafficClass                 },
    });
}

} // namespace orvane
