// The executable selector and the resolution cycle.
#include <gtest/gtest.h>

#include "launch/ExecutableCycle.h"
#include "launch/ResolutionCycle.h"
#include "support/TempDir.h"

namespace qv {
namespace {

TEST(ExecutableCycleTest, CyclesThroughTheFourBuildsOnEachHost) {
    const HostConventions posix = HostConventions::Posix();
    std::string name = "mamepp";
    std::vector<std::string> seen;
    for (int i = 0; i < 4; ++i) seen.push_back(name = NextExecutable(name, posix));
    EXPECT_EQ(seen, (std::vector<std::string>{"fastmame", "mameanalog", "mame", "mamepp"}));
    EXPECT_EQ(NextExecutable("MAME.EXE", HostConventions::Windows()), "MAMEPP.EXE");
    EXPECT_EQ(NextExecutable("MAME.EXE", posix), "MAME.EXE");  // outside the cycle here
    EXPECT_EQ(NextExecutable("Mame", posix), "Mame");          // exact case

    ASSERT_NE(FindExecutableBuild("mameanalog", posix), nullptr);
    EXPECT_EQ(FindExecutableBuild("mameanalog", posix)->label, "MAMEANALOG");
    EXPECT_EQ(FindExecutableBuild("mamepp", posix)->spoken, "Mame pentium pro");
    EXPECT_EQ(FindExecutableBuild("FASTMAME.EXE", HostConventions::Windows())->spoken,
              "Fast Mame");
}

TEST(ExecutableCycleTest, DisplayFollowsTheFileOnDisk) {
    test::TempDir dir;
    Options options;
    options.MamePath = dir.path().string() + "/";
    options.MameExec = "mame";
    const HostConventions posix = HostConventions::Posix();
    ExecutableDisplay shown = DescribeExecutable(options, posix);
    EXPECT_EQ(shown.label, "MAME");
    EXPECT_EQ(shown.spoken, "Mame");
    EXPECT_FALSE(shown.present);
    dir.Write("mame", "#!/bin/sh\n");
    EXPECT_TRUE(DescribeExecutable(options, posix).present);

    options.MameExec = "mame64";
    shown = DescribeExecutable(options, posix);
    EXPECT_TRUE(shown.label.empty());
    EXPECT_TRUE(shown.spoken.empty());
}

TEST(ExecutableCycleTest, VersionLabel) {
    EXPECT_EQ(VersionLabelText("MAMEPP.EXE", "0.78"), "Using MAMEPP Version: 0.78");
    EXPECT_EQ(VersionLabelText("mame", "0.251"), "Using mame Version: 0.251");
    EXPECT_EQ(VersionLabelText("mame.exe", "#N/A"), "Using mame.exe Version: #N/A");
}

TEST(ResolutionCycleTest, DefaultListRunsRoundWithBlanksOnlyOnTheLabel) {
    const ResolutionCycle cycle("320 x 240, 640 x 480, 800 x 600, 1024 x 768");
    std::vector<std::string> labels;
    std::string label = "Auto";
    for (int i = 0; i < 5; ++i) labels.push_back(label = cycle.Next(label));
    EXPECT_EQ(labels, (std::vector<std::string>{"320 x 240", " 640 x 480", " 800 x 600",
                                                " 1024 x 768", "Auto"}));
    EXPECT_EQ(cycle.Entries().Count(), 5);
    EXPECT_EQ(cycle.Next(""), "320 x 240");  // an empty label counts as "Auto"
    EXPECT_EQ(cycle.Next("1280 x 1024"), "Auto");  // a resolution no longer offered
}

TEST(ResolutionCycleTest, SingleEntryAlternatesAndBlankPiecesAreSkipped) {
    ResolutionCycle cycle("800 x 600");
    EXPECT_EQ(cycle.Next("Auto"), "800 x 600");
    EXPECT_EQ(cycle.Next("800 x 600"), "Auto");
    cycle.Build("640 x 480,, 800 x 600,");
    EXPECT_EQ(cycle.Next("640 x 480"), " 800 x 600");
    EXPECT_EQ(cycle.Next("800 x 600"), "Auto");
    cycle.Build("");
    EXPECT_EQ(cycle.Next("Auto"), "Auto");
}

TEST(ResolutionCycleTest, AdvanceStoresTheChoiceInTheSelectedRecord) {
    const ResolutionCycle cycle("320 x 240, 640 x 480");
    MyClass game;
    game.Resolution = "stale";
    EXPECT_EQ(cycle.Advance("320 x 240", &game), " 640 x 480");
    EXPECT_EQ(game.Resolution, " 640 x 480");
    EXPECT_EQ(cycle.Advance(" 640 x 480", &game), "Auto");
    EXPECT_EQ(game.Resolution, "");
    EXPECT_EQ(cycle.Advance("Auto", nullptr), "320 x 240");  // no game: only the label moves
}

}  // namespace
}  // namespace qv
