#pragma once

#include "LogGenerator/LogChannelObserver.h"
#include "dlf/BlockFile.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"

#include <chrono>
#include <functional>
#include <memory>
#include <string>

namespace orvane
{

// Records a log channel as a plain DLF file: the version report, then the item of every modem
// message as it comes, without type bytes and wrappers, across all reconnections. What the server
// made itself has no place in such a file.
//
// Each item is written at once, so that no item is lost when the process ends. What was written is
// safe from a power cut within a second. The first failure (a full disk, a deleted file) ends the
// recording with one line to the owner; the file keeps the whole items.
class LogRecorder final : public LogChannelObserver
{
public:
    static constexpr std::chrono::milliseconds kSynchronisation{500};

    // Takes one line for the user: the recording has ended, or has nothing to record.
    using Notify = std::function<void(const std::string& line)>;

    // Null where the file cannot be begun; `error` then says so and what to do. The queue must
    // outlive the recorder.
    static std::unique_ptr<LogRecorder> create(MainQueue& queue, const std::string& path,
                                               DiskBlockFile::Existing existing, Notify notify,
                                               std::string& error);
    // Records to a file that begins here; `path` is its name for people. A file that takes nothing
    // ends the recording at once.
    LogRecorder(MainQueue& queue, std::unique_ptr<BlockFile> file, std::string path, Notify notify);
    ~LogRecorder() override;
    LogRecorder(const LogRecorder&) = delete;
    LogRecorder& operator=(const LogRecorder&) = delete;

    void channelOpened(const PropertyValue& technology) override;
    void messageReceived(ByteView message) override;

    [[nodiscard]] bool isRecording() const { return _file != nullptr; }

private:
    void synchroniseSoon();
    void endIfFailed(int error);

    MainQueue& _queue;
    std::unique_ptr<BlockFile> _file; // null once it failed
    std::string _path;
    Notify _notify;
    bool _hasModemMessages = true;
    bool _hasSaidThatNothingComes = false;
    bool _isSynchronisationQueued = false;
    Bytes _item; // kept for its memory
    Lifetime _lifetime;
};

} // namespace orvane
