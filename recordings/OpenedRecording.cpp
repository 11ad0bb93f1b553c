#include "recordings/OpenedRecording.h"

#include "dlf/FileWindow.h"
#include "platform/base/Bytes.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/FileSystem.h"

#include <algorithm>
#include <string_view>

namespace orvane
{

namespace
{

constexpr std::size_t kLongestSnapshot = 256 << 20;
constexpr std::size_t kLongestStart = 64;

bool looksLikePropertyList(ByteView start)
{
    std::string_view text(reinterpret_cast<const char*>(start.data()), start.size());
    for (const char* beginning : {"bplist00", "\xFE\xFF", "\xFF\xFE"})
        if (text.starts_with(beginning))
            return true;
    if (text.starts_with("\xEF\xBB\xBF"))
        text.remove_prefix(3);
    text.remove_prefix(std::min(text.find_first_not_of(" \t\r\n"), text.size()));
    for (const char* beginning : {"<?xml", "<plist", "<!--", "<!DOCTYPE"})
        if (text.starts_with(beginning))
            return true;
    return false;
}

void readSnapshot(OpenedRecording& recording, const std::string& path)
{
    const std::optional<Bytes> content = readFile(path, kLongestSnapshot);
    if (!content) {
        recording.error = "\"" + path + "\" is too long for a snapshot: check what file it is";
        return;
    }
    const PropertyListResult list = readPropertyList(*content);
    recording.snapshot = snapshotFrom(list.value);
    if (!list.value)
        recording.error = "\"" + path + "\" cannot be read as a snapshot (" + list.error +
                          "): it may have been cut short; name another file";
    else if (!recording.snapshot)
        recording.error = "\"" + path +
                          "\" is a property list, but no snapshot of this program: name a snapshot "
                          "(.orvane) or a diagnostic log (.dlf)";
}

} // namespace

OpenedRecording openRecording(const std::string& path)
{
    OpenedRecording recording;
    std::string reason;
    recording.log = FileWindow::open(path, reason);
    if (!recording.log) {
        recording.error =
            "cannot read \"" + path + "\" (" + reason +
            "): name a diagnostic log (.dlf) or a snapshot (.orvane) that may be read";
        return recording;
    }
    if (looksLikePropertyList(recording.log->bytes(0, kLongestStart))) {
        recording.log = nullptr;
        readSnapshot(recording, path);
    }
    return recording;
}

} // namespace orvane
