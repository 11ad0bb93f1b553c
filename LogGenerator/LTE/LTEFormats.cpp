#include "LogGenerator/LTE/LTEFormats.h"

#include "LogGenerator/Formats.h"

namespace orvane
{

RowText rsrpQuarterDb(std::int64_t raw) { return printed("%4.2f dBm", quarterDecibelPower(raw)); }

RowText rsrpHalfDb(std::int64_t raw) { return printed("%4.2f dBm", halfDecibelPower(raw)); }

RowText rsrqEighthDb(std::int64_t raw) { return printed("%4.2f dB", eighthDecibelQuality(raw)); }

RowText rsrqQuarterDb(std::int64_t raw) { return printed("%4.2f dB", quarterDecibelQuality(raw)); }

RowText rssiHalfDb(std::int64_t raw) { return printed("%4.2f dBm", halfDecibelPower(raw)); }

RowText minus30(std::int64_t raw) { return decibelMilliwatts(raw - 30); }

RowText qrxlevmin(std::int64_t raw) { return decibelMilliwatts(raw * 2 - 140); }

} // namespace orvane
