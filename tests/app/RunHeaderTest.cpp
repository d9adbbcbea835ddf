#include <gtest/gtest.h>

#include "support/FixedLog.h"
#include "app/AppVersion.h"
#include "app/RunHeader.h"

namespace qv::test {

namespace {
class FixedHostInfo final : public HostInfo {
public:
    std::string GetLocalIP() override { return "10.0.0.5"; }
    std::string GetLocalHostName() override { return "arcade"; }
};
}  // namespace

TEST(RunHeader, WritesIdentityAddressScreenStartAndSeparatorWithoutTimeStamps) {
    LogFixture f;
    f.dir.Write("quorvane.log", "previous run\r\n");
    FixedHostInfo host;
    WriteRunHeader(f.log, host, 1024, 768, f.regional, f.clock);
    EXPECT_EQ(f.Lines(),
              (std::vector<std::string>{"previous run", "", "", "Quorvane",
                                        "Version 2.25.031704 Build " +
                                            std::to_string(app_version::Build),
                                        "Client IP: 10.0.0.5 (arcade)", "Screen Size: 1024 x 768",
                                        "Started: " + f.regional.GeneralDate(f.clock.now),
                                        std::string(60, '_')}));
    EXPECT_EQ(f.yield.yields, 7);
}

}  // namespace qv::test
