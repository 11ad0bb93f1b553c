#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/CellMonitor.h"
#include "LogGenerator/Field.h"
#include "LogGenerator/Records.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

#include <span>

namespace orvane
{

// For RecordLayout: a count in the byte at a fixed offset, and records that start at one.
template <std::size_t Offset>
std::size_t countAt(PacketView packet)
{
    return packet.unsignedAt(Offset, 1).value_or(0);
}
template <std::size_t Offset>
std::size_t startAt(PacketView)
{
    return Offset;
}

// Where a packet's records stand: how many, and at which offset the first.
struct RecordLayout {
    std::size_t (*count)(PacketView packet);
    std::size_t (*first)(PacketView packet);
    std::size_t stride;
    std::span<const Field> fields;

    [[nodiscard]] Records in(PacketView packet) const
    {
        return Records(packet, first(packet), stride, count(packet));
    }
    // Adds a dictionary of rows for each record.
    void addTo(ListElements& elements, PacketView packet) const
    {
        elements.addAll(in(packet), fields);
    }
};

// One packet that a section understands. `fields` are the rows that it writes; a list section's
// packet has `records` instead, a cell-monitor record `cells`.
struct PacketLayout {
    std::uint32_t logCode;
    std::size_t minimumBytes;
    std::span<const Field> fields = {};
    const RecordLayout* records = nullptr;
    const CellLayout* cells = nullptr;
};

// For tables of packets of different kinds.
constexpr PacketLayout rowsPacket(std::uint32_t logCode, std::size_t minimumBytes,
                                  std::span<const Field> fields)
{
    return {logCode, minimumBytes, fields};
}
constexpr PacketLayout recordsPacket(std::uint32_t logCode, std::size_t minimumBytes,
                                     const RecordLayout& records)
{
    return {logCode, minimumBytes, {}, &records};
}
constexpr PacketLayout cellsPacket(const CellLayout& cells)
{
    return {kCellMonitorCode, 0, {}, nullptr, &cells};
}
// One that the section decodes by itself.
constexpr PacketLayout ownPacket(std::uint32_t logCode, std::size_t minimumBytes)
{
    return {logCode, minimumBytes};
}

// What a section does with a log code that none of its packets has.
enum class UnknownCode { Report, Ignore };

// All that most sections are: a name, the line that is logged on every call, and the packets, whose
// codes in this order are the section's log codes.
struct SectionLayout {
    const char* name;
    const char* callText;
    UnknownCode unknownCode;
    std::span<const PacketLayout> packets;
    LogPriority callPriority = LogPriority::Warning;
};

// A section that a layout describes. Every call logs the call text, finds the packet by its code,
// drops one that is too short, and decodes it: writes the packet's rows, or those of the first
// wanted cell, into the display. Sections with rules of their own override decode().
class Section : public Base
{
public:
    void updateWithData(ByteView data, std::uint32_t logCode) final;
    [[nodiscard]] std::string getSectionName() const final { return _layout->name; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const final;
    [[nodiscard]] const SectionLayout& layout() const { return *_layout; }

protected:
    // The layout is static data of the subclass and outlives the section.
    explicit Section(const SectionLayout& layout) : _layout(&layout) {}

    virtual void decode(PacketView packet, const PacketLayout& layout);
    static void reportUnknownCode(std::uint32_t logCode);

private:
    const SectionLayout* _layout;
};

// A section whose part of the display is an array of records, rebuilt from each packet: emptied
// first, so that a packet without records leaves an empty list.
class ListSection : public Section
{
public:
    [[nodiscard]] PropertyValue::Type subtreeType() const final
    {
        return PropertyValue::Type::Array;
    }

protected:
    using Section::Section;
    void decode(PacketView packet, const PacketLayout& layout) override;
    // Adds the elements that the packet's list has; by default a dictionary of rows a record, or
    // one for each wanted cell.
    virtual void fill(ListElements& elements, PacketView packet, const PacketLayout& layout);

private:
    ListElements _elements;
};

} // namespace orvane
