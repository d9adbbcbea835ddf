#pragma once
#include <string>

#include "app/Options.h"

namespace qv {

namespace network_switch {
// The maker's download site, the base of the download addresses.
inline constexpr const char* MakerWebHost = "downloads.quorvane.org";
// On the maker's own network the downloads come from a local server instead. No such network
// is configured, so the switch never applies.
inline constexpr const char* PrivatePrefix = "";
inline constexpr const char* PrivateServer = "";
}  // namespace network_switch

// Replaces the maker's web host in the screenshot, marquee and live-update addresses by
// server when the first ten characters of localIP equal prefix. An empty prefix never matches.
void ApplyNetworkSwitch(Options& options, const std::string& localIP, const std::string& prefix,
                        const std::string& server);

}  // namespace qv
