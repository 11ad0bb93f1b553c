#pragma once

#include "platform/services/SystemLog.h"
#include "recordings/RecordingExport.h"

#include <memory>
#include <optional>
#include <span>
#include <string>

namespace orvane
{

// The word that the command line begins with.
inline constexpr const char* kExportCommand = "export";

enum class ExportFormat { Csv, JsonLines, PathList };

// What the command line asks `orvane export` for.
struct ExportOptions {
    bool wantsHelp = false;
    ExportRequest request;
    ExportFormat format = ExportFormat::JsonLines;
    std::unique_ptr<SystemLog> log;

    // One line that says what is wrong and what to do; then nothing else counts.
    std::optional<std::string> error;
};

// `arguments` are those after the command.
ExportOptions parseExportOptions(std::span<const std::string> arguments);

// The text of --help.
std::string exportHelp();

} // namespace orvane
