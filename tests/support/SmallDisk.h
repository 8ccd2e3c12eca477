#pragma once

#include <string>

namespace tovimar::test {

/// A disk of 64 KB on a folder, seen by this process alone and gone with this object. Making one takes the
/// rights to mount: a test skips itself where `Mounted` is false.
class SmallDisk {
public:
    explicit SmallDisk(std::string nativeFolder);
    ~SmallDisk();
    SmallDisk(const SmallDisk&) = delete;
    SmallDisk& operator=(const SmallDisk&) = delete;

    bool Mounted() const { return mounted_; }
    /// Takes all the room that is left, by a file "filler".
    void Fill();
    void Free();

private:
    std::string folder_;
    bool mounted_ = false;
};

} // namespace tovimar::test
