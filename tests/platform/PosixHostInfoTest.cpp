#include <gtest/gtest.h>
#include <unistd.h>

#include <regex>

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
        // Four parts of 0-255, without leading zeros.
        const std::string part = "(25[0-5]|2[0-4][0-9]|1[0-9][0-9]|[1-9]?[0-9])";
        EXPECT_TRUE(std::regex_match(address, std::regex(part + "(\\." + part + "){3}"))) << address;
    }
}

}  // namespace qv::test
