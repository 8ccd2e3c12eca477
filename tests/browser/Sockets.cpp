#include "browser/Sockets.h"

#include <arpa/inet.h>
#include <array>
#include <cerrno>
#include <netinet/in.h>
#include <stdexcept>
#include <sys/socket.h>
#include <unistd.h>

namespace tovimar::test {
namespace {

sockaddr_in HomeAddress(int port) {
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_port = htons(static_cast<std::uint16_t>(port));
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    return address;
}

std::string Some(int handle) {
    std::array<char, 16384> buffer{};
    ssize_t got = 0;
    do
        got = recv(handle, buffer.data(), buffer.size(), 0);
    while (got < 0 && errno == EINTR);
    return {buffer.data(), got > 0 ? static_cast<std::size_t>(got) : 0U};
}

} // namespace

Socket::~Socket() {
    if (handle_ >= 0)
        close(handle_);
}

int Socket::Connect(int port) {
    const int handle = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    const auto address = HomeAddress(port);
    if (connect(handle, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0) {
        close(handle);
        throw std::runtime_error("no connection to port " + std::to_string(port));
    }
    return handle;
}

int Socket::Listen(int& port) {
    const int handle = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    auto address = HomeAddress(0);
    socklen_t size = sizeof address;
    if (bind(handle, reinterpret_cast<const sockaddr*>(&address), size) != 0 || listen(handle, 64) != 0 ||
        getsockname(handle, reinterpret_cast<sockaddr*>(&address), &size) != 0)
        throw std::runtime_error("no port to listen on");
    port = ntohs(address.sin_port);
    return handle;
}

bool Socket::Send(const std::string& bytes) const {
    for (std::size_t sent = 0; sent < bytes.size();) {
        const auto now = send(handle_, bytes.data() + sent, bytes.size() - sent, MSG_NOSIGNAL);
        if (now <= 0)
            return false;
        sent += static_cast<std::size_t>(now);
    }
    return true;
}

std::string Socket::ReadUntil(const std::string& end, std::string& rest) const {
    std::string text;
    for (;;) {
        const auto found = text.find(end);
        if (found != std::string::npos) {
            rest = text.substr(found + end.size());
            return text.substr(0, found + end.size());
        }
        const auto more = Some(handle_);
        if (more.empty())
            return text;
        text += more;
    }
}

std::string Socket::Read(std::size_t bytes, std::string rest) const {
    while (rest.size() < bytes) {
        const auto more = Some(handle_);
        if (more.empty())
            break;
        rest += more;
    }
    return rest;
}

} // namespace tovimar::test
