#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/LTE/LTEServingCellInfo.h"

namespace orvane
{

// The LTE sections, in the order in which they are made, called and released.
class LTEClassIndex final : public ClassIndex
{
public:
    LTEClassIndex();
    ~LTEClassIndex() override;

private:
    std::unique_ptr<LTEServingCellInfo> objLTEServingCellInfo;
};

} // namespace orvane
