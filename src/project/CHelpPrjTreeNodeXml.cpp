#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/TextEncodings.h"
#include "platform/files/Paths.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"
#include "project/SitemapText.h"
#include "uimodel/DefinitionText.h"

#include <algorithm>
#include <string_view>
#include <vector>

/// The node in the project file.
namespace tovimar {

namespace {

/// Values that go unencoded hold file names and the like; what would break the file is written as an
/// entity all the same.
constexpr auto AppendPlain = definition::AppendEscaped;

/// The name alone; most values are one already.
std::string FileNameIn(std::string_view value) {
    return value.find_first_of("\\/:") == std::string_view::npos ? std::string(value)
                                                                 : platform::FileNameOf(std::string(value));
}

using Appender = void (*)(std::string& out, std::string_view value);

void EndLine(std::string& out) {
    if (!out.ends_with(kCrLf))
        out += kCrLf;
}

/// A value's words, the first of two that differ only in case counting; none when they are too many to be
/// compared one by one.
bool FewWords(std::string_view text, std::vector<std::string_view>& words) {
    constexpr std::size_t kFew = 24;
    words.clear();
    for (;;) {
        const auto end = text.find('|');
        const auto word = text.substr(0, end);
        const auto same = [&](std::string_view other) {
            return other.size() == word.size() && text::EqualsIgnoringCase(other, word);
        };
        if (!text::IsAscii(word) || words.size() == kFew)
            return false;
        if (!word.empty() && std::none_of(words.begin(), words.end(), same))
            words.push_back(word);
        if (end == std::string_view::npos)
            return true;
        text.remove_prefix(end + 1);
    }
}

/// The keyword attributes, a chunk of words each.
class KeywordAttributes {
public:
    explicit KeywordAttributes(std::string& out) : out_(out) {}

    void Add(std::string_view word) {
        if (text::Length(chunk_) > kChunkCharacters)
            WriteChunk();
        if (!chunk_.empty())
            chunk_ += '|';
        AppendSpecialChars(chunk_, word);
    }
    void Finish() {
        if (!chunk_.empty())
            WriteChunk();
    }

private:
    /// A chunk that is longer than this is written before the next word.
    static constexpr std::size_t kChunkCharacters = 80;

    void WriteChunk() {
        out_ += "  Indexes";
        if (number_ != 0)
            out_ += std::to_string(number_);
        out_ += " = \"";
        out_ += chunk_;
        out_ += "\" ";
        chunk_.clear();
        ++number_;
    }

    std::string& out_;
    std::string chunk_;
    int number_ = 0;
};

} // namespace

/// One text under way, and what its nodes use in turn.
struct CHelpPrjTreeNode::XmlPass {
    std::string& out;
    bool skipSerializers = false;
    std::string buffer;
    std::vector<std::string_view> words;

    /// ` name = "value" `, nothing for an empty value.
    void First(const char* name, std::string_view value, Appender append) {
        if (value.empty())
            return;
        out += ' ';
        out += name;
        out += " = \"";
        append(out, value);
        out += "\" ";
    }
    /// On a line of its own: `name="value" `.
    void Line(std::int32_t level, const char* name, std::string_view value, Appender append) {
        out += kCrLf;
        out.append(static_cast<std::size_t>(2 * level + 8), ' ');
        out += name;
        out += "=\"";
        append(out, value);
        out += "\" ";
    }
    void FilledLine(std::int32_t level, const char* name, std::string_view value, Appender append) {
        if (!value.empty())
            Line(level, name, value, append);
    }
};

std::string CHelpPrjTreeNode::XMLSTr(std::int32_t vlngLevel, bool vfSkipSerializers, bool /*vfExtInfo*/,
                                     bool vfIncludeXMLHeader, const std::string& vstrExtraAttrs) {
    std::string out;
    Trapped("CHelpPrjTreeNode", "XMLSTr", [&] {
        if (vfIncludeXMLHeader)
            out = kXmlHeader;
        XmlPass pass{out, vfSkipSerializers, {}, {}};
        AppendXml(pass, vlngLevel, Parent == nullptr ? std::string() : EncodeSpecialName(Parent->Key()),
                  vstrExtraAttrs);
    });
    return out;
}

/// A value with project tags is resolved into the buffer.
std::string_view CHelpPrjTreeNode::Resolved(const NodePropertyViews& values, NodeProperty property,
                                            std::string& buffer) const {
    const auto value = values[property];
    if (terminated_)
        return {};
    if (value.find('{') == std::string_view::npos)
        return value;
    buffer = PropertyValue(property);
    if (property == NodeProperty::Caption || property == NodeProperty::Title)
        buffer = MessageOr(std::move(buffer));
    return buffer;
}

/// The neighbours in the view, from which a later paste finds the place again.
void CHelpPrjTreeNode::NoteNeighbours() {
    if (TreeViewNode == nullptr)
        return;
    if (const auto* previous = TreeViewNode->Previous())
        SetPreviousNodeKey(previous->Key());
    if (const auto* next = TreeViewNode->Next())
        SetNextNodeKey(next->Key());
}

void CHelpPrjTreeNode::AppendXml(XmlPass& pass, std::int32_t level, const std::string& encodedParentKey,
                                 const std::string& extraAttributes) {
    if (IsControl || IsMenu)
        return;
    NoteNeighbours();
    const auto values = properties_.ReadAll();
    if (pass.skipSerializers && !Resolved(values, NodeProperty::Serializer, pass.buffer).empty())
        return;
    auto& out = pass.out;
    const auto indent = static_cast<std::size_t>(2 * level);
    out.append(indent, ' ');
    out += '<';
    out += Tag;
    out += " level = \"";
    out += std::to_string(level);
    out += "\" ";
    out += extraAttributes;
    AppendXmlFirstLine(pass, values,
                       !extraAttributes.empty() && text::ContainsIgnoringCase(extraAttributes, "Name = \""));
    std::string key;
    const auto ownKey = Resolved(values, NodeProperty::Key, pass.buffer);
    AppendSpecialName(key, ownKey.empty() && !terminated_ ? Tag : ownKey);
    AppendXmlLines(pass, values, level, key, encodedParentKey);
    AppendXmlIndexes(pass, values);

    const auto head = out.size();
    out += " >";
    EndLine(out);
    const auto body = out.size();
    for (const auto& child : children_) {
        const auto before = out.size();
        child->AppendXml(pass, level + 1, key, {});
        if (out.size() != before)
            EndLine(out);
    }
    if (out.size() == body) {
        out.resize(head);
        out += " />";
        return;
    }
    out.append(indent, ' ');
    out += "</";
    out += Tag;
    out += '>';
    out += kCrLf;
}

void CHelpPrjTreeNode::AppendXmlFirstLine(XmlPass& pass, const NodePropertyViews& values,
                                          bool nameIsGiven) const {
    const auto value = [&](NodeProperty property) { return Resolved(values, property, pass.buffer); };
    if (!nameIsGiven)
        pass.First("name", value(NodeProperty::Name), AppendSpecialName);
    if (values[NodeProperty::Type] != "-1" || values[NodeProperty::ObjectType] != "-1")
        if (const auto type = ObjectType(); type != -1)
            pass.First("type", std::to_string(type), AppendPlain);
    pass.First("caption", value(NodeProperty::Caption), AppendSpecialChars);
    const auto firstFilled = [&](auto... properties) {
        std::string_view found;
        ((found = found.empty() ? value(properties) : found), ...);
        return found;
    };
    pass.First("TemplateHtmlFile",
               templateFileKnown_
                   ? std::string_view(templateFile_)
                   : firstFilled(NodeProperty::TemplateHtmlFile, NodeProperty::Html, NodeProperty::Htm),
               AppendPlain);
    pass.First("GeneratedHtmlFile",
               generatedFileKnown_
                   ? generatedFile_
                   : FileNameIn(firstFilled(NodeProperty::GeneratedHtmlFile, NodeProperty::GenHtml)),
               AppendPlain);
    pass.First("PicsSubfolderName", value(NodeProperty::PicsSubfolderName), AppendPlain);
    pass.First("serializer", value(NodeProperty::Serializer), AppendPlain);
    pass.First("Charset", value(NodeProperty::Charset), AppendPlain);
    if (!values[NodeProperty::CSSFullPath].empty())
        pass.First("CSSFullpath", platform::FileNameOf(CSSFullPath()), AppendPlain);
    pass.First("SourceProjectType", value(NodeProperty::SourceProjectType), AppendPlain);
    pass.First("SourceProjectName", value(NodeProperty::SourceProjectName), AppendPlain);
}

void CHelpPrjTreeNode::AppendXmlLines(XmlPass& pass, const NodePropertyViews& values, std::int32_t level,
                                      const std::string& encodedKey, const std::string& encodedParentKey) {
    const auto value = [&](NodeProperty property) { return Resolved(values, property, pass.buffer); };
    const auto asIs = [](std::string& out, std::string_view text) { out += text; };
    pass.Line(level, "key", encodedKey, asIs);
    if (Parent != nullptr)
        pass.Line(level, "pkey", encodedParentKey, asIs);
    if (const auto* previous = TreeViewNode == nullptr ? nullptr : TreeViewNode->Previous())
        pass.Line(level, "pnodekey", previous->Key(), AppendSpecialName);
    if (const auto* next = TreeViewNode == nullptr ? nullptr : TreeViewNode->Next())
        pass.Line(level, "nnodekey", next->Key(), AppendSpecialName);
    pass.FilledLine(level, "icon", value(NodeProperty::Icon), AppendPlain);
    pass.FilledLine(level, "title", value(NodeProperty::Title), AppendSpecialChars);
    if (values[NodeProperty::ProcessCode] != "0")
        if (const auto code = ProcessCode(); code != 0)
            pass.Line(level, "ProcessCode", std::to_string(code), asIs);
    pass.FilledLine(level, "extraValue", value(NodeProperty::ExtraValue), AppendSpecialChars);
    if (values[NodeProperty::Skipped] != "0" && Skipped())
        pass.Line(level, "skipped", "-1", asIs);
    pass.FilledLine(level, "OriginalKey", value(NodeProperty::OriginalKey), AppendSpecialName);
    pass.FilledLine(level, "POriginalKey", value(NodeProperty::ParentOriginalKey), AppendSpecialName);
}

void CHelpPrjTreeNode::AppendXmlIndexes(XmlPass& pass, const NodePropertyViews& values) {
    if (indexes_ == nullptr && values.indexes.empty() && !values.hasMoreIndexes)
        return;
    KeywordAttributes attributes(pass.out);
    if (indexes_ == nullptr && !values.hasMoreIndexes && FewWords(values.indexes, pass.words)) {
        for (const auto word : pass.words)
            attributes.Add(word);
    } else {
        for (const auto& word : IndexesCollection())
            attributes.Add(word);
    }
    attributes.Finish();
}

std::string CHelpPrjTreeNode::IndexesXmlStr() {
    std::string out;
    XmlPass pass{out, false, {}, {}};
    AppendXmlIndexes(pass, properties_.ReadAll());
    return out;
}

} // namespace tovimar
