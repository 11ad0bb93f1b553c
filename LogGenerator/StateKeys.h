#pragma once

namespace orvane
{

// Keys of the state dictionary, and of the snapshots in its history.
inline constexpr const char* kTemplateKey = "Template";
inline constexpr const char* kDisplayKey = "Display";
inline constexpr const char* kExtraInfoKey = "ExtraInfo";
inline constexpr const char* kDisplayStateKey = "DisplayState";
inline constexpr const char* kHistoryKey = "History";
inline constexpr const char* kDateKey = "Date";
inline constexpr const char* kDescriptionKey = "Description";

} // namespace orvane
