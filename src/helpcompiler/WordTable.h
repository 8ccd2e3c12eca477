#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

/// What the help viewer takes for a word. The viewer knows one table, made for Western European text, and
/// puts the bytes of every single-byte code page through it, both when a help file is made and when somebody
/// searches; a help file that splits its words in any other way can't be searched.
namespace tovimar::helpcompiler {

enum class ByteClass : std::uint16_t {
    End = 0,
    Kept = 1,
    Replaced = 2,
    Digit = 3,
    Comma = 4,
    Point = 5,
    Apostrophe = 6,
    Separator = 7,
    Wildcard = 9,
    TwoLetters = 0xC, ///< a ligature or sharp s: `ae`, `oe`, `ss`
    // The dashes and curved quotes end a word and have classes of their own.
    Bullet = 0x100,
    EnDash = 0x200,
    EmDash = 0x300,
    OpeningQuote = 0x400,
    ClosingQuote = 0x500,
    OpeningDoubleQuote = 0x600,
    ClosingDoubleQuote = 0x700
};

struct ByteTraits {
    ByteClass kind = ByteClass::End;
    std::uint16_t weight = 0; ///< sorting weight, for the viewer alone
    std::uint8_t norm = 0;    ///< lower case without accent
    std::uint8_t mapped = 0;  ///< the same character in the Macintosh's code page, for the viewer alone
};

const std::array<ByteTraits, 256>& ByteTable();

/// The letters of a `TwoLetters` byte.
std::string_view LettersOf(std::uint8_t byte);

/// Words that are longer are cut there: a node of the index stores a word's length in a byte.
constexpr std::size_t kLongestWord = 250;

/// True for the code pages in which a character may take two bytes: 932, 936, 949, 950.
bool IsDoubleByte(int codePage);
/// True for the first byte of two.
bool IsLeadByte(int codePage, std::uint8_t byte);

/// The words of a stretch of text that no tag interrupts, folded as they are stored and looked up. In a
/// double-byte code page only the words of plain ASCII are found.
void SplitWords(std::string_view text, int codePage, const std::function<void(std::string_view)>& found);

} // namespace tovimar::helpcompiler
