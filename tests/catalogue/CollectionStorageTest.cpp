#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

#include "catalogue/MyClass.h"
#include "catalogue/TabColumns.h"

namespace qv {
namespace {

std::string Name(int i) { return "Game" + std::to_string(i) + ".ZIP"; }

// Callers keep item pointers while the collection grows, so growth must never move an item.
TEST(CollectionStorageTest, ItemsKeepTheirAddressAndKeysThroughGrowthDeleteAndReuse) {
    MyClass games;
    games.Reserve(10);  // far too little: growth has to add storage and regrow the index
    std::vector<MyClass*> added;
    for (int i = 0; i < 5000; ++i) {
        MyClass* item = games.Add(Name(i));
        ASSERT_NE(item, nullptr) << i;
        item->Title = "Title " + std::to_string(i);
        added.push_back(item);
    }
    EXPECT_EQ(games.Add("game4999.zip"), nullptr);
    for (int i = 0; i < 5000; i += 7) {
        EXPECT_EQ(games.Item("game" + std::to_string(i) + ".zip"), added[i]) << i;
        EXPECT_EQ(added[i]->Title, "Title " + std::to_string(i));
    }

    games.Delete("GAME10.zip");
    games.Delete(1);  // Game0
    EXPECT_EQ(games.Count(), 4998);
    EXPECT_EQ(games.Item(1), added[1]);
    EXPECT_EQ(games.Item(10), added[11]);
    EXPECT_FALSE(games.exists("game0.zip"));
    // Storage freed by a delete may serve a new item; old keys and positions still hold.
    MyClass* again = games.Add("game0.zip");
    ASSERT_NE(again, nullptr);
    EXPECT_EQ(again->Title, "");
    EXPECT_EQ(again->Key(), "game0.zip");
    EXPECT_EQ(games.Item(games.Count()), again);
    EXPECT_EQ(games.Item("GAME4999.ZIP"), added[4999]);
    EXPECT_EQ(added[4999]->Title, "Title 4999");

    int position = 0;
    for (const MyClass& item : games) {
        ++position;
        ASSERT_EQ(&item, games.Item(position));
    }
    EXPECT_EQ(position, games.Count());
}

TEST(CollectionStorageTest, ItemsHoldTheirOwnCollectionsAndMovesKeepEverything) {
    MyClass outer;
    MyClass* parent = outer.Add("parent");
    for (int i = 0; i < 40; ++i) outer.Add(Name(i));  // the parent's storage must not move
    MyClass* child = parent->Add("child");
    ASSERT_NE(child, nullptr);
    child->Notes = "inner";
    EXPECT_EQ(parent->Count(), 1);
    EXPECT_EQ(outer.Item("PARENT")->Item("CHILD")->Notes, "inner");
    EXPECT_EQ(outer.Item("game3.zip")->Count(), 0);
    EXPECT_FALSE(outer.Item("game3.zip")->exists("child"));
    EXPECT_TRUE(outer.Item("game3.zip")->begin() == outer.Item("game3.zip")->end());

    MyClass moved = std::move(outer);
    EXPECT_EQ(moved.Count(), 41);
    EXPECT_EQ(moved.Item("parent"), parent);
    EXPECT_EQ(moved.Item(1)->Item(1), child);
    moved.Clear();
    EXPECT_EQ(moved.Count(), 0);
    EXPECT_NE(moved.Add("PARENT"), nullptr);
}

std::vector<std::string> Split(std::string_view line, std::string* stripped = nullptr) {
    const TabColumns<4> columns(line);
    std::vector<std::string> out;
    for (std::size_t i = 0; i < columns.Count(); ++i) out.emplace_back(columns[i]);
    if (stripped) {
        stripped->clear();
        for (std::size_t i = 0; i < columns.Count(); ++i) {
            std::string text;
            columns.AssignWithoutQuotes(text, i);
            *stripped += text + "|";
        }
    }
    return out;
}

// Tabs and quotes are found eight bytes at a time and then byte by byte in the tail, so the
// cases put them on both sides of those boundaries.
TEST(CollectionStorageTest, TabColumnsSplitAndStripQuotesAcrossWordBoundaries) {
    std::string stripped;
    EXPECT_EQ(Split("", &stripped), (std::vector<std::string>{""}));
    EXPECT_EQ(stripped, "|");
    EXPECT_EQ(Split("a\tb", &stripped), (std::vector<std::string>{"a", "b"}));
    EXPECT_EQ(Split("0123456\t89abcdef\tghi", &stripped),
              (std::vector<std::string>{"0123456", "89abcdef", "ghi"}));
    // Columns past the fourth are ignored, including their quotes and tabs.
    EXPECT_EQ(Split("a\t\"b\"\tc\td\t\"e\"\tf", &stripped),
              (std::vector<std::string>{"a", "\"b\"", "c", "d"}));
    EXPECT_EQ(stripped, "a|b|c|d|");

    const struct { const char* line; const char* stripped; } cases[] = {
        {"\"Generated Game 1\"\t\"1980\"\tMaker", "Generated Game 1|1980|Maker|"},
        {"\"The \"Real\" Game\"\t\"\"\t\"", "The Real Game|||"},
        {"x\"\t\"only start\tonly end\"", "x|only start|only end|"},
        {"\"a\"b\"\t\"\"\"\"\ttail \"q\"", "ab||tail q|"},
        {"long text with \"quotes\" inside it\t\t", "long text with quotes inside it|||"},
    };
    for (const auto& c : cases) {
        Split(c.line, &stripped);
        EXPECT_EQ(stripped, c.stripped) << c.line;
        std::string viaText;
        for (const std::string& column : Split(c.line)) viaText += WithoutQuotes(column) + "|";
        EXPECT_EQ(viaText, c.stripped) << c.line;
    }
}

}  // namespace
}  // namespace qv
