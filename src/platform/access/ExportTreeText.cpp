#include "platform/access/ExportTreeText.h"

#include "platform/text/CodePoints.h"

#include <algorithm>
#include <array>

namespace tovimar::platform::access {

namespace {

constexpr std::string_view kCrLf = "\r\n";
constexpr std::size_t kTextWidth = 80;
constexpr std::size_t kBytesPerLine = 32;
constexpr int kMostIndent = 200;

std::string Indent(int depth) {
    return std::string(static_cast<std::size_t>(std::clamp(depth, 0, kMostIndent)) * 4, ' ');
}

/// One character as it stands between quotes.
std::string_view Escaped(std::string_view character, std::array<char, 4>& buffer) {
    const auto code = static_cast<unsigned char>(character[0]);
    if (code == '"')
        return "\\\"";
    if (code == '\\')
        return "\\\\";
    if (code >= 0x20)
        return character;
    buffer = {'\\', '0', static_cast<char>('0' + (code >> 3U)), static_cast<char>('0' + (code & 7U))};
    return {buffer.data(), buffer.size()};
}

class TreeWriter {
public:
    void Children(const DesignObject& owner, int depth) {
        for (const auto& child : owner.children)
            Block(*child, depth);
    }
    void Properties(const DesignObject& object, int depth) {
        for (const auto& [name, value] : object.properties)
            Property(name, value, depth);
    }
    void Inner(const DesignObject& object, int depth) {
        Properties(object, depth);
        if (object.children.empty())
            return;
        Line(depth, "Begin");
        Children(object, depth + 1);
        Line(depth, "End");
    }
    std::string Take() { return std::move(out_); }

private:
    void Line(int depth, std::string_view text) {
        out_ += Indent(depth);
        out_ += text;
        out_ += kCrLf;
    }

    void Block(const DesignObject& object, int depth) {
        Line(depth, object.type.empty() ? "Begin" : "Begin " + object.type);
        Inner(object, depth + 1);
        Line(depth, "End");
    }

    void Property(const std::string& name, const PropertyValue& value, int depth) {
        using Form = PropertyValue::Form;
        switch (value.form) {
        case Form::Number:
            return Line(depth, name + " =" + value.text);
        case Form::NotDefault:
            return Line(depth, name + " = NotDefault");
        case Form::Bytes:
            return Bytes(name, value.text, depth);
        case Form::Text:
            if (name.ends_with("EmMacro")) {
                Line(depth, name + " = Begin");
                out_ += value.text;
                return Line(depth, "End");
            }
            return Text(name, value.text, depth);
        }
    }

    void Text(const std::string& name, std::string_view value, int depth) {
        out_ += Indent(depth) + name + " =\"";
        std::size_t width = 0;
        std::array<char, 4> buffer{};
        for (std::size_t i = 0; i < value.size();) {
            const auto start = i;
            text::NextCodePoint(value, i);
            const auto piece = Escaped(value.substr(start, i - start), buffer);
            if (width + piece.size() > kTextWidth) {
                out_ += '"';
                out_ += kCrLf;
                out_ += Indent(depth + 1) + '"';
                width = 0;
            }
            out_ += piece;
            width += piece.size();
        }
        out_ += '"';
        out_ += kCrLf;
    }

    void Bytes(const std::string& name, std::string_view bytes, int depth) {
        constexpr std::string_view kDigits = "0123456789abcdef";
        Line(depth, name + " = Begin");
        for (std::size_t i = 0; i < bytes.size(); i += kBytesPerLine) {
            out_ += Indent(depth + 1) + "0x";
            for (const char byte : bytes.substr(i, kBytesPerLine)) {
                out_ += kDigits[static_cast<unsigned char>(byte) >> 4U];
                out_ += kDigits[static_cast<unsigned char>(byte) & 15U];
            }
            if (i + kBytesPerLine < bytes.size())
                out_ += " ,";
            out_ += kCrLf;
        }
        Line(depth, "End");
    }

    std::string out_;
};

} // namespace

std::string ExportTreeText(const DesignObject& root) {
    TreeWriter writer;
    writer.Properties(root, 0);
    writer.Children(root, 0);
    return writer.Take();
}

std::string BlockLines(const DesignObject& block, int depth) {
    TreeWriter writer;
    writer.Properties(block, depth);
    writer.Children(block, depth);
    return writer.Take();
}

} // namespace tovimar::platform::access
