#pragma once
#include <string>

namespace qv {

// The local machine's host name and first IPv4 address; "" on any failure.
class HostInfo {
public:
    virtual ~HostInfo() = default;
    virtual std::string GetLocalIP() = 0;
    virtual std::string GetLocalHostName() = 0;
};

}  // namespace qv
