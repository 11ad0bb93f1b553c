#include "LogGenerator/GSM/Sections.h"

#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"

namespace orvane
{

namespace
{

struct SimFile {
    const char* key;
    const char* row;
};

constexpr SimFile kFiles[] = {
    {"kSimFile_ICCID",    "EF-ICCID"                       },
    {"kSimFile_MSISDN",   "EF-MSISDN"                      },
    {"kSimFile_MBDN",     "EF-3GPP MAIL BOX DIALING NUMBER"},
    {"kSimFile_HPPLMN",   "EF-HPPLMN SEARCH PERIOD"        },
    {"kSimFile_LOCI",     "EF-LOCI"                        },
    {"kSimFile_PSLOCI",   "EF-GPRS/PS-LOCI"                },
    {"kSimFile_ACC",      "EF-ACCESS CONTROL CLASS"        },
    {"kSimFile_AD",       "EF-ADMINISTRATIVE DATA"         },
    {"kSimFile_FPLMN",    "EF-FPLMN"                       },
    {"kSimFile_AHPLMN",   "EF-ACTING HPLMN"                },
    {"kSimFile_RATMODE",  "EF-RAT MODE"                    },
    {"kSimFile_PNN",      "EF-PLMN NETWORK NAME"           },
    {"kSimFile_OPL",      "EF-OPERATOR PLMN LIST"          },
    {"kSimFile_OPLMNAcT", "EF-OPLMNAcT"                    },
};

constexpr PacketLayout kPackets[] = {ownPacket(kSimFilesCode, 0)};

constexpr SectionLayout kLayout = {"SIM Info", "SimInfo", UnknownCode::Ignore, kPackets};

} // namespace

SimInfo::SimInfo() : Section(kLayout) {}

void SimInfo::decode(PacketView packet, const PacketLayout&)
{
    const PropertyValue files = readPropertyList(packet.from(kLogHeaderBytes).bytes()).value;
    if (!files) {
        logError("SIM File dictionary data could not be constructed");
        throw LogCode_0xFF0000::UnknownDataException();
    }
    const auto shown = rows();
    if (!shown)
        return;
    for (const SimFile& file : kFiles)
        if (const PropertyValue& content = files[file.key])
            shown->set(file.row, content);
}

} // namespace orvane
