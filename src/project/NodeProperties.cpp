#include "project/NodeProperties.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>

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

const std::unordered_map<std::string_view, NodeProperty>& PropertiesByAttribute() {
    static const auto table = [] {
        std::unordered_map<std::string_view, NodeProperty> made;
        for (const auto& row : kRows)
            made.emplace(row.attribute, row.property);
        return made;
    }();
    return table;
}

std::size_t IndexOf(NodeProperty property) {
    return static_cast<std::size_t>(property);
}

} // namespace

void NodeProperties::Attach(std::shared_ptr<XmlDocument> document, XmlNode element) {
    document_ = std::move(document);
    element_ = element;
    positionsKnown_ = false;
}

void NodeProperties::Release() {
    element_ = XmlNode();
    document_.reset();
    side_.clear();
    side_.shrink_to_fit();
    positionsKnown_ = false;
}

std::string NodeProperties::Read(NodeProperty property) const {
    FindAttributes();
    const auto position = positions_[IndexOf(property)];
    if (position >= 0)
        return element_.attributeValue(static_cast<std::size_t>(position));
    for (const auto& [kept, value] : side_)
        if (kept == property)
            return value;
    return kRows[IndexOf(property)].absent;
}

void NodeProperties::Write(NodeProperty property, const std::string& value) {
    FindAttributes();
    const auto position = positions_[IndexOf(property)];
    if (position >= 0) {
        element_.setAttributeValue(static_cast<std::size_t>(position), value);
        return;
    }
    const auto kept =
        std::find_if(side_.begin(), side_.end(), [&](const auto& entry) { return entry.first == property; });
    if (kept == side_.end())
        side_.emplace_back(property, value);
    else
        kept->second = value;
}

std::string NodeProperties::ReadAttribute(std::string_view name) const {
    const auto count = element_ ? element_.attributeCount() : 0;
    for (std::size_t i = 0; i < count; ++i)
        if (text::EqualsIgnoringCase(element_.attributeName(i), name))
            return element_.attributeValue(i);
    return {};
}

void NodeProperties::FindAttributes() const {
    if (positionsKnown_)
        return;
    positionsKnown_ = true;
    positions_.fill(-1);
    constexpr std::size_t kMostAttributes = 1000;
    const auto count = element_ ? std::min(element_.attributeCount(), kMostAttributes) : 0;
    for (std::size_t i = 0; i < count; ++i) {
        const auto folded = text::FoldCase(element_.attributeName(i));
        const auto known = PropertiesByAttribute().find(folded);
        if (known != PropertiesByAttribute().end() && positions_[IndexOf(known->second)] < 0)
            positions_[IndexOf(known->second)] = static_cast<std::int16_t>(i);
    }
}

} // namespace tovimar
