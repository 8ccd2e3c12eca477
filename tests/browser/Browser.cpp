#include "browser/Browser.h"

#include "browser/Sockets.h"
#include "cli/Program.h"

#include <array>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <fcntl.h>
#include <map>
#include <stdexcept>
#include <sys/wait.h>
#include <unistd.h>

namespace tovimar::test {
namespace {

using nlohmann::json;

constexpr const char* kElementKey = "element-6066-11e4-a52e-4f735466cecf"; // the protocol's name for it
constexpr std::chrono::seconds kPatience{8};

/// Keys that have no character, by the protocol's private ones.
const std::map<std::string, std::string> kKeys = {
    {"Tab", "\uE004"},       {"Enter", "\uE007"},     {"Escape", "\uE00C"},   {"Home", "\uE011"},
    {"ArrowLeft", "\uE012"}, {"ArrowUp", "\uE013"},   {"End", "\uE010"},      {"ArrowRight", "\uE014"},
    {"Control", "\uE009"},   {"ArrowDown", "\uE015"}, {"Backspace", "\uE003"}};

/// Bytes of the character that begins here.
std::size_t LengthOfCharacter(char first) {
    const auto byte = static_cast<unsigned char>(first);
    return byte < 0x80 ? 1 : byte < 0xE0 ? 2 : byte < 0xF0 ? 3 : 4;
}

json KeyActions(const std::string& keys) {
    auto actions = json::array();
    for (std::size_t at = 0; at < keys.size();) {
        const auto end = keys[at] == '{' ? keys.find('}', at) : std::string::npos;
        const auto length = end == std::string::npos ? LengthOfCharacter(keys[at]) : end + 1 - at;
        const auto key =
            end == std::string::npos ? keys.substr(at, length) : kKeys.at(keys.substr(at + 1, length - 2));
        for (const char* kind : {"keyDown", "keyUp"})
            actions.push_back({{"type", kind}, {"value", key}});
        at += length;
    }
    return actions;
}

} // namespace

bool Browser::IsInstalled() {
    return test::IsInstalled("chromedriver");
}

Browser::Browser() {
    StartDriver();
    std::string pattern = (fs::temp_directory_path() / "tovimar-browser-XXXXXX").string();
    if (mkdtemp(pattern.data()) == nullptr)
        throw std::runtime_error("no folder for the browser's profile");
    profile_ = pattern;
    const json options = {
        {"args",
         {"--headless=new", "--no-sandbox", "--disable-gpu", "--no-first-run", "--disable-quic",
          "--disable-dev-shm-usage", "--window-size=1200,900", "--user-data-dir=" + profile_.string()}}};
    const json wanted = {
        {"browserName", "chrome"}, {"goog:chromeOptions", options}, {"timeouts", {{"script", 8000}}}};
    const auto started = Ask("POST", "/session", {{"capabilities", {{"alwaysMatch", wanted}}}});
    session_ = "/session/" + started.at("sessionId").get<std::string>();
}

Browser::~Browser() {
    try {
        Ask("DELETE", session_, json::object());
    } catch (const std::exception&) {
        // The driver has gone before; its end is all that is left to do.
    }
    EndDriver();
    std::error_code ignored;
    fs::remove_all(profile_, ignored);
}

void Browser::StartDriver() {
    std::array<int, 2> ends{-1, -1};
    if (pipe2(ends.data(), O_CLOEXEC) != 0)
        throw std::runtime_error("no pipe for the driver");
    driver_ = fork();
    if (driver_ == 0) {
        dup2(ends[1], STDOUT_FILENO);
        dup2(ends[1], STDERR_FILENO);
        execlp("chromedriver", "chromedriver", "--port=0", static_cast<char*>(nullptr));
        _exit(127);
    }
    close(ends[1]);
    output_ = ends[0];
    const Started driver{driver_, output_};
    const std::string said = "ChromeDriver was started successfully on port ";
    const auto text = driver.ReadUntil(said);
    const auto at = text.find(said);
    if (at == std::string::npos)
        throw std::runtime_error("the driver doesn't start: " + text);
    port_ = std::stoi(text.substr(at + said.size()));
}

void Browser::EndDriver() {
    kill(driver_, SIGTERM);
    Started{driver_, output_}.Wait();
}

json Browser::Ask(const std::string& method, const std::string& path, const json& body) {
    const Socket socket(Socket::Connect(port_));
    const auto text = body.dump();
    socket.Send(method + " " + path +
                " HTTP/1.1\r\nHost: 127.0.0.1\r\nContent-Type: application/json\r\nContent-Length: " +
                std::to_string(text.size()) + "\r\nConnection: close\r\n\r\n" + text);
    std::string rest;
    auto head = socket.ReadUntil("\r\n\r\n", rest);
    const auto length = head.find("ontent-Length: ");
    const auto size = length == std::string::npos ? 0U : std::stoul(head.substr(length + 15));
    const auto answer = json::parse(socket.Read(size, rest)).at("value");
    if (answer.is_object() && answer.contains("error"))
        throw std::runtime_error(answer.at("error").get<std::string>() + ": " +
                                 answer.at("message").get<std::string>());
    return answer;
}

json Browser::InSession(const std::string& path, const json& body) {
    return Ask("POST", session_ + path, body);
}

void Browser::Go(const std::string& address) {
    InSession("/url", {{"url", address}});
}

json Browser::Run(const std::string& body) {
    return InSession("/execute/sync", {{"script", body}, {"args", json::array()}});
}

bool Browser::Until(const std::string& expression) {
    const std::string script = "const done=arguments[0];(function look(){let is=false;try{is=" + expression +
                               ";}catch(e){}if(is)done(true);else requestAnimationFrame(look);})()";
    const auto end = std::chrono::steady_clock::now() + kPatience;
    while (std::chrono::steady_clock::now() < end)
        try {
            InSession("/execute/async", {{"script", script}, {"args", json::array()}});
            return true;
        } catch (const std::runtime_error&) {
            // The page has changed under the script, or the script's own patience has ended.
        }
    return false;
}

std::string Browser::Find(const std::string& selector) {
    return InSession("/element", {{"using", "css selector"}, {"value", selector}}).at(kElementKey);
}

void Browser::Click(const std::string& selector) {
    InSession("/element/" + Find(selector) + "/click", json::object());
}

void Browser::Type(const std::string& keys) {
    InSession("/actions", {{"actions", {{{"type", "key"}, {"id", "keys"}, {"actions", KeyActions(keys)}}}}});
}

void Browser::LookIntoFrame(const std::string& selector) {
    LookAtPage();
    InSession("/frame", {{"id", {{kElementKey, Find(selector)}}}});
}

void Browser::LookAtPage() {
    InSession("/frame", {{"id", nullptr}});
}

void Browser::Command(const std::string& name, const json& parameters) {
    InSession("/goog/cdp/execute", {{"cmd", name}, {"params", parameters}});
}

} // namespace tovimar::test
