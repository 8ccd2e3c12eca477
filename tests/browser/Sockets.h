#pragma once

#include <string>

namespace tovimar::test {

/// A socket of this machine, closed when it goes.
class Socket {
public:
    explicit Socket(int handle) : handle_(handle) {}
    ~Socket();
    Socket(const Socket&) = delete;
    Socket& operator=(const Socket&) = delete;

    static int Connect(int port);
    /// Listens on a free port, which is given back.
    static int Listen(int& port);

    bool Send(const std::string& bytes) const;
    /// Up to and including the text, or all until the other side ends; what came behind it is in `rest`.
    std::string ReadUntil(const std::string& end, std::string& rest) const;
    std::string Read(std::size_t bytes, std::string rest) const;

private:
    int handle_;
};

} // namespace tovimar::test
