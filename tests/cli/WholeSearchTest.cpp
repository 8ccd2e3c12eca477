#include "cli/Program.h"
#include "helpcompiler/WordTable.h"
#include "platform/html/HtmlDocument.h"
#include "platform/html/HtmlNode.h"
#include "platform/text/Text.h"
#include "support/SearchReader.h"

#include <gmock/gmock.h>

#include <map>
#include <set>

namespace tovimar::test {
namespace {

using PagesOfWords = std::map<std::string, std::set<std::string>>;

/// The search of a compiled help beside a plain scan of its pages.
class WholeSearchTest : public ProgramTest, public ::testing::WithParamInterface<const char*> {
protected:
    static constexpr int kCodePage = 1252;

    void SetUp() override {
        if (!IsInstalled("7z"))
            GTEST_SKIP() << "7z isn't installed; scripts/packages names its package";
    }

    /// A file of the compiled help, as another reader takes it out.
    std::string Held(const std::string& name) const { return ReadWhole(Folder() / "x" / name); }
    std::uint32_t Number(const std::string& bytes, std::size_t offset) const {
        return SearchReader(bytes).Number(offset);
    }
    /// The page of each topic, through the three tables that a viewer goes through.
    std::vector<std::string> PagesOfTopics() const {
        constexpr std::size_t kTopicSize = 16;
        const std::string topics = Held("#TOPICS");
        const std::string places = Held("#URLTBL");
        const std::string addresses = Held("#URLSTR");
        std::vector<std::string> pages;
        for (std::size_t at = 0; at + kTopicSize <= topics.size(); at += kTopicSize) {
            const auto place = Number(places, Number(topics, at + 8) + 8);
            pages.emplace_back(addresses.c_str() + place + 8);
        }
        return pages;
    }
    /// Every word that somebody sees on the page or in its title.
    std::set<std::string> VisibleWords(const std::string& page) const {
        const text::CodePage codePage(kCodePage);
        const HtmlDocument document(codePage.Decode(Held(page)));
        std::set<std::string> words;
        for (const auto* node = &document.Root(); node != nullptr; node = node->NextWithin(document.Root()))
            if (node->IsText() && !node->parentNode()->Is("script") && !node->parentNode()->Is("style"))
                helpcompiler::SplitWords(codePage.Encode(node->nodeValue()), kCodePage,
                                         [&](std::string_view word) { words.emplace(word); });
        return words;
    }
};

TEST_P(WholeSearchTest, FindsEveryWordOnThePagesThatShowItAndOnNoOther) {
    const std::string source = TOVIMAR_SOURCE_DIR "/" + std::string(GetParam());
    if (!fs::exists(source))
        GTEST_SKIP() << "the corpus is absent: " << source;
    Run({"generate", source, "--output", "help", "--copy-to", "."}).ExpectExit(0);
    const std::string file = [&] {
        for (const auto& entry : fs::directory_iterator(Folder() / "help"))
            if (entry.path().extension() == ".chm")
                return entry.path().string();
        return std::string();
    }();
    const std::string unpack = "cd '" + Folder().string() + "' && 7z x -ox '" + file + "' >/dev/null";
    ASSERT_EQ(std::system(unpack.c_str()), 0);

    const auto pages = PagesOfTopics();
    PagesOfWords seen;
    for (const auto& page : pages)
        for (const auto& word : VisibleWords(page))
            seen[word].insert(page);
    const SearchReader search(Held("$FIftiMain"));
    PagesOfWords found;
    for (const auto& word : search.Words())
        for (const auto topic : search.Topics(word))
            found[word].insert(pages.at(topic));
    EXPECT_GT(seen.size(), 100U);
    for (const auto& [word, where] : seen)
        EXPECT_EQ(found[word], where) << word;
    EXPECT_EQ(found.size(), seen.size());
}

INSTANTIATE_TEST_SUITE_P(Applications, WholeSearchTest,
                         ::testing::Values("samples/orchard", "../shared/corpus/sports-admin",
                                           "../shared/corpus/vcs-testing",
                                           "../shared/corpus/access-forms/Controls.accdb",
                                           "../shared/corpus/access-forms/FormExamples.accdb"));

} // namespace
} // namespace tovimar::test
