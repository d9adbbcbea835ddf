#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "catalogue/MyClass.h"

namespace qv {
namespace {

std::vector<std::string> Keys(const MyClass& collection) {
    std::vector<std::string> keys;
    for (const MyClass& item : collection) keys.push_back(item.Key());
    return keys;
}

TEST(MyClassTest, KeysIgnoreLetterCaseAndAreSetOnce) {
    MyClass games;
    MyClass* first = games.Add("a.zip");
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(games.Add("A.ZIP"), nullptr);
    EXPECT_EQ(games.Count(), 1);
    EXPECT_EQ(games.Item("A.Zip"), first);
    EXPECT_EQ(games.Item("never.zip"), nullptr);
    EXPECT_FALSE(games.exists("never.zip"));
    first->SetKey("other.zip");  // an added item's key cannot drift from its index
    EXPECT_EQ(first->Key(), "a.zip");
    EXPECT_EQ(games.Item("a.zip"), first);
}

TEST(MyClassTest, DeleteKeepsTheOthersFindableAndRaisesForMissingItems) {
    MyClass games;
    games.Add("a.zip");
    MyClass* b = games.Add("b.zip");
    MyClass* c = games.Add("c.zip");
    EXPECT_EQ(games.Item(1)->Key(), "a.zip");  // positions are one-based
    EXPECT_EQ(games.Item(0), nullptr);
    EXPECT_EQ(games.Item(4), nullptr);
    EXPECT_THROW(games.Delete("never.zip"), std::out_of_range);
    EXPECT_THROW(games.Delete(0), std::out_of_range);
    EXPECT_THROW(games.Delete(4), std::out_of_range);

    games.Delete("A.ZIP");
    EXPECT_EQ(games.Item("b.zip"), b);
    EXPECT_EQ(games.Item(1), b);
    games.Delete(1);
    EXPECT_EQ(games.Item("C.ZIP"), c);
    EXPECT_EQ(games.Item(1), c);
    EXPECT_FALSE(games.exists("b.zip"));
    EXPECT_NE(games.Add("b.zip"), nullptr);  // a deleted key can be added again
    games.Add("a");
    EXPECT_EQ(Keys(games), (std::vector<std::string>{"c.zip", "b.zip", "a"}));  // insertion order

    games.Clear();
    EXPECT_EQ(games.Count(), 0);
    EXPECT_FALSE(games.exists("c.zip"));
    EXPECT_NE(games.Add("C.ZIP"), nullptr);
}

}  // namespace
}  // namespace qv
