#pragma once

#include "LogGenerator/VRNLogGenerator2.h"

namespace orvane
{

// The generator for UTRAN diagnostics: sections of UTRANClassIndex, and the first template among
// the resources whose path contains "UTRAN", in whichever letter case. Where there is none, it is
// left without a base (see VRNLogGenerator2).
class UTRANLogGenerator final : public VRNLogGenerator2
{
public:
    void init();
    static std::unique_ptr<LogGenerator> generator();
};

} // namespace orvane
