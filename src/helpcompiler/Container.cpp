#include "helpcompiler/Container.h"

#include "helpcompiler/Bytes.h"
#include "helpcompiler/Lzx.h"
#include "platform/text/Text.h"

#include <set>

namespace tovimar::helpcompiler {
namespace {

constexpr const char* kStorage = "::DataSpace/Storage/MSCompressed/";
constexpr const char* kTransform = "{7FC28940-9D31-11D0-9B27-00A0C91E9C7C}";
constexpr std::size_t kHeaderSize = 0x60;
constexpr std::size_t kFirstSectionSize = 0x18;

std::string Utf16(std::string_view text) {
    std::string out;
    for (const char16_t unit : text::ToUtf16(text))
        PutU16(out, unit);
    return out;
}

std::string NameList() {
    std::string names;
    for (const char* name : {"Uncompressed", "MSCompressed"}) {
        PutU16(names, 12);
        names += Utf16(name);
        PutU16(names, 0);
    }
    std::string out;
    PutU16(out, static_cast<std::uint32_t>(names.size() / 2 + 2));
    PutU16(out, 2);
    return out + names;
}

std::string ControlData() {
    std::string out;
    PutU32(out, 6);
    out += "LZXC";
    for (const std::uint32_t number : {2U, 2U, 2U, 1U, 0U})
        PutU32(out, number);
    return out;
}

std::string ResetTable(const CompressedContent& content) {
    std::string out;
    for (const std::uint32_t number : {2U, static_cast<std::uint32_t>(content.frames.size()), 8U, 0x28U})
        PutU32(out, number);
    PutU64(out, content.length);
    PutU64(out, content.bytes.Size());
    PutU64(out, kLzxFrame);
    for (const std::uint64_t frame : content.frames)
        PutU64(out, frame);
    return out;
}

} // namespace

bool Container::TakeName(const std::string& name) {
    return name.size() <= kLongestName && names_.insert(text::FoldCase(name)).second;
}

bool Container::Add(const std::string& name, std::string_view bytes, bool compressed) {
    if (!TakeName(name))
        return false;
    if (compressed)
        entries_.push_back({name, 1, compressor_.Add(bytes), bytes.size()});
    else
        plain_.push_back({name, std::string(bytes)});
    return true;
}

bool Container::AddInPieces(const std::string& name, const Read& read) {
    if (!TakeName(name))
        return false;
    DirectoryEntry entry{name, 1, compressor_.Add({}), 0};
    for (std::string piece = read(); !piece.empty(); piece = read()) {
        compressor_.Add(piece);
        entry.length += piece.size();
    }
    entries_.push_back(std::move(entry));
    return true;
}

void Container::AddPlain(const std::string& name, std::string_view bytes) {
    entries_.push_back({name, 0, section_.size(), bytes.size()});
    section_ += bytes;
}

void Container::AddDescription(const CompressedContent& content) {
    const std::string storage = kStorage;
    std::string span;
    PutU64(span, content.length);
    AddPlain("::DataSpace/NameList", NameList());
    // The list holds half of the name, as every reader knows it.
    AddPlain(storage + "Transform/List", Utf16(std::string_view(kTransform).substr(0, 19)));
    AddPlain(storage + "SpanInfo", span);
    AddPlain(storage + "ControlData", ControlData());
    AddPlain(storage + "Transform/" + kTransform + "/InstanceData/ResetTable", ResetTable(content));
    for (const Plain& file : plain_)
        AddPlain(file.name, file.bytes);
    entries_.push_back({storage + "Content", 0, section_.size(), content.bytes.Size()});
}

void Container::AddFolders() {
    std::set<std::string> folders{"/"};
    for (const DirectoryEntry& entry : entries_)
        if (entry.name.starts_with('/'))
            for (std::size_t slash = entry.name.find('/', 1); slash != std::string::npos;
                 slash = entry.name.find('/', slash + 1))
                folders.insert(entry.name.substr(0, slash + 1));
    folders.insert(std::string(kStorage) + "Transform/" + kTransform + "/InstanceData/");
    for (const std::string& folder : folders)
        entries_.push_back({folder});
}

std::string Container::Header(std::size_t directory, std::uint64_t content) const {
    std::string out = "ITSF";
    for (const std::uint32_t number : {3U, static_cast<std::uint32_t>(kHeaderSize), 1U, time_, language_})
        PutU32(out, number);
    out += FromHex("10fd017caa7bd0119e0c00a0c922e6ec");
    out += FromHex("11fd017caa7bd0119e0c00a0c922e6ec");
    const std::uint64_t contentOffset = kHeaderSize + kFirstSectionSize + directory;
    for (const std::uint64_t number :
         {kHeaderSize, kFirstSectionSize, kHeaderSize + kFirstSectionSize, directory, contentOffset})
        PutU64(out, number);
    PutU32(out, 0x1FE);
    PutU32(out, 0);
    PutU64(out, contentOffset + content);
    PutU64(out, 0);
    return out;
}

void Container::Finish(const Write& write) {
    const CompressedContent content = compressor_.Finish();
    AddDescription(content);
    AddFolders();
    const std::string directory = DirectoryBytes(std::move(entries_));
    write(Header(directory.size(), section_.size() + content.bytes.Size()));
    write(directory);
    write(section_);
    content.bytes.CopyTo(write);
}

std::string Container::Finish() {
    std::string out;
    Finish([&](std::string_view bytes) { out += bytes; });
    return out;
}

} // namespace tovimar::helpcompiler
