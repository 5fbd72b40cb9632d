// Files of several tables: where each table stands, which one is read when
// none is asked for, what the library reads from one, and errors that name the
// table and the line.
#include <gtest/gtest.h>

#include <filesystem>

#include "chart_tables.h"
#include "temp_files.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

// A measurement table and a calibration table; line numbers on the right.
const std::string kTwoTables = "CTI3\n"                        // 1
                               "\n"                            // 2
                               "DESCRIPTOR \"measurements\"\n" // 3
                               "NUMBER_OF_FIELDS 4\n"          // 4
                               "BEGIN_DATA_FORMAT\n"           // 5
                               "SAMPLE_ID LAB_L LAB_A LAB_B\n" // 6
                               "END_DATA_FORMAT\n"             // 7
                               "NUMBER_OF_SETS 2\n"            // 8
                               "BEGIN_DATA\n"                  // 9
                               "A1 50 10 -10\n"                // 10
                               "\"A2\" 60 -5 5\n"              // 11
                               "END_DATA\n"                    // 12
                               "\n"                            // 13
                               "CAL\n"                         // 14
                               "NUMBER_OF_FIELDS 4\n"          // 15
                               "BEGIN_DATA_FORMAT\n"           // 16
                               "RGB_I RGB_R RGB_G RGB_B\n"     // 17
                               "END_DATA_FORMAT\n"             // 18
                               "NUMBER_OF_SETS 3\n"            // 19
                               "BEGIN_DATA\n"                  // 20
                               "0 0 0 0\n"                     // 21
                               "0.5 127.9 128 255\n"           // 22
                               "1 255 255 255\n"               // 23
                               "END_DATA\n";                   // 24

struct Extent {
    int first;
    int last;
    std::string identification;
    int rows;
};

std::vector<Extent> Extents(const std::string& text) {
    std::vector<Extent> extents;
    for (const auto& table : FindTables(ChartLines(text))) {
        extents.push_back({table.firstLine, table.lastLine, table.identification, table.rowCount});
    }
    return extents;
}

bool operator==(const Extent& a, const Extent& b) {
    return a.first == b.first && a.last == b.last && a.identification == b.identification &&
           a.rows == b.rows;
}

void PrintTo(const Extent& e, std::ostream* out) {
    *out << e.first << "-" << e.last << " " << e.identification << " " << e.rows;
}

TEST(ChartTables, EachDataBlockEndsATable) {
    const std::string oneTable = kTwoTables.substr(0, kTwoTables.find("\nCAL") + 1);
    const struct {
        const char* what;
        std::string text;
        std::vector<Extent> tables;
    } cases[] = {
        {"two tables", kTwoTables, {{1, 12, "CTI3", 2}, {14, 24, "CAL", 3}}},
        {"keywords after the last END_DATA belong to the last table",
         kTwoTables + "KEYWORD \"NOTE\"\nNOTE \"end\"\n",
         {{1, 12, "CTI3", 2}, {14, 26, "CAL", 3}}},
        {"one table with a blank line after it", oneTable, {{1, 13, "CTI3", 2}}},
        {"a data block the file ends in is a table of its own",
         oneTable + "CAL\nNUMBER_OF_SETS 1\nBEGIN_DATA_FORMAT\nX\nEND_DATA_FORMAT\nBEGIN_DATA\n1\n",
         {{1, 12, "CTI3", 2}, {14, 20, "CAL", 1}}},
        {"no data block at all", "CGATS.17\nORIGINATOR x\n", {{1, 2, "CGATS.17", 0}}},
        {"a data block inside a section that is passed over does not count",
         "\n IT8.7/2\nBEGIN_TARGET_FORMAT\nBEGIN_DATA\nEND_DATA\nEND_TARGET_FORMAT\n" +
             oneTable.substr(5),
         {{1, 18, "IT8.7/2", 2}}},
        {"CR LF line ends",
         "CTI1\r\nNUMBER_OF_SETS 1\r\nBEGIN_DATA\r\n1\r\nEND_DATA\r\nCTI2\r\n"
         "BEGIN_DATA\r\n2\r\n3\r\nEND_DATA\r\n",
         {{1, 5, "CTI1", 1}, {6, 10, "CTI2", 2}}},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(Extents(c.text), c.tables) << c.what;
    }
}

TEST(ChartTables, LoadsOneTableThroughATemporaryFileThatGoesWithIt) {
    test_support::TempDir dir;
    const std::string path = dir.write("two.ti3", kTwoTables).u8string();
    std::wstring temporary;
    {
        LoadedTable table = LoadTable(path, 2);
        temporary = table.LibraryPath();
        EXPECT_NE(temporary, std::filesystem::path(path).wstring());
        EXPECT_EQ(table.Name(), path + ", table 2");
        EXPECT_EQ(table.Chart().GetPatchCount(), 3);
        int result = -1;
        // RGB is kept as whole numbers cut toward zero: 127.9 reads as 127.
        const tagRGB rgb = table.Chart().GetPatch(2, result).GetRGB();
        EXPECT_EQ(rgb.r, 127);
        EXPECT_EQ(rgb.g, 128);
        EXPECT_EQ(table.FileLine(table.Text().rowLines[0]), 21);
        EXPECT_TRUE(table.ColumnText("SAMPLE_ID").empty());
        EXPECT_TRUE(std::filesystem::exists(temporary));
    }
    EXPECT_FALSE(std::filesystem::exists(temporary));

    // The first table with data rows is the default; a file of one table is read itself.
    const LoadedTable first = LoadTable(path);
    EXPECT_EQ(first.Table().number, 1);
    EXPECT_EQ(first.ColumnText("SAMPLE_ID"), (std::vector<std::string>{"A1", "A2"}));
    const std::string single =
        dir.write("one.it8", kTwoTables.substr(0, kTwoTables.find("CAL"))).u8string();
    EXPECT_EQ(LoadTable(single).LibraryPath(), std::filesystem::path(single).wstring());
    const std::string empty = dir.write("empty first.ti3", "CTI1\nNUMBER_OF_SETS 1\n"
                                                           "BEGIN_DATA_FORMAT\nX\nEND_DATA_FORMAT\n"
                                                           "BEGIN_DATA\nEND_DATA\n" +
                                                               kTwoTables)
                                  .u8string();
    EXPECT_EQ(LoadTable(empty, 0).Table().number, 2);
}

TEST(ChartTables, ErrorsNameTheFileTheTableAndTheLine) {
    test_support::TempDir dir;
    std::string bad = kTwoTables;
    bad.replace(bad.find("NUMBER_OF_FIELDS 4\nBEGIN_DATA_FORMAT\nRGB_I"), 18, "NUMBER_OF_FIELDS 5");
    const std::string path = dir.write("bad.ti3", bad).u8string();
    const struct {
        int table;
        int code;
        int line;
        std::string message;
    } cases[] = {
        // The second table's format names 4 fields against its own NUMBER_OF_FIELDS 5.
        {2, 5, 16,
         path + ", table 2 (lines 14-24): the data format on line 16 names 4 different fields "
                "but NUMBER_OF_FIELDS on line 15 is 5 [code 5]"},
        {3, 0, 0, path + ": the file holds 2 tables, not a table 3"},
    };
    for (const auto& c : cases) {
        try {
            LoadTable(path, c.table);
            ADD_FAILURE() << "table " << c.table << " read";
        } catch (const TableReadError& error) {
            EXPECT_EQ(error.what(), c.message);
            EXPECT_EQ(error.Code(), c.code);
            EXPECT_EQ(error.Line(), c.line);
            EXPECT_EQ(error.Table(), c.table);
        }
    }
    EXPECT_EQ(LoadTable(path, 1).Chart().GetPatchCount(), 2); // the first table is sound
    // A spectral field name without a wavelength: the library's read ends with
    // a standard exception, whose message the error keeps.
    const std::string noWavelength =
        dir.write("nm.it8", "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID NM_380\nEND_DATA_FORMAT\n"
                            "NUMBER_OF_SETS 1\nBEGIN_DATA\n1 0.5\nEND_DATA\n")
            .u8string();
    try {
        LoadTable(noWavelength);
        ADD_FAILURE() << "NM_380 read";
    } catch (const TableReadError& error) {
        EXPECT_EQ(error.LibraryException(), "invalid stol argument");
        EXPECT_EQ(error.Code(), 0);
    }
    try {
        LoadTable(dir.file("missing.it8").u8string());
        ADD_FAILURE() << "a missing file read";
    } catch (const TableReadError& error) {
        EXPECT_EQ(error.Code(), 3);
    }
}

} // namespace
} // namespace swatchlog
