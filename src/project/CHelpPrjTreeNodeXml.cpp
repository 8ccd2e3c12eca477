#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/TextEncodings.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"
#include "project/SitemapText.h"

/// The node in the project file.
namespace tovimar {

namespace {

/// Values that go unencoded hold file names and the like; what would break the file is written as an
/// entity all the same.
std::string PlainValue(const std::string& value) {
    std::string out;
    for (const char c : value) {
        switch (c) {
        case '"':
            out += "&quot;";
            break;
        case '&':
            out += "&amp;";
            break;
        case '<':
            out += "&lt;";
            break;
        case '>':
            out += "&gt;";
            break;
        default:
            out += c;
        }
    }
    return out;
}

/// ` name = "value" `, nothing for an empty value.
void AppendFirst(std::string& out, const char* name, const std::string& value) {
    if (!value.empty())
        out += ' ' + std::string(name) + " = \"" + value + "\" ";
}

/// Attributes on lines of their own: `name="value" `.
class AttributeLines {
public:
    AttributeLines(std::string& out, std::int32_t level)
        : out_(out), start_(kCrLf + std::string(static_cast<std::size_t>(2 * level + 8), ' ')) {}

    void Add(const char* name, const std::string& value) { out_ += start_ + name + "=\"" + value + "\" "; }
    void AddFilled(const char* name, const std::string& value) {
        if (!value.empty())
            Add(name, value);
    }

private:
    std::string& out_;
    std::string start_;
};

void EndLine(std::string& out) {
    if (!out.ends_with(kCrLf))
        out += kCrLf;
}

} // namespace

std::string CHelpPrjTreeNode::XMLSTr(std::int32_t vlngLevel, bool vfSkipSerializers, bool /*vfExtInfo*/,
                                     bool vfIncludeXMLHeader, const std::string& vstrExtraAttrs) {
    std::string out;
    Trapped("CHelpPrjTreeNode", "XMLSTr", [&] {
        if (vfIncludeXMLHeader)
            out = kXmlHeader;
        AppendXml(out, vlngLevel, vfSkipSerializers, vstrExtraAttrs);
    });
    return out;
}

void CHelpPrjTreeNode::AppendXml(std::string& out, std::int32_t level, bool skipSerializers,
                                 const std::string& extraAttributes) {
    if (IsControl || IsMenu || (skipSerializers && HasSerializer()))
        return;
    const std::string indent(static_cast<std::size_t>(2 * level), ' ');
    out += indent + '<' + Tag + " level = \"" + std::to_string(level) + "\" " + extraAttributes;
    AppendXmlFirstLine(out, text::ContainsIgnoringCase(extraAttributes, "Name = \""));
    AppendXmlLines(out, level);
    out += IndexesXmlStr();

    const auto head = out.size();
    out += " >";
    EndLine(out);
    const auto body = out.size();
    for (const auto& child : children_) {
        const auto before = out.size();
        child->AppendXml(out, level + 1, skipSerializers, {});
        if (out.size() != before)
            EndLine(out);
    }
    if (out.size() == body) {
        out.resize(head);
        out += " />";
    } else {
        out += indent + "</" + Tag + '>' + kCrLf;
    }
}

void CHelpPrjTreeNode::AppendXmlFirstLine(std::string& out, bool nameIsGiven) const {
    if (!nameIsGiven)
        AppendFirst(out, "name", EncodeSpecialName(Name()));
    if (const auto type = ObjectType(); type != -1)
        AppendFirst(out, "type", std::to_string(type));
    AppendFirst(out, "caption", EncodeSpecialChars(Caption()));
    AppendFirst(out, "TemplateHtmlFile", PlainValue(TemplateHtmlFile()));
    AppendFirst(out, "GeneratedHtmlFile", PlainValue(GeneratedHTMLFile()));
    AppendFirst(out, "PicsSubfolderName", PlainValue(PicsSubfolderName()));
    AppendFirst(out, "serializer", PlainValue(Serializer()));
    AppendFirst(out, "Charset", PlainValue(Charset()));
    AppendFirst(out, "CSSFullpath", PlainValue(platform::FileNameOf(CSSFullPath())));
    AppendFirst(out, "SourceProjectType", PlainValue(SourceProjectType()));
    AppendFirst(out, "SourceProjectName", PlainValue(SourceProjectName()));
}

void CHelpPrjTreeNode::AppendXmlLines(std::string& out, std::int32_t level) {
    AttributeLines lines(out, level);
    lines.Add("key", EncodeSpecialName(Key()));
    if (Parent != nullptr)
        lines.Add("pkey", EncodeSpecialName(Parent->Key()));
    if (const auto* previous = TreeViewNode == nullptr ? nullptr : TreeViewNode->Previous()) {
        SetPreviousNodeKey(previous->Key());
        lines.Add("pnodekey", EncodeSpecialName(previous->Key()));
    }
    if (const auto* next = TreeViewNode == nullptr ? nullptr : TreeViewNode->Next()) {
        SetNextNodeKey(next->Key());
        lines.Add("nnodekey", EncodeSpecialName(next->Key()));
    }
    lines.AddFilled("icon", PlainValue(Icon()));
    lines.AddFilled("title", EncodeSpecialChars(HtmlTitle()));
    if (const auto code = ProcessCode(); code != 0)
        lines.Add("ProcessCode", std::to_string(code));
    lines.AddFilled("extraValue", EncodeSpecialChars(ExtraValue()));
    if (Skipped())
        lines.Add("skipped", "-1");
    lines.AddFilled("OriginalKey", EncodeSpecialName(OriginalKey()));
    lines.AddFilled("POriginalKey", EncodeSpecialName(ParentOriginalKey()));
}

} // namespace tovimar
