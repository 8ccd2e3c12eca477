#include "project/NodeProperties.h"

#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <utility>

namespace tovimar {

namespace {

struct PropertyRow {
    NodeProperty property;
    const char* attribute; ///< folded
    const char* absent;
};

constexpr PropertyRow kRows[] = {
    {NodeProperty::Name, "name", ""},
    {NodeProperty::Caption, "caption", ""},
    {NodeProperty::Title, "title", ""},
    {NodeProperty::Key, "key", ""},
    {NodeProperty::ParentKey, "pkey", ""},
    {NodeProperty::PreviousNodeKey, "pnodekey", ""},
    {NodeProperty::NextNodeKey, "nnodekey", ""},
    {NodeProperty::OriginalKey, "originalkey", ""},
    {NodeProperty::ParentOriginalKey, "poriginalkey", ""},
    {NodeProperty::Type, "type", "-1"},
    {NodeProperty::ObjectType, "objecttype", "-1"},
    {NodeProperty::ProcessCode, "processcode", "0"},
    {NodeProperty::Skipped, "skipped", "0"},
    {NodeProperty::Hidden, "hidden", "0"},
    {NodeProperty::Icon, "icon", ""},
    {NodeProperty::Bookmark, "bookmark", ""},
    {NodeProperty::Serializer, "serializer", ""},
    {NodeProperty::Charset, "charset", ""},
    {NodeProperty::ExtraValue, "extravalue", ""},
    {NodeProperty::CSSFullPath, "cssfullpath", ""},
    {NodeProperty::PicsSubfolderName, "picssubfoldername", ""},
    {NodeProperty::SourceProjectType, "sourceprojecttype", ""},
    {NodeProperty::SourceProjectName, "sourceprojectname", ""},
    {NodeProperty::TemplateHtmlFile, "templatehtmlfile", ""},
    {NodeProperty::Html, "html", ""},
    {NodeProperty::Htm, "htm", ""},
    {NodeProperty::GeneratedHtmlFile, "generatedhtmlfile", ""},
    {NodeProperty::GenHtml, "genhtml", ""},
};
static_assert(std::size(kRows) == static_cast<std::size_t>(NodeProperty::Count));

constexpr std::size_t kLongestAttribute = 17;

/// Positions in the table by the length of the attribute's name, each list ended by the table's size.
constexpr auto kRowsByLength = [] {
    std::array<std::array<std::uint8_t, 8>, kLongestAttribute + 1> table{};
    for (auto& rows : table)
        rows.fill(std::size(kRows));
    for (std::size_t row = 0; row < std::size(kRows); ++row) {
        auto& rows = table[std::string_view(kRows[row].attribute).size()];
        *std::find(rows.begin(), rows.end(), std::size(kRows)) = static_cast<std::uint8_t>(row);
    }
    return table;
}();

bool IsCalled(std::string_view attribute, std::string_view folded) {
    for (std::size_t i = 0; i < attribute.size() && i < folded.size(); ++i)
        if (!text::IsAscii(attribute[i]))
            return text::EqualsIgnoringCase(attribute, folded);
        else if (text::LowerAscii(attribute[i]) != folded[i])
            return false;
    return attribute.size() == folded.size();
}

/// `Count` for an attribute without a meaning.
NodeProperty PropertyOf(std::string_view attribute) {
    if (!text::IsAscii(attribute)) {
        const auto folded = text::FoldCase(attribute);
        return text::IsAscii(folded) ? PropertyOf(folded) : NodeProperty::Count;
    }
    if (attribute.size() > kLongestAttribute)
        return NodeProperty::Count;
    for (const auto row : kRowsByLength[attribute.size()])
        if (row < std::size(kRows) && IsCalled(attribute, kRows[row].attribute))
            return kRows[row].property;
    return NodeProperty::Count;
}

std::size_t IndexOf(NodeProperty property) {
    return static_cast<std::size_t>(property);
}

} // namespace

void NodeProperties::Attach(std::shared_ptr<XmlDocument> document, XmlNode element) {
    document_ = std::move(document);
    element_ = element;
}

void NodeProperties::Release() {
    element_ = XmlNode();
    document_.reset();
    side_.clear();
    side_.shrink_to_fit();
}

std::string_view NodeProperties::Read(NodeProperty property) const {
    const auto& row = kRows[IndexOf(property)];
    for (auto attribute = element_.firstAttribute(); attribute; attribute = attribute.next())
        if (IsCalled(attribute.name(), row.attribute))
            return attribute.value();
    for (const auto& [kept, value] : side_)
        if (kept == property)
            return value;
    return row.absent;
}

NodePropertyViews NodeProperties::ReadAll() const {
    constexpr std::string_view kIndexes = "indexes";
    NodePropertyViews views;
    for (const auto& row : kRows)
        views.values[IndexOf(row.property)] = row.absent;
    for (const auto& [kept, value] : side_)
        views.values[IndexOf(kept)] = value;
    std::array<bool, static_cast<std::size_t>(NodeProperty::Count)> seen{};
    bool indexesSeen = false;
    for (auto attribute = element_.firstAttribute(); attribute; attribute = attribute.next()) {
        const auto name = attribute.name();
        const auto property = PropertyOf(name);
        if (property != NodeProperty::Count) {
            if (!std::exchange(seen[IndexOf(property)], true))
                views.values[IndexOf(property)] = attribute.value();
        } else if (name.size() >= kIndexes.size() && IsCalled(name.substr(0, kIndexes.size()), kIndexes)) {
            if (name.size() > kIndexes.size())
                views.hasMoreIndexes = true;
            else if (!std::exchange(indexesSeen, true))
                views.indexes = attribute.value();
        }
    }
    return views;
}

void NodeProperties::Write(NodeProperty property, const std::string& value) {
    for (auto attribute = element_.firstAttribute(); attribute; attribute = attribute.next())
        if (IsCalled(attribute.name(), kRows[IndexOf(property)].attribute)) {
            attribute.setValue(value);
            return;
        }
    const auto kept =
        std::find_if(side_.begin(), side_.end(), [&](const auto& entry) { return entry.first == property; });
    if (kept == side_.end())
        side_.emplace_back(property, value);
    else
        kept->second = value;
}

std::string_view NodeProperties::ReadAttribute(std::string_view name) const {
    for (auto attribute = element_.firstAttribute(); attribute; attribute = attribute.next())
        if (text::EqualsIgnoringCase(attribute.name(), name))
            return attribute.value();
    return {};
}

} // namespace tovimar
