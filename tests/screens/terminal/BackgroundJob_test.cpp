#include "screens/terminal/VirtualTerminal.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::HasSubstr;

} // namespace

TEST(BackgroundJobTest, WhatIsTypedForTheShellDoesNotStopTheViewer)
{
    const TemporaryDirectory directory;
    VirtualTerminal shell({"bash", "--norc", "--noprofile", "-i"},
                          {"TERM=xterm-256color", "PS1=ready> ", "HOME=" + directory.path()});
    ASSERT_TRUE(shell.waitFor("ready>"));
    shell.send(std::string(ORVANE_PROGRAM) + " --demo --ui json --log none > " + directory.path() +
               "/out &\r");
    shell.send("until grep -q Serving " + directory.path() +
               "/out; do sleep 0.1; done; echo sh''ows\r");
    ASSERT_TRUE(shell.waitFor("shows")) << shell.screen();
    // Typed while only the background job waits for input.
    shell.send("sleep 1; jobs; kill %1; wait; echo en''ded\r");
    shell.send("true\r");
    ASSERT_TRUE(shell.waitFor("ended")) << shell.screen();
    EXPECT_THAT(shell.screen(), HasSubstr("Running"));
}

} // namespace orvane
