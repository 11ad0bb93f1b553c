#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/GSM/LogCodes.h"

namespace orvane
{

namespace
{

// Deliberate: three of the names have a blank inside.
constexpr ValueName kRrStates[] = {
    {0,  "RR_INACTIVE"                         },
    {1,  "RR_GOING_ACTIVE"                     },
    {2,  "RR_GOING_INACTIVE"                   },
    {3,  "RR_CELL_SELECTION"                   },
    {4,  "RR_PLMN_LIST_CONSTRUCTION"           },
    {5,  "RR_IDLE"                             },
    {6,  "RR_CELL_RESELECTION"                 },
    {7,  "RR_CONNECTION_PENDING"               },
    {8,  "RR_CHOOSE_CELL"                      },
    {9,  "RR_DATA_TRANSFER"                    },
    {10, "RR_NO_CHANNELS"                      },
    {11, "RR_CONNECTION_RELEASE"               },
    {12, "RR_EARLY_CAMPED_WAIT_FOR_SI"         },
    {13, "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"  },
    {14, "RR_W2G_INTERRAT_RESELECTION_PROGRESS"},
    {15, "RR_WAIT_FOR_EARLY_PSCAN"             },
    {16, "GRR51"                               },
    {17, "GRR52"                               },
    {18, "RR_G2W_INTERRAT_RESELECTION_PROGRESS"},
    {19, "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"  },
    {20, "RR_CELL_REEST"                       },
    {21, "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"  },
};

constexpr Format kMode = flagFormat("Voice", "Data");
constexpr Format kOnOrOff = flagFormat("OFF", "ON");
constexpr Format kSeconds = wholeFormat(" sec");

constexpr Field kStateFields[] = {
    bytesField("RR State", 13, 1, named<kRrStates>),
    bytesField("RR Sub State", 14, 1, decimal),
    bytesField("RR Status", 15, 1, decimal),
    bytesField("RR Mode", 16, 1, kMode),
};

// Deliberate: the bytes that "GSM Serving Cell" shows as C1 and C2, here uncut.
constexpr Field kMeasurementFields[] = {
    bytesField("Serving Rx Level", 15, 1, decimal),
    bytesField("Rx Quality Full", 16, 4, decimal),
    bytesField("Rx Quality Sub", 20, 4, decimal),
};

constexpr Field kDtxFields[] = {
    bytesField("DTX Used", 19, 1, kOnOrOff),
};

constexpr Field kCellOptionsFields[] = {
    bytesField("DRX Used", 16, 1, kSeconds),
};

constexpr PacketLayout kPackets[] = {
    {kGsmRrStateCode,      17, kStateFields      },
    {kGsmMeasurementCode,  29, kMeasurementFields},
    {kGsmDtxCode,          20, kDtxFields        },
    {kGprsCellOptionsCode, 24, kCellOptionsFields},
};

constexpr SectionLayout kLayout = {"GSM RR Info", "GSMRRInfo", UnknownCode::Report, kPackets};

} // namespace

GSMRRInfo::GSMRRInfo() : Section(kLayout) {}

} // namespace orvane
