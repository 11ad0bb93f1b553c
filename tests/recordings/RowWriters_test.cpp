#include "LogGenerator/TextReadings.h"
#include "platform/base/PropertyValue.h"
#include "recordings/CsvRowWriter.h"
#include "recordings/JsonRowWriter.h"
#include "recordings/PathListWriter.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>

namespace orvane
{
namespace
{

using ::testing::HasSubstr;

class RowWritersTest : public ::testing::Test
{
protected:
    RowWriter::Output output()
    {
        return [this](std::string_view lines) {
            written += lines;
            return --linesWanted > 0;
        };
    }
    // A period of the rows given, as a snapshot's texts; its time is the number of the period.
    bool take(RowWriter& writer,
              std::initializer_list<std::pair<std::string_view, PropertyValue>> rows)
    {
        table.take(withTextReadings(PropertyValue::dictionaryOf(rows)));
        return writer.takePeriod(std::to_string(++periods), table);
    }
    void finish(RowWriter& writer)
    {
        writer.finish(table);
        EXPECT_EQ(writer.problem(), std::nullopt);
    }

    RowTable table{{}};
    std::string written;
    int linesWanted = 1000;
    int periods = 0;
};

class CsvTest : public RowWritersTest
{
protected:
    CsvTest() { table = RowTable({"/*"}); }
    CsvRowWriter csv{output()};
};

TEST_F(CsvTest, HasAHeaderAndAColumnARow)
{
    take(csv, {
                  {"State", "Idle"},
                  {"Cell",  "7"   }
    });
    take(csv, {
                  {"State", "Busy"},
                  {"Cell",  "7"   }
    });
    EXPECT_EQ(written, "") << "which columns there are is not known yet";
    finish(csv);
    EXPECT_EQ(written, "time,/State,/Cell\n"
                       "1,Idle,7\n"
                       "2,Busy,7\n");
}

TEST_F(CsvTest, AbsentRowsAreEmptyFields)
{
    take(csv, {
                  {"a", "x"}
    });
    take(csv, {});
    take(csv, {
                  {"b", "y"}
    });
    take(csv, {
                  {"a", "x"},
                  {"b", "" }
    });
    finish(csv);
    EXPECT_EQ(written, "time,/b,/a\n1,,x\n2,,\n3,y,\n4,,x\n");
}

TEST_F(CsvTest, ColumnsOfOneUnitHoldTheNumbers)
{
    take(csv, {
                  {"RSRP",  "-97.50 dBm"},
                  {"CQI",   "+3"        },
                  {"Mixed", "1 dB"      },
                  {"Loss",  "5%"        }
    });
    take(csv, {
                  {"RSRP",  "-98.00 dBm"},
                  {"CQI",   "12"        },
                  {"Mixed", "n/a"       }
    });
    finish(csv);
    EXPECT_EQ(written, "time,/RSRP [dBm],/CQI,/Mixed,/Loss [%]\n"
                       "1,-97.50,3,1 dB,5\n"
                       "2,-98.00,12,n/a,\n");
}

TEST_F(CsvTest, EmptyTextsAmongNumbersAreEmptyFields)
{
    take(csv, {
                  {"RSRP", ""}
    });
    take(csv, {
                  {"RSRP", "-98.00 dBm"}
    });
    finish(csv);
    EXPECT_EQ(written, "time,/RSRP [dBm]\n1,\n2,-98.00\n");
}

TEST_F(CsvTest, FieldsAreQuotedWhereTheyMustBe)
{
    take(csv, {
                  {"a,b",           "1,5"    },
                  {"say \"hello\"", "\"\""   },
                  {"plain",         "a b;c'd"}
    });
    finish(csv);
    EXPECT_EQ(written, "time,\"/a,b\",\"/say \"\"hello\"\"\",/plain\n"
                       "1,\"1,5\",\"\"\"\"\"\",a b;c'd\n");
    std::string field;
    appendCsvField(field, "two\r\nlines");
    EXPECT_EQ(field, "\"two\r\nlines\"");
}

TEST_F(CsvTest, APeriodIsALineWhateverTheNetworkSent)
{
    take(csv, {
                  {"a\nb", "x\ny\xFF\x1b[2J\u009b"}
    });
    finish(csv);
    EXPECT_EQ(written, "time,/a b\n1,x y\uFFFD\uFFFD[2J\uFFFD\n");
}

TEST_F(CsvTest, FormulasStayAsTheyAreUnlessForASpreadsheet)
{
    take(csv, {
                  {"Name", "=1+2"}
    });
    finish(csv);
    EXPECT_EQ(written, "time,/Name\n1,=1+2\n");
}

TEST_F(CsvTest, ForASpreadsheetCellsThatWouldBeFormulasBeginWithAnApostrophe)
{
    CsvRowWriter writer(output(), CsvRowWriter::Cells::ForSpreadsheet);
    take(
        writer,
        {
            {"Name",  "=HYPERLINK(\"http://x\")"},
            {"Mixed", "-97.50 dBm"              },
            {"RSRP",  "-97.50 dBm"              }
    });
    take(writer, {
                     {"Name",  "plain"     },
                     {"Mixed", "n/a"       },
                     {"RSRP",  "-98.00 dBm"}
    });
    take(writer, {
                     {"Name",  "-5"},
                     {"Mixed", "+5"}
    });
    finish(writer);
    EXPECT_EQ(written, "time,/Name,/Mixed,/RSRP [dBm]\n"
                       "1,\"'=HYPERLINK(\"\"http://x\"\")\",'-97.50 dBm,-97.50\n"
                       "2,plain,n/a,-98.00\n"
                       "3,-5,+5,\n");
}

TEST(SpreadsheetFormulaTest, IsToldFromNumbersAndOtherTexts)
{
    for (const char* formula : {"=1", "+1+1", "-1-1", "@SUM(A1)", "\t=1", "\tx", " =1", "=", "-",
                                "-97.50 dBm", "+49 170", "--1", "-n/a"})
        EXPECT_TRUE(isFormulaOfSpreadsheets(formula)) << formula;
    for (const char* text : {"", " ", "-1", "+1", "-97.50", "1-2", "a=b", "'=1", "12:30", "(-1)"})
        EXPECT_FALSE(isFormulaOfSpreadsheets(text)) << text;
}

TEST_F(CsvTest, WithoutPeriodsThereIsTheHeader)
{
    table = RowTable({"/a"});
    finish(csv);
    EXPECT_EQ(written, "time,/a\n");
}

TEST_F(CsvTest, StopsOnceNobodyReads)
{
    for (int i = 0; i < 5; ++i)
        EXPECT_TRUE(take(csv, {
                                  {"a", "x"}
        }));
    linesWanted = 2;
    finish(csv);
    EXPECT_EQ(written, "time,/a\n1,x\n");
}

// A directory for temporary files of the test's choice.
class TemporaryFiles
{
public:
    explicit TemporaryFiles(const std::string& directory)
        : _hadOne(std::getenv("TMPDIR") != nullptr)
    {
        if (_hadOne)
            _before = std::getenv("TMPDIR");
        setenv("TMPDIR", directory.c_str(), 1);
    }
    ~TemporaryFiles()
    {
        if (_hadOne)
            setenv("TMPDIR", _before.c_str(), 1);
        else
            unsetenv("TMPDIR");
    }
    TemporaryFiles(const TemporaryFiles&) = delete;
    TemporaryFiles& operator=(const TemporaryFiles&) = delete;

private:
    bool _hadOne;
    std::string _before;
};

TEST_F(CsvTest, LeavesNothingAmongTheTemporaryFiles)
{
    const TemporaryDirectory directory;
    const TemporaryFiles there(directory.path());
    CsvRowWriter writer(output());
    take(writer, {
                     {"a", "x"}
    });
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
    finish(writer);
    EXPECT_EQ(written, "time,/a\n1,x\n");
}

TEST_F(CsvTest, WithoutADirectoryForTemporaryFilesItSaysWhatToDo)
{
    const TemporaryFiles nowhere("/proc");
    CsvRowWriter writer(output());
    EXPECT_FALSE(take(writer, {
                                  {"a", "x"}
    }));
    writer.finish(table);
    EXPECT_THAT(writer.problem().value_or(""), HasSubstr("set TMPDIR to one with room"));
    EXPECT_EQ(written, "");
}

TEST_F(RowWritersTest, JsonLinesHaveTheRowsThatAreThere)
{
    JsonRowWriter json(output());
    EXPECT_TRUE(take(json, {
                               {"State", "Idle"      },
                               {"RSRP",  "-97.50 dBm"}
    }));
    EXPECT_EQ(written, "{\"time\":\"1\",\"/State\":\"Idle\",\"/RSRP\":\"-97.50 dBm\"}\n");
    take(json, {
                   {"RSRP", "\"\n\xFF"}
    });
    take(json, {});
    finish(json);
    EXPECT_THAT(written, HasSubstr("\n{\"time\":\"2\",\"/RSRP\":\"\\\"\\n\xEF\xBF\xBD\"}\n"
                                   "{\"time\":\"3\"}\n"));
}

TEST_F(RowWritersTest, JsonLinesStopOnceNobodyReads)
{
    JsonRowWriter json(output());
    linesWanted = 2;
    EXPECT_TRUE(take(json, {}));
    EXPECT_FALSE(take(json, {}));
}

TEST_F(RowWritersTest, TheListHasEachPathOnceInTheOrderShown)
{
    PathListWriter list(output());
    take(list, {
                   {"b", "1"}
    });
    take(list, {
                   {"a\n", "1"},
                   {"b",   "2"},
                   {"c",   "3"}
    });
    EXPECT_EQ(written, "");
    finish(list);
    EXPECT_EQ(written, "/a \n/b\n/c\n");
}

TEST_F(RowWritersTest, TheListHasNoPathThatDidNotOccur)
{
    table = RowTable({"/a", "/nowhere"});
    PathListWriter list(output());
    take(list, {
                   {"a", "1"}
    });
    finish(list);
    EXPECT_EQ(written, "/a\n");
}

} // namespace
} // namespace orvane
