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

TEST(MyClassTest, KeysIgnoreLetterCase) {
    MyClass games;
    MyClass* first = games.Add("a.zip");
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(games.Add("A.ZIP"), nullptr);
    EXPECT_EQ(games.Count(), 1);
    EXPECT_EQ(games.Item("A.Zip"), first);
    EXPECT_TRUE(games.exists("A.ZIP"));
    EXPECT_EQ(first->Key(), "a.zip");
}

TEST(MyClassTest, MissingKeyGivesNothingAndDeleteRaises) {
    MyClass games;
    EXPECT_EQ(games.Item("never.zip"), nullptr);
    EXPECT_FALSE(games.exists("never.zip"));
    EXPECT_THROW(games.Delete("never.zip"), std::out_of_range);
    games.Add("pacman.zip");
    EXPECT_EQ(games.Item("never.zip"), nullptr);
    EXPECT_THROW(games.Delete("never.zip"), std::out_of_range);
    EXPECT_EQ(games.Count(), 1);
}

TEST(MyClassTest, ItemByPositionIsOneBased) {
    MyClass games;
    MyClass* first = games.Add("first.zip");
    MyClass* second = games.Add("second.zip");
    EXPECT_EQ(games.Item(1), first);
    EXPECT_EQ(games.Item(2), second);
    EXPECT_EQ(games.Item(0), nullptr);
    EXPECT_EQ(games.Item(3), nullptr);
    EXPECT_FALSE(games.exists(3));
    EXPECT_THROW(games.Delete(0), std::out_of_range);
    EXPECT_THROW(games.Delete(3), std::out_of_range);
}

TEST(MyClassTest, DeleteKeepsTheOthersFindableByKeyAndPosition) {
    MyClass games;
    games.Add("a.zip");
    MyClass* b = games.Add("b.zip");
    MyClass* c = games.Add("c.zip");
    games.Delete("A.ZIP");
    EXPECT_EQ(games.Count(), 2);
    EXPECT_EQ(games.Item("b.zip"), b);
    EXPECT_EQ(games.Item("c.zip"), c);
    EXPECT_EQ(games.Item(1), b);
    games.Delete(1);
    EXPECT_EQ(games.Item("C.ZIP"), c);
    EXPECT_EQ(games.Item(1), c);
    EXPECT_FALSE(games.exists("b.zip"));
    // A deleted key can be added again.
    EXPECT_NE(games.Add("b.zip"), nullptr);
    EXPECT_EQ(Keys(games), (std::vector<std::string>{"c.zip", "b.zip"}));
}

TEST(MyClassTest, KeyIsSetOnce) {
    MyClass item;
    item.SetKey("first");
    item.SetKey("second");
    EXPECT_EQ(item.Key(), "first");

    MyClass games;
    MyClass* added = games.Add("pacman.zip");
    added->SetKey("other.zip");
    EXPECT_EQ(added->Key(), "pacman.zip");
    EXPECT_EQ(games.Item("pacman.zip"), added);
}

TEST(MyClassTest, EnumeratesInInsertionOrder) {
    MyClass games;
    games.Add("b");
    games.Add("a");
    games.Add("c");
    EXPECT_EQ(Keys(games), (std::vector<std::string>{"b", "a", "c"}));
}

TEST(MyClassTest, ClearEmptiesAndForgetsKeys) {
    MyClass games;
    games.Add("a.zip");
    games.Clear();
    EXPECT_EQ(games.Count(), 0);
    EXPECT_FALSE(games.exists("a.zip"));
    EXPECT_NE(games.Add("A.ZIP"), nullptr);
}

}  // namespace
}  // namespace qv
