#pragma once

#include "helpcompiler/Message.h"

#include <cstdint>
#include <exception>
#include <filesystem>
#include <functional>
#include <optional>

/// Compiles a help project (`.hhp`) into one compressed file that help viewers open: its pages with what they
/// need, contents, index, the numbers of its topics, and an index of its words.
namespace tovimar::helpcompiler {

struct CompileOptions {
    unsigned threads = 0; ///< 0: as many as there are processors
    /// What the file says of its time; without one a number made of the contents, so that the same project
    /// gives the same bytes and a changed one another stamp.
    std::optional<std::uint32_t> time;
    /// Asked between the pieces of the work; yes ends it with Interrupted, and nothing was written.
    std::function<bool()> stop = [] { return false; };
};

struct Interrupted : std::exception {
    const char* what() const noexcept override { return "interrupted"; }
};

struct CompileResult {
    std::filesystem::path file; ///< empty when nothing was compiled
    std::size_t topics = 0;
    std::uint64_t bytes = 0;
    bool complaints = false;
};

/// Writes the compiled file in whole or not at all. Messages come in the order of the files. A project that
/// can't be read, or a file that can't be written, raises as FileSystem does.
CompileResult Compile(const std::filesystem::path& project, const CompileOptions& options, const Tell& tell);

} // namespace tovimar::helpcompiler
