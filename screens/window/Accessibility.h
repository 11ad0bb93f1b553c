#pragma once

namespace orvane
{

// Gives screen readers the role of each widget of this layer, and lets them press rows. To be
// called once a process.
void installAccessibility();

} // namespace orvane
