#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <array>
#include <charconv>
#include <map>
#include <memory>
#include <unicode/ucnv.h>

namespace tovimar::text {

struct ConverterCloser {
    void operator()(UConverter* converter) const { ucnv_close(converter); }
};

using Converter = std::unique_ptr<UConverter, ConverterCloser>;

/// One code page. Single-byte pages have whole tables in both directions, the others a converter.
struct CodePageTable {
    bool singleByte = false;
    bool utf8 = false;
    std::array<char32_t, 256> toUnicode{};
    /// Byte by code unit; 0 for none but the code point 0.
    std::vector<std::uint8_t> fromUnicode;
    Converter converter;
};

namespace {

Converter OpenConverter(const std::string& name) {
    UErrorCode status = U_ZERO_ERROR;
    Converter converter(ucnv_open(name.c_str(), &status));
    return U_FAILURE(status) ? nullptr : std::move(converter);
}

Converter OpenPage(int number) {
    const std::string text = std::to_string(number);
    if (number == 28591)
        return OpenConverter("ISO-8859-1");
    if (number > 28591 && number <= 28606)
        return OpenConverter("ISO-8859-" + std::to_string(number - 28590));
    if (number == 20866 || number == 21866)
        return OpenConverter(number == 20866 ? "KOI8-R" : "KOI8-U");
    for (const char* prefix : {"windows-", "cp", "ibm-"}) {
        if (auto converter = OpenConverter(prefix + text))
            return converter;
    }
    return nullptr;
}

char32_t DecodeByte(UConverter* converter, std::uint8_t byte) {
    UErrorCode status = U_ZERO_ERROR;
    const char source = static_cast<char>(byte);
    char16_t target[4];
    ucnv_resetToUnicode(converter);
    const auto length = ucnv_toUChars(converter, target, 4, &source, 1, &status);
    if (U_SUCCESS(status) && length == 1 && target[0] != kReplacement)
        return target[0];
    // Undefined bytes keep their value as control characters, so that text survives a round trip.
    return byte >= 0x80 && byte < 0xA0 ? byte : kReplacement;
}

void FillTables(CodePageTable& table, UConverter* converter) {
    table.singleByte = true;
    table.fromUnicode.assign(0x10000, 0);
    for (int byte = 255; byte >= 0; --byte) {
        const auto value = static_cast<std::uint8_t>(byte);
        const char32_t codePoint = value < 0x80 ? value : DecodeByte(converter, value);
        table.toUnicode[value] = codePoint;
        if (codePoint != kReplacement)
            table.fromUnicode[codePoint] = value;
    }
}

std::unique_ptr<CodePageTable> MakeTable(int number) {
    auto table = std::make_unique<CodePageTable>();
    table->utf8 = number == 65001;
    if (table->utf8)
        return table;
    Converter converter = OpenPage(number);
    if (!converter)
        return nullptr;
    if (ucnv_getMaxCharSize(converter.get()) == 1)
        FillTables(*table, converter.get());
    else
        table->converter = std::move(converter);
    return table;
}

/// Tables are made once and live as long as the process.
const CodePageTable* TableOf(int& number) {
    static std::map<int, std::unique_ptr<CodePageTable>> tables;
    auto& table = tables[number];
    if (!table)
        table = MakeTable(number);
    if (table)
        return table.get();
    tables.erase(number);
    number = 1252;
    return TableOf(number);
}

CodePage& Current() {
    static CodePage page(1252);
    return page;
}

/// Bytes of one character in a multi-byte page, empty when it has none.
std::string EncodeOne(UConverter* converter, char32_t codePoint) {
    const std::u16string source = ToUtf16(FromCodePoint(codePoint));
    UErrorCode status = U_ZERO_ERROR;
    ucnv_setFromUCallBack(converter, UCNV_FROM_U_CALLBACK_STOP, nullptr, nullptr, nullptr, &status);
    ucnv_resetFromUnicode(converter);
    char target[16];
    const auto length = ucnv_fromUChars(converter, target, sizeof target, source.data(),
                                        static_cast<std::int32_t>(source.size()), &status);
    return U_SUCCESS(status) && length > 0 ? std::string(target, static_cast<std::size_t>(length))
                                           : std::string();
}

std::string DecodeMultiByte(UConverter* converter, std::string_view bytes) {
    ucnv_resetToUnicode(converter);
    const char* source = bytes.data();
    const char* sourceEnd = source + bytes.size();
    std::u16string decoded;
    char16_t buffer[1024];
    for (UErrorCode status = U_BUFFER_OVERFLOW_ERROR; status == U_BUFFER_OVERFLOW_ERROR;) {
        status = U_ZERO_ERROR;
        char16_t* target = buffer;
        ucnv_toUnicode(converter, &target, buffer + 1024, &source, sourceEnd, nullptr, true, &status);
        decoded.append(buffer, static_cast<std::size_t>(target - buffer));
    }
    return FromUtf16(decoded);
}

} // namespace

CodePage::CodePage(int number) : number_(number), table_(TableOf(number_)) {}

std::string CodePage::Decode(std::string_view bytes) const {
    if (table_->utf8)
        return MakeValidUtf8(bytes);
    if (table_->converter)
        return DecodeMultiByte(table_->converter.get(), bytes);
    std::string out;
    out.reserve(bytes.size());
    for (const char byte : bytes) {
        const char32_t codePoint = table_->toUnicode[static_cast<std::uint8_t>(byte)];
        if (codePoint < 0x80)
            out += static_cast<char>(codePoint);
        else
            AppendCodePoint(out, codePoint);
    }
    return out;
}

std::string CodePage::Encode(std::string_view text, std::string_view substitute) const {
    if (table_->utf8)
        return MakeValidUtf8(text);
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size();) {
        const char32_t codePoint = NextCodePoint(text, i);
        if (codePoint < 0x80)
            out += static_cast<char>(codePoint);
        else if (!CanEncode(codePoint))
            out += substitute;
        else if (table_->singleByte)
            out += static_cast<char>(table_->fromUnicode[codePoint]);
        else
            out += EncodeOne(table_->converter.get(), codePoint);
    }
    return out;
}

bool CodePage::CanEncode(char32_t codePoint) const {
    if (codePoint < 0x80 || table_->utf8)
        return codePoint <= 0x10FFFF;
    if (table_->singleByte)
        return codePoint < 0x10000 && table_->fromUnicode[codePoint] != 0;
    return !EncodeOne(table_->converter.get(), codePoint).empty();
}

std::uint8_t CodePage::AnsiValue(char32_t codePoint) const {
    if (codePoint < 0x80)
        return static_cast<std::uint8_t>(codePoint);
    if (!table_->singleByte || codePoint >= 0x10000 || table_->fromUnicode[codePoint] == 0)
        return '?';
    return table_->fromUnicode[codePoint];
}

const CodePage& AnsiCodePage() {
    return Current();
}

void SetAnsiCodePage(int number) {
    Current() = CodePage(number);
}

int CodePageByCharsetName(std::string_view charset) {
    const std::string name = ToLower(Trim(charset));
    static const std::map<std::string, int, std::less<>> names = {
        {"utf-8", 65001},       {"utf8", 65001},       {"us-ascii", 1252},      {"iso-8859-1", 28591},
        {"iso-8859-2", 28592},  {"iso-8859-5", 28595}, {"iso-8859-7", 28597},   {"iso-8859-9", 28599},
        {"iso-8859-15", 28605}, {"koi8-r", 20866},     {"koi8-u", 21866},       {"shift_jis", 932},
        {"gb2312", 936},        {"gbk", 936},          {"ks_c_5601-1987", 949}, {"euc-kr", 949},
        {"big5", 950},          {"windows-874", 874},  {"tis-620", 874},
    };
    if (const auto found = names.find(name); found != names.end())
        return found->second;
    for (const std::string_view prefix : {"windows-", "cp"}) {
        int number = 0;
        if (!name.starts_with(prefix))
            continue;
        const char* end = name.data() + name.size();
        const auto [stop, error] = std::from_chars(name.data() + prefix.size(), end, number);
        int known = number;
        if (error == std::errc() && stop == end && number > 0 && TableOf(known) && known == number)
            return number;
    }
    return 0;
}

} // namespace tovimar::text
