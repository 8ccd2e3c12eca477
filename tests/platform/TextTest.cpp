#include "platform/text/Text.h"

#include <gtest/gtest.h>

namespace tovimar::text {
namespace {

TEST(TextFolding, ComparesWithoutRegardToCase) {
    EXPECT_EQ(FoldCase("Orders_É"), "orders_é");
    EXPECT_TRUE(EqualsIgnoringCase("ЗАКАЗЫ", "заказы"));
    EXPECT_TRUE(EqualsIgnoringCase("STRASSE", "straße"));
    EXPECT_TRUE(EqualsIgnoringCase("", ""));
    EXPECT_FALSE(EqualsIgnoringCase("Orders", "Orders1"));
    EXPECT_FALSE(EqualsIgnoringCase("Orders", "Ordérs"));
}

TEST(TextFolding, OrdersTheSameBothWays) {
    const char* inOrder[] = {"", "a", "A1", "ab", "b", "é", "Я"};
    for (std::size_t i = 0; i + 1 < std::size(inOrder); ++i) {
        EXPECT_LT(CompareIgnoringCase(inOrder[i], inOrder[i + 1]), 0) << inOrder[i];
        EXPECT_GT(CompareIgnoringCase(inOrder[i + 1], inOrder[i]), 0) << inOrder[i];
    }
}

TEST(TextFinding, ReportsWhatMatched) {
    EXPECT_EQ(FindIgnoringCase("<HTML><Title>", "<title>"), 6U);
    EXPECT_EQ(FindIgnoringCase("aaab", "AAB"), 1U);
    EXPECT_EQ(FindIgnoringCase("abc", "abcd"), std::string::npos);
    EXPECT_EQ(FindIgnoringCase("abc", "a", 1), std::string::npos);
    EXPECT_EQ(FindIgnoringCase("abc", "", 3), 3U);

    std::size_t matched = 0;
    EXPECT_EQ(FindIgnoringCase("x ФОРМА y", "форма", 0, &matched), 2U);
    EXPECT_EQ(matched, 10U);
    // U+023A is two bytes long, its small letter three.
    EXPECT_EQ(FindIgnoringCase("x\xC8\xBA", "\xE2\xB1\xA5", 0, &matched), 1U);
    EXPECT_EQ(matched, 2U);
}

TEST(TextFinding, PrefixesAndSuffixes) {
    EXPECT_TRUE(StartsWithIgnoringCase("Форма1", "форма"));
    EXPECT_FALSE(StartsWithIgnoringCase("Ф", "форма"));
    EXPECT_TRUE(EndsWithIgnoringCase("a.HTM", ".htm"));
    EXPECT_TRUE(EndsWithIgnoringCase("имяЁ", "ё"));
    EXPECT_FALSE(EndsWithIgnoringCase("m", ".htm"));
}

TEST(TextReplacing, DoesNotSearchWhatItPutIn) {
    EXPECT_EQ(ReplaceAll("a\\\\\\\\b", "\\\\", "\\"), "a\\\\b");
    EXPECT_EQ(ReplaceAll("aa", "a", "aa"), "aaaa");
    EXPECT_EQ(ReplaceAll("abc", "", "x"), "abc");
    EXPECT_EQ(ReplaceAllIgnoringCase("{{Body}} {{BODY}}", "{{body}}", "{{BODY}}!"), "{{BODY}}! {{BODY}}!");
}

TEST(TextCutting, CountsCharacters) {
    const std::string text = "aé漢😀";
    EXPECT_EQ(Length(text), 4U);
    EXPECT_EQ(Left(text, 2), "aé");
    EXPECT_EQ(Right(text, 2), "漢😀");
    EXPECT_EQ(Mid(text, 2, 2), "é漢");
    EXPECT_EQ(Mid(text, 5), "");
    EXPECT_EQ(Length("a\xC3(\xFF"), 4U);
    EXPECT_EQ(Trim("  \ta "), "\ta");
    EXPECT_EQ(TrimWhitespace("\r\n a\t"), "a");
    EXPECT_EQ(Split("a||b|", "|"), (std::vector<std::string>{"a", "", "b", ""}));
    EXPECT_EQ(Split("", "|"), std::vector<std::string>{""});
    EXPECT_EQ(Join({"a", "", "b"}, "|"), "a||b");
}

TEST(TextEncodings, RepairsIllFormedBytes) {
    EXPECT_FALSE(IsValidUtf8("\xC0\x80"));     // overlong
    EXPECT_FALSE(IsValidUtf8("\xED\xA0\x80")); // half of a pair
    EXPECT_FALSE(IsValidUtf8("abc\xE2\x82"));  // cut short
    EXPECT_TRUE(IsValidUtf8("€😀"));
    EXPECT_EQ(MakeValidUtf8("a\x80z"), "a\xEF\xBF\xBDz");
    EXPECT_EQ(FromUtf16(ToUtf16("a€😀")), "a€😀");
    EXPECT_EQ(FromUtf16(u"\xD800x"), "\xEF\xBF\xBDx");
}

TEST(CodePages, EveryByteSurvivesARoundTrip) {
    for (const int number : {1250, 1251, 1252, 1253, 1257, 874}) {
        const CodePage page(number);
        ASSERT_EQ(page.Number(), number);
        for (int byte = 0; byte < 256; ++byte) {
            const std::string source(1, static_cast<char>(byte));
            const std::string decoded = page.Decode(source);
            if (decoded != "\xEF\xBF\xBD") {
                EXPECT_EQ(page.Encode(decoded), source) << number << " " << byte;
            }
        }
    }
}

TEST(CodePages, KnowsItsCharacters) {
    const CodePage western(1252);
    EXPECT_EQ(western.Decode("\x80\xE9"), "€é");
    EXPECT_EQ(western.Encode("Жé"), "?\xE9");
    EXPECT_EQ(western.AnsiValue(U'€'), 128);
    EXPECT_EQ(western.AnsiValue(U'Ж'), '?');
    EXPECT_EQ(CodePage(1251).AnsiValue(U'Ж'), 198);
    EXPECT_EQ(CodePage(932).Encode("日本x"), "\x93\xFA\x96{x");
    EXPECT_EQ(CodePage(932).Decode("\x93\xFA\x96{x"), "日本x");
    EXPECT_FALSE(CodePage(932).CanEncode(U'😀'));
    EXPECT_EQ(CodePage(99999).Number(), 1252);
}

TEST(CodePages, CharsetNames) {
    EXPECT_EQ(CodePageByCharsetName("Windows-1251"), 1251);
    EXPECT_EQ(CodePageByCharsetName(" UTF-8"), 65001);
    EXPECT_EQ(CodePageByCharsetName("windows-77"), 0);
    EXPECT_EQ(CodePageByCharsetName("windows-1252x"), 0);
    EXPECT_EQ(CodePageByCharsetName(""), 0);
}

} // namespace
} // namespace tovimar::text
