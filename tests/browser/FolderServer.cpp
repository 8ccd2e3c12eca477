#include "browser/Browser.h"
#include "browser/Sockets.h"
#include "cli/Program.h"

#include <map>
#include <sys/socket.h>
#include <unistd.h>
#include <utility>

namespace tovimar::test {
namespace {

/// "%20" and the like as bytes.
std::string Decoded(const std::string& path) {
    std::string out;
    for (std::size_t at = 0; at < path.size(); ++at)
        if (path[at] == '%' && at + 2 < path.size()) {
            out += static_cast<char>(std::stoi(path.substr(at + 1, 2), nullptr, 16));
            at += 2;
        } else
            out += path[at];
    return out;
}

std::string KindOf(const fs::path& file) {
    static const std::map<std::string, std::string> kKinds = {{".htm", "text/html"},
                                                              {".html", "text/html"},
                                                              {".js", "text/javascript; charset=utf-8"},
                                                              {".css", "text/css"},
                                                              {".jpg", "image/jpeg"}};
    const auto kind = kKinds.find(file.extension().string());
    return kind == kKinds.end() ? "application/octet-stream" : kind->second;
}

} // namespace

FolderServer::FolderServer(fs::path folder) : folder_(std::move(folder)) {
    listening_ = Socket::Listen(port_);
    thread_ = std::thread([this] { Serve(); });
}

FolderServer::~FolderServer() {
    shutdown(listening_, SHUT_RDWR);
    thread_.join();
    close(listening_);
}

std::string FolderServer::Address() const {
    return "http://127.0.0.1:" + std::to_string(port_) + "/";
}

void FolderServer::Serve() {
    for (;;) {
        const int connection = accept4(listening_, nullptr, nullptr, SOCK_CLOEXEC);
        if (connection < 0)
            return;
        Answer(connection);
    }
}

void FolderServer::Answer(int connection) const {
    const Socket socket(connection);
    std::string rest;
    const auto request = socket.ReadUntil("\r\n\r\n", rest);
    const auto start = request.find('/');
    const auto end = request.find_first_of(" ?", start);
    if (start == std::string::npos || end == std::string::npos)
        return;
    const auto file = folder_ / Decoded(request.substr(start + 1, end - start - 1));
    const bool there = fs::is_regular_file(file);
    const auto bytes = there ? ReadWhole(file) : std::string("not here");
    socket.Send(std::string("HTTP/1.1 ") + (there ? "200 OK" : "404 Not Found") +
                "\r\nContent-Type: " + KindOf(file) + "\r\nContent-Length: " + std::to_string(bytes.size()) +
                "\r\nConnection: close\r\n\r\n" + bytes);
}

} // namespace tovimar::test
