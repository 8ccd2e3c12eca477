#include "platform/access/DescriptionsReader.h"

#include "platform/Error.h"
#include "platform/access/DatabaseReader.h"
#include "platform/text/Text.h"

#include <map>

namespace tovimar::platform::access {

namespace {

using Descriptions = std::unordered_map<std::string, std::string>;

constexpr int kMostRows = 100'000;
constexpr std::size_t kMostBytes = std::size_t{64} << 20;

std::map<std::string, Descriptions>& Known() {
    static std::map<std::string, Descriptions> known;
    return known;
}

Descriptions Read(const std::string& nativePath) {
    const Records records = ReadTableRecords(nativePath, "tblDescription", kMostRows);
    const int key = records.ColumnIndex("Key");
    const int description = records.ColumnIndex("Description");
    Descriptions descriptions;
    if (key < 0 || description < 0)
        return descriptions;
    std::size_t bytes = 0;
    for (const auto& row : records.rows) {
        const std::string& text = row.at(static_cast<std::size_t>(description));
        bytes += text.size();
        if (bytes > kMostBytes)
            break;
        descriptions.try_emplace(text::FoldCase(row.at(static_cast<std::size_t>(key))), text);
    }
    return descriptions;
}

} // namespace

const Descriptions& ReadDescriptions(const std::string& nativePath) {
    const auto [place, unread] = Known().try_emplace(nativePath);
    if (unread) {
        try {
            place->second = Read(nativePath);
        } catch (const RaisedError&) {
            // A file that can't be read describes nothing, as the contract says.
        }
    }
    return place->second;
}

void ForgetDescriptions() {
    Known().clear();
}

} // namespace tovimar::platform::access
