#pragma once

#include "platform/plist/PropertyList.h"

#include <bit>
#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// A copy of exactly that size, so that the address sanitizer finds a read one byte beyond it.
inline Bytes bytesOf(std::string_view text) { return Bytes(text.begin(), text.end()); }

// Parses bytes from pairs of hexadecimal digits with a space between them.
inline Bytes hexBytes(std::string_view pairs)
{
    Bytes bytes;
    for (std::size_t at = 0; at < pairs.size(); at += 3)
        bytes.push_back(
            static_cast<std::uint8_t>(std::stoi(std::string(pairs.substr(at, 2)), nullptr, 16)));
    return bytes;
}

inline PropertyListResult readText(std::string_view text)
{
    return readPropertyList(bytesOf(text));
}

// An XML property list around the given root on one line, without an XML declaration.
inline std::string xmlList(std::string_view root)
{
    return "<plist version=\"1.0\">" + std::string(root) + "</plist>";
}

// Masks that corrupt a byte: each bit alone, and several bits.
constexpr int kFlippedBits[] = {1, 2, 4, 8, 16, 32, 64, 128, 0x0F, 0xF0, 0x7F, 0xFF};

// Builds a binary property list object by object, well-formed or not.
class BinaryListBuilder
{
public:
    using References = std::vector<std::size_t>;

    explicit BinaryListBuilder(std::size_t offsetBytes = 1, std::size_t referenceBytes = 1)
        : _offsetBytes(offsetBytes), _referenceBytes(referenceBytes)
    {
    }

    // Each adds one object and returns its index. The object added last is the root.
    std::size_t raw(const Bytes& object)
    {
        offsets.push_back(_bytes.size());
        _bytes.insert(_bytes.end(), object.begin(), object.end());
        return offsets.size() - 1;
    }
    std::size_t boolean(bool flag) { return raw({static_cast<std::uint8_t>(flag ? 0x09 : 0x08)}); }
    // `width` is 1, 2, 4, 8 or 16; the upper half of 16 bytes repeats the sign.
    std::size_t integer(std::int64_t number, std::size_t width)
    {
        Bytes object = {static_cast<std::uint8_t>(0x10 | std::countr_zero(width))};
        if (width == 16)
            object.insert(object.end(), 8, number < 0 ? 0xFF : 0);
        append(object, static_cast<std::uint64_t>(number), width == 16 ? 8 : width);
        return raw(object);
    }
    std::size_t real(double number) { return eightBytes(0x23, number); }
    std::size_t date(double secondsSince2001) { return eightBytes(0x33, secondsSince2001); }
    std::size_t data(const Bytes& bytes) { return counted(0x40, bytes.size(), bytes); }
    std::size_t ascii(std::string_view text) { return counted(0x50, text.size(), bytesOf(text)); }
    std::size_t utf16(std::u16string_view text)
    {
        Bytes content;
        for (const char16_t unit : text)
            append(content, unit, 2);
        return counted(0x60, text.size(), content);
    }
    std::size_t array(const References& elements) { return container(0xA0, elements, {}); }
    std::size_t set(const References& elements) { return container(0xC0, elements, {}); }
    std::size_t dictionary(const References& keys, const References& values)
    {
        return container(0xD0, keys, values);
    }

    [[nodiscard]] Bytes bytes() const
    {
        Bytes list = _bytes;
        for (const std::size_t offset : offsets)
            append(list, offset, _offsetBytes);
        list.insert(list.end(), 6, 0);
        append(list, _offsetBytes, 1);
        append(list, _referenceBytes, 1);
        append(list, offsets.size(), 8);
        append(list, offsets.size() - 1, 8);
        append(list, _bytes.size(), 8);
        return list;
    }
    [[nodiscard]] PropertyListResult read() const { return readPropertyList(bytes()); }

    static void append(Bytes& to, std::uint64_t number, std::size_t width)
    {
        for (std::size_t i = width; i-- > 0;)
            to.push_back(static_cast<std::uint8_t>(i < 8 ? number >> (8 * i) : 0));
    }

    // The offset table, for tests that corrupt it.
    std::vector<std::size_t> offsets;

private:
    std::size_t eightBytes(std::uint8_t marker, double number)
    {
        Bytes object = {marker};
        append(object, std::bit_cast<std::uint64_t>(number), 8);
        return raw(object);
    }
    std::size_t counted(std::uint8_t marker, std::size_t count, const Bytes& content)
    {
        Bytes object = {static_cast<std::uint8_t>(marker | (count < 15 ? count : 15))};
        if (count >= 15) {
            object.push_back(0x12);
            append(object, count, 4);
        }
        object.insert(object.end(), content.begin(), content.end());
        return raw(object);
    }
    std::size_t container(std::uint8_t marker, const References& first, const References& second)
    {
        Bytes content;
        for (const References* references : {&first, &second})
            for (const std::size_t reference : *references)
                append(content, reference, _referenceBytes);
        return counted(marker, first.size(), content);
    }

    std::size_t _offsetBytes;
    std::size_t _referenceBytes;
    Bytes _bytes = bytesOf("bplist00");
};

} // namespace orvane
