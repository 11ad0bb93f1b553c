#pragma once

#include "recordings/Measure.h"
#include "recordings/RowSpool.h"
#include "recordings/RowWriter.h"

#include <vector>

namespace orvane
{

// One line a period behind a header: the time, then a column a row, empty where it is absent. Where
// all values of a column are numbers of one unit it holds the numbers, and its header "PATH [UNIT]"
// (or PATH where they have none); otherwise the texts as shown on one line. Fields are quoted as
// RFC 4180 says; lines end with a line feed.
//
// As the header comes first and is known last, the changes of the rows are put aside on disk.
class CsvRowWriter final : public RowWriter
{
public:
    enum class Cells {
        Exact,
        ForSpreadsheet // those that would be taken for formulas begin with an apostrophe
    };

    explicit CsvRowWriter(Output output, Cells cells = Cells::Exact)
        : _output(std::move(output)), _cells(cells)
    {
    }

    bool takePeriod(const std::string& time, const RowTable& table) override;
    void finish(const RowTable& table) override;
    [[nodiscard]] std::optional<std::string> problem() const override;

private:
    [[nodiscard]] std::string header(const RowTable& table,
                                     const std::vector<std::size_t>& order) const;
    void appendCell(std::string& to, std::string_view text) const;
    void writeLines(const std::vector<std::size_t>& order);

    struct Cell {
        std::string text;
        std::string number;
    };

    Output _output;
    Cells _cells;
    RowSpool _spool;
    std::vector<CommonUnit> _units; // by row
};

// Whether a spreadsheet may take the cell for a formula: it begins with =, +, -, @ or a tab and is
// not just a number.
bool isFormulaOfSpreadsheets(std::string_view text);

// Appends the text as a field: in quotation marks where it holds one, a comma or a line's end.
void appendCsvField(std::string& to, std::string_view text);

} // namespace orvane
