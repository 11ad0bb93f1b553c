#include "telephonyd/phone/RadioConnection.h"

#include <gmock/gmock.h>

#include <map>
#include <set>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using std::chrono::milliseconds;

TEST(RadioConnectionTest, StatesFollowOneAnotherAsTheNetworkAllows)
{
    using enum RadioState;
    const std::map<RadioState, std::set<RadioState>> allowed = {
        {Idle,       {Connecting}                    },
        {Connecting, {CellDch, CellFach}             },
        {CellDch,    {CellFach, Idle}                },
        {CellFach,   {CellDch, CellPch, UraPch, Idle}},
        {CellPch,    {CellFach}                      },
        {UraPch,     {CellFach}                      },
    };
    for (const unsigned seed : {1U, 2U, 3U}) {
        RadioConnection connection(seed);
        EXPECT_EQ(connection.state(), Idle);
        std::set<RadioState> seen;
        RadioState before = Idle;
        for (milliseconds now{0}; now < 300s; now += 40ms) {
            const bool changed = connection.advance(now);
            EXPECT_EQ(changed, connection.state() != before);
            if (changed) {
                EXPECT_TRUE(allowed.at(before).contains(connection.state()))
                    << static_cast<int>(before) << " to " << static_cast<int>(connection.state());
            }
            before = connection.state();
            seen.insert(before);
        }
        EXPECT_EQ(seen.size(), 6U);
        EXPECT_GE(connection.transfers(), 3U);
    }
}

TEST(RadioConnectionTest, AReleasedConnectionStaysIdleForAWhileAndComesBack)
{
    RadioConnection connection(1);
    milliseconds now{0};
    while (connection.state() != RadioState::CellDch)
        connection.advance(now += 40ms);
    connection.release(now);
    EXPECT_EQ(connection.state(), RadioState::Idle);
    EXPECT_FALSE(connection.advance(now + 5s));
    EXPECT_TRUE(connection.advance(now + 15s));
    EXPECT_EQ(connection.state(), RadioState::Connecting);
}

TEST(RadioConnectionTest, AnIdleConnectionIsMadeWhenItIsWanted)
{
    RadioConnection connection(1);
    EXPECT_FALSE(connection.advance(1s));
    connection.connect(1s);
    EXPECT_TRUE(connection.advance(1s));
    EXPECT_EQ(connection.state(), RadioState::Connecting);
    connection.connect(1s);
    EXPECT_FALSE(connection.advance(1s)) << "it is under way already";
}

} // namespace
} // namespace orvane
