#pragma once

#include <gtest/gtest.h>

#include <grp.h>
#include <sys/types.h>
#include <unistd.h>
#include <vector>

namespace orvane
{

// Lets the test's process be another user, with that user's groups, for the life of this object.
// Only root can.
class EffectiveUser
{
public:
    EffectiveUser(uid_t user, gid_t group, const std::vector<gid_t>& supplementary = {})
        : _formerGroups(static_cast<std::size_t>(::getgroups(0, nullptr)))
    {
        ::getgroups(static_cast<int>(_formerGroups.size()), _formerGroups.data());
        EXPECT_EQ(::setgroups(supplementary.size(), supplementary.data()), 0);
        EXPECT_EQ(::setegid(group), 0);
        EXPECT_EQ(::seteuid(user), 0);
    }
    ~EffectiveUser()
    {
        EXPECT_EQ(::seteuid(0), 0);
        EXPECT_EQ(::setegid(0), 0);
        EXPECT_EQ(::setgroups(_formerGroups.size(), _formerGroups.data()), 0);
    }
    EffectiveUser(const EffectiveUser&) = delete;
    EffectiveUser& operator=(const EffectiveUser&) = delete;

private:
    std::vector<gid_t> _formerGroups;
};

} // namespace orvane

// For the first line of a test that makes an EffectiveUser.
#define ORVANE_SKIP_UNLESS_ROOT()                                                                  \
    if (::geteuid() != 0)                                                                          \
    GTEST_SKIP() << "only root can become other users"
