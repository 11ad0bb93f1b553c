#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "GSM Serving Cell": identity, channel and levels of the GSM serving cell, from the modem and from
// the telephony server's cells.
class GSMServingCell final : public Section
{
public:
    GSMServingCell();
};

} // namespace orvane
