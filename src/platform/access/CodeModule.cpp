#include "platform/access/CodeObjects.h"
#include "platform/access/ExportReader.h"

#include <algorithm>
#include <optional>

namespace tovimar::platform::access {

namespace {

constexpr ResultCode kNoSuchProcedure = 35;

std::vector<std::string> SplitLines(const std::string& code) {
    std::vector<std::string> lines;
    for (std::size_t position = 0; position < code.size();) {
        const auto end = std::min(code.find('\n', position), code.size());
        auto line = code.substr(position, end - position);
        if (line.ends_with('\r'))
            line.pop_back();
        lines.push_back(std::move(line));
        position = end + 1;
    }
    return lines;
}

/// The words at the start of a line, letters of a name together, up to the first other sign.
std::vector<std::string> FirstWords(const std::string& line, std::size_t count) {
    std::vector<std::string> words;
    std::size_t position = 0;
    while (words.size() < count) {
        position = std::min(line.find_first_not_of(" \t", position), line.size());
        const auto end = std::min(line.find_first_of(" \t(:'", position), line.size());
        if (end == position)
            break;
        words.push_back(line.substr(position, end - position));
        position = end;
    }
    return words;
}

struct Declaration {
    std::string name;
    int kind = 0;
};

bool IsAny(const std::string& word, std::initializer_list<std::string_view> words) {
    return std::any_of(words.begin(), words.end(),
                       [&](std::string_view other) { return text::EqualsIgnoringCase(word, other); });
}

/// What a line like "Private Sub Print_Click()" declares.
std::optional<Declaration> ReadDeclaration(const std::string& line) {
    const auto words = FirstWords(line, 6);
    std::size_t next = 0;
    while (next < words.size() && IsAny(words[next], {"Public", "Private", "Friend", "Static"}))
        ++next;
    if (next + 1 < words.size() && IsAny(words[next], {"Sub", "Function"}))
        return Declaration{words[next + 1], 0};
    if (next + 2 >= words.size() || !IsAny(words[next], {"Property"}))
        return std::nullopt;
    const auto& access = words[next + 1];
    return Declaration{words[next + 2], IsAny(access, {"Let"}) ? 1 : IsAny(access, {"Set"}) ? 2 : 3};
}

bool EndsProcedure(const std::string& line) {
    const auto words = FirstWords(line, 2);
    return words.size() == 2 && IsAny(words[0], {"End"}) && IsAny(words[1], {"Sub", "Function", "Property"});
}

bool IsBlankOrComment(const std::string& line) {
    const auto first = line.find_first_not_of(" \t");
    return first == std::string::npos || line[first] == '\'' ||
           text::StartsWithIgnoringCase(std::string_view(line).substr(first), "Rem ");
}

} // namespace

const MemberTable<CodeModule>& CodeModule::Members() {
    static const MemberTable<CodeModule> kMembers{
        {"Name", &CodeModule::ReadName},
        {"CountOfLines", &CodeModule::ReadCountOfLines},
        {"Lines", &CodeModule::ReadLines},
        {"ProcStartLine", &CodeModule::ReadProcStartLine},
        {"ProcBodyLine", &CodeModule::ReadProcBodyLine},
        {"ProcCountLines", &CodeModule::ReadProcCountLines},
    };
    return kMembers;
}

CodeModule::CodeModule(std::string name, const std::string& code)
    : name_(std::move(name)), lines_(SplitLines(VisibleCode(code))) {
    FindProcedures();
}

void CodeModule::FindProcedures() {
    int previousEnd = 0;
    for (std::size_t i = 0; i < lines_.size(); ++i) {
        const auto declaration = ReadDeclaration(lines_[i]);
        if (!declaration)
            continue;
        const int body = static_cast<int>(i) + 1;
        Procedure procedure{declaration->name, declaration->kind, StartOf(body, previousEnd), body, 0};
        while (i < lines_.size() && !EndsProcedure(lines_[i]))
            ++i;
        procedure.end = static_cast<int>(std::min(i + 1, lines_.size()));
        previousEnd = procedure.end;
        procedures_.push_back(std::move(procedure));
    }
}

/// Comments and blank lines above a declaration belong to it, back to what stands before them.
int CodeModule::StartOf(int body, int previousEnd) const {
    int start = body;
    while (start - 1 > previousEnd && IsBlankOrComment(lines_[static_cast<std::size_t>(start) - 2]))
        --start;
    return start;
}

const CodeModule::Procedure& CodeModule::Demand(const Arguments& arguments) const {
    const auto name = TextAt(arguments, 0);
    const auto kind = IntegerAt(arguments, 1);
    for (const auto& procedure : procedures_)
        if (procedure.kind == kind && text::EqualsIgnoringCase(procedure.name, name))
            return procedure;
    throw RaisedError(kNoSuchProcedure, "Sub or Function not defined: " + name + " in " + name_, ClassName());
}

Value CodeModule::ReadProcCountLines(const Arguments& arguments) {
    const auto& procedure = Demand(arguments);
    return procedure.end - procedure.start + 1;
}

Value CodeModule::ReadLines(const Arguments& arguments) {
    const auto first = static_cast<std::size_t>(std::max(IntegerAt(arguments, 0, 1), 1)) - 1;
    const auto count = static_cast<std::size_t>(std::max(IntegerAt(arguments, 1, 1), 0));
    std::string block;
    for (auto i = first; i < lines_.size() && i - first < count; ++i) {
        if (i > first)
            block += "\r\n";
        block += lines_[i];
    }
    return block;
}

} // namespace tovimar::platform::access
