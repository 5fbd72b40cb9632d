// The layout setters and the keyword list to be written. Keyword look-up and
// the layout keywords of a file are tested through read charts.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using Pairs = std::vector<std::pair<std::string, std::string>>;

TEST(Layout, SetLayoutAndPagesRejectCountsBelowOne) {
    TestStore store;
    EXPECT_EQ(store.SetLayout(2, 5), 0);
    for (const auto& [strips, cols] : {std::pair{0, 5}, {5, 0}, {-1, 7}}) {
        EXPECT_EQ(store.SetLayout(strips, cols), 15) << strips << " " << cols;
    }
    EXPECT_EQ(store.GetNumberOfStrips(), 2);
    EXPECT_EQ(store.GetNumberOfCols(), 5);

    EXPECT_EQ(store.SetNumberOfPages(0), 18);
    EXPECT_EQ(store.GetNumberOfPages(), 0);
    EXPECT_EQ(store.SetNumberOfPages(3), 0);
    EXPECT_EQ(store.GetNumberOfPages(), 3);
}

TEST(Keywords, SetChartTypeEditsTheListToBeWritten) {
    TestStore store;
    store.SetChartType("A");
    EXPECT_EQ(store.keywordList, (Pairs{{"CHART_TYPE", "A"}}));
    store.SetChartType("B");
    EXPECT_EQ(store.keywordList, (Pairs{{"CHART_TYPE", "B"}}));
    std::string type;
    EXPECT_EQ(store.GetChartType(type), 0);
    EXPECT_EQ(type, "unknown"); // answered from the file read, not the list
    store.keywordMap["CHART_TYPE"] = " \"IT8.7/4\"";
    store.GetChartType(type);
    EXPECT_EQ(type, " \"IT8.7/4\""); // as the reader stored it

    // AddKeyword appends even a keyword already there; SetChartType changes both.
    store.AddKeyword({"ORIGINATOR", "x"});
    store.AddKeyword({"CHART_TYPE", "C"});
    store.SetChartType("D");
    EXPECT_EQ(store.keywordList,
              (Pairs{{"CHART_TYPE", "D"}, {"ORIGINATOR", "x"}, {"CHART_TYPE", "D"}}));
    store.SetKeyword({"CHART_TYP", "E"}); // a prefix is another keyword
    EXPECT_EQ(store.keywordList.back(), (std::pair<std::string, std::string>{"CHART_TYP", "E"}));
    store.SetKeywordList({{"K", "1"}, {"K", "2"}});
    EXPECT_EQ(store.keywordList, (Pairs{{"K", "1"}, {"K", "2"}}));
}

} // namespace
