#include "support/SmallDisk.h"

#include <fcntl.h>
#include <sched.h>
#include <sys/mount.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>
#include <vector>

namespace tovimar::test {

SmallDisk::SmallDisk(std::string nativeFolder) : folder_(std::move(nativeFolder)) {
    mkdir(folder_.c_str(), 0777);
    mounted_ = unshare(CLONE_NEWNS) == 0 && mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0 &&
               mount("tmpfs", folder_.c_str(), "tmpfs", 0, "size=64k") == 0;
}

SmallDisk::~SmallDisk() {
    if (mounted_)
        umount2(folder_.c_str(), MNT_DETACH);
}

void SmallDisk::Fill() {
    const int file = open((folder_ + "/filler").c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0666);
    const std::vector<char> page(4096);
    while (write(file, page.data(), page.size()) > 0)
        continue;
    close(file);
}

void SmallDisk::Free() {
    unlink((folder_ + "/filler").c_str());
}

} // namespace tovimar::test
