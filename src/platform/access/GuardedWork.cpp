#include "platform/access/GuardedWork.h"

#include "platform/Error.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <poll.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kMaxBytes = std::size_t{256} << 20;
constexpr int kMaxSeconds = 60;
/// Reading takes milliseconds per megabyte; a file whose pages lead in circles is given up soon.
constexpr rlim_t kLeastProcessorSeconds = 5;
constexpr rlim_t kMostProcessorSeconds = 30;
constexpr char kDone = 'D';
constexpr char kFailed = 'F';

class Descriptor {
public:
    explicit Descriptor(int number) : number_(number) {}
    ~Descriptor() { Close(); }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    int Number() const { return number_; }
    void Close() {
        if (number_ >= 0)
            ::close(number_);
        number_ = -1;
    }

private:
    int number_;
};

rlim_t ProcessorSeconds(const std::string& nativePath) {
    struct stat file {};
    if (::stat(nativePath.c_str(), &file) != 0)
        return kLeastProcessorSeconds;
    return std::min(kMostProcessorSeconds,
                    kLeastProcessorSeconds + (static_cast<rlim_t>(file.st_size) >> 20));
}

void LimitChild(rlim_t seconds) {
    const rlimit processor{seconds, seconds};
    ::setrlimit(RLIMIT_CPU, &processor);
    const rlimit core{0, 0};
    ::setrlimit(RLIMIT_CORE, &core);
#if defined(__has_feature)
#define TOVIMAR_HAS_FEATURE(name) __has_feature(name)
#else
#define TOVIMAR_HAS_FEATURE(name) 0
#endif
#if !defined(__SANITIZE_ADDRESS__) && !TOVIMAR_HAS_FEATURE(address_sanitizer)
    // The sanitizer's own address space is larger than any limit.
    const rlimit memory{rlim_t{4} << 30, rlim_t{4} << 30};
    ::setrlimit(RLIMIT_AS, &memory);
#endif
    const int nowhere = ::open("/dev/null", O_RDWR | O_CLOEXEC);
    if (nowhere >= 0)
        for (int stream = 0; stream <= 2; ++stream)
            ::dup2(nowhere, stream);
    for (const int number : {SIGSEGV, SIGABRT, SIGBUS, SIGFPE, SIGILL, SIGTERM, SIGINT})
        std::signal(number, SIG_DFL);
}

void WriteAll(int descriptor, std::string_view bytes) {
    while (!bytes.empty()) {
        const auto written = ::write(descriptor, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR)
            continue;
        if (written <= 0)
            return;
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
}

/// The last byte tells how the work ended; without one the child has died before its end.
[[noreturn]] void RunChild(int descriptor, rlim_t seconds, const std::function<std::string()>& work) {
    LimitChild(seconds);
    std::string answer;
    try {
        answer = work() + kDone;
    } catch (const std::exception& failure) {
        answer = std::string(failure.what()) + kFailed;
    }
    WriteAll(descriptor, answer);
    ::_exit(0);
}

/// Everything that the child writes; empty when it takes too long or writes too much.
std::string ReadAnswer(int descriptor) {
    using Clock = std::chrono::steady_clock;
    const auto deadline = Clock::now() + std::chrono::seconds(kMaxSeconds);
    std::string answer;
    std::string buffer(std::size_t{1} << 16, '\0');
    for (;;) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now()).count();
        pollfd waiting{descriptor, POLLIN, 0};
        const int ready = left > 0 ? ::poll(&waiting, 1, static_cast<int>(left)) : 0;
        if (ready < 0 && errno == EINTR)
            continue;
        if (ready <= 0)
            return {};
        const auto count = ::read(descriptor, buffer.data(), buffer.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return answer;
        answer.append(buffer, 0, static_cast<std::size_t>(count));
        if (answer.size() > kMaxBytes)
            return {};
    }
}

} // namespace

std::string RunGuarded(const std::string& nativePath, const std::function<std::string()>& work) {
    int ends[2] = {-1, -1};
    if (::pipe2(ends, O_CLOEXEC) != 0)
        throw RaisedError(kFailure1, nativePath + ": no pipe for reading the database.", "DatabaseReader");
    // The two processes wait for each other less often; without it they only take longer.
    ::fcntl(ends[1], F_SETPIPE_SZ, 1 << 20);
    Descriptor reading(ends[0]);
    Descriptor writing(ends[1]);
    const auto child = ::fork();
    if (child < 0)
        throw RaisedError(kFailure1, nativePath + ": no process for reading the database.", "DatabaseReader");
    if (child == 0)
        RunChild(writing.Number(), ProcessorSeconds(nativePath), work);
    writing.Close();
    auto answer = ReadAnswer(reading.Number());
    ::kill(child, SIGKILL);
    while (::waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
    }
    const char end = answer.empty() ? '\0' : answer.back();
    if (end != kDone && end != kFailed)
        throw RaisedError(kFailure1, nativePath + ": the file is damaged and can't be read.",
                          "DatabaseReader");
    answer.pop_back();
    if (end == kFailed)
        throw RaisedError(kFailure1, answer, "DatabaseReader");
    return answer;
}

} // namespace tovimar::platform::access
