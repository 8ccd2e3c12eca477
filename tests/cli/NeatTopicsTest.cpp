#include "cli/Program.h"

#include "editor/CHtmlBeautifier.h"
#include "platform/html/HtmlDocument.h"
#include "platform/text/Text.h"
#include "topics/CFormHTMLControlDefs.h"

namespace tovimar::test {
namespace {

std::string Neat(const std::string& page, bool sourceAttributes) {
    HtmlDocument document(page, "file:///C:/Help/html/page.htm");
    CHtmlBeautifier beautifier;
    beautifier.UseSourceAttributes = sourceAttributes;
    beautifier.SetDocument(document);
    return beautifier.EditModeReadyHTML();
}

std::string TextOf(const std::string& page) {
    return HtmlDocument(page).body()->innerText();
}

/// What a topic documents, a line for each, without blanks: line ends in captions count as nothing, and are
/// written as blanks.
std::string DocumentedBy(const std::string& page) {
    CFormHTMLControlDefs defs;
    EXPECT_EQ(kSuccess, defs.ParseText(page));
    std::string lines;
    for (const auto& def : defs.Controls)
        lines += def->XMLSTr() + "\n";
    for (const auto& def : defs.Menus)
        lines += def->XMLSTr() + "\n";
    return text::ReplaceAll(lines, " ", "");
}

class NeatTopicsTest : public ProgramTest, public ::testing::WithParamInterface<const char*> {};

TEST_P(NeatTopicsTest, WrittenAgainTheySayTheSameAndWrittenTwiceNothingChanges) {
    const fs::path source = fs::path(TOVIMAR_SOURCE_DIR) / GetParam();
    if (!fs::exists(source))
        GTEST_SKIP() << "no application in " << source;
    Run({"generate", source.string(), "--output", "help", "--no-compile"}).ExpectExit(0);
    int topics = 0;
    std::size_t documented = 0;
    for (const std::string& name : FilesBelow(Folder() / "help")) {
        if (!name.ends_with(".htm"))
            continue;
        const std::string page = ReadWhole(Folder() / "help" / name);
        const std::string neat = Neat(page, /*sourceAttributes=*/false);
        EXPECT_EQ(neat, Neat(neat, false)) << name;
        EXPECT_EQ(TextOf(page), TextOf(neat)) << name;
        EXPECT_EQ(DocumentedBy(page), DocumentedBy(neat)) << name;
        const std::string ofSource = Neat(page, /*sourceAttributes=*/true);
        EXPECT_EQ(ofSource, Neat(ofSource, true)) << name;
        EXPECT_EQ(DocumentedBy(page), DocumentedBy(ofSource)) << name;
        const std::string outer = HtmlDocument(page).outerHTML();
        EXPECT_EQ(outer, HtmlDocument(outer).outerHTML()) << name;
        documented += DocumentedBy(page).size();
        ++topics;
    }
    EXPECT_LT(10, topics);
    EXPECT_LT(0U, documented);
}

INSTANTIATE_TEST_SUITE_P(Applications, NeatTopicsTest,
                         ::testing::Values("samples/orchard", "../shared/corpus/sports-admin",
                                           "../shared/corpus/vcs-testing"));

} // namespace
} // namespace tovimar::test
