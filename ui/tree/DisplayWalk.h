#pragma once

#include "platform/base/PropertyValue.h"

#include <algorithm>
#include <charconv>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace orvane
{

// How a display value is read as groups and rows. The caller holds the array lock.

// Whether the value is a group: a dictionary or an array. Any other value is a row.
inline bool isDisplayGroup(const PropertyValue& value)
{
    return value.asDictionary() || value.asArray();
}

// The text that a row shows: "(unknown)" if the value is not a text.
std::string displayText(const PropertyValue& row);

// Under a key "_sorted" the keys are shown in the order of their characters, not of numbers: "10;Y"
// before "2;X".
inline constexpr const char* kSortedKey = "_sorted";
// The name that is shown for such a key: "Serving Cell" for "01;Serving Cell". A key with any other
// number of parts is shown whole.
std::string_view nameOfSortedKey(std::string_view key);

// A name as it is shown: cut after this many bytes, at the end of a character.
inline constexpr std::size_t kLongestName = 1024;
std::string_view shownName(std::string_view name);

// Calls visit(std::string_view name, const PropertyValue& child) for each child of a group, in the
// order in which they are shown. A row has none. The group must not change meanwhile.
template <typename Visit>
void forEachDisplayChild(const PropertyValue& group, const Visit& visit)
{
    if (const PropertyArray* array = group.asArray()) {
        char name[20];
        for (std::size_t i = 0; i < array->size(); ++i) {
            const char* end = std::to_chars(name, name + sizeof name, i).ptr;
            visit(std::string_view(name, end), (*array)[i]);
        }
        return;
    }
    const PropertyDictionary* dictionary = group.asDictionary();
    if (!dictionary)
        return;
    if (!dictionary->contains(kSortedKey)) {
        for (const auto& [key, child] : *dictionary)
            visit(shownName(key), child);
        return;
    }
    using Entry = const std::pair<std::string, PropertyValue>*;
    std::vector<Entry> entries;
    for (const auto& entry : *dictionary)
        if (entry.first != kSortedKey)
            entries.push_back(&entry);
    std::sort(entries.begin(), entries.end(),
              [](Entry left, Entry right) { return left->first < right->first; });
    for (const Entry entry : entries)
        visit(shownName(nameOfSortedKey(entry->first)), entry->second);
}

} // namespace orvane
