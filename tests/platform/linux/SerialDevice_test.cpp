#include "platform/linux/SerialDevice.h"

#include "platform/base/Bytes.h"
#include "platform/linux/EffectiveUser.h"
#include "platform/linux/QtTest.h"
#include "support/PseudoTerminal.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <optional>
#include <sys/stat.h>
#include <sys/wait.h>
#include <termios.h>

namespace orvane
{
namespace
{

using testing::AllOf;
using testing::HasSubstr;

class SerialDeviceTest : public QtTest
{
protected:
    std::unique_ptr<ByteDevice> open(const std::string& path)
    {
        error.clear();
        auto opened = openSerialDevice(path, error);
        if (opened)
            opened->setCallbacks(
                [this](ByteView bytes) {
                    received.insert(received.end(), bytes.begin(), bytes.end());
                },
                [this](const std::string& reason) { reasons.push_back(reason); });
        return opened;
    }
    std::string failureToOpen(const std::string& path)
    {
        EXPECT_FALSE(open(path)) << path;
        EXPECT_EQ(error.find('\n'), std::string::npos);
        return error;
    }

    PseudoTerminal terminal;
    std::string error;
    Bytes received;
    std::vector<std::string> reasons;
};

// All bytes, among them those that a terminal would take for keys or change.
Bytes allBytes()
{
    Bytes bytes;
    for (int value = 0; value < 256; ++value)
        bytes.push_back(static_cast<std::uint8_t>(value));
    return bytes;
}

TEST_F(SerialDeviceTest, BytesGoBothWaysUnchanged)
{
    const auto device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    terminal.write(allBytes());
    EXPECT_TRUE(runUntil([&] { return received.size() >= 256; }));
    EXPECT_EQ(received, allBytes());

    device->write(allBytes());
    Bytes written;
    EXPECT_TRUE(runUntil([&] {
        terminal.readInto(written);
        return written.size() >= 256;
    }));
    EXPECT_EQ(written, allBytes());
}

TEST_F(SerialDeviceTest, ASerialDeviceIsSetTo115200BaudEightBitsNoParityRaw)
{
    const auto device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    termios settings{};
    ASSERT_EQ(::tcgetattr(terminal.descriptor(), &settings), 0);
    EXPECT_EQ(::cfgetispeed(&settings), static_cast<speed_t>(B115200));
    EXPECT_EQ(::cfgetospeed(&settings), static_cast<speed_t>(B115200));
    EXPECT_EQ(settings.c_cflag & (CSIZE | CSTOPB | PARENB | CRTSCTS), static_cast<tcflag_t>(CS8));
    EXPECT_EQ(settings.c_lflag & (ECHO | ICANON | ISIG), 0U);
    EXPECT_EQ(settings.c_iflag & (IXON | IXOFF | IXANY | ICRNL), 0U);
    EXPECT_EQ(settings.c_oflag & OPOST, 0U);
}

TEST_F(SerialDeviceTest, ACharacterDeviceThatIsNotSerialTakesNoSettings)
{
    EXPECT_TRUE(open("/dev/zero")) << error;
}

TEST_F(SerialDeviceTest, ADeviceIsOpenedOnceAtATime)
{
    auto device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    EXPECT_THAT(failureToOpen(terminal.path()),
                HasSubstr("cannot open " + terminal.path() + ": Device or resource busy; "));
    device.reset();
    EXPECT_TRUE(open(terminal.path())) << error;
}

TEST_F(SerialDeviceTest, OtherUsersCannotOpenWhatIsOpen)
{
    ORVANE_SKIP_UNLESS_ROOT();
    const auto device = open(terminal.path());
    ASSERT_EQ(::chmod(terminal.path().c_str(), 0666), 0);
    constexpr uid_t kNobody = 65534;
    const EffectiveUser nobody(kNobody, kNobody);
    // Without the lock of openSerialDevice: any program.
    EXPECT_EQ(::open(terminal.path().c_str(), O_RDWR | O_NOCTTY), -1);
    EXPECT_EQ(errno, EBUSY);
}

TEST_F(SerialDeviceTest, TheProgramThatHoldsADeviceIsNamed)
{
    int ready[2];
    ASSERT_EQ(::pipe2(ready, O_CLOEXEC), 0);
    const pid_t holder = ::fork();
    ASSERT_GE(holder, 0);
    if (holder == 0) {
        std::string ignored;
        const auto device = openSerialDevice(terminal.path(), ignored);
        (void)!::write(ready[1], device ? "1" : "0", 1);
        for (;;)
            ::pause();
    }
    char answer = 0;
    ASSERT_EQ(::read(ready[0], &answer, 1), 1);
    ASSERT_EQ(answer, '1');
    EXPECT_THAT(failureToOpen(terminal.path()),
                AllOf(HasSubstr("busy"),
                      HasSubstr(" (process " + std::to_string(holder) + ") uses it; end that")));
    ::kill(holder, SIGKILL);
    ::waitpid(holder, nullptr, 0);
    ::close(ready[0]);
    ::close(ready[1]);
}

TEST_F(SerialDeviceTest, ADeviceThatCannotBeOpenedIsToldWithCauseAndRemedy)
{
    const TemporaryDirectory directory;
    const std::string file = directory.path() + "/file";
    std::ofstream(file) << "text";
    const std::string pipe = directory.path() + "/pipe";
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    const std::string link = directory.path() + "/link";
    std::filesystem::create_symlink(directory.path() + "/gone", link);
    const struct {
        std::string path;
        const char* text;
    } cases[] = {
        {directory.path() + "/none", "No such file or directory; plug the modem in"},
        {link,                       "No such file or directory; plug the modem in"},
        {file,                       "it is not a device; give the name of a"      },
        {pipe,                       "it is not a device; give the name of a"      },
        {directory.path(),           "it is not a device; give the name of a"      },
        {"",                         "No such file or directory; plug the modem in"},
    };
    for (const auto& each : cases)
        EXPECT_THAT(failureToOpen(each.path),
                    HasSubstr("cannot open " + each.path + ": " + each.text));
}

TEST_F(SerialDeviceTest, ADeviceThatIsNotPermittedIsToldWithItsGroup)
{
    ORVANE_SKIP_UNLESS_ROOT();
    constexpr gid_t kDialout = 20;
    const group* dialout = ::getgrgid(kDialout);
    ASSERT_EQ(::chown(terminal.path().c_str(), 0, kDialout), 0);
    ASSERT_EQ(::chmod(terminal.path().c_str(), 0660), 0);
    constexpr uid_t kNobody = 65534;
    const std::string name = dialout ? dialout->gr_name : "20";
    const EffectiveUser nobody(kNobody, kNobody);
    EXPECT_THAT(failureToOpen(terminal.path()),
                HasSubstr("Permission denied; it belongs to the group " + name + "; add yourself"));
}

TEST_F(SerialDeviceTest, ADeviceThatIsUnpluggedIsToldOnce)
{
    const auto device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    terminal.hangUp();
    EXPECT_TRUE(runUntil([&] { return !reasons.empty(); }));
    turnOnce();
    EXPECT_EQ(reasons.size(), 1U);
    EXPECT_NE(reasons.front(), "");
    device->write(allBytes());
    turnOnce();
    EXPECT_EQ(reasons.size(), 1U);
}

TEST_F(SerialDeviceTest, ACallbackMayCloseTheDevice)
{
    auto device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    bool hasReceived = false;
    device->setCallbacks(
        [&](ByteView) {
            hasReceived = true;
            device.reset();
        },
        [&](const std::string&) { ADD_FAILURE() << "closed by its owner"; });
    terminal.write(allBytes());
    EXPECT_TRUE(runUntil([&] { return hasReceived; }));
    turnOnce();

    device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    bool hasClosed = false;
    device->setCallbacks([](ByteView) {},
                         [&](const std::string&) {
                             hasClosed = true;
                             device.reset();
                         });
    terminal.hangUp();
    EXPECT_TRUE(runUntil([&] { return hasClosed; }));
}

TEST_F(SerialDeviceTest, WhatTheDeviceDoesNotTakeAtOnceFollows)
{
    const auto device = open(terminal.path());
    ASSERT_TRUE(device) << error;
    const Bytes much(100'000, 0x42);
    device->write(much);
    device->write(allBytes());
    Bytes written;
    EXPECT_TRUE(runUntil([&] {
        terminal.readInto(written);
        return written.size() >= much.size() + 256;
    }));
    Bytes expected = much;
    const Bytes end = allBytes();
    expected.insert(expected.end(), end.begin(), end.end());
    EXPECT_EQ(written, expected);
}

} // namespace
} // namespace orvane
