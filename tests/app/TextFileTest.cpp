#include <gtest/gtest.h>
#include <unistd.h>

#include "app/TextFile.h"
#include "support/TempDir.h"

namespace qv::test {

TEST(TextFile, LinesEndInCrLfOrLfAndLastLineNeedsNoEnd) {
    EXPECT_EQ(SplitLines("a\r\nb\nc"), (std::vector<std::string>{"a", "b", "c"}));
    EXPECT_EQ(SplitLines("a\r\n\r\n"), (std::vector<std::string>{"a", ""}));
    EXPECT_TRUE(SplitLines("").empty());
    // A lone CR inside a line is a byte of the line.
    EXPECT_EQ(SplitLines("x\ry\n"), (std::vector<std::string>{"x\ry"}));
}

TEST(TextFile, AtomicWriteReplacesContentOrKeepsTheOldFile) {
    TempDir dir;
    const auto file = dir / "config.inc";
    EXPECT_EQ(WriteFileAtomically(file, "one\r\n"), "");
    EXPECT_EQ(WriteFileAtomically(file, "two\r\n"), "");
    EXPECT_EQ(ReadAll(file), "two\r\n");
    // A non-empty folder where the file should go: the rename over it fails.
    dir.Write("target/inside.txt", "keep");
    EXPECT_NE(WriteFileAtomically(dir / "target", "new"), "");
    EXPECT_EQ(dir.Read("target/inside.txt"), "keep");
    // No temporary file is left behind either way.
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(dir.path()), {}), 2);

    if (::geteuid() == 0) return;  // permissions do not bind root
    std::filesystem::permissions(dir.path(), std::filesystem::perms::owner_read |
                                                 std::filesystem::perms::owner_exec);
    EXPECT_NE(WriteFileAtomically(file, "new\r\n"), "");
    std::filesystem::permissions(dir.path(), std::filesystem::perms::owner_all);
    EXPECT_EQ(ReadAll(file), "two\r\n");
}

TEST(TextFile, DisplayUtf8KeepsUtf8AndReadsOtherBytesAsWindows1252) {
    EXPECT_EQ(DisplayUtf8("Caf\xC3\xA9"), "Caf\xC3\xA9");
    EXPECT_EQ(DisplayUtf8("Caf\xE9"), "Caf\xC3\xA9");
    EXPECT_EQ(DisplayUtf8("\x80 5"), "\xE2\x82\xAC 5");
}

TEST(TextFile, FileExistsOnlyForFiles) {
    TempDir dir;
    EXPECT_FALSE(FileExists(dir.path()));
    EXPECT_FALSE(FileExists(dir / "none"));
    EXPECT_FALSE(FileExists(""));
    EXPECT_TRUE(FileExists(dir.Write("a.txt", "")));
}

}  // namespace qv::test
