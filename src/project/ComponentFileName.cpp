#include "project/ComponentFileName.h"

#include "foundation/NameEncoding.h"

#include <cstdint>
#include <cstdio>

namespace tovimar {

namespace {

/// Bytes of a name: a file name holds 255 with prefix and extension.
constexpr std::size_t kLongestObject = 150;
constexpr std::size_t kLongestControl = 220;

/// FNV-1a, the same on every machine.
std::uint32_t Digest(const std::string& text) {
    std::uint32_t hash = 2166136261U;
    for (const char c : text) {
        hash ^= static_cast<unsigned char>(c);
        hash *= 16777619U;
    }
    return hash;
}

std::string Shortened(const std::string& name, std::size_t longest) {
    if (name.size() <= longest)
        return name;
    char digest[10];
    const auto length = std::snprintf(digest, sizeof digest, "_%08x", Digest(name));
    auto cut = longest - static_cast<std::size_t>(length);
    while (cut > 0 && (static_cast<unsigned char>(name[cut]) & 0xC0U) == 0x80U)
        --cut;
    return name.substr(0, cut) + digest;
}

} // namespace

std::string GetComponentFileName(const std::string& vstrObjName, const std::string& vstrCtlName,
                                 const std::string& vstrPredefinedFileName) {
    auto name = vstrPredefinedFileName.empty() ? vstrObjName : vstrPredefinedFileName;
    if (!vstrCtlName.empty())
        name += '_' + vstrCtlName;
    return Shortened(NormalizeName(name), vstrCtlName.empty() ? kLongestObject : kLongestControl);
}

std::string GetComponentAnchor(const std::string& objectName, const std::string& controlName) {
    return NormalizeName(objectName + '_' + controlName);
}

} // namespace tovimar
