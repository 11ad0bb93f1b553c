#include "telephonyd/modem/DiagnosticRequest.h"

#include "platform/base/Bytes.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using Kind = DiagnosticAnswer::Kind;

Bytes payloadOf(const DiagnosticRequest& request)
{
    return Bytes(request.payload().begin(), request.payload().end());
}

Bytes operator+(Bytes left, const Bytes& right)
{
    left.insert(left.end(), right.begin(), right.end());
    return left;
}

const Bytes kOff = {0x73, 0, 0, 0, 0, 0, 0, 0};
const Bytes kRanges = {0x73, 0, 0, 0, 1, 0, 0, 0};
const Bytes kMask = {0x73, 0, 0, 0, 3, 0, 0, 0};
const Bytes kGood = {0, 0, 0, 0};
const Bytes kGroupB = {0xB, 0, 0, 0, 11, 0, 0, 0};
const Bytes kPlaces0And10 = {0x01, 0x04};

DiagnosticRequest maskOfGroupB() { return DiagnosticRequest::setMask(0xB, 11, {0, 10}); }

TEST(DiagnosticRequestTest, RequestsAreTheseBytes)
{
    EXPECT_EQ(payloadOf(DiagnosticRequest::version()), Bytes{0});
    EXPECT_EQ(payloadOf(DiagnosticRequest::ranges()), kRanges);
    EXPECT_EQ(payloadOf(DiagnosticRequest::allOff()), kOff);
    EXPECT_EQ(payloadOf(maskOfGroupB()), kMask + kGroupB + kPlaces0And10);
}

TEST(DiagnosticRequestTest, AMaskHasABitForEachCodeOfTheGroup)
{
    EXPECT_EQ(payloadOf(DiagnosticRequest::setMask(1, 8, {7})).size(), 17U);
    EXPECT_EQ(payloadOf(DiagnosticRequest::setMask(1, 9, {7})).size(), 18U);
    EXPECT_EQ(payloadOf(DiagnosticRequest::setMask(1, 4096, {})).size(), 16U + 512);
    EXPECT_EQ(payloadOf(DiagnosticRequest::setMask(1, 8, {7})).back(), 0x80);
    // A code outside the group has no bit.
    EXPECT_EQ(payloadOf(DiagnosticRequest::setMask(1, 8, {8})).back(), 0);
}

TEST(DiagnosticRequestTest, GroupAndPlaceOfACode)
{
    EXPECT_EQ(logGroupOf(0xB0C2), 0xBU);
    EXPECT_EQ(logPlaceOf(0xB0C2), 0x0C2U);
    EXPECT_EQ(logGroupOf(0x1183), 1U);
    EXPECT_EQ(logPlaceOf(0x1FFF), 0xFFFU);
}

TEST(DiagnosticRequestTest, AnswersAreToldFromWhatIsNone)
{
    const Bytes groupA = {0xA, 0, 0, 0, 11, 0, 0, 0};
    const Bytes bad = {1, 0, 0, 0};
    const Bytes item = {0x10, 0, 12, 0};
    const Bytes unknown = {0x13};
    const Bytes badParameters = {0x14};
    const Bytes badLength = {0x15};
    const Bytes notNow = {0x18};
    const Bytes command = {0x73};
    const auto version = DiagnosticRequest::version();
    const auto off = DiagnosticRequest::allOff();
    const auto ranges = DiagnosticRequest::ranges();
    const auto mask = maskOfGroupB();
    const Bytes whole = kMask + kGood + kGroupB + kPlaces0And10;
    const struct {
        const char* name;
        const DiagnosticRequest& request;
        Bytes payload;
        std::optional<Kind> kind;
    } cases[] = {
        {"one byte is a version",  version, Bytes(1),                               Kind::Done   },
        {"a version text",         version, Bytes(40),                              Kind::Done   },
        {"nothing",                version, Bytes(),                                std::nullopt },
        {"a log item",             version, item,                                   std::nullopt },
        {"off",                    off,     kOff + kGood,                           Kind::Done   },
        {"off, failed",            off,     kOff + bad,                             Kind::Failed },
        {"off, cut short",         off,     kOff + Bytes(3),                        std::nullopt },
        {"of another operation",   off,     kRanges + kGood,                        std::nullopt },
        {"ranges",                 ranges,  kRanges + kGood + Bytes(64),            Kind::Done   },
        {"ranges, cut short",      ranges,  kRanges + kGood + Bytes(63),            std::nullopt },
        {"ranges, failed",         ranges,  kRanges + bad,                          Kind::Failed },
        {"mask",                   mask,    whole,                                  Kind::Done   },
        {"mask of another group",  mask,    kMask + kGood + groupA + kPlaces0And10, std::nullopt },
        {"mask, cut short",        mask,    kMask + kGood + Bytes(2),               std::nullopt },
        {"mask, failed",           mask,    kMask + bad + kGroupB,                  Kind::Failed },
        {"mask, failed, in short", mask,    kMask + bad,                            Kind::Failed },
        {"unknown command",        ranges,  unknown + kRanges,                      Kind::Refused},
        {"bad parameters",         ranges,  badParameters + kRanges,                Kind::Refused},
        {"bad length",             ranges,  badLength + kRanges,                    Kind::Refused},
        {"not now",                ranges,  notNow + kRanges,                       Kind::NotNow },
        {"refusal of another",     ranges,  unknown + kOff,                         std::nullopt },
        {"refusal cut short",      ranges,  unknown + command,                      std::nullopt },
        {"refusal of nothing",     version, unknown,                                std::nullopt },
        {"refusal of a version",   version, unknown + Bytes(1),                     Kind::Refused},
    };
    for (const auto& each : cases) {
        const auto answer = each.request.answerIn(each.payload);
        ASSERT_EQ(answer.has_value(), each.kind.has_value()) << each.name;
        if (answer) {
            EXPECT_EQ(answer->kind, *each.kind) << each.name;
        }
    }
}

TEST(DiagnosticRequestTest, RangesAreSixteenLittleEndianNumbers)
{
    Bytes payload = kRanges + kGood;
    for (std::uint8_t group = 0; group < 16; ++group)
        payload = payload + Bytes{group, 0x0F, 0, 0};
    const auto answer = DiagnosticRequest::ranges().answerIn(payload);
    ASSERT_TRUE(answer);
    EXPECT_EQ(answer->ranges[0], 0xF00U);
    EXPECT_EQ(answer->ranges[15], 0xF0FU);
}

TEST(DiagnosticRequestTest, ALogItemIsWhatStandsBehindItsOuterLength)
{
    const Bytes item = {14, 0, 0xC2, 0xB0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10};
    const Bytes payload = Bytes{0x10, 3, 14, 0} + item;
    const DiagnosticItem found = diagnosticItemIn(payload);
    EXPECT_TRUE(found.isItem);
    EXPECT_EQ(Bytes(found.bytes.begin(), found.bytes.end()), item);
    EXPECT_FALSE(diagnosticItemIn(kOff).isItem);
    EXPECT_FALSE(diagnosticItemIn({}).isItem);
}

TEST(DiagnosticRequestTest, AnItemThatContradictsItselfIsEmpty)
{
    const Bytes whole = {0x10, 0, 13, 0, 13, 0, 0xC2, 0xB0, 1, 2, 3, 4, 5, 6, 7, 8, 9};
    ASSERT_FALSE(diagnosticItemIn(whole).bytes.empty());
    for (std::size_t size = 1; size < whole.size(); ++size) {
        const Bytes shorter(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
        EXPECT_TRUE(diagnosticItemIn(shorter).isItem) << size;
        EXPECT_TRUE(diagnosticItemIn(shorter).bytes.empty()) << size;
    }
    Bytes outer = whole;
    outer[2] = 12;
    Bytes inner = whole;
    inner[4] = 12;
    Bytes headerOnly = {0x10, 0, 11, 0, 11, 0, 0xC2, 0xB0, 1, 2, 3, 4, 5, 6, 7};
    for (const Bytes& payload : {outer, inner, whole + Bytes(1), headerOnly})
        EXPECT_TRUE(diagnosticItemIn(payload).bytes.empty());
}

} // namespace
} // namespace orvane
