#pragma once

namespace orvane
{

struct AppOptions;

// `orvane export`. Returns the exit status, after telling what is wrong.
int runExport(const AppOptions& options);

} // namespace orvane
