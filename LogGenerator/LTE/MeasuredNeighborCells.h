#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Measured Neighbor Cells": the neighbours measured while connected.
class MeasuredNeighborCells final : public ListSection
{
public:
    MeasuredNeighborCells();
};

} // namespace orvane
