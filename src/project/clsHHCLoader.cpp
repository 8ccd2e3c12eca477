#include "project/clsHHCLoader.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/SitemapText.h"

namespace tovimar {

namespace {

const char* const kNameParam = "<param name=\"Name\" value=\"";

bool Begins(const std::string& line, const char* with) {
    return text::StartsWithIgnoringCase(line, with);
}

/// One line made well-formed; empty for one that goes.
std::string WellFormedLine(std::string line) {
    line = text::Trim(text::ReplaceAll(line, "\t", ""));
    if (Begins(line, "<!DOCTYPE") || Begins(line, "<meta") || Begins(line, "</LI>"))
        return {};
    if (Begins(line, "</OBJECT>"))
        return "</OBJECT></LI>";
    const std::string prefix = kNameParam;
    if (Begins(line, kNameParam) && line.size() >= prefix.size() + 2)
        return prefix +
               clsHHCObjectEntry::DecEncode(line.substr(prefix.size(), line.size() - prefix.size() - 2)) +
               "\"/>";
    if (Begins(line, "<param"))
        return line.substr(0, line.size() - 1) + "/>";
    return line;
}

} // namespace

std::string clsHHCLoader::WellFormed(const std::string& text) {
    std::string out = kXmlHeader;
    for (auto& line : text::Split(text, "\n")) {
        if (!line.empty() && line.back() == '\r')
            line.pop_back();
        const auto formed = WellFormedLine(std::move(line));
        if (!formed.empty())
            out += kCrLf + formed;
    }
    return out;
}

ResultCode clsHHCLoader::Load(const std::string& vstrHHCFileFullPath) {
    return Trapped(
        "clsHHCLoader", "Load",
        [&] {
            root_.reset();
            flat_.clear();
            const auto bytes = platform::Env().files->ReadFile(vstrHHCFileFullPath);
            XmlDocument document;
            CXMLFile file;
            errorCode_ = file.LoadXml(WellFormed(text::AnsiCodePage().Decode(bytes)), document);
            errorReason_ = file.XmlParseError.reason;
            if (errorCode_ == kSuccess)
                Walk(0, document.documentElement().childElements());
        },
        [&] { return "HHCFileFullPath = " + vstrHHCFileFullPath; });
}

/// The body's list is the first level, each list in it one deeper.
void clsHHCLoader::Walk(std::int32_t level, const std::vector<XmlNode>& nodes) {
    for (const auto& node : nodes) {
        const auto tag = node.nodeName();
        if (text::EqualsIgnoringCase(tag, "UL")) {
            Walk(level + 1, node.childElements());
        } else if (text::EqualsIgnoringCase(tag, "BODY") || text::EqualsIgnoringCase(tag, "LI")) {
            Walk(level, node.childElements());
        } else if (text::EqualsIgnoringCase(tag, "OBJECT")) {
            auto entry = std::make_unique<clsHHCObjectEntry>();
            entry->ProcessHHCXmlStrTree(level, node.childElements());
            Place(std::move(entry));
        }
    }
}

void clsHHCLoader::Place(std::unique_ptr<clsHHCObjectEntry> entry) {
    auto* placed = entry.get();
    if (flat_.empty()) {
        root_ = std::move(entry);
        flat_.push_back(placed);
        return;
    }
    // Entries that are not above anything that follows leave the chain: only ancestors are of use.
    while (flat_.size() > 1 && flat_.back()->Level >= placed->Level)
        flat_.pop_back();
    if (flat_.back()->Level >= placed->Level)
        return;
    flat_.back()->Children.push_back(std::move(entry));
    flat_.push_back(placed);
}

std::string clsHHCLoader::GetXMLStr() const {
    std::string out = std::string(kXmlHeader) + kCrLf;
    std::int32_t pref = 0;
    if (root_ != nullptr)
        out += root_->XMLSTr(pref, {}, /*hidden=*/false, {}, 1);
    return out;
}

ResultCode clsHHCLoader::SaveXml(const std::string& path) const {
    return CXMLFile().SaveXml(path, GetXMLStr());
}

} // namespace tovimar
