#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/services/FileSystem.h"

#include <string>

namespace orvane
{

// The system's folder of diagnostic files, below the file system's root.
inline constexpr const char* kLogFolder = "/var/mobile/Library/Logs/DiagDrop";

// The texts of the alert for a failed save.
inline constexpr const char* kFileErrorTitle = "File Error";
inline constexpr const char* kFileErrorMessage = "Unable to write file to disk";
// The title of the alert that names a saved file.
inline constexpr const char* kSavedTitle = "Saved";

struct SnapshotResult {
    bool isWritten;
    std::string path; // of the file, root included
};

// Writes a snapshot file "OrvaneSnapshot-SECONDS.orvane" into the system's log folder, SECONDS
// being the current time since 1970: an XML property list of `timeStamp` (when the save screen was
// opened, seconds since 1970), the save contents unchanged and the user's description. Makes the
// folder where what lies above it belongs to the user. A failure is logged, with its reason; no
// half file is left behind.
SnapshotResult writeSnapshotFile(const FileSystem& files, const PropertyValue& saveHistory,
                                 double timeStamp, const std::string& description);

} // namespace orvane
