// Preloaded into a program under test: kills it at its N-th change of a file (TOVIMAR_KILL_AT), a write in
// its middle. With TOVIMAR_COUNT_CHANGES naming a file, tells there how many changes a whole run makes.
// Programs that the killed one starts run undisturbed.

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <dlfcn.h>
#include <fcntl.h>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace {

long killAt = -1;
std::string countFile;
std::atomic<long> changes{0};

struct Start {
    Start() {
        if (const char* at = std::getenv("TOVIMAR_KILL_AT"))
            killAt = std::strtol(at, nullptr, 10);
        if (const char* file = std::getenv("TOVIMAR_COUNT_CHANGES"))
            countFile = file;
        unsetenv("LD_PRELOAD");
        unsetenv("TOVIMAR_KILL_AT");
        unsetenv("TOVIMAR_COUNT_CHANGES");
    }
    ~Start() {
        if (countFile.empty())
            return;
        if (FILE* out = std::fopen(countFile.c_str(), "w")) {
            std::fprintf(out, "%ld", changes.load());
            std::fclose(out);
        }
    }
} start;

bool IsDue() {
    return ++changes == killAt;
}

void Die() {
    kill(getpid(), SIGKILL);
    pause();
}

void Change() {
    if (IsDue())
        Die();
}

bool IsFile(int descriptor) {
    struct stat info {};
    return fstat(descriptor, &info) == 0 && S_ISREG(info.st_mode);
}

template <typename Function> Function* Original(const char* name) {
    return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

} // namespace

extern "C" {

ssize_t write(int descriptor, const void* bytes, size_t length) {
    static auto* original = Original<ssize_t(int, const void*, size_t)>("write");
    if (descriptor > STDERR_FILENO && IsFile(descriptor) && IsDue()) {
        original(descriptor, bytes, length / 2);
        Die();
    }
    return original(descriptor, bytes, length);
}

int rename(const char* from, const char* to) noexcept {
    static auto* original = Original<int(const char*, const char*)>("rename");
    Change();
    return original(from, to);
}

int linkat(int fromFolder, const char* from, int toFolder, const char* to, int flags) noexcept {
    static auto* original = Original<int(int, const char*, int, const char*, int)>("linkat");
    Change();
    return original(fromFolder, from, toFolder, to, flags);
}

int unlink(const char* path) noexcept {
    static auto* original = Original<int(const char*)>("unlink");
    Change();
    return original(path);
}

int remove(const char* path) noexcept {
    static auto* original = Original<int(const char*)>("remove");
    Change();
    return original(path);
}

int mkdir(const char* path, mode_t mode) noexcept {
    static auto* original = Original<int(const char*, mode_t)>("mkdir");
    Change();
    return original(path, mode);
}

int ftruncate(int descriptor, off_t length) noexcept {
    static auto* original = Original<int(int, off_t)>("ftruncate");
    Change();
    return original(descriptor, length);
}

int mkostemp(char* pattern, int flags) {
    static auto* original = Original<int(char*, int)>("mkostemp");
    Change();
    return original(pattern, flags);
}

int open(const char* path, int flags, ...) {
    static auto* original = Original<int(const char*, int, ...)>("open");
    mode_t mode = 0;
    if ((flags & (O_CREAT | __O_TMPFILE)) != 0) {
        va_list arguments;
        va_start(arguments, flags);
        mode = va_arg(arguments, mode_t);
        va_end(arguments);
    }
    if ((flags & O_ACCMODE) != O_RDONLY)
        Change();
    return original(path, flags, mode);
}

} // extern "C"
