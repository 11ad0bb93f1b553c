#include "recordings/PathListWriter.h"

#include "platform/base/Utf8.h"

namespace orvane
{

void PathListWriter::finish(const RowTable& table)
{
    for (const std::size_t i : table.order()) {
        const RowTable::Row& row = table.rows()[i];
        if (row.lastPeriod != 0 && !_output(printableText(row.path) + "\n"))
            return;
    }
}

} // namespace orvane
