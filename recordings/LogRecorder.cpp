#include "recordings/LogRecorder.h"

#include "dlf/VersionReport.h"
#include "platform/base/Bytes.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/SystemLog.h"

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <utility>

namespace orvane
{

namespace
{

constexpr std::size_t kLongestItem = 0xFFFF; // what the length field holds

} // namespace

std::unique_ptr<LogRecorder> LogRecorder::create(MainQueue& queue, const std::string& path,
                                                 DiskBlockFile::Existing existing, Notify notify,
                                                 std::string& error)
{
    auto file = DiskBlockFile::create(path, existing, error);
    if (!file)
        return nullptr;
    Bytes report(kDlfVersionReportBytes);
    const int failure = writeVersionReport(report) ? file->append(report) : EIO;
    if (failure == 0)
        return std::make_unique<LogRecorder>(queue, std::move(file), path, std::move(notify));
    error = "\"" + path + "\" cannot be written (" + std::strerror(failure) +
            "): make room, or give another name to record to";
    std::error_code ignored;
    if (std::filesystem::is_regular_file(path, ignored))
        std::filesystem::remove(path, ignored);
    return nullptr;
}

LogRecorder::LogRecorder(MainQueue& queue, std::unique_ptr<BlockFile> file, std::string path,
                         Notify notify)
    : _queue(queue), _file(std::move(file)), _path(std::move(path)), _notify(std::move(notify))
{
}

LogRecorder::~LogRecorder()
{
    if (_file)
        endIfFailed(_file->synchronise());
}

void LogRecorder::channelOpened(const PropertyValue& technology)
{
    _hasModemMessages = technology != kTSLogChannelTechnology_IFX;
    if (_hasModemMessages || !_file || std::exchange(_hasSaidThatNothingComes, true))
        return;
    _notify("Nothing to record to \"" + _path + "\": a cell monitor has no messages of a modem.");
}

void LogRecorder::messageReceived(ByteView message)
{
    if (!_file || !_hasModemMessages || message.size() < kLogHeaderBytes)
        return;
    message = unwrappedMessage(message);
    // No item of a file has code 0.
    if (message.size() < kLogHeaderBytes || message[0] != kModemItem || logCodeOf(message) == 0)
        return;
    const ByteView item = message.subspan(1);
    if (item.size() > kLongestItem) {
        logError("Not recording a message of %zu bytes: no file holds it", message.size());
        return;
    }
    // Its length is what it has; a wrong one would hide what follows.
    _item.assign(item.begin(), item.end());
    _item[0] = static_cast<std::uint8_t>(item.size());
    _item[1] = static_cast<std::uint8_t>(item.size() >> 8);
    endIfFailed(_file->append(_item));
    synchroniseSoon();
}

void LogRecorder::synchroniseSoon()
{
    if (!_file || std::exchange(_isSynchronisationQueued, true))
        return;
    _queue.after(kSynchronisation, _lifetime.whileAlive([this] {
        _isSynchronisationQueued = false;
        if (!_file)
            return;
        endIfFailed(_file->synchronise());
        if (_file && _file->isBehind())
            synchroniseSoon();
    }));
}

void LogRecorder::endIfFailed(int error)
{
    if (error == 0)
        return;
    if (error == ENOENT)
        _notify("Recording to \"" + _path + "\" has ended: the file has been deleted.");
    else
        _notify("Recording to \"" + _path + "\" has ended: " + std::strerror(error) +
                ". What came before is kept.");
    _file.reset();
}

} // namespace orvane
