#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// The LTE sections. Most of them are tables alone: one source each, and one line here.
// clang-format off
// "Connected mode LTE Intra-frequency Measurement": the serving cell as measured while connected.
struct ConnectedModeMeasurementMisc final : Section { ConnectedModeMeasurementMisc(); };
// "Measured Neighbor Cells": the neighbours measured while connected.
struct MeasuredNeighborCells final : ListSection { MeasuredNeighborCells(); };
// "Detected Cells": the cells that the modem found while connected but did not measure.
struct DetectedCells final : ListSection { DetectedCells(); };
// "Serving Cell Measurements": the serving cell as measured while idle, and the rules for measuring
// others.
struct ServingCellMeasurement final : Section { ServingCellMeasurement(); };
// "Neighbor Measurements": the channel on which neighbours were measured while idle.
struct NeighborMeasurementMisc final : Section { NeighborMeasurementMisc(); };
// "Reselection Candidates": the serving cell while candidates for reselection are ranked.
struct ReselectionCandidatesMisc final : Section { ReselectionCandidatesMisc(); };
// clang-format on

// "Serving Cell Info" of the LTE view: the serving cell's identity, channels and bandwidths, from
// two modem packets and from the telephony server's cells.
class LTEServingCellInfo final : public Section
{
public:
    LTEServingCellInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "Neighbor Cells List": the neighbours measured while idle. Logs what it shows.
class NeighborCellsList final : public ListSection
{
public:
    NeighborCellsList();

private:
    void fill(ListElements& elements, PacketView packet, const PacketLayout& layout) override;
};

// "Reselection Candidates List": the candidates, each with the fields of its technology.
class ReselectionCandidatesList final : public ListSection
{
public:
    ReselectionCandidatesList();

private:
    void fill(ListElements& elements, PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
