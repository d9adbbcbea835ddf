// A games.inc that exists but cannot be read was never loaded: saving must not replace it with
// whatever happens to be in memory.
#include <gtest/gtest.h>

#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "catalogue/CatalogueTestSupport.h"
#include "catalogue/GameRecords.h"

namespace qv::test {
namespace {

bool SaveIsRefused(const std::filesystem::path& folder) {
    TestLog log;
    Options options;
    options.GamesFile = (folder / "games.inc").string();
    options.DefaultROMdir = folder.string();
    MyClass records;
    records.Add("new.zip")->RomFile = "new.zip";
    return !SaveGameRecords(records, options, HostConventions::Posix(), log.regional, log.log)
                .empty();
}

TEST(UnreadableGamesFile, IsLeftAsItIsAndTheSaveReportsWhy) {
    TempDir dir;
    const std::string original = "pacman.zip\tPac-Man\t\tTrue\r\n";
    const auto games = dir.Write("games.inc", original);
    ::chmod(dir.path().c_str(), 0777);
    ::chmod(games.c_str(), 0);

    bool refused = false;
    if (::geteuid() == 0) {
        // Permissions do not bind root: try the save as an ordinary user in a child process.
        const pid_t child = ::fork();
        ASSERT_GE(child, 0);
        if (child == 0) {
            const bool ok = ::setgid(65534) == 0 && ::setuid(65534) == 0 && SaveIsRefused(dir.path());
            ::_exit(ok ? 0 : 1);
        }
        int status = 0;
        ::waitpid(child, &status, 0);
        refused = WIFEXITED(status) && WEXITSTATUS(status) == 0;
    } else {
        refused = SaveIsRefused(dir.path());
    }
    ::chmod(games.c_str(), 0644);
    EXPECT_TRUE(refused);
    EXPECT_EQ(dir.Read("games.inc"), original);
}

}  // namespace
}  // namespace qv::test
