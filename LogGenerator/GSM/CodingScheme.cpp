#include "LogGenerator/GSM/Sections.h"

namespace orvane
{

namespace
{

// The text is that of the cell change counters, and meant.
constexpr SectionLayout kLayout = {"Coding Scheme", "CellChangeCounters", UnknownCode::Ignore, {}};

} // namespace

CodingScheme::CodingScheme() : Section(kLayout) {}

} // namespace orvane
