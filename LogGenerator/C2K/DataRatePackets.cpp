#include "LogGenerator/C2K/C2KDecoders.h"
#include "LogGenerator/Formats.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

#include <iterator>

// The data rates: each packet has counters of frames sent at every rate; the bits between two
// packets over the sequence numbers between them are the data rate.

namespace orvane
{

namespace
{

constexpr Format kRateFormat = realFormat(2, " kbps");
constexpr RowDescription kForwardRate = {"kFLDataRate", &kRateFormat};
constexpr RowDescription kReverseRate = {"kRLDataRate", &kRateFormat};

// Where one direction keeps the totals of its last packet, in the state and for the record in
// "ExtraInfo" (1 is the last packet, 2 the one before it).
struct Direction {
    const RowDescription* rate;
    const char* sequenceKey;
    const char* sentKey;
    const char* sequenceBeforeKey;
    const char* sentBeforeKey;
    const char* sequenceLastKey;
    const char* sentLastKey;
};

constexpr Direction kForward = {&kForwardRate, "FLDataSeqNum",  "FLDataSent", "FLDataSeqNum2",
                                "FLDataSent2", "FLDataSeqNum1", "FLDataSent1"};
constexpr Direction kReverse = {&kReverseRate, "RLDataSeqNum",  "RLDataSent", "RLDataSeqNum2",
                                "RLDataSent2", "RLDataSeqNum1", "RLDataSent1"};

struct Totals {
    std::int64_t sequence;
    std::int64_t sent; // bits
};

std::optional<Totals> storedTotals(const PropertyDictionary& state, const Direction& direction)
{
    const auto sequence = state[direction.sequenceKey].asInteger();
    const auto sent = state[direction.sentKey].asInteger();
    if (!sequence || !sent)
        return std::nullopt;
    return Totals{*sequence, *sent};
}

double rateBetween(const Totals& before, const Totals& now, std::int32_t sequences)
{
    const auto bits = static_cast<double>(now.sent - before.sent);
    return bits / (static_cast<double>(sequences) * 1024);
}

void store(PropertyDictionary* to, const char* sequenceKey, const char* sentKey,
           const Totals& totals)
{
    if (!to)
        return;
    to->set(sequenceKey, PropertyValue::integer(totals.sequence));
    to->set(sentKey, PropertyValue::integer(totals.sent));
}

void publishRate(const Totals& now, const Direction& direction, PropertyDictionary& state,
                 const C2KPublisher& publisher)
{
    PropertyDictionary* extra = state[kExtraInfoKey].asDictionary();
    if (const auto before = storedTotals(state, direction)) {
        const auto sequences =
            static_cast<std::int32_t>(static_cast<std::uint32_t>(now.sequence) -
                                      static_cast<std::uint32_t>(before->sequence));
        if (sequences >= 1)
            publisher.publishReading(*direction.rate,
                                     bitsOfValue(rateBetween(*before, now, sequences)));
        store(extra, direction.sequenceBeforeKey, direction.sentBeforeKey, *before);
    } else {
        publisher.publish(direction.rate->row, "");
    }
    store(&state, direction.sequenceKey, direction.sentKey, now);
    store(extra, direction.sequenceLastKey, direction.sentLastKey, now);
}

// Bits that a counted frame of each rate carries.
constexpr std::int64_t kForwardWeights[] = {
    128,  256,  512, 1024, 0,    128,  256,  512,  1024, 0,    128,  256,  512,  1024,
    0,    128,  256, 512,  1024, 0,    128,  256,  512,  1024, 0,    512,  1024, 2048,
    0,    128,  256, 512,  1024, 0,    512,  1024, 2048, 0,    1024, 3072, 0,    512,
    1024, 2048, 0,   4096, 0,    1024, 3072, 0,    4096, 0,    5120, 0,    5120, 0};
static_assert(std::size(kForwardWeights) == 56);
constexpr std::size_t kFirstForwardCounter = 17;
constexpr std::size_t kForwardBytes = 241;
static_assert(kFirstForwardCounter + 4 * std::size(kForwardWeights) <= kForwardBytes);

std::int64_t forwardBits(PacketView packet)
{
    std::int64_t bits = 0;
    for (std::size_t i = 0; i < std::size(kForwardWeights); ++i) {
        const auto counter = packet.unsignedAt(kFirstForwardCounter + 4 * i, 4).value_or(0);
        bits += static_cast<std::int64_t>(counter) * kForwardWeights[i];
    }
    return bits;
}

constexpr std::int64_t kReverseWeights[] = {128,  256,  512,  768,  1024, 1536,
                                            2048, 3072, 4096, 6144, 8192, 12288};
constexpr std::size_t kReverseCounters[] = {18, 22, 26, 30, 306, 310, 314, 318};
constexpr std::size_t kReverseBlocks = 3;
constexpr std::size_t kReverseBytes = 1750;
static_assert(24 * (std::size(kReverseWeights) - 1) + 576 * (kReverseBlocks - 1) + 318 + 4 <=
              kReverseBytes);

std::int64_t reverseBits(PacketView packet)
{
    std::int64_t bits = 0;
    for (std::size_t rate = 0; rate < std::size(kReverseWeights); ++rate)
        for (std::size_t block = 0; block < kReverseBlocks; ++block)
            for (const std::size_t offset : kReverseCounters) {
                const auto counter = packet.unsignedAt(24 * rate + 576 * block + offset, 4);
                bits += static_cast<std::int64_t>(counter.value_or(0)) * kReverseWeights[rate];
            }
    return bits;
}

} // namespace

void decodeForwardDataRate(PacketView packet, PropertyDictionary& state,
                           const C2KPublisher& publisher)
{
    if (packet.size() < kForwardBytes) {
        logError("Log code 0x1192 is %d bytes long but must be at least %ld bytes.",
                 static_cast<int>(packet.size()), static_cast<long>(kForwardBytes));
        return;
    }
    const auto sequence = static_cast<std::int64_t>(packet.unsignedAt(13, 4).value_or(0));
    publishRate({sequence, forwardBits(packet)}, kForward, state, publisher);
}

void decodeReverseDataRate(PacketView packet, PropertyDictionary& state,
                           const C2KPublisher& publisher)
{
    if (packet.size() < kReverseBytes) {
        logError("Log code 0x127e is %d bytes long but must be at least %ld bytes.",
                 static_cast<int>(packet.size()), static_cast<long>(kReverseBytes));
        return;
    }
    const auto sequence = static_cast<std::int64_t>(packet.unsignedAt(14, 4).value_or(0));
    publishRate({sequence, reverseBits(packet)}, kReverse, state, publisher);
}

} // namespace orvane
