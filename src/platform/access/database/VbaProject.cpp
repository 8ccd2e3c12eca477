#include "platform/access/database/VbaProject.h"

#include "platform/access/database/Bytes.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kChunk = 4096;

/// Distance and length share two bytes; the farther into a chunk, the more bits the distance gets.
unsigned DistanceBits(std::size_t written) {
    unsigned bits = 4;
    while ((std::size_t{1} << bits) < written)
        ++bits;
    return bits;
}

void CopyEarlier(ByteReader& reader, std::string& out, std::size_t chunkStart) {
    const std::size_t written = out.size() - chunkStart;
    const unsigned token = reader.U16();
    const unsigned lengthBits = 16 - DistanceBits(written);
    const std::size_t distance = (token >> lengthBits) + 1U;
    const std::size_t length = (token & ((1U << lengthBits) - 1U)) + 3U;
    if (distance > written)
        reader.Fail("goes back before its start");
    for (std::size_t i = 0; i < length; ++i)
        out += out[out.size() - distance];
}

void UnpackChunk(std::string_view chunk, std::string& out) {
    ByteReader reader(chunk, "The code");
    const std::size_t start = out.size();
    while (!reader.AtEnd()) {
        const unsigned flags = reader.U8();
        for (unsigned bit = 0; bit < 8 && !reader.AtEnd(); ++bit) {
            if ((flags >> bit & 1U) == 0)
                out += reader.Take(1);
            else
                CopyEarlier(reader, out, start);
            if (out.size() - start > kChunk)
                reader.Fail("unpacks to a chunk that is too long");
        }
    }
}

struct DirectoryEntry {
    std::string name;
    std::string stream;
    std::uint32_t offset = 0;
    bool isClass = false;
};

struct Directory {
    int codePage = 1252;
    std::string projectName;
    std::vector<DirectoryEntry> modules;
};

Directory ReadDirectory(std::string_view bytes) {
    ByteReader reader(bytes, "The directory of code modules");
    Directory directory;
    while (reader.Left() >= 6) {
        const auto id = reader.U16();
        auto size = reader.U32();
        if (id == 9)
            size = 6; // the version, whatever its size says
        ByteReader value(reader.Take(size), "The directory of code modules");
        const bool inModule = !directory.modules.empty();
        const auto ansi = [&] { return text::CodePage(directory.codePage).Decode(value.Take(size)); };
        switch (id) {
        case 0x03:
            directory.codePage = value.U16();
            break;
        case 0x04:
            directory.projectName = ansi();
            break;
        case 0x19:
            directory.modules.push_back({ansi(), {}, 0, false});
            break;
        case 0x47:
            if (inModule)
                directory.modules.back().name = FromUtf16Bytes(value.Take(size));
            break;
        case 0x1A:
            if (inModule)
                directory.modules.back().stream = ansi();
            break;
        case 0x32:
            if (inModule)
                directory.modules.back().stream = FromUtf16Bytes(value.Take(size));
            break;
        case 0x31:
            if (inModule)
                directory.modules.back().offset = value.U32();
            break;
        case 0x22:
            if (inModule)
                directory.modules.back().isClass = true;
            break;
        case 0x10:
            return directory;
        default:
            break;
        }
    }
    return directory;
}

VbaModule ReadModule(const Storage& storage, const StorageNode& folder, const DirectoryEntry& entry,
                     const text::CodePage& codePage) {
    const auto* stream = storage.Child(folder, entry.stream);
    if (stream == nullptr)
        throw RaisedError(kFailure1, "The code is missing.", "DatabaseReader");
    if (entry.offset > stream->bytes.size())
        throw RaisedError(kFailure1, "The code begins behind its end.", "DatabaseReader");
    const auto packed = std::string_view(stream->bytes).substr(entry.offset);
    return {entry.name, entry.isClass, codePage.Decode(UnpackCode(packed))};
}

} // namespace

std::string UnpackCode(std::string_view packed, std::size_t most) {
    ByteReader reader(packed, "The code");
    if (reader.U8() != 1)
        reader.Fail("isn't packed in a known way");
    std::string out;
    while (reader.Left() >= 2) {
        const unsigned header = reader.U16();
        const std::size_t size = std::min<std::size_t>((header & 0xFFFU) + 1U, reader.Left());
        if ((header >> 15U) != 0)
            UnpackChunk(reader.Take(size), out);
        else
            out += reader.Take(size);
        if (out.size() > most)
            reader.Fail("unpacks to more than " + std::to_string(most) + " bytes");
    }
    return out;
}

VbaProject ReadVbaProject(const Storage& storage) {
    VbaProject project;
    const auto* folder = storage.Find({"VBA", "VBAProject", "VBA"});
    const auto* dir = folder != nullptr ? storage.Child(*folder, "dir") : nullptr;
    if (dir == nullptr)
        return project;
    Directory directory;
    try {
        directory = ReadDirectory(UnpackCode(dir->bytes));
    } catch (const RaisedError& failure) {
        project.faults.emplace_back(failure.what());
        return project;
    }
    project.name = directory.projectName;
    project.codePage = directory.codePage;
    const text::CodePage codePage(directory.codePage);
    for (const auto& entry : directory.modules) {
        try {
            project.modules.push_back(ReadModule(storage, *folder, entry, codePage));
        } catch (const RaisedError& failure) {
            project.faults.push_back(entry.name + ": " + failure.what());
        }
    }
    return project;
}

} // namespace tovimar::platform::access
