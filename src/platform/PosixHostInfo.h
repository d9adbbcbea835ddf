#pragma once
#include <cstddef>
#include <string>

#include "platform/HostInfo.h"
#include "platform/Prompt.h"

namespace qv {

// Bytes of an address as dotted decimal: {10, 0, 0, 5} -> "10.0.0.5".
std::string DottedAddress(const unsigned char* bytes, std::size_t count);

// The error part of the host-name messages: the number in decimal, preceded by one space when
// it is not negative.
std::string SocketErrorText(int number);

// Host name and first IPv4 address from gethostname and getaddrinfo. Failures are shown
// through prompt (when given) and give "".
class PosixHostInfo final : public HostInfo {
public:
    explicit PosixHostInfo(Prompt* prompt) : prompt_(prompt) {}

    std::string GetLocalIP() override;
    std::string GetLocalHostName() override;

private:
    void Show(const std::string& text);

    Prompt* prompt_;
};

}  // namespace qv
