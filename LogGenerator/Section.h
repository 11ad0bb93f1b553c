#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Field.h"
#include "LogGenerator/Records.h"
#include "platform/SystemLog.h"

#include <span>

namespace orvane
{

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
};

// One packet that a section understands. `fields` are the rows that it writes; a list section's
// packet has `records` instead.
struct PacketLayout {
    std::uint32_t logCode;
    std::size_t minimumBytes;
    std::span<const Field> fields = {};
    const RecordLayout* records = nullptr;
};

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
// drops one that is too short, and decodes it: writes the packet's rows into the display. Sections
// with rules of their own override decode().
class Section : public Base
{
public:
    void updateWithData(ByteView data, std::uint32_t logCode) final;
    [[nodiscard]] std::string getSectionName() const final { return _layout->name; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const final;

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
    void decode(PacketView packet, const PacketLayout& layout) final;
    // The elements that the packet's list has; by default a dictionary of rows a record.
    virtual std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout);
};

} // namespace orvane
