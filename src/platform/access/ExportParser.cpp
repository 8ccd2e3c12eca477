#include "platform/Error.h"
#include "platform/access/ExportReader.h"
#include "platform/access/HexDigit.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kMaxDepth = 200;
constexpr std::size_t kMaxBytes = std::size_t{256} << 20;

bool IsOctal(char digit) {
    return digit >= '0' && digit <= '7';
}

/// Walks over the lines with a stack of open blocks; every line is looked at once.
class Parser {
public:
    Parser(std::string_view source, const std::string& file) : source_(source), file_(file) {}

    ExportTree Run() {
        if (source_.size() > kMaxBytes)
            Fail("the file is larger than 256 MiB");
        tree_.root = std::make_unique<DesignObject>();
        open_.push_back({tree_.root.get(), 0});
        while (NextLine() && tree_.code.empty() && !atCode_)
            TakeLine();
        if (open_.size() > 1)
            Fail("the file ends inside the block that begins in line " + std::to_string(open_.back().line));
        return std::move(tree_);
    }

private:
    struct OpenBlock {
        DesignObject* object;
        std::size_t line;
    };

    [[noreturn]] void Fail(const std::string& reason) const {
        throw RaisedError(kFailure1, file_ + ", line " + std::to_string(lineNumber_) + ": " + reason + ".",
                          "ExportReader");
    }

    bool NextLine() {
        if (position_ >= source_.size())
            return false;
        const auto end = std::min(source_.find('\n', position_), source_.size());
        lineStart_ = position_;
        line_ = source_.substr(position_, end - position_);
        position_ = end + 1;
        ++lineNumber_;
        const auto first = line_.find_first_not_of(" \t\r");
        line_ = first == std::string_view::npos
                    ? std::string_view()
                    : line_.substr(first, line_.find_last_not_of(" \t\r") - first + 1);
        return true;
    }

    /// Start of the next line that isn't blank, without taking it.
    std::string_view Peek() const {
        const auto first = std::min(source_.find_first_not_of(" \t\r\n", position_), source_.size());
        return source_.substr(first, std::min<std::size_t>(source_.size() - first, 8));
    }

    void TakeLine() {
        if (line_.empty())
            return;
        if (line_ == "Begin" || line_.starts_with("Begin "))
            OpenObject(line_.size() > 6 ? line_.substr(6) : std::string_view());
        else if (line_ == "End")
            CloseObject();
        else if (open_.size() == 1 && text::StartsWithIgnoringCase(line_, "CodeBehind"))
            TakeCode();
        else
            TakeProperty();
    }

    void OpenObject(std::string_view type) {
        if (open_.size() > kMaxDepth)
            Fail("blocks are nested deeper than " + std::to_string(kMaxDepth));
        auto object = std::make_unique<DesignObject>();
        object->type = std::string(type);
        object->parent = open_.back().object;
        auto* opened = object.get();
        open_.back().object->children.push_back(std::move(object));
        open_.push_back({opened, lineNumber_});
    }

    void CloseObject() {
        if (open_.size() == 1)
            Fail("\"End\" without a block that is open");
        open_.pop_back();
    }

    void TakeCode() {
        tree_.code = std::string(source_.substr(std::min(position_, source_.size())));
        atCode_ = true;
        position_ = source_.size();
    }

    /// `Name =value`; query files write the name in quotes behind its type: `dbMemo "SQL" ="..."`.
    void TakeProperty() {
        const auto sign = line_.find('=');
        if (sign == std::string_view::npos || sign == 0)
            return; // a line of a kind that isn't known says nothing
        auto name = line_.substr(0, line_.find_last_not_of(' ', sign - 1) + 1);
        if (name.size() > 2 && name.back() == '"')
            if (const auto quote = name.find('"'); quote + 1 < name.size())
                name = name.substr(quote + 1, name.size() - quote - 2);
        const std::string property(name);
        auto value = line_.substr(sign + 1);
        value.remove_prefix(std::min(value.find_first_not_of(' '), value.size()));
        auto parsed = ParseValue(value);
        open_.back().object->properties.emplace_back(property, std::move(parsed));
    }

    PropertyValue ParseValue(std::string_view value) {
        using Form = PropertyValue::Form;
        if (value == "NotDefault")
            return {Form::NotDefault, {}};
        if (value == "Begin")
            return ParseBlob();
        if (!value.starts_with('"'))
            return {Form::Number, std::string(value)};
        PropertyValue text{Form::Text, {}};
        AppendQuoted(value, text.text);
        while (Peek().starts_with('"')) {
            do
                NextLine();
            while (line_.empty());
            AppendQuoted(line_, text.text);
        }
        return text;
    }

    /// One quoted piece: `\"`, `\\`, `\015` and doubled quotes stand for a character each.
    void AppendQuoted(std::string_view piece, std::string& out) const {
        for (std::size_t i = 1; i < piece.size(); ++i) {
            if (piece[i] == '"') {
                if (i + 1 >= piece.size() || piece[i + 1] != '"')
                    return;
                out += piece[++i];
            } else if (piece[i] == '\\' && i + 1 < piece.size()) {
                i += AppendEscape(piece.substr(i + 1), out);
            } else {
                out += piece[i];
            }
        }
        Fail("a text has no closing quote");
    }

    /// Appends the character of an escape; the number of characters behind the backslash that it takes.
    static std::size_t AppendEscape(std::string_view rest, std::string& out) {
        if (rest.size() < 3 || !IsOctal(rest[0]) || !IsOctal(rest[1]) || !IsOctal(rest[2])) {
            out += rest[0];
            return 1;
        }
        const auto code =
            static_cast<unsigned char>((rest[0] - '0') * 64 + (rest[1] - '0') * 8 + rest[2] - '0');
        if (code < 0x80)
            out += static_cast<char>(code);
        else
            out += text::AnsiCodePage().Decode(std::string(1, static_cast<char>(code)));
        return 3;
    }

    /// Behind "Name = Begin": hexadecimal lines give bytes; an embedded macro is kept as its text.
    PropertyValue ParseBlob() {
        const auto begin = lineNumber_;
        const bool hexadecimal = Peek().starts_with("0x");
        PropertyValue blob{hexadecimal ? PropertyValue::Form::Bytes : PropertyValue::Form::Text, {}};
        const auto start = position_;
        for (std::size_t depth = 1; NextLine();) {
            if (line_ == "End" && --depth == 0) {
                if (!hexadecimal)
                    blob.text = std::string(source_.substr(start, lineStart_ - start));
                return blob;
            }
            if (line_ == "Begin" || line_.starts_with("Begin ") || line_.ends_with("= Begin"))
                ++depth;
            else if (hexadecimal)
                AppendHexadecimal(blob.text);
        }
        Fail("the file ends inside the data that begin in line " + std::to_string(begin));
    }

    void AppendHexadecimal(std::string& bytes) const {
        auto digits = line_;
        if (digits.starts_with("0x"))
            digits.remove_prefix(2);
        for (std::size_t i = 0; i + 1 < digits.size(); i += 2) {
            const int high = HexDigit(digits[i]);
            const int low = HexDigit(digits[i + 1]);
            if (high < 0 || low < 0)
                break; // the blank and comma at the end of a line
            bytes += static_cast<char>(high << 4 | low);
        }
    }

    std::string_view source_;
    const std::string& file_;
    ExportTree tree_;
    std::vector<OpenBlock> open_;
    std::string_view line_;
    std::size_t position_ = 0;
    std::size_t lineStart_ = 0;
    std::size_t lineNumber_ = 0;
    bool atCode_ = false;
};

} // namespace

ExportTree ParseExportTree(std::string_view text, const std::string& nativePath) {
    return Parser(text, nativePath).Run();
}

} // namespace tovimar::platform::access
