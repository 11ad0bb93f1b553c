#include "recordings/CsvRowWriter.h"

#include "LogGenerator/TextReadings.h"
#include "platform/base/Utf8.h"
#include "ui/tree/DisplayWalk.h"

#include <cstring>

namespace orvane
{

namespace
{

// A period in the spool: its time, the changes (index of the row; kThere, its text and its number,
// which is empty where there is none, or kGone), kEnd.
constexpr std::uint32_t kEnd = UINT32_MAX;
constexpr std::uint32_t kGone = 0;
constexpr std::uint32_t kThere = 1;

} // namespace

bool CsvRowWriter::takePeriod(const std::string& time, const RowTable& table)
{
    _units.resize(table.rows().size());
    _spool.putText(time);
    for (std::size_t i = 0; i < table.rows().size(); ++i) {
        const RowTable::Row& row = table.rows()[i];
        if (!row.hasChanged)
            continue;
        _spool.putNumber(static_cast<std::uint32_t>(i));
        if (table.isPresent(row)) {
            const std::string text = printableText(displayText(row.value));
            const auto measure = measureOf(row.value);
            if (!text.empty())
                _units[i].take(measure);
            _spool.putNumber(kThere);
            _spool.putText(text);
            _spool.putText(measure ? measure->number : "");
        } else {
            _spool.putNumber(kGone);
        }
    }
    _spool.putNumber(kEnd);
    return _spool.error() == 0;
}

void CsvRowWriter::finish(const RowTable& table)
{
    _units.resize(table.rows().size());
    const std::vector<std::size_t> order = table.order();
    _spool.rewind();
    if (_spool.error() == 0 && _output(header(table, order)))
        writeLines(order);
}

std::optional<std::string> CsvRowWriter::problem() const
{
    if (_spool.error() == 0)
        return std::nullopt;
    return std::string("the rows cannot be kept in the directory for temporary files (") +
           std::strerror(_spool.error()) + "): set TMPDIR to one with room";
}

std::string CsvRowWriter::header(const RowTable& table, const std::vector<std::size_t>& order) const
{
    std::string line = "time";
    for (const std::size_t row : order) {
        std::string name = printableText(table.rows()[row].path);
        if (const auto unit = _units[row].unit(); unit && !unit->empty())
            ((name += " [") += *unit) += ']';
        line += ',';
        appendCell(line, name);
    }
    return line += '\n';
}

void CsvRowWriter::writeLines(const std::vector<std::size_t>& order)
{
    std::vector<Cell> cells(_units.size()); // empty where absent
    std::string line;
    while (_spool.text(line)) {
        for (auto row = _spool.number(); row && *row < cells.size(); row = _spool.number()) {
            Cell& cell = cells[*row];
            if (_spool.number() == kThere && _spool.text(cell.text))
                _spool.text(cell.number);
            else
                cell = {};
        }
        for (const std::size_t row : order) {
            line += ',';
            appendCell(line, _units[row].unit() ? cells[row].number : cells[row].text);
        }
        line += '\n';
        if (_spool.error() != 0 || !_output(line))
            return;
    }
}

void CsvRowWriter::appendCell(std::string& to, std::string_view text) const
{
    if (_cells == Cells::ForSpreadsheet && isFormulaOfSpreadsheets(text))
        appendCsvField(to, "'" + std::string(text));
    else
        appendCsvField(to, text);
}

bool isFormulaOfSpreadsheets(std::string_view text)
{
    // What follows blanks counts: they may be taken away on the way into the spreadsheet.
    const std::size_t first = text.find_first_not_of(" \t");
    if (first == std::string_view::npos ||
        std::string_view("=+-@").find(text[first]) == std::string_view::npos)
        return text.starts_with('\t');
    const std::size_t last = text.find_last_not_of(' ');
    const auto number = textReading(text.substr(first, last + 1 - first));
    return !number || !number->unit.empty() || text.substr(0, first).find('\t') != text.npos;
}

void appendCsvField(std::string& to, std::string_view text)
{
    if (text.find_first_of(",\"\r\n") == std::string_view::npos) {
        to += text;
        return;
    }
    to += '"';
    for (const char character : text) {
        if (character == '"')
            to += '"';
        to += character;
    }
    to += '"';
}

} // namespace orvane
