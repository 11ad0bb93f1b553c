#pragma once

#include "LogGenerator/VRNLogGenerator2.h"

namespace orvane
{

// The generator for LTE diagnostics: template "LTE", sections of LTEClassIndex.
class LTELogGenerator final : public VRNLogGenerator2
{
public:
    ~LTELogGenerator() override;
    void init();
    static std::unique_ptr<LogGenerator> generator();
};

} // namespace orvane
