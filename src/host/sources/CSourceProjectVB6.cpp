#include "host/sources/CSourceProjectVB6.h"

#include "foundation/ErrorTrap.h"
#include "host/contract/ObjectTypes.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "host/sources/SourceFileText.h"
#include "host/sources/TextLines.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <array>

namespace tovimar {

/// A kind of line in the project's file, and what its files begin with.
struct CSourceProjectVB6::FormKind {
    std::string_view line;
    std::array<std::string_view, 2> begins;
    const char* subType;
};

struct CSourceProjectVB6::FormHead {
    std::string name;
    std::string caption;
};

namespace {

bool BeginsWithWord(std::string_view line, std::string_view word) {
    return text::StartsWithIgnoringCase(line, word) &&
           (line.size() == word.size() || line[word.size()] == ' ');
}

/// The text between the quotes, where a quote is doubled. A text that is kept in another file, `$"..."`,
/// isn't here.
std::string QuotedText(std::string_view value) {
    if (value.size() < 2 || value.front() != '"' || value.back() != '"')
        return {};
    return text::TrimWhitespace(text::ReplaceAll(value.substr(1, value.size() - 2), "\"\"", "\""));
}

/// "    Caption         =   \"Orders\"" gives Orders; nothing for a line of another property.
bool IsCaption(std::string_view line, std::string& caption) {
    if (!text::StartsWithIgnoringCase(line, "Caption"))
        return false;
    const auto equals = line.find('=');
    if (equals == std::string_view::npos)
        return false;
    caption = QuotedText(text::TrimWhitespace(line.substr(equals + 1)));
    return true;
}

} // namespace

CSourceProjectVB6::CSourceProjectVB6() : SourceProjectLists("CSourceProjectVB6", SourceProjectKind::kVB6) {}

bool CSourceProjectVB6::Read(const std::string& path) {
    if (!HelpForFormsWanted())
        return true;
    // The window that frames all others is a form to its users.
    static const std::array<FormKind, 3> kKinds{
        {{"Form=", {"Begin VB.Form", "Begin VB.MDIForm"}, ""},
         {"UserControl=", {"Begin VB.UserControl"}, "UserControl"},
         {"UserDocument=", {"Begin VB.UserDocument"}, "UserDocument"}}};
    const std::string folder = platform::FolderOf(path);
    const std::string project = ReadSourceFile(path);
    TextLines lines(project);
    std::string_view line;
    while (lines.Next(line))
        for (const FormKind& kind : kKinds)
            if (text::StartsWithIgnoringCase(line, kind.line)) {
                const std::string file = text::TrimWhitespace(line.substr(kind.line.size()));
                Trapped(ClassName(), "IHelpPrjSourceProject_Init",
                        [&] { ReadForm(kind, SourceFilePath(folder, file)); });
            }
    return true;
}

void CSourceProjectVB6::ReadForm(const FormKind& kind, const std::string& path) {
    if (!platform::Env().files->FileExists(path))
        return;
    const std::string source = ReadSourceFile(path);
    const FormHead head = ReadHead(kind, source);
    if (head.name.empty() || !IsUsableName("Source Form skipped ", head.name))
        return;
    auto item = std::make_unique<CHelpPrjSourceItem>();
    item->InitFromTextProject(Name(), path, head.name, head.caption, kind.subType);
    Add(forms_, std::move(item));
}

/// Without a name when the object isn't there.
CSourceProjectVB6::FormHead CSourceProjectVB6::ReadHead(const FormKind& kind, std::string_view text) {
    FormHead head;
    TextLines lines(text);
    std::string_view line;
    while (head.name.empty() && lines.Next(line))
        for (const std::string_view begin : kind.begins)
            if (!begin.empty() && BeginsWithWord(line, begin))
                head.name = text::TrimWhitespace(line.substr(begin.size()));
    while (lines.Next(line) && !text::StartsWithIgnoringCase(line, "Begin") &&
           !text::StartsWithIgnoringCase(line, "End"))
        if (IsCaption(line, head.caption))
            break;
    return head;
}

} // namespace tovimar
