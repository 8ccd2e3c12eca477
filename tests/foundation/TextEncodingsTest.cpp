#include "foundation/TextEncodings.h"

#include "foundation/CSpecialChars.h"
#include "platform/text/Text.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

class TextEncodingsTest : public test::EnvironmentTest {};

bool IsIn(int c, std::initializer_list<std::pair<int, int>> ranges) {
    for (const auto& [from, to] : ranges)
        if (c >= from && c <= to)
            return true;
    return false;
}

std::string Reference(int c) {
    return "&#" + std::to_string(c) + ";";
}

constexpr std::initializer_list<std::pair<int, int>> kKept = {{32, 33}, {35, 37},  {40, 44},   {46, 46},
                                                              {48, 58}, {61, 61},  {63, 91},   {93, 93},
                                                              {95, 95}, {97, 125}, {128, 173}, {225, 239}};

TEST_F(TextEncodingsTest, EveryCodeOfTheWesternPage) {
    for (int c = 0; c < 256; ++c) {
        const std::string text = text::AnsiCodePage().Decode(std::string(1, static_cast<char>(c)));
        const bool kept = IsIn(c, kKept);
        EXPECT_EQ(EncodeSpecialChars(text), kept ? text : Reference(c)) << c;
        const bool keptInXml = kept || c == 59 || c == 175 || c == 179 || c == 185 || c == 191;
        EXPECT_EQ(EncodeXmlText(text), keptInXml ? text : Reference(c)) << c;
    }
}

/// A reference is what every reader shows as this character, whatever the page; read back it is the same.
TEST_F(TextEncodingsTest, EveryCodeOfOtherPagesShowsRight) {
    for (const int number : {1250, 1251, 1253}) {
        text::SetAnsiCodePage(number);
        for (int c = 160; c < 256; ++c) {
            const std::string text = text::AnsiCodePage().Decode(std::string(1, static_cast<char>(c)));
            const auto codePoint = static_cast<int>(text::ToCodePoints(text).front());
            if (codePoint == 0xFFFD)
                continue; // the page doesn't define it
            const bool kept = IsIn(c, kKept) || codePoint != c;
            EXPECT_EQ(EncodeSpecialChars(text), kept ? text : Reference(codePoint)) << number << " " << c;
            EXPECT_EQ(DecodeHtmlEntities(EncodeSpecialChars(text)), text) << number << " " << c;
            EXPECT_EQ(DecodeEntities(EncodeXmlText(text, true)), text) << number << " " << c;
        }
    }
    text::SetAnsiCodePage(1250);
    EXPECT_EQ(EncodeXmlText("Źródło"), "Źr&#243;dło");
    text::SetAnsiCodePage(1251);
    EXPECT_EQ(EncodeSpecialChars("Юж", true), "&#1070;ж");
}

TEST_F(TextEncodingsTest, CharactersBeyondThePage) {
    EXPECT_EQ(EncodeSpecialChars("Ж漢😀"), "Ж&#28450;&#128512;");
    EXPECT_EQ(EncodeXmlText("Ж", true), "&#1046;");
}

TEST_F(TextEncodingsTest, EntitiesAreNotEncodedAgain) {
    EXPECT_EQ(EncodeSpecialChars("&nbsp;&#38;&"), "&nbsp;&#38;&#38;");
    EXPECT_EQ(EncodeXmlText("&nbsp;&amp;&bogus;&"), "&#160;&#38;&#38;bogus;&#38;");
    EXPECT_EQ(EncodeSpecialChars("&bogus;"), "&#38;bogus&#59;");
    for (const std::string number : {"00", "55296", "65535", "1114112"})
        EXPECT_EQ(EncodeSpecialChars("&#" + number + ";").substr(0, 5), "&#38;") << number;
    EXPECT_EQ(EncodeXmlText("&Auml;&auml;&AUML;"), "&#196;&#228;&#196;");
    EXPECT_EQ(EncodeXmlText("& far away ;"), "&#38; far away ;");
    const std::string odd = "It's <b> \"5/6\" - a\\b & c;";
    for (auto* encode : {EncodeSpecialChars, EncodeXmlText}) {
        const std::string once = encode(odd, false);
        EXPECT_EQ(encode(once, false), once);
        EXPECT_EQ(DecodeEntities(once), odd);
    }
}

TEST_F(TextEncodingsTest, NamesReadBackAsTheyWereWhateverTheyLookLike) {
    EXPECT_EQ(EncodeXmlName("R&amp;D"), "R&#38;amp;D");
    EXPECT_EQ(EncodeSpecialName("R&amp;D"), "R&#38;amp&#59;D");
    EXPECT_EQ(EncodeXmlName("&#65; < &"), "&#38;#65; &#60; &#38;");
    for (const std::string name : {"plain_1", "A & B;", "\"x\"", "Заказ"})
        EXPECT_EQ(EncodeXmlName(name), EncodeXmlText(name));
}

TEST(SpecialChars, HoldTheWholeTable) {
    const CSpecialChars table;
    EXPECT_EQ(table.GetNumCode("&nbsp;"), "&#160;");
    EXPECT_EQ(table.GetNumCode("&thetasym;"), "&#977;");
    EXPECT_EQ(table.GetNumCode("&NBSP;"), "&#160;");
    EXPECT_EQ(table.GetNumCode("nbsp"), "");
    EXPECT_EQ(table.GetNumCode("&apos;"), "");
    int known = 0;
    for (int c = 1; c < 10000; ++c) {
        const std::string name = table.GetCharCode(Reference(c));
        if (name.empty())
            continue;
        ++known;
        EXPECT_EQ(table.GetNumCode(name), Reference(c));
    }
    EXPECT_EQ(known, 252);
    EXPECT_EQ(table.GetCharCode("&#x26;"), "");
}

TEST_F(TextEncodingsTest, DecodesInItsOrder) {
    EXPECT_EQ(DecodeHtmlEntities("&lt;b&gt; &quot;&#39;&ldquo;&trade;&copy;&circ;"), "<b> \"'“™©ˆ");
    EXPECT_EQ(DecodeHtmlEntities("&amp;lt; &AMP;#169;"), "< ©");
    EXPECT_EQ(DecodeHtmlEntities("&Eacute;&eacute;&#1046;&#128512;"), "ÉéЖ😀");
    EXPECT_EQ(DecodeHtmlEntities("&#150;&#0;&#55296;&#99999999;"), "–&#0;&#55296;&#99999999;");
    EXPECT_EQ(DecodeEntities("a & b; &unknown; &#; &"), "a & b; &unknown; &#; &");
}

} // namespace
} // namespace tovimar
