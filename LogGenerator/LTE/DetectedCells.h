#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Detected Cells": the cells that the modem found while connected but did not measure.
class DetectedCells final : public ListSection
{
public:
    DetectedCells();
};

} // namespace orvane
