#include "recordings/Checkpoints.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

// So many are kept, however large they are.
constexpr std::size_t kFewest = 8;

// The last one for which the test holds. It must hold for all up to some place, and for none after.
template <typename Test>
const LogDecoder::Checkpoint* lastOf(const std::vector<LogDecoder::Checkpoint>& all,
                                     const Test& test)
{
    const auto behind = std::partition_point(all.begin(), all.end(), test);
    return behind == all.begin() ? nullptr : &*std::prev(behind);
}

} // namespace

void Checkpoints::pass(const LogDecoder& decoder)
{
    if (decoder.itemsTaken() % _spacing != 0)
        return;
    _all.push_back(decoder.checkpoint());
    _bytes += _all.back().bytes();
    while (_all.size() > kMost || (_bytes > kMostBytes && _all.size() > kFewest))
        thinOut();
}

void Checkpoints::thinOut()
{
    _spacing *= 2;
    std::erase_if(_all, [this](const LogDecoder::Checkpoint& each) {
        return each.place.itemsTaken % _spacing != 0;
    });
    _bytes = 0;
    for (const LogDecoder::Checkpoint& each : _all)
        _bytes += each.bytes();
}

const LogDecoder::Checkpoint* Checkpoints::before(LogTime time) const
{
    return lastOf(_all, [time](const LogDecoder::Checkpoint& each) {
        return each.place.itemsTaken == 0 || each.place.time < time;
    });
}

const LogDecoder::Checkpoint* Checkpoints::withCellChanges(std::uint64_t most) const
{
    return lastOf(_all, [most](const LogDecoder::Checkpoint& each) {
        return each.place.servingCellChanges <= most;
    });
}

} // namespace orvane
