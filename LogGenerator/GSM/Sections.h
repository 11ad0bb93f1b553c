#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

#include <exception>
#include <map>

namespace orvane
{

// The GSM/UMTS sections. Most of them are tables alone: one source each, and one line here.
// clang-format off
// The GSM serving cell, its packet-service options, its radio-resource state.
struct GSMServingCell final : Section { GSMServingCell(); };
struct GPRSInformation final : Section { GPRSInformation(); };
struct GSMRRInfo final : Section { GSMRRInfo(); };
// Network, area and service of the serving cell, from the modem and from the telephony server.
// Deliberate: the two show the codes differently ("01 " and "1"), and the later one stands.
struct ServingPLMN final : Section { ServingPLMN(); };
// Mobility management and registration: of both services, circuit-switched, packet-switched.
struct ProcessCO final : Section { ProcessCO(); };
struct ProcessCS final : Section { ProcessCS(); };
struct ProcessPS final : Section { ProcessPS(); };
// The cells ranked for reselection; UMTSSet also takes the telephony server's neighbours, and shows
// whichever came last.
struct GSMSet final : ListSection { GSMSet(); };
struct UMTSSet final : ListSection { UMTSSet(); };
// Lists that stay empty (LogGenerator/GSM/AlwaysEmptySet.h).
struct DetectedSet final : ListSection { DetectedSet(); };
struct MonitoredSet final : ListSection { MonitoredSet(); };
struct VirtualActiveSet final : ListSection { VirtualActiveSet(); };
// Parts of the template for which nothing is decoded: they only log.
struct CellChangeCounters final : Section { CellChangeCounters(); };
struct CodingScheme final : Section { CodingScheme(); };
struct NonRankedGSMSet final : ListSection { NonRankedGSMSet(); };
struct NonRankedUMTSSet final : ListSection { NonRankedUMTSSet(); };
struct UMTSRRMeasurement final : Section { UMTSRRMeasurement(); };
// clang-format on

// "Active Set": the cells that the receiver combines, with their measured levels.
class ActiveSet final : public ListSection
{
public:
    ActiveSet();

private:
    void fill(ListElements& elements, PacketView packet, const PacketLayout& layout) override;
};

// "Mobile Allocation": the hopping sequence and its channels.
class MobileAllocation final : public Section
{
public:
    MobileAllocation();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "Neighboring Cells": the neighbours that the modem measured, or that the telephony server
// reports, whichever came last.
class NeighboringCells final : public ListSection
{
public:
    NeighboringCells();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
    void fill(ListElements& elements, PacketView packet, const PacketLayout& layout) override;
    [[nodiscard]] PropertyValue keptValues() const override;
    void takeKeptValues(const PropertyValue& values) override;
    void decodeBsicList(PacketView packet);

    // From the last BSIC list.
    std::map<std::int64_t, std::int64_t> arfcnToBsic;
};

// "PDP Context Info": the packet-data contexts as the telephony server lists them, with keys and
// values of its own.
class PDPContextList final : public ListSection
{
public:
    PDPContextList();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "Equivalent PLMN List": the networks that count as the registered one.
class EquivalentPLMNList final : public ListSection
{
public:
    EquivalentPLMNList();

private:
    void fill(ListElements& elements, PacketView packet, const PacketLayout& layout) override;
};

// "UMTS RR Info": RRC state, identity and frequencies of the serving cell, ciphering and the mean
// uplink power.
class UMTSRRInfo final : public Section
{
public:
    UMTSRRInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "BLER": how many blocks of each transport channel came with a wrong checksum.
class BLER final : public Section
{
public:
    BLER();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// The telephony server's record of SIM files.
struct LogCode_0xFF0000 {
    // The record is no property list. It ends the decoding of that message.
    class UnknownDataException : public std::exception
    {
    public:
        [[nodiscard]] const char* what() const noexcept override
        {
            return "the SIM file dictionary is not a property list";
        }
    };
};

// "SIM Info": elementary files of the SIM as the telephony server reports them, each value as it
// came. A file that is no longer reported keeps its row. Throws
// LogCode_0xFF0000::UnknownDataException for a record that cannot be parsed.
class SimInfo final : public Section
{
public:
    SimInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "HSDPA Info": the carrier configuration, and what each HARQ process of the primary and of the
// secondary carrier received.
class HSDPAInformation final : public Section
{
public:
    HSDPAInformation();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
