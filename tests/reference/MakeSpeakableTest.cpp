#include "reference/MakeSpeakable.h"

#include <gtest/gtest.h>

namespace qv {
namespace {

struct Example {
    const char* input;
    const char* spoken;
};

TEST(MakeSpeakableTest, WorkedExamples) {
    const Example examples[] = {
        {"Tom vs. Jerry", "TOM verses JERRY"},
        {"Cops && Robbers", "COPS and ROBBERS"},
        {"Cops & Robbers", "COPS & ROBBERS"},
        {"Star*Fighter", "STAR-FIGHTER"},
        {"Space Fight III (Japan)", "SPACE FIGHT 3"},
        {"Space Fight II", "SPACE FIGHT2"},
        {"Space Fight II Turbo", "SPACE FIGHT 2TURBO"},
        {"Great Race, The", "The GREAT RACE"},
        {"(C) 1982, Acme", "Copyright 1982, ACME"},
        {"(bootleg) Race", ""},
    };
    for (const auto& [input, spoken] : examples) EXPECT_EQ(MakeSpeakable(input), spoken) << input;
}

TEST(MakeSpeakableTest, PlainTextIsOnlyUpperCased) {
    EXPECT_EQ(MakeSpeakable("Pac-Man 2000"), "PAC-MAN 2000");
    EXPECT_EQ(MakeSpeakable(""), "");
}

TEST(MakeSpeakableTest, ReplacementsApplyToEveryOccurrenceInOrder) {
    EXPECT_EQ(MakeSpeakable("a*b*c"), "A-B-C");
    EXPECT_EQ(MakeSpeakable("x vs. y vs. z"), "X verses Y verses Z");
    // Lower-case "(c)" is upper-cased before the table runs.
    EXPECT_EQ(MakeSpeakable("(c) 1999"), "Copyright 1999");
    // "III " consumes its space before " II" can see the numeral.
    EXPECT_EQ(MakeSpeakable("Part III Now"), "PART 3NOW");
    EXPECT_EQ(MakeSpeakable("Part III"), "PART3");
    // A single numeral letter inside a word is untouched.
    EXPECT_EQ(MakeSpeakable("Iinn"), "IINN");
}

TEST(MakeSpeakableTest, BracketCutKeepsTheTextBeforeIt) {
    EXPECT_EQ(MakeSpeakable("Galaga (Midway set 1) (rev 2)"), "GALAGA ");
    EXPECT_EQ(MakeSpeakable("Title ( "), "TITLE ");
}

TEST(MakeSpeakableTest, TrailingArticleMovesToTheFront) {
    // Spaces around the article do not hide it; the untrimmed text is used afterwards.
    EXPECT_EQ(MakeSpeakable("  Great Race, The  "), "The   GREAT RACE  ");
    // Every ", THE" is removed, and a bracketed part goes first.
    EXPECT_EQ(MakeSpeakable("Legend, The (World)"), "The LEGEND ");
    EXPECT_EQ(MakeSpeakable("Tom vs. Jerry, the"), "The TOM VERSES JERRY");
    // Not at the end: nothing moves.
    EXPECT_EQ(MakeSpeakable("Race, The Sequel"), "RACE, THE SEQUEL");
    EXPECT_EQ(MakeSpeakable(", THE"), "The ");
}

}  // namespace
}  // namespace qv
