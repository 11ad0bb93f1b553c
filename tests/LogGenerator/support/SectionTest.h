#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/support/PacketBuilder.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace orvane
{

// What a display dictionary shows, in order: a row's text, or for a nested array its description.
using Rows = std::vector<std::pair<std::string, std::string>>;

inline Rows rowsOf(const PropertyValue& value)
{
    Rows rows;
    if (const PropertyDictionary* dictionary = value.asDictionary())
        for (const auto& [key, row] : *dictionary)
            rows.emplace_back(key, row.description());
    return rows;
}

// The integers of a list; -1 for any other element.
inline std::vector<std::int64_t> integersOf(const PropertyValue& list)
{
    std::vector<std::int64_t> numbers;
    if (const PropertyArray* array = list.asArray())
        for (const PropertyValue& number : *array)
            numbers.push_back(number.asInteger().value_or(-1));
    return numbers;
}

// The rows of each element of a list.
inline std::vector<Rows> recordsOf(const PropertyValue& list)
{
    std::vector<Rows> all;
    if (const PropertyArray* array = list.asArray())
        for (const PropertyValue& element : *array)
            all.push_back(rowsOf(element));
    return all;
}

// A section with a display of its own, as if a template had given it one.
template <typename SectionUnderTest>
class SectionTest : public ::testing::Test
{
protected:
    SectionTest()
        : display(section.subtreeType() == PropertyValue::Type::Array
                      ? PropertyValue::newArray()
                      : PropertyValue::newDictionary())
    {
        section.initWithDict(classDict, codeDict);
        section.updateSectionRef(display);
        services.log.lines.clear();
    }

    // Sends an exactly sized copy, so that the address sanitizer sees one byte too many.
    void send(std::uint32_t code, const Bytes& packet)
    {
        const Bytes exact(packet.begin(), packet.end());
        section.updateWithData(exact, code);
    }
    // The same, cut to the first `size` bytes.
    void sendCut(std::uint32_t code, const Bytes& packet, std::size_t size)
    {
        send(code, Bytes(packet.begin(), packet.begin() + static_cast<std::ptrdiff_t>(size)));
    }

    [[nodiscard]] std::string row(std::string_view key) const
    {
        return display[key] ? display[key].description() : "(no row)";
    }
    [[nodiscard]] Rows rows() const { return rowsOf(display); }
    // The rows of each element of a list section.
    [[nodiscard]] std::vector<Rows> records() const { return recordsOf(display); }

    // Every cut of the packet below `minimum` bytes changes nothing in the display and logs no
    // error.
    void expectShorterIsIgnored(std::uint32_t code, const Bytes& packet, std::size_t minimum)
    {
        const PropertyValue before = display.deepCopy();
        services.log.lines.clear();
        for (std::size_t size = 0; size < minimum; ++size) {
            sendCut(code, packet, size);
            EXPECT_EQ(display.description(), before.description()) << code << " cut to " << size;
        }
        EXPECT_EQ(services.log.errors(), std::vector<std::string>()) << code;
    }
    // Another code leaves the display as it is and is reported by its number.
    void expectReported(std::uint32_t code)
    {
        const PropertyValue before = display.deepCopy();
        services.log.lines.clear();
        send(code, PacketBuilder(code, 64));
        EXPECT_EQ(
            services.log.errors(),
            std::vector<std::string>({"Received an unknown log message: " + std::to_string(code)}));
        EXPECT_EQ(display.description(), before.description());
    }

    TestServices services;
    ClassDictionary classDict;
    CodeDictionary codeDict;
    SectionUnderTest section;
    PropertyValue display;
};

} // namespace orvane
