#include "recordings/JsonRowWriter.h"

#include "platform/base/JsonText.h"
#include "ui/tree/DisplayWalk.h"

namespace orvane
{

bool JsonRowWriter::takePeriod(const std::string& time, const RowTable& table)
{
    _line = '{';
    if (!time.empty()) {
        _line += "\"time\":";
        appendJsonString(_line, time);
    }
    for (const std::size_t i : table.order()) {
        const RowTable::Row& row = table.rows()[i];
        if (!table.isPresent(row))
            continue;
        if (_line.size() > 1)
            _line += ',';
        appendJsonString(_line, row.path);
        _line += ':';
        appendJsonString(_line, displayText(row.value));
    }
    _line += "}\n";
    return _output(_line);
}

} // namespace orvane
