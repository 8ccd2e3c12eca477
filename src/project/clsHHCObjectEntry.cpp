#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/SitemapText.h"
#include "project/clsHHCLoader.h"

#include <charconv>
#include <cstdio>

namespace tovimar {

namespace {

/// Characters before the values in a comment.
constexpr std::size_t kCommentHead = 9;

std::string Attribute(const char* head, const std::string& value) {
    return head + value + "\" ";
}

bool IsOneOf(const std::string& name, const std::string& type, const char* group, const char* groupType) {
    return text::EqualsIgnoringCase(name, group) ||
           text::EqualsIgnoringCase(name, std::string("All ") + group) ||
           text::EqualsIgnoringCase(type, groupType);
}

void AppendParam(std::string& out, const std::string& indent, const char* name, const std::string& value) {
    out += indent + "<param name=\"" + name + "\" value=\"" + value + "\">" + kCrLf;
}

} // namespace

/// How an entry appears in a project file.
struct clsHHCObjectEntry::Element {
    std::string tag;
    std::string processText;
    std::string icon;
    std::string type; ///< handed to the children
};

std::string clsHHCObjectEntry::Parameter(const std::string& name) const {
    const auto* found = parameters_.Find(name);
    return found == nullptr ? std::string() : found->Value;
}

std::string clsHHCObjectEntry::CommentValue(const std::string& name) const {
    const auto* found = comments_.Find(name);
    return found == nullptr ? std::string() : found->Value;
}

std::int32_t clsHHCObjectEntry::TovimarVersionMajor() const {
    const auto version = text::Trim(CommentValue("Version"));
    std::int32_t major = 1;
    std::from_chars(version.data(), version.data() + version.size(), major);
    return major;
}

void clsHHCObjectEntry::ProcessHHCXmlStrTree(std::int32_t level, const std::vector<XmlNode>& nodes) {
    Level = level;
    for (const auto& node : nodes) {
        if (!text::EqualsIgnoringCase(node.nodeName(), "param") || node.attributeCount() != 2)
            continue;
        const auto name = text::Trim(node.attributeValue(0));
        if (!parameters_.Contains(name))
            parameters_.Add({name, node.attributeValue(1)}, name);
    }
    ReadComment();
}

void clsHHCObjectEntry::ReadComment() {
    const auto comment = Comment();
    const auto length = text::Length(comment);
    if (length <= kCommentHead + 1)
        return;
    for (const auto& part :
         text::Split(text::Mid(comment, kCommentHead + 1, length - kCommentHead - 1), ";")) {
        const auto equals = part.find('=');
        if (equals == std::string::npos)
            continue;
        const auto name = part.substr(0, equals);
        if (!comments_.Contains(name))
            comments_.Add({name, part.substr(equals + 1)}, name);
    }
}

clsHHCObjectEntry::Element clsHHCObjectEntry::DescribeElement(std::int32_t pref,
                                                              const std::string& type) const {
    if (Level <= 1)
        return {"Project", {}, {}, type};
    const auto own = SourceObjectType();
    if (IsOneOf(Name(), own, "Dialogs", "Dialogs"))
        return {"Dialogs", " ProcessCode = \"1\" ", "form", "Dialog"};
    if (IsOneOf(Name(), own, "Forms", "Forms"))
        return {"Forms", "  ProcessCode = \"1\" ", "form", "Form"};
    if (IsOneOf(Name(), own, "Reports", "Reports"))
        return {"Reports", "  ProcessCode = \"2\" ", "report", "Report"};
    char level[16];
    std::snprintf(level, sizeof level, "%04d", Level);
    // A name can't begin with a digit in XML; what this element is called has no meaning to the reader.
    return {std::string("x") + level + (pref > 0 ? std::to_string(pref) : std::string()) + "x", {}, {}, type};
}

std::string clsHHCObjectEntry::OpenTag(const Element& element, const std::string& type, bool hidden,
                                       bool underIcon) const {
    const auto name = EncodeSpecialChars(Name());
    std::string out = '<' + element.tag + " caption=\"" + name + "\" GeneratedHtmlFile=\"" +
                      EncodeSpecialChars(Local_()) + "\" ";
    if (!type.empty())
        out += Attribute(" stype = \"", EncodeSpecialChars(type));
    out += element.processText;
    if (!element.icon.empty())
        out += Attribute(" icon = \"", element.icon);
    if (hidden || underIcon)
        out += " hidden=\"true\" ";
    return out;
}

std::string clsHHCObjectEntry::ObjectTag(const std::string& tag, const std::string& type) const {
    const bool report = tag == "REPORT";
    const auto name = EncodeSpecialChars(Name());
    const auto skipped = Skipped();
    std::string out =
        '<' + tag + " Name=\"" + name + "\" Key=\"" + (report ? "Report_" : "Form_") + name +
        "\" caption=\"" + name + "\" icon = \"" + (report ? "report" : "form") +
        "\" ProcessCode=\"999\" GeneratedHtmlFile = \"" + EncodeSpecialChars(Local_()) + "\" title = \"" +
        name + "\" Skipped = \"" + (skipped.empty() ? "0" : EncodeSpecialChars(skipped)) + "\" stype = \"" +
        EncodeSpecialChars(type) + "\" ExtraValue = \"" + EncodeSpecialChars(ExtraValue()) + "\" ";
    if (const auto words = IndexesStr(); !words.empty())
        out += Attribute(" Indexes = \"", EncodeSpecialChars(words));
    return out + " Type = \"" + (report ? "3" : "2") + "\" ";
}

std::string clsHHCObjectEntry::XMLSTr(std::int32_t& rlngPref, const std::string& icon, bool hidden,
                                      const std::string& sourceObjectType, std::int32_t version) const {
    std::string out;
    AppendXml(out, rlngPref, {icon, hidden, sourceObjectType, version});
    return out;
}

void clsHHCObjectEntry::AppendXml(std::string& out, std::int32_t& pref, const Surroundings& around) const {
    auto inner = around;
    if (Level <= 1)
        inner.version = TovimarVersionMajor();
    const auto type = SourceObjectType().empty() ? around.type : SourceObjectType();
    auto element = DescribeElement(pref, type);
    out += std::string(static_cast<std::size_t>(4 * (Level - 1)), ' ');
    const bool isForm = text::EqualsIgnoringCase(type, "Form") || text::EqualsIgnoringCase(type, "Dialog");
    if (inner.version >= 2 && element.processText.empty() &&
        (isForm || text::EqualsIgnoringCase(type, "Report"))) {
        element.tag = isForm ? "FORM" : "REPORT";
        element.type = "Control";
        out += ObjectTag(element.tag, type);
    } else {
        const bool underIcon = around.icon == "form" || around.icon == "report";
        inner.hidden =
            around.hidden || underIcon || (inner.version >= 2 && text::EqualsIgnoringCase(type, "Control"));
        out += OpenTag(element, type, inner.hidden, underIcon);
    }
    inner.icon = element.icon;
    inner.type = element.type;
    if (Children.empty()) {
        out += std::string(" />") + kCrLf;
        return;
    }
    out += std::string(" >") + kCrLf;
    for (const auto& child : Children) {
        ++pref;
        child->AppendXml(out, pref, inner);
    }
    out += std::string(static_cast<std::size_t>(4 * (Level - 1)), ' ') + "</" + element.tag + '>' + kCrLf;
}

std::string clsHHCObjectEntry::HHCStr() const {
    std::string out;
    AppendSitemap(out);
    return out;
}

void clsHHCObjectEntry::AppendSitemap(std::string& out) const {
    const std::string indent(static_cast<std::size_t>(8 * Level), ' ');
    const auto inner = indent + "        ";
    out += indent + "<LI>  <OBJECT type=\"text/sitemap\">" + kCrLf;
    AppendParam(out, inner, "Name", HhcCaption(Name()));
    AppendParam(out, inner, "Local", Local_());
    for (const char* optional : {"URL", "Comment", "ImageNumber"})
        if (const auto value = Parameter(optional); !value.empty())
            AppendParam(out, inner, optional, value);
    out += inner + "</OBJECT>" + kCrLf;
    if (Children.empty())
        return;
    out += indent + "<UL>" + kCrLf;
    for (const auto& child : Children)
        child->AppendSitemap(out);
    out += indent + "</UL>" + kCrLf;
}

} // namespace tovimar
