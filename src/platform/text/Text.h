#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

/// Text on characters. Strings are UTF-8; counting, cutting and comparing go through here, never over
/// bytes. A character is a Unicode code point; ill-formed bytes count as U+FFFD each. Built on ICU.
namespace tovimar::text {

/// Case folding that serves every comparison without regard to case (locale independent, length may change).
/// ASCII text takes a fast path.
std::string FoldCase(std::string_view text);
bool EqualsIgnoringCase(std::string_view left, std::string_view right);
/// Order of texts without regard to case: below 0, 0, above 0. The same on every machine.
int CompareIgnoringCase(std::string_view left, std::string_view right);
bool StartsWithIgnoringCase(std::string_view text, std::string_view prefix);
bool EndsWithIgnoringCase(std::string_view text, std::string_view suffix);

std::string ToUpper(std::string_view text);
std::string ToLower(std::string_view text);

/// Byte position of the first occurrence at or behind `from`, std::string::npos when absent. Matches
/// cover the same number of bytes in `text` as they are reported by `matched` (may differ from the
/// needle's for letters whose folding changes their length).
std::size_t FindIgnoringCase(std::string_view text, std::string_view needle, std::size_t from = 0,
                             std::size_t* matched = nullptr);
bool ContainsIgnoringCase(std::string_view text, std::string_view needle);

/// Every occurrence, from the left, in one linear pass; replaced text is not searched again.
std::string ReplaceAll(std::string_view text, std::string_view from, std::string_view to);
std::string ReplaceAllIgnoringCase(std::string_view text, std::string_view from, std::string_view to);

/// Characters, not bytes.
std::size_t Length(std::string_view text);
std::string Left(std::string_view text, std::size_t characters);
std::string Right(std::string_view text, std::size_t characters);
/// 1-based start; to the end without a count.
std::string Mid(std::string_view text, std::size_t start, std::size_t count = std::string_view::npos);

/// Takes blanks off both ends; only the blank U+0020, as the fixed formats ask for.
std::string Trim(std::string_view text);
/// Takes blanks, tabs and line ends off both ends.
std::string TrimWhitespace(std::string_view text);

/// Always at least one part; an empty separator gives the whole text.
std::vector<std::string> Split(std::string_view text, std::string_view separator);
std::string Join(const std::vector<std::string>& parts, std::string_view separator);

std::u32string ToCodePoints(std::string_view text);
std::string FromCodePoints(std::u32string_view codePoints);
std::string FromCodePoint(char32_t codePoint);
std::u16string ToUtf16(std::string_view text);
std::string FromUtf16(std::u16string_view text);

/// True when the bytes are well-formed UTF-8.
bool IsValidUtf8(std::string_view bytes);
/// Ill-formed sequences become U+FFFD.
std::string MakeValidUtf8(std::string_view bytes);

/// Code pages by Windows number: 1250 to 1258, 874, 932, 936, 949, 950, 65001, ...
/// Unknown numbers count as 1252.
class CodePage {
public:
    explicit CodePage(int number);
    int Number() const { return number_; }
    /// Bytes that the page doesn't define become the control character of the same value or U+FFFD.
    std::string Decode(std::string_view bytes) const;
    /// Characters that the page can't hold become `substitute` ("?" as the platform does).
    std::string Encode(std::string_view text, std::string_view substitute = "?") const;
    bool CanEncode(char32_t codePoint) const;
    /// The page's byte for a character, the "ANSI value"; 63 ("?") when it has none. Single-byte pages.
    std::uint8_t AnsiValue(char32_t codePoint) const;

private:
    int number_;
    const struct CodePageTable* table_; // kept for the life of the process
};

/// The process's ANSI code page: what "plain text" files are read and written in. 1252 at start;
/// the run's charset sets it ("windows-1251" gives 1251).
const CodePage& AnsiCodePage();
void SetAnsiCodePage(int number);
/// 1251 for "windows-1251", 65001 for "utf-8", ...; 0 for a name that isn't known.
int CodePageByCharsetName(std::string_view charset);

} // namespace tovimar::text
