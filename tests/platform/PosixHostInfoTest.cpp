#include <gtest/gtest.h>
#include <unistd.h>

#include "platform/PosixHostInfo.h"

namespace qv::test {

namespace {
class RecordingPrompt final : public Prompt {
public:
    PromptAnswer Ask(const std::string&, const std::string& text, PromptButtons,
                     PromptIcon) override {
        messages.push_back(text);
        return PromptAnswer::Ok;
    }
    std::vector<std::string> messages;
};
}  // namespace

TEST(PosixHostInfo, DottedAddressHasNoLeadingZerosOrTrailingDot) {
    const unsigned char a[] = {10, 0, 0, 5};
    EXPECT_EQ(DottedAddress(a, 4), "10.0.0.5");
    const unsigned char b[] = {255, 1, 100, 0};
    EXPECT_EQ(DottedAddress(b, 4), "255.1.100.0");
    EXPECT_EQ(DottedAddress(b, 0), "");
}

TEST(PosixHostInfo, ErrorNumberTextHasSpaceBeforeNonNegativeNumbers) {
    EXPECT_EQ("Windows Sockets error " + SocketErrorText(10093) + " has occurred.",
              "Windows Sockets error  10093 has occurred.");
    EXPECT_EQ(SocketErrorText(-1), "-1");
}

TEST(PosixHostInfo, HostNameMatchesSystemAndAddressIsDottedOrReported) {
    RecordingPrompt prompt;
    PosixHostInfo info(&prompt);
    char expected[256] = {};
    ASSERT_EQ(::gethostname(expected, sizeof expected - 1), 0);
    EXPECT_EQ(info.GetLocalHostName(), expected);

    const std::string address = info.GetLocalIP();
    if (address.empty()) {
        // This machine's name does not resolve to IPv4: the user is told why.
        ASSERT_EQ(prompt.messages.size(), 1u);
        EXPECT_EQ(prompt.messages[0],
                  "Windows Sockets are not responding. Unable to successfully get Host Name.");
    } else {
        EXPECT_TRUE(prompt.messages.empty());
        int parts = 0;
        for (std::size_t start = 0; start <= address.size(); ++parts) {
            const auto dot = std::min(address.find('.', start), address.size());
            const std::string part = address.substr(start, dot - start);
            ASSERT_FALSE(part.empty()) << address;
            EXPECT_LE(std::stoi(part), 255);
            EXPECT_TRUE(part == "0" || part[0] != '0') << address;
            start = dot + 1;
        }
        EXPECT_EQ(parts, 4) << address;
    }
}

}  // namespace qv::test
