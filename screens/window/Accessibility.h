#pragma once

namespace orvane
{

// Tells screen readers what tables and their rows are, and lets them press rows. Once a process.
void installAccessibility();

} // namespace orvane
