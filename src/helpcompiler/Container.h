#pragma once

#include "helpcompiler/Compression.h"
#include "helpcompiler/Directory.h"

#include <cstdint>
#include <filesystem>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

namespace tovimar::helpcompiler {

/// The file that everything goes into: a directory of names and two sections, one of plain bytes and one that
/// is compressed as a whole.
class Container {
public:
    /// Gives the next piece of a file, none at its end.
    using Read = std::function<std::string()>;
    using Write = Spool::Write;

    /// `time` counts the lower half of a file time, by which viewers know a file that is new. What is
    /// compressed waits in the folder `scratch` when it gets large, in memory without one.
    explicit Container(std::uint32_t language, std::uint32_t time, unsigned threads = 0,
                       const std::filesystem::path& scratch = {})
        : language_(language), time_(time), compressor_(threads, scratch) {}

    void SetTime(std::uint32_t time) { time_ = time; }
    /// Names begin with "/". A name that stands already, or is longer than a name may be, is refused.
    bool Add(const std::string& name, std::string_view bytes, bool compressed = true);
    /// The same with a file that comes in pieces, however large.
    bool AddInPieces(const std::string& name, const Read& read);
    /// Files that come in between are pictures and the like, which don't shrink.
    void BeginPacked() { compressor_.BeginPacked(); }
    void EndPacked() { compressor_.EndPacked(); }
    /// The bytes of the file in pieces; nothing can be added then.
    void Finish(const Write& write);
    std::string Finish();

private:
    void AddPlain(const std::string& name, std::string_view bytes);
    bool TakeName(const std::string& name);
    void AddDescription(const CompressedContent& content);
    void AddFolders();
    std::string Header(std::size_t directory, std::uint64_t content) const;

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
    std::string section_; ///< the plain bytes before the compressed ones
};

} // namespace tovimar::helpcompiler
