#pragma once

#include "platform/files/NativeFile.h"

#include <cstdint>
#include <filesystem>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace tovimar::helpcompiler {

/// Bytes that are written one after the other and then read once: in memory while they are few, from some
/// megabytes on in a file without a name, which is gone with this whatever happens.
class Spool {
public:
    using Write = std::function<void(std::string_view)>;

    /// `folder` is where the file goes; without one all stays in memory.
    explicit Spool(std::filesystem::path folder = {}) : folder_(std::move(folder)) {}

    void Add(std::string_view bytes);
    std::uint64_t Size() const { return size_; }
    void CopyTo(const Write& write) const;

private:
    void Empty();

    std::filesystem::path folder_;
    std::string pending_;
    std::optional<platform::NativeFile> file_;
    std::uint64_t size_ = 0;
};

} // namespace tovimar::helpcompiler
