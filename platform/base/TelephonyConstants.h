#pragma once

#include <cstdint>

namespace orvane
{

// The telephony server's constants. Each text is its own name.
#define ORVANE_TS_CONSTANT(name) inline constexpr const char* name = #name
ORVANE_TS_CONSTANT(kTSLogChannelTechnology_IFX);
ORVANE_TS_CONSTANT(kTSLogChannelTechnology_Varnel_GSM);
ORVANE_TS_CONSTANT(kTSLogChannelTechnology_Varnel_CDMA);
ORVANE_TS_CONSTANT(kTSLogChannelTechnology_Varnel_LTE);
ORVANE_TS_CONSTANT(kTSLogChannelTechnology_Varnel_UTRAN2);

ORVANE_TS_CONSTANT(kTSCellMonitorCellRadioAccessTechnology);
ORVANE_TS_CONSTANT(kTSCellMonitorRadioAccessTechnologyGSM);
ORVANE_TS_CONSTANT(kTSCellMonitorRadioAccessTechnologyUMTS);
ORVANE_TS_CONSTANT(kTSCellMonitorRadioAccessTechnologyLTE);
ORVANE_TS_CONSTANT(kTSCellMonitorRadioAccessTechnologyUTRAN2);
ORVANE_TS_CONSTANT(kTSCellMonitorCellType);
ORVANE_TS_CONSTANT(kTSCellMonitorCellTypeServing);
ORVANE_TS_CONSTANT(kTSCellMonitorCellTypeNeighbor);
ORVANE_TS_CONSTANT(kTSCellMonitorMCC);
ORVANE_TS_CONSTANT(kTSCellMonitorMNC);
ORVANE_TS_CONSTANT(kTSCellMonitorLAC);
ORVANE_TS_CONSTANT(kTSCellMonitorTAC);
ORVANE_TS_CONSTANT(kTSCellMonitorCellId);
ORVANE_TS_CONSTANT(kTSCellMonitorPID);
ORVANE_TS_CONSTANT(kTSCellMonitorBandInfo);
ORVANE_TS_CONSTANT(kTSCellMonitorARFCN);
ORVANE_TS_CONSTANT(kTSCellMonitorUARFCN);
ORVANE_TS_CONSTANT(kTSCellMonitorSCN);
ORVANE_TS_CONSTANT(kTSCellMonitorRSSI);
ORVANE_TS_CONSTANT(kTSCellMonitorRSCP);
ORVANE_TS_CONSTANT(kTSCellMonitorECN0);
#undef ORVANE_TS_CONSTANT

// Names of the transport: the server's own port, its message ids and the keys of its messages.
inline constexpr const char* kTelephonyServerPort = "TelephonyServer";
inline constexpr std::int32_t kCreateLogChannelMessage = 1;
inline constexpr std::int32_t kNotificationMessage = 2;
inline constexpr const char* kCreateLogChannelKey = "CreateLogChannel";
inline constexpr const char* kLogChannelErrorKey = "Error";
inline constexpr const char* kLogChannelPortKey = "Port";
inline constexpr const char* kNotificationNameKey = "Name";
inline constexpr const char* kNotificationInfoKey = "Info";
inline constexpr const char* kChannelStreamingNotification = "ChannelStreaming";
inline constexpr const char* kTechnologyChangedNotification = "TechnologyChanged";
inline constexpr const char* kModemMissingNotification = "ModemMissing";
inline constexpr const char* kModemPresentNotification = "ModemPresent";

// Those of a log channel: technology query, start command and log messages.
inline constexpr std::int32_t kChannelMessage = 0;
inline constexpr const char* kGetTechnologyKey = "GetTechnology";
inline constexpr const char* kSetStateKey = "SetState";
inline constexpr const char* kStreaming = "Streaming";
inline constexpr const char* kSetModemLogCodesKey = "SetVarnelLogCodes";
inline constexpr const char* kSetExtraCodesKey = "SetTsExtraCodes";

} // namespace orvane
