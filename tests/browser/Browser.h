#pragma once

#include <nlohmann/json.hpp>

#include <filesystem>
#include <memory>
#include <string>
#include <sys/types.h>
#include <thread>

/// A real browser, driven by the WebDriver protocol.
namespace tovimar::test {

/// A headless browser with a fresh profile. Failures raise std::runtime_error with the driver's words.
class Browser {
public:
    Browser();
    ~Browser();
    Browser(const Browser&) = delete;
    Browser& operator=(const Browser&) = delete;

    /// False where the driver isn't installed.
    static bool IsInstalled();

    void Go(const std::string& address);
    /// Runs the body of a function in the page or in the frame that is looked into.
    nlohmann::json Run(const std::string& body);
    /// Waits for an expression to be true, also over changes of the page; false after 8 to 16 seconds.
    bool Until(const std::string& expression);
    void Click(const std::string& selector);
    /// Keys as a user presses them, one after the other: texts, or names such as "ArrowDown" in braces.
    void Type(const std::string& keys);
    void LookIntoFrame(const std::string& selector);
    void LookAtPage();
    /// A command of the browser's own protocol, such as emulations.
    void Command(const std::string& name, const nlohmann::json& parameters);

private:
    nlohmann::json Ask(const std::string& method, const std::string& path, const nlohmann::json& body);
    nlohmann::json InSession(const std::string& path, const nlohmann::json& body);
    std::string Find(const std::string& selector);
    void StartDriver();
    void EndDriver();

    pid_t driver_ = 0;
    int output_ = -1;
    int port_ = 0;
    std::string session_;
    std::filesystem::path profile_;
};

/// Serves the files of a folder on a free port of this machine until it goes.
class FolderServer {
public:
    explicit FolderServer(std::filesystem::path folder);
    ~FolderServer();
    FolderServer(const FolderServer&) = delete;
    FolderServer& operator=(const FolderServer&) = delete;
    /// "http://127.0.0.1:PORT/".
    std::string Address() const;

private:
    void Serve();
    void Answer(int connection) const;

    std::filesystem::path folder_;
    int listening_ = -1;
    int port_ = 0;
    std::thread thread_;
};

} // namespace tovimar::test
