#include "foundation/NameEncoding.h"

#include "foundation/CCodePages.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

class NameEncodingTest : public test::EnvironmentTest {};

TEST_F(NameEncodingTest, InstalledTableMakesNamesSafe) {
    EXPECT_EQ(NormalizeName("Order Details"), "Order_Details");
    EXPECT_EQ(NormalizeName("a/b\\c:d*e?"), "a-2Fb-5Cc-3Ad-2Ae-3F");
    EXPECT_EQ(NormalizeName("Жар"), "Zhar");
    EXPECT_EQ(NormalizeName("漢😀_1-2"), "漢😀_1-2");
    EXPECT_EQ(NormalizeName(""), "");
}

TEST_F(NameEncodingTest, OwnTable) {
    SetInstallation(Folder());
    WriteFile("Settings\\ObjectNameEncoding.xml",
              "<EncodingTable><c U=\"0416\" T=\"ZH\"/><!-- c --><c u=\"0041\"/><c u=\"zz\" t=\"x\"/>"
              "<c u=\"0042\" t=\"\"/><c u=\"0042\" t=\"second\"/></EncodingTable>");
    EXPECT_EQ(NormalizeName("ЖABC"), "ZHAC");
    // Kept for the session, whatever happens to the file.
    environment->files->DeleteFile(Path("Settings\\ObjectNameEncoding.xml"));
    EXPECT_EQ(NormalizeName("Ж"), "ZH");
    ForgetNameEncodingTable();
    EXPECT_EQ(NormalizeName("Ж "), "Ж ");
    EXPECT_TRUE(boxes->shown.empty());
}

TEST_F(NameEncodingTest, CodePagesByLanguage) {
    CCodePages pages;
    const CCodePage* english = pages.GetCodePageByLanguageCode("en");
    ASSERT_NE(english, nullptr);
    EXPECT_EQ(english->CP1, "1252");
    EXPECT_EQ(english->HHPLName, "0x409 English (United States)");
    EXPECT_EQ(pages.GetCodePageByLanguageCode("XX"), nullptr);
    EXPECT_EQ(pages.Load(WriteFile("own.xml", "<CodePages><L><LCode>\r\n XY </LCode><CP1> 1250\r\n</CP1></L>"
                                              "</CodePages>")),
              0);
    EXPECT_EQ(pages.GetCodePageByLanguageCode("XY")->CP1, "1250");
    EXPECT_NE(pages.Load(WriteFile("broken.xml", "<CodePages>")), 0);
    EXPECT_TRUE(pages.Pages().Empty());
}

} // namespace
} // namespace tovimar
