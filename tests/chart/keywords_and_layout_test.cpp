// Header keywords, the keyword list to be written, chart type and layout.
#include <gtest/gtest.h>

#include <stdexcept>

#include "test_store.h"

namespace {

using Pairs = std::vector<std::pair<std::string, std::string>>;

TEST(Layout, SetLayoutAndPagesRejectCountsBelowOne) {
    TestStore store;
    EXPECT_EQ(store.SetLayout(0, 5), 15);
    EXPECT_EQ(store.SetLayout(5, 0), 15);
    EXPECT_EQ(store.GetNumberOfStrips(), 0);
    EXPECT_EQ(store.GetNumberOfCols(), 0);
    EXPECT_EQ(store.SetLayout(2, 5), 0);
    EXPECT_EQ(store.SetLayout(-1, 7), 15);
    EXPECT_EQ(store.GetNumberOfStrips(), 2);
    EXPECT_EQ(store.GetNumberOfCols(), 5);

    EXPECT_EQ(store.SetNumberOfPages(0), 18);
    EXPECT_EQ(store.GetNumberOfPages(), 0);
    EXPECT_EQ(store.SetNumberOfPages(3), 0);
    EXPECT_EQ(store.GetNumberOfPages(), 3);
}

TEST(Keywords, LookUpIsExactAndCaseSensitive) {
    TestStore store;
    store.keywordMap["ORIGINATOR"] = "\"lab 2\"";
    store.keywordMap["CHART_TYPE"] = " \"IT8.7/4\"";
    EXPECT_EQ(store.GetKeywordValue("ORIGINATOR"), "\"lab 2\"");
    EXPECT_EQ(store.GetKeywordValue("originator"), "");
    EXPECT_EQ(store.GetKeywordValue("ORIGINATOR "), "");
    EXPECT_EQ(store.GetKeywords().size(), 2u);

    std::string type;
    EXPECT_EQ(store.GetChartType(type), 0);
    EXPECT_EQ(type, " \"IT8.7/4\""); // as the reader stored it

    TestStore empty;
    EXPECT_EQ(empty.GetChartType(type), 0);
    EXPECT_EQ(type, "unknown");
}

TEST(Keywords, SetChartTypeEditsTheListToBeWritten) {
    TestStore store;
    store.SetChartType("A");
    EXPECT_EQ(store.keywordList, (Pairs{{"CHART_TYPE", "A"}}));
    store.SetChartType("B");
    EXPECT_EQ(store.keywordList, (Pairs{{"CHART_TYPE", "B"}}));
    std::string type;
    store.GetChartType(type);
    EXPECT_EQ(type, "unknown"); // answered from the file read, not the list

    store.AddKeyword({"ORIGINATOR", "x"});
    store.AddKeyword({"CHART_TYPE", "C"});
    store.SetChartType("D");
    EXPECT_EQ(store.keywordList,
              (Pairs{{"CHART_TYPE", "D"}, {"ORIGINATOR", "x"}, {"CHART_TYPE", "D"}}));

    store.SetKeyword({"CHART_TYP", "E"}); // a prefix is another keyword
    EXPECT_EQ(store.keywordList.size(), 4u);
    store.SetKeywordList({{"K", "1"}, {"K", "2"}});
    EXPECT_EQ(store.keywordList, (Pairs{{"K", "1"}, {"K", "2"}}));
}

TEST(Keywords, LayoutKeywordsAreReadLikeStol) {
    TestStore store;
    store.keywordMap["NUMBER_OF_STRIPS"] = "\"12\"";
    store.keywordMap["NUMBER_OF_COLS"] = "24";
    store.ReadLayoutKeywords();
    EXPECT_EQ(store.GetNumberOfStrips(), 12);
    EXPECT_EQ(store.GetNumberOfCols(), 24);

    store.keywordMap["NUMBER_OF_STRIPS"] = " 3x";
    store.keywordMap.erase("NUMBER_OF_COLS");
    store.ReadLayoutKeywords();
    EXPECT_EQ(store.GetNumberOfStrips(), 3);
    EXPECT_EQ(store.GetNumberOfCols(), 24); // absent keyword leaves the count
}

TEST(Keywords, UnreadableLayoutKeywordsThrow) {
    TestStore store;
    store.keywordMap["NUMBER_OF_STRIPS"] = "x3";
    try {
        store.ReadLayoutKeywords();
        ADD_FAILURE() << "no exception";
    } catch (const std::invalid_argument& e) {
        EXPECT_STREQ(e.what(), "invalid stol argument");
    }

    store.keywordMap["NUMBER_OF_STRIPS"] = "7";
    store.keywordMap["NUMBER_OF_COLS"] = "99999999999";
    try {
        store.ReadLayoutKeywords();
        ADD_FAILURE() << "no exception";
    } catch (const std::out_of_range& e) {
        EXPECT_STREQ(e.what(), "stol argument out of range");
    }
    EXPECT_EQ(store.GetNumberOfStrips(), 7); // set before the columns failed
    EXPECT_EQ(store.GetNumberOfCols(), 0);
}

} // namespace
