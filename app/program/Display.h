#pragma once

namespace orvane
{

// Whether a display accepts connections: the one named by WAYLAND_DISPLAY or DISPLAY, or the
// platform that QT_QPA_PLATFORM names instead.
bool hasDisplay();

} // namespace orvane
