#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

namespace orvane
{

// A map from text to V that keeps the order in which keys were first stored. Small maps (nearly
// all of them: a display group, a command) are searched straight through; from kIndexedSize entries
// on, a hash index keeps a large hostile property list from costing quadratic time.
template <typename V>
class OrderedMap
{
public:
    using Entry = std::pair<std::string, V>;

    [[nodiscard]] std::size_t size() const { return _entries.size(); }
    [[nodiscard]] bool empty() const { return _entries.empty(); }
    auto begin() const { return _entries.begin(); }
    auto end() const { return _entries.end(); }

    // Null when the key is not there. The pointer holds until the map is next changed.
    [[nodiscard]] V* find(std::string_view key)
    {
        const std::size_t at = position(key);
        return at == _entries.size() ? nullptr : &_entries[at].second;
    }
    [[nodiscard]] const V* find(std::string_view key) const
    {
        const std::size_t at = position(key);
        return at == _entries.size() ? nullptr : &_entries[at].second;
    }

    // The value under the key, made with V's default at the end if it was not there.
    V& operator[](std::string_view key)
    {
        // A group's rows are mostly written again in the order in which they stand.
        if (_next < _entries.size() && _entries[_next].first == key)
            return _entries[_next++].second;
        const std::size_t at = position(key);
        _next = at + 1;
        if (at != _entries.size())
            return _entries[at].second;
        _entries.emplace_back(key, V());
        if (!_index.empty())
            _index.emplace(_entries.back().first, at);
        else if (_entries.size() >= kIndexedSize)
            rebuildIndex();
        return _entries.back().second;
    }

    // The same, where isKnown(value) can tell without comparing keys that a value is the key's.
    template <typename IsKnown>
    V& at(const char* key, IsKnown isKnown)
    {
        if (_next < _entries.size() && isKnown(_entries[_next].second))
            return _entries[_next++].second;
        for (std::size_t i = 0; i < _entries.size(); ++i)
            if (isKnown(_entries[i].second)) {
                _next = i + 1;
                return _entries[i].second;
            }
        return (*this)[key];
    }

    // The value at a place below size(), to be changed.
    [[nodiscard]] V& valueAt(std::size_t place) { return _entries[place].second; }

    void remove(std::string_view key)
    {
        const std::size_t at = position(key);
        if (at == _entries.size())
            return;
        _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(at));
        rebuildIndex();
    }

    void clear()
    {
        _entries.clear();
        _index.clear();
    }

    void reserve(std::size_t size) { _entries.reserve(size); }

private:
    static constexpr std::size_t kIndexedSize = 32;

    struct TextHash {
        using is_transparent = void;
        std::size_t operator()(std::string_view text) const
        {
            return std::hash<std::string_view>{}(text);
        }
    };

    [[nodiscard]] std::size_t position(std::string_view key) const
    {
        if (!_index.empty()) {
            const auto found = _index.find(key);
            return found == _index.end() ? _entries.size() : found->second;
        }
        for (std::size_t i = 0; i < _entries.size(); ++i)
            if (_entries[i].first == key)
                return i;
        return _entries.size();
    }

    void rebuildIndex()
    {
        _index.clear();
        if (_entries.size() < kIndexedSize)
            return;
        for (std::size_t i = 0; i < _entries.size(); ++i)
            _index.emplace(_entries[i].first, i);
    }

    std::vector<Entry> _entries;
    std::size_t _next = 0; // behind the entry that was written last
    std::unordered_map<std::string, std::size_t, TextHash, std::equal_to<>> _index;
};

} // namespace orvane
