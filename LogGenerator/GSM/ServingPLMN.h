#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Serving PLMN": network, area and service of the serving cell, from the modem and from the
// telephony server's cells. The two show the codes differently ("01 " and "1"); the later one
// stands. This is meant.
class ServingPLMN final : public Section
{
public:
    ServingPLMN();
};

} // namespace orvane
