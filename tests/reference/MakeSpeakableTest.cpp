#include "reference/MakeSpeakable.h"

#include <gtest/gtest.h>

namespace qv {
namespace {

TEST(MakeSpeakableTest, TitlesBecomeWhatTheVoiceShouldSay) {
    const struct {
        const char* input;
        const char* spoken;
    } rows[] = {
        {"", ""},
        {"Pac-Man 2000", "PAC-MAN 2000"},  // plain text is only upper-cased
        {"Tom vs. Jerry", "TOM verses JERRY"},
        {"x vs. y vs. z", "X verses Y verses Z"},  // every occurrence
        {"Cops && Robbers", "COPS and ROBBERS"},
        {"Cops & Robbers", "COPS & ROBBERS"},
        {"Star*Fighter", "STAR-FIGHTER"},
        {"a*b*c", "A-B-C"},
        {"(C) 1982, Acme", "Copyright 1982, ACME"},
        {"(c) 1999", "Copyright 1999"},  // upper-cased before the table runs
        // Numerals: "III " consumes its space before " II" can see it; letters in words stay.
        {"Space Fight III (Japan)", "SPACE FIGHT 3"},
        {"Space Fight II", "SPACE FIGHT2"},
        {"Space Fight II Turbo", "SPACE FIGHT 2TURBO"},
        {"Part III Now", "PART 3NOW"},
        {"Part III", "PART3"},
        {"Iinn", "IINN"},
        // A bracket cuts the rest off.
        {"(bootleg) Race", ""},
        {"Galaga (Midway set 1) (rev 2)", "GALAGA "},
        {"Title ( ", "TITLE "},
        // A trailing article moves to the front; spaces around it do not hide it.
        {"Great Race, The", "The GREAT RACE"},
        {"  Great Race, The  ", "The   GREAT RACE  "},
        {"Legend, The (World)", "The LEGEND "},
        {"Tom vs. Jerry, the", "The TOM VERSES JERRY"},
        {"Race, The Sequel", "RACE, THE SEQUEL"},
        {", THE", "The "},
    };
    for (const auto& [input, spoken] : rows) EXPECT_EQ(MakeSpeakable(input), spoken) << input;
}

}  // namespace
}  // namespace qv
