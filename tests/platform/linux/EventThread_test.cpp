#include "platform/linux/EventThread.h"

#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/QtTest.h"
#include "platform/linux/SocketTransport.h"

#include <atomic>
#include <stdexcept>
#include <thread>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

class EventThreadTest : public QtTest
{
};

TEST_F(EventThreadTest, EverythingOfTheInhabitantHappensInsideTheThread)
{
    std::thread::id made;
    std::thread::id destroyed;
    std::atomic<bool> hasTicked = false;
    std::thread::id ticked;
    {
        EventThread thread([&](MainQueue& queue) {
            made = std::this_thread::get_id();
            queue.after(1ms, [&] {
                ticked = std::this_thread::get_id();
                hasTicked = true;
                hasTicked.notify_all();
            });
            return std::shared_ptr<int>(new int(0), [&](const int* inhabitant) {
                destroyed = std::this_thread::get_id();
                delete inhabitant;
            });
        });
        EXPECT_NE(made, std::this_thread::get_id());
        EXPECT_EQ(destroyed, std::thread::id());
        hasTicked.wait(false);
        thread.stop();
        EXPECT_EQ(destroyed, made);
        thread.stop();
    }
    EXPECT_EQ(ticked, made);
}

TEST_F(EventThreadTest, WhatSetUpThrowsIsThrownByTheConstructor)
{
    EXPECT_THROW(EventThread([](MainQueue&) -> std::shared_ptr<void> {
                     throw std::runtime_error("no phone");
                 }),
                 std::runtime_error);
}

TEST_F(EventThreadTest, AThreadWithoutInhabitantStops)
{
    const EventThread thread([](MainQueue&) { return nullptr; });
}

// Answers each frame with one of the next message id.
struct Answerer {
    explicit Answerer(const PortsDirectory& directory) : transport(directory)
    {
        std::string error;
        listener = transport.listen("Answerer", error);
        listener->setConnectionCallback([this](std::unique_ptr<FrameConnection> accepted) {
            connection = std::move(accepted);
            connection->setFrameCallback([this](const FrameReader::View& frame) {
                connection->send(frame.messageId + 1, frame.serial, false, true, frame.data);
            });
        });
    }
    SocketTransport transport;
    std::unique_ptr<FrameListener> listener;
    std::unique_ptr<FrameConnection> connection;
};

TEST_F(EventThreadTest, ThreadsTalkOverPorts)
{
    const PrivatePortsDirectory directory;
    const EventThread thread(
        [&](MainQueue&) { return std::make_shared<Answerer>(directory.directory()); });
    SocketTransport transport(directory.directory());
    std::string error;
    const auto connection = transport.connect("Answerer", error);
    ASSERT_TRUE(connection) << error;
    int answers = 0;
    connection->setFrameCallback([&](const FrameReader::View& frame) {
        EXPECT_EQ(frame.messageId, 8);
        ++answers;
    });
    connection->send(7, 1, true, false, Bytes(1000, 1));
    EXPECT_TRUE(connection->waitUntil([&] { return answers == 1; }, 30s));
    connection->send(7, 2, true, false, Bytes(1000000, 2));
    EXPECT_TRUE(runUntil([&] { return answers == 2; }));
}

} // namespace
} // namespace orvane
