#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/GSM/LogCodes.h"

namespace orvane
{

namespace
{

constexpr ValueName kSi13Positions[] = {
    {0,   "Located on BCCH"         },
    {1,   "Located on Extended BCCH"},
    {255, "Not Available"           },
};

constexpr ValueName kNetworkControlOrders[] = {
    {0,   "NC0"          },
    {1,   "NC1"          },
    {2,   "NC2"          },
    {255, "Not Available"},
};

constexpr ValueName kFlowControlSupports[] = {
    {0,   "Not Supported"},
    {1,   "Supported"    },
    {255, "Available"    }, // deliberate: elsewhere 255 is "Not Available"
};

constexpr ValueName kPriorityAccessThresholds[] = {
    {0,   "Barred (PKT access not allowed in the Cell)"},
    {1,   "Barred"                                     },
    {2,   "Barred"                                     },
    {3,   "1 Only"                                     },
    {4,   "1 to 2"                                     },
    {5,   "1 to 3"                                     },
    {6,   "1 to 4"                                     },
    {7,   "Allowed"                                    },
    {255, "Not Available"                              },
};

constexpr ValueName kT3192Times[] = {
    {0, "500" },
    {1, "1000"},
    {2, "1500"},
    {3, "0"   },
    {4, "80"  },
    {5, "120" },
    {6, "160" },
    {7, "200" },
};

constexpr ValueName kNetworkModes[] = {
    {0, "Class 1"},
    {1, "Class 2"},
    {2, "Class 3"},
};

constexpr Format kT3192Time = namesFormat(kT3192Times, "?? ms").withSuffix(" ms");
constexpr Format kBurstType = flagFormat("8-bit format", "11-bit format");
constexpr Format kSupported = flagFormat("Not Supported", "Supported");
constexpr Format kApplied = flagFormat("Not Applied", "Applied");

constexpr Field kSystemInformationFields[] = {
    bytesField("SI13 Position", 14, 1, named<kSi13Positions>),
};

constexpr Field kAccessFields[] = {
    bytesField("Network Control Order", 15, 1, named<kNetworkControlOrders>),
    bytesField("PFC Supported", 13, 1, named<kFlowControlSupports>),
    bytesField("Priority Access Threshold", 14, 1, named<kPriorityAccessThresholds>),
};

constexpr Field kCellOptionsFields[] = {
    bytesField("T3192", 15, 1, kT3192Time),
    bytesField("Access Burst Type", 17, 1, kBurstType),
    bytesField("DRX Timer Max", 16, 1, decimal),
};

constexpr Field kBroadcastChannelFields[] = {
    bytesField("PBCCH Present", 13, 1, decimal),
};

constexpr Field kPacketStatusFields[] = {
    bytesField("Ext Measurement Order", 16, 1, decimal),
    bytesField("Packet PSI Status", 13, 1, decimal),
    bytesField("Packet SI Status", 33, 1, kSupported),
    bytesField("Count LR", 14, 1, decimal),
    bytesField("Count HR", 15, 1, decimal),
};

constexpr Field kMeasurementFields[] = {
    bytesField("Cell Reselect Hysteresis", 26, 1, kApplied),
};

constexpr Field kServingPlmnFields[] = {
    bytesField("Network Operating Mode", 13, 1, named<kNetworkModes>),
};

constexpr PacketLayout kPackets[] = {
    {kGprsAccessCode,            18, kAccessFields           },
    {kServingPlmnCode,           32, kServingPlmnFields      },
    {kGprsCellOptionsCode,       24, kCellOptionsFields      },
    {kGprsBroadcastChannelCode,  34, kBroadcastChannelFields },
    {kGprsPacketStatusCode,      35, kPacketStatusFields     },
    {kGprsSystemInformationCode, 15, kSystemInformationFields},
    {kGsmMeasurementCode,        29, kMeasurementFields      },
};

constexpr SectionLayout kLayout = {"GPRS Information", "GPRSInformation", UnknownCode::Report,
                                   kPackets};

} // namespace

GPRSInformation::GPRSInformation() : Section(kLayout) {}

} // namespace orvane
