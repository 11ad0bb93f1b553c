#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/Cells.h"
#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/GSM/NasTables.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr Field kRegistrationFields[] = {
    bytesField("PLMN Sel Mod", 14, 1, named<kPlmnSelectionModes>),
};

// A digit of a code, or a blank for a filler.
char digit(std::int64_t identity, unsigned nibble)
{
    const std::int64_t value = identity >> (4 * nibble) & 0xF;
    return value < 10 ? static_cast<char>('0' + value) : ' ';
}

// The identity's three bytes hold its digits from the low half of the first byte on as
// MCC 1, MCC 2, MCC 3, MNC 3, MNC 1, MNC 2.
std::string countryCode(std::int64_t identity)
{
    return {digit(identity, 0), digit(identity, 1), digit(identity, 2)};
}

std::string networkCode(std::int64_t identity)
{
    return {digit(identity, 4), digit(identity, 5), digit(identity, 3)};
}

constexpr Format kCountryCode(countryCode);
constexpr Format kNetworkCode(networkCode);

constexpr Field kPlmnFields[] = {
    bytesField("Mobile Country Code", 15, 3, kCountryCode),
    bytesField("Mobile Network Code", 15, 3, kNetworkCode),
    bytesField("Location Area Code", 18, 2, decimal, Coding::BigEndian),
    bytesField("Routing Area Code", 20, 1, decimal),
    bytesField("Service Type", 14, 1, named<kServiceTypes>),
};

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorMCC, "Mobile Country Code", "ServingPLMN: Failed to retrieve MCC\n"),
    cellRow(kTSCellMonitorMNC, "Mobile Network Code", "ServingPLMN: Failed to retrieve MNC\n"),
    cellRow(kTSCellMonitorLAC, "Location Area Code", "ServingPLMN: Failed to retrieve LAC\n"),
};

bool isServingCell(const PropertyValue& cell)
{
    return isServingUmtsCell(cell) || isServingGsmCell(cell);
}

constexpr CellLayout kServingCell = {isServingCell, kCellRows};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kServingPlmnCode, 32, kPlmnFields),
    rowsPacket(kRegistrationCode, 16, kRegistrationFields),
    cellsPacket(kServingCell),
};

constexpr SectionLayout kLayout = {"Serving PLMN", "Serving PLMN", UnknownCode::Report, kPackets};

} // namespace

ServingPLMN::ServingPLMN() : Section(kLayout) {}

} // namespace orvane
