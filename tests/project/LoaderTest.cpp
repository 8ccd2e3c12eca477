#include "project/ProjectTest.h"

#include "project/clsHHCLoader.h"

namespace tovimar::test {
namespace {

using LoaderTest = ProjectTest;

const char* const kForeign =
    "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n<HTML>\r\n<HEAD>\r\n"
    "<meta name=\"GENERATOR\" content=\"x\">\r\n</HEAD>\r\n<BODY>\r\n<UL>\r\n"
    "\t<LI> <OBJECT type=\"text/sitemap\">\r\n"
    "\t<param name=\"Name\" value=\"Help\">\r\n"
    "\t<param name=\"Comment\" value=\"Tovimar: Version=2;SourceApp=x;\">\r\n"
    "\t<param name=\"Local\" value=\"index.htm\">\r\n\t</OBJECT>\r\n<UL>\r\n"
    "<LI> <OBJECT type=\"text/sitemap\">\r\n<param name=\"Name\" value=\"Forms\">\r\n"
    "<param name=\"Local\" value=\"forms.htm\">\r\n</OBJECT>\r\n<UL>\r\n"
    "<LI> <OBJECT type=\"text/sitemap\">\r\n<param name=\"Name\" value=\"Orders\">\r\n"
    "<param name=\"Local\" value=\"o.htm\">\r\n</OBJECT>\r\n"
    "</UL>\r\n</UL>\r\n</UL>\r\n</BODY>\r\n</HTML>\r\n";

TEST_F(LoaderTest, AForeignContentsFileBecomesAProject) {
    clsHHCLoader loader;
    ASSERT_EQ(loader.Load(WriteFile("f.hhc", kForeign)), 0);
    ASSERT_NE(loader.Root(), nullptr) << loader.ErrorReason();
    EXPECT_EQ(loader.Root()->SourceApp(), "x");
    ExpectGolden("foreign.xml", loader.GetXMLStr());
    ExpectGolden("foreign.hhc", loader.Root()->HHCStr());
}

TEST_F(LoaderTest, WhatIsNoSitemapGivesNothing) {
    clsHHCLoader loader;
    EXPECT_EQ(loader.Load(WriteFile("f.hhc", "<HTML><BODY>")), 0);
    EXPECT_NE(loader.ErrorCode(), 0);
    EXPECT_EQ(loader.Root(), nullptr);
}

} // namespace
} // namespace tovimar::test
