#include "Tools.h"
#include "helpcompiler/Compiler.h"
#include "helpcompiler/WordTable.h"
#include "platform/text/Text.h"
#include "support/SearchReader.h"

#include <gmock/gmock.h>

#include <array>

using namespace tovimar::helpcompiler;
namespace text = tovimar::text;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

namespace {

struct Language {
    const char* name;
    const char* number;
    int codePage;
    const char* title;   ///< of the first page, and its entry in contents
    const char* keyword; ///< in the index
    const char* body;
    /// Words of the body as somebody may type them. The viewer's table was made for Western Europe: Polish ź,
    /// Turkish ğ and dotted capital I, Greek accented capitals are other letters to it than their partners.
    const char* inCapitals;
    const char* otherBody; ///< of the second page, none of whose words are in the first
};

void PrintTo(const Language& language, std::ostream* out) {
    *out << language.name;
}

constexpr std::array kLanguages{
    Language{"German", "0x407", 1252, "Übersicht der Aufträge", "Straße", "Fünf Größen für Äpfel",
             "ÄPFEL FÜNF", "Löschen"},
    Language{"French", "0x40c", 1252, "Les élèves à Noël", "Œuvre", "Ça coûte très cher", "COÛTE ÇA",
             "Supprimer"},
    Language{"Spanish", "0x40a", 1252, "Años y niños", "Mañana", "¿Dónde está el pingüino?", "PINGÜINO DÓNDE",
             "Borrar"},
    Language{"Polish", "0x415", 1250, "Przegląd zamówień", "Źródło", "Zażółć gęślą jaźń", "GĘŚLĄ", "Usuń"},
    Language{"Czech", "0x405", 1250, "Příliš žluťoučký kůň", "Účet", "Úpěl ďábelské ódy", "ÓDY ĎÁBELSKÉ",
             "Smazat"},
    Language{"Russian", "0x419", 1251, "Обзор заказов", "Счёт", "Отчёты по складу", "СКЛАДУ", "Удалить"},
    Language{"Greek", "0x408", 1253, "Επισκόπηση", "Πελάτης", "Κατάλογος προϊόντων", "προϊόντων", "Διαγραφή"},
    Language{"Turkish", "0x41f", 1254, "Sipariş özeti", "Müşteri", "Değişiklik günlüğü, özet", "ÖZET",
             "Silme"},
    Language{"Hebrew", "0x40d", 1255, "סקירת הזמנות", "לקוח", "רשימת מוצרים", "מוצרים", "מחיקה"},
    Language{"Japanese", "0x411", 932, "注文の一覧", "顧客", "商品 Printer を表示する", "PRINTER", "削除"}};

std::string ListEntry(const std::string& name, const std::string& target) {
    return "<UL><LI><OBJECT type=\"text/sitemap\"><param name=\"Name\" value=\"" + name +
           "\"><param name=\"Local\" value=\"" + target + "\"></OBJECT></UL>";
}

/// A project in Unicode; the contents stand in the code page, as other tools write them.
class LanguageHelp {
public:
    explicit LanguageHelp(const Language& language) : language_(language), page_(language.codePage) {
        WritePage("first.htm", language.title, language.body);
        WritePage("second.htm", "2", language.otherBody);
        folder_.Write("p.hhc", page_.Encode(ListEntry(language.title, "first.htm")));
        folder_.Write("p.hhk", "<meta charset=utf-8>" + ListEntry(language.keyword, "second.htm"));
        folder_.Write("p.hhp", std::string("[OPTIONS]\r\nCompiled file=p.chm\r\nContents file=p.hhc\r\n"
                                           "Index file=p.hhk\r\nDefault topic=first.htm\r\n"
                                           "Full-text search=Yes\r\nBinary index=Yes\r\nLanguage=") +
                                   language.number + "\r\nTitle=" + language.title +
                                   "\r\n[FILES]\r\nfirst.htm\r\nsecond.htm\r\n");
        const auto result = Compile(folder_.Path() / "p.hhp", {}, [this](const Message& message) {
            messages.push_back(message.file + ": " + message.text);
        });
        topics = result.topics;
        extracted_ = folder_.Run("extract_chmLib p.chm out");
    }

    std::string Stream(const std::string& name) const {
        EXPECT_TRUE(extracted_);
        return folder_.Read("out/" + name);
    }
    SearchReader Search() const { return SearchReader(Stream("$FIftiMain")); }
    /// What the reader library of the viewers says.
    std::vector<std::string> Seen(const std::string& words) const {
        EXPECT_TRUE(folder_.Run("/usr/bin/python3 " TOVIMAR_SOURCE_DIR "/tests/support/read_chm.py p.chm cp" +
                                std::to_string(language_.codePage) + " " + words))
            << folder_.Read("printed");
        return text::Split(folder_.Read("printed"), "\n");
    }

    std::vector<std::string> messages;
    std::size_t topics = 0;

private:
    void WritePage(const std::string& name, const std::string& title, const std::string& body) const {
        folder_.Write(name, "<html><head><meta charset=\"utf-8\"><title>" + title +
                                "</title></head><body><p>" + body + "</p></body></html>");
    }

    Folder folder_;
    const Language& language_;
    text::CodePage page_;
    bool extracted_ = false;
};

class LanguagesTest : public ::testing::TestWithParam<Language> {
protected:
    void SetUp() override {
        if (std::system("/usr/bin/python3 -c 'from chm import chm' 2>/dev/null") != 0)
            GTEST_SKIP() << "the package python3-chm isn't installed";
    }
    std::string Encoded(const std::string& text) const {
        return text::CodePage(GetParam().codePage).Encode(text);
    }
    /// The words as the index holds them, a blank between.
    std::string Folded(const std::string& text) const {
        std::string words;
        SplitWords(Encoded(text), GetParam().codePage,
                   [&](std::string_view word) { words += std::string(word) + " "; });
        return words;
    }
};

} // namespace

TEST_P(LanguagesTest, TitlesContentsAndIndexShowRight) {
    const Language& language = GetParam();
    const LanguageHelp help(language);
    EXPECT_THAT(help.messages, IsEmpty());
    EXPECT_EQ(help.topics, 2U);
    const auto seen = help.Seen("");
    EXPECT_THAT(seen, Contains(std::string("language: ") + language.number));
    EXPECT_THAT(seen, Contains(std::string("title: ") + language.title));
    EXPECT_THAT(seen, Contains(std::string("contents: ") + language.title));
    EXPECT_THAT(seen, Contains(std::string("index: ") + language.keyword));
    EXPECT_THAT(help.Stream("#STRINGS"), HasSubstr(Encoded(language.title))) << "titles of search hits";
    EXPECT_THAT(help.Stream("first.htm"), HasSubstr("<p>" + Encoded(language.body) + "</p>"));
    std::string wide;
    for (const char16_t unit : text::ToUtf16(language.keyword))
        wide += {static_cast<char>(unit & 0xFF), static_cast<char>(unit >> 8)};
    EXPECT_THAT(help.Stream("$WWKeywordLinks/BTree"), HasSubstr(wide));
}

TEST_P(LanguagesTest, SearchFindsThePageAndNoOther) {
    const Language& language = GetParam();
    const LanguageHelp help(language);
    const SearchReader search = help.Search();
    EXPECT_EQ(search.Number(0x7A), static_cast<std::uint32_t>(language.codePage));
    EXPECT_EQ(search.Search(Encoded(language.inCapitals), language.codePage), std::set<std::uint32_t>{0});
    const auto seen = help.Seen(Folded(language.inCapitals));
    EXPECT_THAT(seen, Contains(::testing::StartsWith("found: ")));
    for (const std::string& line : seen)
        EXPECT_FALSE(line.starts_with("found: ") && line.ends_with("second.htm")) << line;
    if (IsDoubleByte(language.codePage)) {
        // Words without blanks between them are split by a dictionary that this compiler doesn't have.
        EXPECT_EQ(search.Words(), std::vector<std::string>({"2", "printer"}));
        return;
    }
    EXPECT_EQ(search.Search(Encoded(language.body), language.codePage), std::set<std::uint32_t>{0});
    EXPECT_EQ(search.Search(Encoded(language.title), language.codePage), std::set<std::uint32_t>{0});
    EXPECT_EQ(search.Search(Encoded(language.otherBody), language.codePage), std::set<std::uint32_t>{1});
}

INSTANTIATE_TEST_SUITE_P(All, LanguagesTest, ::testing::ValuesIn(kLanguages));

TEST(CodePageLimitsTest, WhatTheCodePageCannotHoldIsReportedAndStaysReadable) {
    constexpr Language kMixed{"Mixed", "0x407", 1252, "Łódź", "Łódź", "Łódź é", "é", "x"};
    const LanguageHelp help(kMixed);
    EXPECT_THAT(help.messages, ElementsAre(HasSubstr("p.hhk: "))) << "contents came in the code page";
    EXPECT_THAT(help.Stream("first.htm"), HasSubstr("<p>&#321;\xF3"
                                                    "d&#378; \xE9</p>"));
}
