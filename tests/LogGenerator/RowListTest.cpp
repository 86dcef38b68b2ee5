// A list refilled in place equals one built from scratch.

#include "RowWriter.h"

#include <gtest/gtest.h>

namespace orvex {
namespace {

using Records = std::vector<std::vector<std::pair<const char*, int>>>; // rows of each record

void fill(const ArrayRef& list, const Records& records)
{
    RowList rows(list);
    for (const auto& record : records) {
        RowWriter& row = rows.next();
        for (const auto& [name, number] : record)
            row.setText(name, "%d", number);
    }
}

// As text, because the order of rows counts: dictionaries are equal in any order.
std::string described(const Array& list)
{
    std::string result;
    for (const Value& element : list) {
        for (const auto& [name, value] : *element.dictionary())
            result += name + "=" + *value.string() + " ";
        result += "| ";
    }
    return result;
}

TEST(RowListTest, HoldsWhatWasWrittenLast)
{
    const Records kSteps[] = {
        {{{"A", 1}, {"B", 2}}, {{"A", 3}, {"B", 4}}},
        {{{"A", 5}, {"B", 6}}, {{"A", 7}, {"B", 8}}, {{"A", 9}, {"B", 0}}}, // longer
        {{{"A", 1}}},                                                       // shorter, with fewer rows
        {},
        {{{"A", 1}, {"B", 2}, {"C", 3}}, {{"A", 4}}},
        {{{"B", 1}, {"A", 2}, {"C", 3}}, {{"B", 4}, {"A", 5}}}, // another order
        {{{"A", 1}, {"C", 2}}, {{"D", 3}}},                     // a row left out, another row
        {{{"A", 1}, {"B", 2}, {"A", 3}, {"C", 4}}},             // a row set twice keeps its place
        {{{"A", 1}, {"B", 2}, {"C", 3}}},
    };
    const auto list = Array::make();
    for (const Records& step : kSteps) {
        fill(list, step);
        const auto fromNothing = Array::make();
        fill(fromNothing, step);
        EXPECT_EQ(described(*list), described(*fromNothing));
    }
    EXPECT_EQ(described(*list), "A=1 B=2 C=3 | ");
}

TEST(RowListTest, RemovedRowsAreGone)
{
    const auto list = Array::make();
    for (int i = 0; i < 2; ++i) {
        RowList rows(list);
        RowWriter& row = rows.next();
        row.set("A", "1");
        row.set("B", "2");
        row.remove("A");
        row.set("C", "3");
    }
    EXPECT_EQ(described(*list), "B=2 C=3 | ");
}

TEST(RowListTest, LeavesWhatSomebodyElseHoldsAndElementsOfAnotherKind)
{
    const auto kept = Dictionary::make({{"Z", "1"}});
    const auto list = Array::make({"text", kept});
    fill(list, {{{"A", 1}}, {{"A", 2}}});
    EXPECT_EQ(described(*list), "A=1 | A=2 | ");
    fill(list, {});
    fill(list, {{{"A", 3}}});
    EXPECT_EQ(*kept, Dictionary({{"Z", "1"}}));
}

TEST(RowsTest, ListThatSomebodyElseHoldsIsReplaced)
{
    const auto dictionary = Dictionary::make();
    for (const int number : {1, 2}) {
        const ArrayRef held = (*dictionary)["List"].array(); // as an older history entry may hold it
        fill(RowWriter(dictionary).list("List"), {{{"A", number}}});
        EXPECT_TRUE(!held || described(*held) == "A=1 | ");
        EXPECT_EQ(described(*(*dictionary)["List"].array()), number == 1 ? "A=1 | " : "A=2 | ");
    }
}

} // namespace
} // namespace orvex
