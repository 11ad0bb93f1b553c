#pragma once

#include "platform/PropertyValue.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// What a request for a log channel came to.
struct LogChannelResult {
    std::int32_t error = 0;          // 0 = success
    std::optional<std::string> port; // name of the server's port for the channel
};

// A connection to the telephony server. Releasing it right after the channel is made is fine: the
// platform keeps what notifications need until the ports of that channel are gone.
class TelephonyServerConnection
{
public:
    virtual ~TelephonyServerConnection() = default;
    // Asks for a network-monitor log channel to the local port of that name. Takes at most 1.0 s to
    // send and 1.0 s to be answered: error -2 when no answer comes in time, -4 when it is unusable.
    virtual LogChannelResult createNetworkMonitorLogChannel(const std::string& localPortName) = 0;
};

class TelephonyServer
{
public:
    // Name and info (absent where there is none) of a notification, on the main queue.
    using NotificationCallback =
        std::function<void(const std::string& name, const PropertyValue& info)>;

    virtual ~TelephonyServer() = default;
    // Null when there is no server.
    virtual std::unique_ptr<TelephonyServerConnection>
    createConnection(NotificationCallback callback) = 0;
};

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

// Those of a log channel: technology query, start command and log messages.
inline constexpr std::int32_t kChannelMessage = 0;
inline constexpr const char* kGetTechnologyKey = "GetTechnology";
inline constexpr const char* kSetStateKey = "SetState";
inline constexpr const char* kStreaming = "Streaming";
inline constexpr const char* kSetModemLogCodesKey = "SetVarnelLogCodes";
inline constexpr const char* kSetExtraCodesKey = "SetTsExtraCodes";

} // namespace orvane
