#include "cli/HelpFolder.h"
#include "cli/Program.h"
#include "helpcompiler/CodePageText.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <set>

namespace tovimar::test {
namespace {

using ::testing::Contains;
using ::testing::Not;

constexpr const char* kPython = "/usr/bin/python3"; // the one that the library is packaged for

/// Compiled helps as programs see them that share nothing with the compiler: 7-Zip, libchm, and the reader
/// library that viewers are built on.
class ChmReadersTest : public ProgramTest {
protected:
    void SetUp() override {
        for (const char* tool : {"chmls", "7z", "extract_chmLib"})
            if (!IsInstalled(tool))
                GTEST_SKIP() << tool << " isn't installed; scripts/packages names its package";
        if (std::system((std::string(kPython) + " -c 'from chm import chm' 2>/dev/null").c_str()) != 0)
            GTEST_SKIP() << "the package python3-chm isn't installed";
    }

    std::vector<std::string> Lines(const std::string& command) const {
        const std::string said = (Folder() / "said.txt").string();
        const std::string line = "cd '" + Folder().string() + "' && ( " + command + " ) >said.txt 2>&1";
        EXPECT_EQ(std::system(line.c_str()), 0) << command << "\n" << ReadWhole(said);
        return text::Split(ReadWhole(said), "\n");
    }
    /// What the reader library finds, a line each.
    std::vector<std::string> Found(const std::string& file, const std::string& codePage,
                                   const std::string& words = {}) const {
        return Lines(std::string(kPython) + " " TOVIMAR_SOURCE_DIR "/tests/support/read_chm.py '" + file +
                     "' " + codePage + " " + words);
    }
    /// Every file of the project's list, and contents and index, comes out of every reader as it went in.
    /// Pages in UTF-8 come out in the code page of the help.
    void ExpectAllFiles(const std::string& help, const std::string& file, int codePage = 1252) const {
        Lines("mkdir seven libchm; 7z x -y -oseven '" + file + "'; extract_chmLib '" + file + "' libchm");
        std::set<std::string> listed;
        for (const std::string& line : Lines("chmls -n list '" + file + "' 2>/dev/null"))
            listed.insert(text::FoldCase(text::TrimWhitespace(line)));
        auto names = HelpFolder(Folder() / help).ListedFiles();
        EXPECT_FALSE(names.empty());
        for (const auto& entry : fs::directory_iterator(Folder() / help))
            if (entry.path().extension() == ".hhc" || entry.path().extension() == ".hhk")
                names.insert(names.end(), entry.path().filename().string());
        for (const std::string& windowsName : names) {
            const std::string name = text::ReplaceAll(windowsName, "\\", "/");
            std::string bytes = ReadWhole(Folder() / help / name);
            if (name.ends_with(".htm"))
                bytes = helpcompiler::InCodePage(bytes, text::CodePage(codePage));
            EXPECT_FALSE(bytes.empty()) << name;
            EXPECT_EQ(ReadWhole(Folder() / "seven" / name), bytes) << name;
            EXPECT_EQ(ReadWhole(Folder() / "libchm" / name), bytes) << name;
            EXPECT_TRUE(listed.contains(text::FoldCase("/" + name))) << name;
        }
    }
};

TEST_F(ChmReadersTest, TheSampleIsListedExtractedAndSearched) {
    Run({"generate", kSample, "--output", "help", "--copy-to", "."}).ExpectExit(0);
    fs::remove(Folder() / "orchard.chm");
    ExpectAllFiles("help", "help/orchard.chm");
    const auto found = Found("help/orchard.chm", "cp1252", "restaurants printed zebra");
    EXPECT_THAT(found, Contains("title: orchard"));
    EXPECT_THAT(found, Contains("home: /Welcome.htm"));
    EXPECT_THAT(found, Contains("contents: Order Lines"));
    EXPECT_THAT(found, Contains("index: Customers"));
    EXPECT_THAT(found, Contains("found: restaurants orchard_Table_Customers.htm"));
    EXPECT_THAT(found, Not(Contains(::testing::StartsWith("found: zebra"))));
    const std::string contents = ReadWhole(Folder() / "help/orchard.hhc");
    EXPECT_EQ(std::count_if(found.begin(), found.end(),
                            [](const std::string& line) { return line.starts_with("contents: "); }),
              static_cast<long>(text::Split(contents, "<param name=\"Name\"").size()) - 1);
}

TEST_F(ChmReadersTest, ANameWithBlanksAndParenthesesIsCompiled) {
    fs::create_directories(Folder() / "my (own) help");
    Run({"generate", kSample, "--output", "my (own) help", "--copy-to", "a copy (1)", "--option",
         "HelpProjectName=Orchard (new) 2", "--option", "HelpProjectTitle=Orchard & more (2)"})
        .ExpectExit(0);
    const std::string file = "my (own) help/Orchard (new) 2.chm";
    EXPECT_EQ(ReadWhole(Folder() / file), ReadWhole(Folder() / "a copy (1)/Orchard (new) 2.chm"));
    ExpectAllFiles("my (own) help", file);
    EXPECT_THAT(Found(file, "cp1252"), Contains("title: Orchard & more (2)"));
}

struct Language {
    const char* code;
    const char* charset;
    const char* codePage; ///< of the language, whatever the pages are written in
    const char* number;
    const char* title;
    const char* caption;
};

void PrintTo(const Language& language, std::ostream* out) {
    *out << language.code << " " << language.charset;
}

class ChmLanguageTest : public ChmReadersTest, public ::testing::WithParamInterface<Language> {};

TEST_P(ChmLanguageTest, TitlesAndCaptionsShowRight) {
    const Language& language = GetParam();
    const std::string tip = "                    ControlTipText =\"" + std::string(language.caption) +
                            " exactly\"\r\n                    Caption =\"" + language.caption + "\"\r\n";
    Write("shop/forms/Main.form", FormExport(language.title, ControlExport("CommandButton", "button", tip)));
    Run({"generate", "shop", "--output", "help", "--option", std::string("LanguageCode=") + language.code,
         "--option", std::string("Charset=") + language.charset, "--option",
         std::string("HelpProjectTitle=") + language.title})
        .ExpectExit(0);
    ExpectAllFiles("help", "help/shop.chm", text::CodePageByCharsetName(language.codePage));
    const auto found = Found("help/shop.chm", language.codePage, "exactly");
    EXPECT_THAT(found, Contains(std::string("language: ") + language.number));
    EXPECT_THAT(found, Contains(std::string("title: ") + language.title));
    EXPECT_THAT(found, Contains(std::string("contents: ") + language.caption));
    EXPECT_THAT(found, Contains(std::string("index: ") + language.caption));
    EXPECT_THAT(found, Contains("found: exactly shop_Form_Main.htm"));

    // The page shows the letters themselves or references to their code points.
    const std::string page = ReadWhole(Folder() / "help/shop_Form_Main.htm");
    const int number = text::CodePageByCharsetName(language.charset);
    std::string shown = text::CodePage(number).Decode(page);
    for (const char32_t letter : text::ToCodePoints(std::string(language.title) + language.caption))
        shown = text::ReplaceAll(shown, "&#" + std::to_string(static_cast<std::uint32_t>(letter)) + ";",
                                 text::FromCodePoint(letter));
    EXPECT_NE(shown.find("<title>" + std::string(language.title)), std::string::npos) << shown.substr(0, 600);
    EXPECT_NE(shown.find(language.caption), std::string::npos);
}

INSTANTIATE_TEST_SUITE_P(
    Languages, ChmLanguageTest,
    ::testing::Values(Language{"DE", "windows-1252", "cp1252", "0x407", "Übersicht", "Größe"},
                      Language{"PL", "windows-1250", "cp1250", "0x415", "Przegląd łąk", "Źródło"},
                      Language{"RU", "windows-1251", "cp1251", "0x419", "Обзор заказов", "Удалить"},
                      Language{"EL", "windows-1253", "cp1253", "0x408", "Επισκόπηση", "Διαγραφή"},
                      Language{"DE", "utf-8", "cp1252", "0x407", "Übersicht", "Größe"},
                      Language{"PL", "utf-8", "cp1250", "0x415", "Przegląd łąk", "Źródło"},
                      Language{"RU", "utf-8", "cp1251", "0x419", "Обзор заказов", "Удалить"},
                      Language{"EL", "utf-8", "cp1253", "0x408", "Επισκόπηση", "Διαγραφή"}));

/// The help compiler beside the command.
class ChmContainerTest : public ChmReadersTest {
protected:
    void SetUp() override {
        ChmReadersTest::SetUp();
        program = (fs::path(TOVIMAR_PROGRAM).parent_path() / "tools/hhc.exe").string();
    }
    /// Enough pages for a directory of several chunks.
    void WriteProject(int pages) const {
        std::string files;
        for (int i = 0; i < pages; ++i) {
            const std::string name = "a_page_with_a_long_name_" + std::to_string(i) + ".htm";
            Write("p/" + name, "<html><head><title>" + name + "</title></head><body>word</body></html>");
            files += name + "\r\n";
        }
        Write("p/p.hhp", "[Options]\r\nCompiled file = p.chm\r\nFull-text search=Yes\r\n[Files]\r\n" + files);
    }
    std::string Compile() {
        Run({"p/p.hhp"}).ExpectExit(0);
        return ReadWhole(Folder() / "p/p.chm");
    }
};

TEST_F(ChmContainerTest, ReadersThatGoThroughTheFilesFindThemAll) {
    WriteProject(400);
    Compile();
    ExpectAllFiles("p", "p/p.chm");
    EXPECT_THAT(Lines("7z t p/p.chm"), Contains("Everything is Ok"));
}

TEST_F(ChmContainerTest, BytesChangeWithThePagesAlone) {
    WriteProject(3);
    const std::string first = Compile();
    fs::last_write_time(Folder() / "p/p.hhp", fs::file_time_type::clock::now() - std::chrono::hours(50));
    EXPECT_EQ(Compile(), first);
    Write("p/a_page_with_a_long_name_0.htm", "<html><body>changed</body></html>");
    const std::string other = Compile();
    EXPECT_NE(other.substr(0x10, 4), first.substr(0x10, 4)) << "viewers know a file that is new by its stamp";
}

} // namespace
} // namespace tovimar::test
