#pragma once

namespace orvane
{

// Whether a display answers: the one that the environment names (WAYLAND_DISPLAY, DISPLAY), or what
// QT_QPA_PLATFORM asks for instead.
bool hasDisplay();

} // namespace orvane
