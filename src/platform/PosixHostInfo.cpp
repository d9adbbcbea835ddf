#include "platform/PosixHostInfo.h"

#include <cerrno>
#include <cstring>
#include <netdb.h>
#include <netinet/in.h>
#include <sys/socket.h>
#include <unistd.h>

namespace qv {

namespace {

constexpr std::size_t kHostNameBuffer = 256;

// The host name, or false with errno set.
bool ReadHostName(std::string& name) {
    char buffer[kHostNameBuffer + 1] = {};
    if (::gethostname(buffer, kHostNameBuffer) != 0) return false;
    buffer[kHostNameBuffer] = '\0';
    name = buffer;
    return true;
}

std::string TrimmedSpaces(const std::string& text) {
    const auto first = text.find_first_not_of(' ');
    if (first == std::string::npos) return {};
    return text.substr(first, text.find_last_not_of(' ') - first + 1);
}

}  // namespace

std::string DottedAddress(const unsigned char* bytes, std::size_t count) {
    std::string text;
    for (std::size_t i = 0; i < count; ++i) {
        if (i) text += '.';
        text += std::to_string(static_cast<unsigned>(bytes[i]));
    }
    return text;
}

std::string SocketErrorText(int number) {
    return (number >= 0 ? " " : "") + std::to_string(number);
}

void PosixHostInfo::Show(const std::string& text) {
    if (prompt_) prompt_->Ask("", text, PromptButtons::Ok, PromptIcon::None);
}

std::string PosixHostInfo::GetLocalIP() {
    std::string name;
    if (!ReadHostName(name)) {
        Show("Windows Sockets error " + SocketErrorText(errno) +
             " has occurred. Unable to successfully get Host Name.");
        return "";
    }
    addrinfo hints{};
    hints.ai_family = AF_INET;
    addrinfo* found = nullptr;
    const std::string trimmed = TrimmedSpaces(name);
    if (::getaddrinfo(trimmed.c_str(), nullptr, &hints, &found) != 0 || !found) {
        Show("Windows Sockets are not responding. Unable to successfully get Host Name.");
        return "";
    }
    std::string address;
    for (const addrinfo* entry = found; entry; entry = entry->ai_next) {
        if (entry->ai_family != AF_INET || !entry->ai_addr) continue;
        const auto* in = reinterpret_cast<const sockaddr_in*>(entry->ai_addr);
        unsigned char bytes[4];
        std::memcpy(bytes, &in->sin_addr.s_addr, sizeof bytes);  // network order = dotted order
        address = DottedAddress(bytes, sizeof bytes);
        break;
    }
    ::freeaddrinfo(found);
    if (address.empty())
        Show("Windows Sockets are not responding. Unable to successfully get Host Name.");
    return address;
}

std::string PosixHostInfo::GetLocalHostName() {
    std::string name;
    if (!ReadHostName(name)) {
        Show("Windows Sockets error " + SocketErrorText(errno) +
             " has occurred.  Unable to successfully get Host Name.");
        return "";
    }
    return name;
}

}  // namespace qv
