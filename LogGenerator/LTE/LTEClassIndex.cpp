#include "LogGenerator/LTE/LTEClassIndex.h"

#include "platform/Console.h"

namespace orvane
{

LTEClassIndex::LTEClassIndex() : objLTEServingCellInfo(make<LTEServingCellInfo>()) {}

LTEClassIndex::~LTEClassIndex() { consoleLine("Deallocing LTEClassIndex"); }

} // namespace orvane
