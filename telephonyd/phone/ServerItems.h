#pragma once

#include "platform/base/PropertyValue.h"
#include "telephonyd/phone/Scenario.h"

#include <initializer_list>
#include <span>
#include <utility>

namespace orvane
{

// The items that the telephony server makes itself: property lists under numbers.

// The value as XML in an item of that number. The value must be one that XML can carry.
PhoneMessage serverItem(std::uint16_t number, const PropertyValue& value);

constexpr std::uint16_t kSimFilesItem = 0;
constexpr std::uint16_t kCellsItem = 1;
constexpr std::uint16_t kDataConnectionsItem = 2;

// The files of a test card: mostly text, some as the card holds them.
PropertyValue simFiles();

// A cell as the server lists it: its technology, whether it serves the phone, the network of all
// towns (001 01), and the given numbers, rounded to whole ones.
PropertyValue listedCell(const char* technology, bool isServing,
                         std::initializer_list<std::pair<const char*, double>> numbers);

// The list of the serving cell and the others, each as the function makes it of its index.
template <typename Function>
PhoneMessage cellList(std::size_t serving, std::span<const std::size_t> others, Function listed)
{
    PropertyValue cells = PropertyValue::arrayOf({listed(serving, true)});
    for (const std::size_t cell : others)
        cells.asArray()->append(listed(cell, false));
    return serverItem(kCellsItem, cells);
}

} // namespace orvane
