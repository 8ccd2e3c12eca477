#include "helpcompiler/LanguageCodePage.h"

#include <array>
#include <charconv>

namespace tovimar::helpcompiler {
namespace {

struct PageOf {
    std::uint32_t language; ///< with a sublanguage, or the primary language alone
    int codePage;
};

constexpr std::array<PageOf, 15> kWithSublanguage{{{0x404, 950},
                                                   {0xC04, 950},
                                                   {0x1404, 950},
                                                   {0x804, 936},
                                                   {0x1004, 936},
                                                   {0x81A, 1250},
                                                   {0x141A, 1250},
                                                   {0x101A, 1250},
                                                   {0xC1A, 1251},
                                                   {0x1C1A, 1251},
                                                   {0x201A, 1251},
                                                   {0x82C, 1251},
                                                   {0x42C, 1254},
                                                   {0x843, 1251},
                                                   {0x443, 1254}}};

constexpr std::array<PageOf, 29> kByPrimary{
    {{0x01, 1256}, {0x02, 1251}, {0x05, 1250}, {0x08, 1253}, {0x0D, 1255}, {0x0E, 1250},
     {0x11, 932},  {0x12, 949},  {0x15, 1250}, {0x18, 1250}, {0x19, 1251}, {0x1A, 1250},
     {0x1B, 1250}, {0x1C, 1250}, {0x1E, 874},  {0x1F, 1254}, {0x20, 1256}, {0x22, 1251},
     {0x23, 1251}, {0x24, 1250}, {0x25, 1257}, {0x26, 1257}, {0x27, 1257}, {0x29, 1256},
     {0x2A, 1258}, {0x2F, 1251}, {0x3F, 1251}, {0x40, 1251}, {0x44, 1251}}};

} // namespace

std::uint32_t LanguageOf(std::string_view text) {
    const auto start = text.find_first_not_of(" \t");
    text.remove_prefix(start == std::string_view::npos ? text.size() : start);
    int base = 10;
    if (text.starts_with("0x") || text.starts_with("0X")) {
        text.remove_prefix(2);
        base = 16;
    }
    std::uint32_t language = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), language, base);
    return result.ec == std::errc() && language != 0 ? language : kDefaultLanguage;
}

int CodePageOfLanguage(std::uint32_t language) {
    for (const PageOf& entry : kWithSublanguage)
        if (entry.language == language)
            return entry.codePage;
    for (const PageOf& entry : kByPrimary)
        if (entry.language == (language & 0x3FFU))
            return entry.codePage;
    return 1252;
}

} // namespace tovimar::helpcompiler
