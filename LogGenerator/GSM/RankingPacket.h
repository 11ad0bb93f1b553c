#pragma once

#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/Section.h"

namespace orvane
{

// The cell reselection ranking: a count of UMTS records, a count of GSM records, and the records.
// Deliberate: both sections read theirs from the same offset on.
constexpr std::size_t kRankingMinimumBytes = 15;
constexpr auto kUmtsRankingCount = countAt<13>;
constexpr auto kGsmRankingCount = countAt<14>;
constexpr auto kFirstRankingRecord = startAt<15>;

} // namespace orvane
