#include <gtest/gtest.h>

#include "support/TempDir.h"
#include "ui/AppFolder.h"

namespace qv {
namespace {

TEST(AppFolderTest, QuorvaneHomeWinsThenXdgDataHomeThenTheHomeFolder) {
    EXPECT_EQ(ApplicationFolder("/q", "/xdg", "/home/u"), std::filesystem::path("/q"));
    EXPECT_EQ(ApplicationFolder(nullptr, "/xdg", "/home/u"),
              std::filesystem::path("/xdg/quorvane"));
    EXPECT_EQ(ApplicationFolder("", "", "/home/u"),
              std::filesystem::path("/home/u/.local/share/quorvane"));
    EXPECT_EQ(ApplicationFolder(nullptr, nullptr, "/home/u"),
              std::filesystem::path("/home/u/.local/share/quorvane"));
}

TEST(AppFolderTest, PreparingCreatesTheFolderWithItsLogsFolder) {
    test::TempDir dir;
    EXPECT_TRUE(PrepareApplicationFolder(dir / "a" / "quorvane"));
    EXPECT_TRUE(std::filesystem::is_directory(dir / "a" / "quorvane" / "logs"));
    dir.Write("file", "x");
    EXPECT_FALSE(PrepareApplicationFolder(dir / "file" / "quorvane"));
}

}  // namespace
}  // namespace qv
