#include "LogGenerator/LTE/LTEFormats.h"

#include "LogGenerator/Formats.h"

namespace orvane
{

RowText rsrpQuarterDb(std::int64_t raw) { return fixedPoint(quarterDecibelPower(raw), 2, " dBm"); }

RowText rsrpHalfDb(std::int64_t raw) { return fixedPoint(halfDecibelPower(raw), 2, " dBm"); }

RowText rsrqEighthDb(std::int64_t raw) { return fixedPoint(eighthDecibelQuality(raw), 2, " dB"); }

RowText rsrqQuarterDb(std::int64_t raw) { return fixedPoint(quarterDecibelQuality(raw), 2, " dB"); }

RowText rssiHalfDb(std::int64_t raw) { return fixedPoint(halfDecibelPower(raw), 2, " dBm"); }

RowText minus30(std::int64_t raw) { return decibelMilliwatts(raw - 30); }

RowText qrxlevmin(std::int64_t raw) { return decibelMilliwatts(raw * 2 - 140); }

} // namespace orvane
