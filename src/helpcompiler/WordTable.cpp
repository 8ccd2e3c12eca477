#include "helpcompiler/WordTable.h"

namespace tovimar::helpcompiler {
namespace {

using Table = std::array<ByteTraits, 256>;

/// 80 to FF; a blank is a byte that has no letter.
constexpr std::string_view kNorms = "          s o             s o  y"
                                    "                                "
                                    "aaaaaaaceeeeiiiidnooooo ouuuuy s"
                                    "aaaaaaaceeeeiiiionooooo ouuuuy y";
static_assert(kNorms.size() == 128);

constexpr std::array<std::uint8_t, 128> kMacintosh{
    0x20, 0x20, 0xE2, 0xC4, 0xE3, 0xC9, 0xA0, 0xE0, 0x5E, 0xE4, 0x20, 0xDC, 0xCE, 0x20, 0x20, 0x20, //
    0x20, 0xD4, 0xD5, 0xD2, 0xD3, 0xA5, 0xD0, 0xD1, 0x7E, 0xAA, 0x20, 0xDD, 0xCF, 0x20, 0x20, 0xD9, //
    0xA0, 0xC1, 0xA2, 0xA3, 0xDB, 0xB4, 0x20, 0xA4, 0xAC, 0xA9, 0xBB, 0xC7, 0xC2, 0x2D, 0xA8, 0xF8, //
    0xA1, 0xB1, 0x20, 0x20, 0xAB, 0xB5, 0xA6, 0xE1, 0xFC, 0x20, 0xBC, 0xC8, 0x20, 0x20, 0x20, 0xC0, //
    0xCB, 0xE7, 0xE5, 0xCC, 0x80, 0x81, 0xAE, 0x82, 0xE9, 0x83, 0xE6, 0xE8, 0xED, 0xEA, 0xEB, 0xEC, //
    0x20, 0x84, 0xF1, 0xEE, 0xEF, 0xCD, 0x85, 0x20, 0xAF, 0xF4, 0xF2, 0xF3, 0x86, 0x20, 0x20, 0xA7, //
    0x88, 0x87, 0x89, 0x8B, 0x8A, 0x8C, 0xBE, 0x8D, 0x8F, 0x8E, 0x90, 0x91, 0x93, 0x92, 0x94, 0x95, //
    0x20, 0x96, 0x98, 0x97, 0x99, 0x9B, 0x9A, 0xD6, 0xBF, 0x9D, 0x9C, 0x9E, 0x9F, 0x20, 0x20, 0xD8};

std::uint16_t LetterWeight(char norm) {
    return static_cast<std::uint16_t>(1230 + 20 * (norm - 'a'));
}

void FillClasses(Table& table) {
    for (unsigned byte = 0x80; byte < 0x100; ++byte)
        if (kNorms[byte - 0x80] != ' ')
            table[byte].kind = ByteClass::Replaced;
    for (unsigned letter = 'a'; letter <= 'z'; ++letter) {
        table[letter].kind = ByteClass::Kept;
        table[letter - 32].kind = ByteClass::Replaced;
    }
    for (unsigned digit = '0'; digit <= '9'; ++digit)
        table[digit].kind = ByteClass::Digit;
    table['_'].kind = ByteClass::Kept;
    table[','].kind = ByteClass::Comma;
    table['.'].kind = ByteClass::Point;
    table['\''].kind = ByteClass::Apostrophe;
    table[1].kind = ByteClass::Separator;
    table['*'].kind = table['?'].kind = ByteClass::Wildcard;
    for (const unsigned byte : {0x8CU, 0x9CU, 0xC6U, 0xDFU, 0xE6U})
        table[byte].kind = ByteClass::TwoLetters;
    table[0xDE].kind = table[0xFE].kind = ByteClass::Replaced;
    constexpr std::array kMarks{ByteClass::OpeningQuote,
                                ByteClass::ClosingQuote,
                                ByteClass::OpeningDoubleQuote,
                                ByteClass::ClosingDoubleQuote,
                                ByteClass::Bullet,
                                ByteClass::EnDash,
                                ByteClass::EmDash};
    for (unsigned i = 0; i < kMarks.size(); ++i)
        table[0x91 + i].kind = kMarks[i];
}

void FillNorms(Table& table) {
    for (unsigned byte = 0; byte < 0x100; ++byte) {
        ByteTraits& traits = table[byte];
        traits.norm = static_cast<std::uint8_t>(byte);
        traits.mapped = byte < 0x80 ? static_cast<std::uint8_t>(byte) : kMacintosh[byte - 0x80];
        if (byte >= 'A' && byte <= 'Z')
            traits.norm = static_cast<std::uint8_t>(byte + 32);
        else if (byte >= 0x80 && kNorms[byte - 0x80] != ' ')
            traits.norm = static_cast<std::uint8_t>(kNorms[byte - 0x80]);
    }
    table[0x0E].mapped = 0x14;
}

/// From `first` on, each byte a step heavier.
void FillRange(Table& table, unsigned first, unsigned last, unsigned weight, unsigned step) {
    for (unsigned byte = first; byte <= last; ++byte)
        table[byte].weight = static_cast<std::uint16_t>(weight + step * (byte - first));
}

void FillWeights(Table& table) {
    FillRange(table, 0x00, 0x20, 0, 1);
    table[0x14].weight = 32;
    FillRange(table, 0x21, 0x2F, 35, 5);
    FillRange(table, '0', '9', 1120, 10);
    FillRange(table, 0x3A, 0x40, 110, 5);
    FillRange(table, 0x5B, 0x60, 145, 5);
    FillRange(table, 0x7B, 0x7D, 175, 5);
    FillRange(table, 0x7E, 0x81, 190, 1);
    FillRange(table, 0x82, 0x89, 195, 5);
    table[0x8B].weight = 240;
    FillRange(table, 0x8D, 0x91, 246, 1);
    FillRange(table, 0x92, 0x99, 255, 5);
    table[0x9B].weight = 305;
    FillRange(table, 0x9D, 0x9E, 311, 1);
    table[0xA0].weight = 316;
    FillRange(table, 0xA1, 0xBF, 320, 5);
    for (unsigned byte = 'A'; byte < 0x100; ++byte)
        if (const char norm = static_cast<char>(table[byte].norm); norm >= 'a' && norm <= 'z')
            table[byte].weight = LetterWeight(norm);
    table[0xF0].weight = LetterWeight('d');
    table[0xD7].weight = 475;
    table[0xF7].weight = 102;
    table[0xDE].weight = 1090;
    table[0xFE].weight = 1100;
}

Table MakeTable() {
    Table table{};
    FillClasses(table);
    FillNorms(table);
    FillWeights(table);
    return table;
}

/// One word in the making.
class Word {
public:
    explicit Word(const std::function<void(std::string_view)>& found) : found_(found) {}

    void Take(std::uint8_t byte, const ByteTraits& traits) {
        switch (traits.kind) {
        case ByteClass::Kept:
        case ByteClass::Replaced:
        case ByteClass::Digit:
            Put(static_cast<char>(traits.norm));
            break;
        case ByteClass::TwoLetters:
            for (const char letter : LettersOf(byte))
                Put(letter);
            break;
        case ByteClass::Comma:
        case ByteClass::Point:
        case ByteClass::Apostrophe:
            TakeMark(traits.kind);
            break;
        default:
            End();
        }
    }

    void End() {
        if (number_)
            while (!text_.empty() && text_.back() == '.')
                text_.pop_back();
        if (!text_.empty())
            found_(text_);
        text_.clear();
        number_ = false;
    }

private:
    void Put(char c) {
        if (text_.empty())
            number_ = c >= '0' && c <= '9';
        if (text_.size() < kLongestWord)
            text_.push_back(c);
    }

    /// "1,234.5" is one number, "don't" one word.
    void TakeMark(ByteClass kind) {
        if (text_.empty())
            return;
        if (number_ == (kind == ByteClass::Apostrophe))
            End();
        else if (kind == ByteClass::Point)
            Put('.');
    }

    const std::function<void(std::string_view)>& found_;
    std::string text_;
    bool number_ = false;
};

} // namespace

const Table& ByteTable() {
    static const Table table = MakeTable();
    return table;
}

std::string_view LettersOf(std::uint8_t byte) {
    switch (byte) {
    case 0x8C:
    case 0x9C:
        return "oe";
    case 0xDF:
        return "ss";
    default:
        return "ae";
    }
}

bool IsDoubleByte(int codePage) {
    return codePage == 932 || codePage == 936 || codePage == 949 || codePage == 950;
}

bool IsLeadByte(int codePage, std::uint8_t byte) {
    if (codePage == 932)
        return (byte >= 0x81 && byte <= 0x9F) || (byte >= 0xE0 && byte <= 0xFC);
    return IsDoubleByte(codePage) && byte >= 0x81 && byte <= 0xFE;
}

void SplitWords(std::string_view text, int codePage, const std::function<void(std::string_view)>& found) {
    const Table& table = ByteTable();
    const bool doubleByte = IsDoubleByte(codePage);
    Word word(found);
    for (std::size_t i = 0; i < text.size(); ++i) {
        const auto byte = static_cast<std::uint8_t>(text[i]);
        if (!doubleByte || byte < 0x80) {
            word.Take(byte, table[byte]);
            continue;
        }
        word.End();
        if (IsLeadByte(codePage, byte))
            ++i;
    }
    word.End();
}

} // namespace tovimar::helpcompiler
