#pragma once

#include "helpcompiler/Compression.h"
#include "helpcompiler/Directory.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

namespace tovimar::helpcompiler {

/// The file that everything goes into: a directory of names and two sections, one of plain bytes and one that
/// is compressed as a whole.
class Container {
public:
    /// `time` counts the lower half of a file time, by which viewers know a file that is new.
    explicit Container(std::uint32_t language, std::uint32_t time, unsigned threads = 0)
        : language_(language), time_(time), compressor_(threads) {}

    void SetTime(std::uint32_t time) { time_ = time; }
    /// Names begin with "/". A name that stands already, or is longer than a name may be, is refused.
    bool Add(const std::string& name, std::string_view bytes, bool compressed = true);
    /// All bytes of the file; nothing can be added then.
    std::string Finish();

private:
    void AddPlain(const std::string& name, std::string_view bytes);
    void AddDescription(const CompressedContent& content);
    void AddFolders();
    std::string Header(std::size_t directory, std::size_t content) const;

    struct Plain {
        std::string name;
        std::string bytes;
    };

    std::uint32_t language_;
    std::uint32_t time_;
    Compressor compressor_;
    std::unordered_set<std::string> names_;
    std::vector<DirectoryEntry> entries_;
    std::vector<Plain> plain_;
    std::string section_; ///< the plain bytes
};

} // namespace tovimar::helpcompiler
