#include "project/CHelpPrjTreeNode.h"

#include "foundation/CAddInProject.h"
#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

#include <charconv>

namespace tovimar {

namespace {

/// Hostile files hold anything: a text that is no number reads as the default.
std::int32_t NumberOr(const std::string& text, std::int32_t absent) {
    std::int32_t number = 0;
    const auto trimmed = text::Trim(text);
    const auto [end, error] = std::from_chars(trimmed.data(), trimmed.data() + trimmed.size(), number);
    return error == std::errc() && end == trimmed.data() + trimmed.size() ? number : absent;
}

} // namespace

CHelpPrjTreeNode::CHelpPrjTreeNode() = default;
CHelpPrjTreeNode::~CHelpPrjTreeNode() = default;

bool CHelpPrjTreeNode::Build(std::int32_t vlngLevel, std::shared_ptr<XmlDocument> robjDomXmlTree,
                             XmlNode robjDomXmlNode, ITreeView* /*rtvw*/, CHelpPrjTree* /*robjHelpPrjTree*/,
                             bool /*vfNewProject*/) {
    properties_.Attach(std::move(robjDomXmlTree), robjDomXmlNode);
    Tag = robjDomXmlNode.nodeName();
    Level = vlngLevel;
    return true;
}

std::string CHelpPrjTreeNode::PropertyValue(NodeProperty property) const {
    if (terminated_)
        return {};
    std::string value(properties_.Read(property));
    auto* parameters = Session::Parameters();
    if (value.find('{') == std::string::npos || Session::Server() == nullptr || parameters == nullptr)
        return value;
    auto* tree = HelpPrjTree != nullptr ? HelpPrjTree : Session::HelpProjectTree();
    if (tree == nullptr)
        return parameters->ReplaceTags(value);
    return parameters->ReplaceTags(value, /*vfByPassCallBack=*/true, tree->SourceProjectLocation(),
                                   tree->SourceProjectName());
}

void CHelpPrjTreeNode::SetPropertyValue(NodeProperty property, const std::string& value) {
    if (terminated_)
        return;
    properties_.Write(property, value);
}

std::int32_t CHelpPrjTreeNode::NumberValue(NodeProperty property, std::int32_t absent) const {
    return NumberOr(PropertyValue(property), absent);
}

std::string CHelpPrjTreeNode::MessageOr(std::string value) const {
    if (value.rfind("{{", 0) != 0 || text::Length(value) <= 2)
        return value;
    auto message = Session::Messages()->GetMessage(value);
    return message.empty() ? value : message;
}

std::string CHelpPrjTreeNode::Name() const {
    return PropertyValue(NodeProperty::Name);
}
void CHelpPrjTreeNode::SetName(const std::string& value) {
    SetPropertyValue(NodeProperty::Name, value);
    if (HelpPrjTree != nullptr)
        HelpPrjTree->Index().ForgetNames();
}

std::string CHelpPrjTreeNode::Caption() const {
    return MessageOr(PropertyValue(NodeProperty::Caption));
}
void CHelpPrjTreeNode::SetCaption(const std::string& value) {
    SetPropertyValue(NodeProperty::Caption, value);
}

std::string CHelpPrjTreeNode::HtmlTitle() const {
    return MessageOr(PropertyValue(NodeProperty::Title));
}
void CHelpPrjTreeNode::SetHtmlTitle(const std::string& value) {
    SetPropertyValue(NodeProperty::Title, value);
}

std::string CHelpPrjTreeNode::Key() const {
    auto key = PropertyValue(NodeProperty::Key);
    return key.empty() && !terminated_ ? Tag : key;
}

void CHelpPrjTreeNode::SetKey(const std::string& value) {
    // A node in a key map moves to its new key at once: the map must never point to a node by an old one.
    const bool mapped = HelpPrjTree != nullptr && HelpPrjTree->MapItem(Key()) == this;
    if (mapped)
        HelpPrjTree->RemoveFromMap(*this);
    SetPropertyValue(NodeProperty::Key, value);
    if (mapped)
        HelpPrjTree->AddToMap(*this);
}

std::string CHelpPrjTreeNode::ParentKey() const {
    return PropertyValue(NodeProperty::ParentKey);
}
void CHelpPrjTreeNode::SetParentKey(const std::string& value) {
    SetPropertyValue(NodeProperty::ParentKey, value);
}
std::string CHelpPrjTreeNode::PreviousNodeKey() const {
    return PropertyValue(NodeProperty::PreviousNodeKey);
}
void CHelpPrjTreeNode::SetPreviousNodeKey(const std::string& value) {
    SetPropertyValue(NodeProperty::PreviousNodeKey, value);
}
std::string CHelpPrjTreeNode::NextNodeKey() const {
    return PropertyValue(NodeProperty::NextNodeKey);
}
void CHelpPrjTreeNode::SetNextNodeKey(const std::string& value) {
    SetPropertyValue(NodeProperty::NextNodeKey, value);
}
std::string CHelpPrjTreeNode::OriginalKey() const {
    return PropertyValue(NodeProperty::OriginalKey);
}
void CHelpPrjTreeNode::SetOriginalKey(const std::string& value) {
    SetPropertyValue(NodeProperty::OriginalKey, value);
}
std::string CHelpPrjTreeNode::ParentOriginalKey() const {
    return PropertyValue(NodeProperty::ParentOriginalKey);
}
void CHelpPrjTreeNode::SetParentOriginalKey(const std::string& value) {
    SetPropertyValue(NodeProperty::ParentOriginalKey, value);
}

std::int32_t CHelpPrjTreeNode::ObjectType() const {
    const auto type = NumberValue(NodeProperty::Type, -1);
    return type != -1 ? type : NumberValue(NodeProperty::ObjectType, -1);
}
void CHelpPrjTreeNode::SetObjectType(std::int32_t value) {
    SetPropertyValue(NodeProperty::Type, std::to_string(value));
}

std::int32_t CHelpPrjTreeNode::ProcessCode() const {
    return NumberValue(NodeProperty::ProcessCode, 0);
}
void CHelpPrjTreeNode::SetProcessCode(std::int32_t value) {
    SetPropertyValue(NodeProperty::ProcessCode, std::to_string(value));
}

bool CHelpPrjTreeNode::Skipped() const {
    const auto value = PropertyValue(NodeProperty::Skipped);
    return text::EqualsIgnoringCase(value, "true") || NumberOr(value, 0) != 0;
}
void CHelpPrjTreeNode::SetSkipped(bool value) {
    SetPropertyValue(NodeProperty::Skipped, value ? "-1" : "0");
}

std::string CHelpPrjTreeNode::Icon() const {
    return PropertyValue(NodeProperty::Icon);
}
void CHelpPrjTreeNode::SetIcon(const std::string& value) {
    SetPropertyValue(NodeProperty::Icon, value);
}
std::string CHelpPrjTreeNode::Bookmark() const {
    return PropertyValue(NodeProperty::Bookmark);
}
void CHelpPrjTreeNode::SetBookmark(const std::string& value) {
    SetPropertyValue(NodeProperty::Bookmark, value);
}
std::string CHelpPrjTreeNode::Serializer() const {
    return PropertyValue(NodeProperty::Serializer);
}
void CHelpPrjTreeNode::SetSerializer(const std::string& value) {
    SetPropertyValue(NodeProperty::Serializer, value);
}
bool CHelpPrjTreeNode::HasSerializer() const {
    return !Serializer().empty();
}
std::string CHelpPrjTreeNode::Charset() const {
    return PropertyValue(NodeProperty::Charset);
}
void CHelpPrjTreeNode::SetCharset(const std::string& value) {
    SetPropertyValue(NodeProperty::Charset, value);
}
std::string CHelpPrjTreeNode::ExtraValue() const {
    return PropertyValue(NodeProperty::ExtraValue);
}
void CHelpPrjTreeNode::SetExtraValue(const std::string& value) {
    SetPropertyValue(NodeProperty::ExtraValue, value);
}

std::string CHelpPrjTreeNode::CSSFullPath() const {
    const auto value = PropertyValue(NodeProperty::CSSFullPath);
    if (value.empty())
        return {};
    const auto* project = Session::CurrentProject();
    return platform::Join(project == nullptr ? std::string() : project->Folder, platform::FileNameOf(value));
}
void CHelpPrjTreeNode::SetCSSFullPath(const std::string& value) {
    SetPropertyValue(NodeProperty::CSSFullPath, value);
}

std::string CHelpPrjTreeNode::PicsSubfolderName() const {
    return PropertyValue(NodeProperty::PicsSubfolderName);
}
void CHelpPrjTreeNode::SetPicsSubfolderName(const std::string& value) {
    SetPropertyValue(NodeProperty::PicsSubfolderName, value);
}
std::string CHelpPrjTreeNode::SourceProjectType() const {
    return PropertyValue(NodeProperty::SourceProjectType);
}
void CHelpPrjTreeNode::SetSourceProjectType(const std::string& value) {
    SetPropertyValue(NodeProperty::SourceProjectType, value);
}
std::string CHelpPrjTreeNode::SourceProjectName() const {
    return PropertyValue(NodeProperty::SourceProjectName);
}
void CHelpPrjTreeNode::SetSourceProjectName(const std::string& value) {
    SetPropertyValue(NodeProperty::SourceProjectName, value);
}

std::string CHelpPrjTreeNode::NodeComponentTypeName() const {
    static const char* const kNames[] = {"Table", "Query", "Form", "Report", "Macro"};
    const auto type = ObjectType();
    return type >= 0 && type <= 4 ? kNames[type] : "";
}

bool CHelpPrjTreeNode::IsObjectNode() const {
    if (ProcessCode() != 999)
        return false;
    const auto type = ObjectType();
    return (type >= 0 && type <= 4) || type == 81 || type == 82;
}

} // namespace tovimar
