#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Coding Scheme": decodes nothing; it is there for the template to name, and only logs.
class CodingScheme final : public Section
{
public:
    CodingScheme();
};

} // namespace orvane
