#include "platform/xml/XmlDocument.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

class XmlTest : public test::EnvironmentTest {};

TEST(Xml, RefusesWhatIsNoDocument) {
    const char* refused[] = {
        "",
        "text",
        "<a>",
        "<a/><b/>",
        "<a/>tail",
        "<a></b>",
        "</a>",
        "<a b='1' b='2'/>",
        "<a b=1/>",
        "<a b='1'c='2'/>",
        "<a b='<'/>",
        "<a>&</a>",
        "<a>&nbsp;</a>",
        "<a b='x & y'/>",
        "<a>&#0;</a>",
        "<a>&#xD800;</a>",
        "<a>&#99999999;</a>",
        "<a>]]></a>",
        "<a><!-- -- --></a>",
        "<a><![CDATA[ </a>",
        "<a><?xml version='1.0'?></a>",
        "<!DOCTYPE a [<!ENTITY e SYSTEM 'file:///etc/passwd'>]><a>&e;</a>",
        "<a/><!DOCTYPE a>",
        "<a>\x01</a>",
        "<a>\xFF</a>",
        "<1a/>",
        "<a",
    };
    for (const char* text : refused) {
        XmlDocument document;
        EXPECT_FALSE(document.loadXML(text)) << text;
        EXPECT_NE(document.parseError().errorCode, 0) << text;
        EXPECT_FALSE(document.parseError().reason.empty()) << text;
        EXPECT_FALSE(document.documentElement()) << text;
    }
}

TEST(Xml, AcceptsWhatIsOne) {
    const char* accepted[] = {
        "<a/>",
        "\xEF\xBB\xBF<a/>",
        "<?xml version=\"1.0\" encoding=\"utf-16\" ?>\r\n<a>x</a>\r\n<!-- end -->\n",
        "<!DOCTYPE a SYSTEM 'a.dtd'><a/>",
        "<a b = \"it's\" c:d='&quot;&#39;&#x41;'>&lt;&#7;</a >",
        "<a><?target data?><![CDATA[<&]]></a>",
        "<форма имя='Ё'/>",
    };
    for (const char* text : accepted) {
        XmlDocument document;
        EXPECT_TRUE(document.loadXML(text)) << text << ": " << document.parseError().reason;
    }
}

TEST(Xml, BoundsDepth) {
    const auto nested = [](int depth) {
        std::string text;
        for (int i = 0; i < depth; ++i)
            text += "<a>";
        for (int i = 0; i < depth; ++i)
            text += "</a>";
        return text;
    };
    XmlDocument document;
    EXPECT_TRUE(document.loadXML(nested(512)));
    EXPECT_FALSE(document.loadXML(nested(513)));
    EXPECT_FALSE(document.loadXML(nested(200000)));
}

TEST(Xml, TellsThePlaceOfAnError) {
    XmlDocument document;
    ASSERT_FALSE(document.loadXML("<a>\r\n  <b é='1' é='2'/>\r\n</a>"));
    const auto& error = document.parseError();
    EXPECT_EQ(error.line, 2);
    EXPECT_EQ(error.srcText, "  <b é='1' é='2'/>");
    ASSERT_FALSE(document.loadXML("<a>\n  <c>ёё&x;</c></a>"));
    EXPECT_EQ(document.parseError().line, 2);
    EXPECT_EQ(document.parseError().linepos, 8);
    EXPECT_EQ(document.parseError().filepos, 13);
    EXPECT_TRUE(document.loadXML("<a/>"));
    EXPECT_EQ(document.parseError().errorCode, 0);
}

TEST(Xml, NodesAnswer) {
    XmlDocument document;
    ASSERT_TRUE(document.loadXML(
        "<r><!-- c --><x:a n='1' N='2'>t<b>u</b> <![CDATA[<]]></x:a><a n=\"q&quot;'\"/></r>"));
    const XmlNode root = document.documentElement();
    EXPECT_EQ(root.childNodes().size(), 3U);
    EXPECT_TRUE(root.firstChild().IsComment());
    const auto elements = root.childElements();
    ASSERT_EQ(elements.size(), 2U);
    EXPECT_EQ(elements[0].nodeName(), "x:a");
    EXPECT_EQ(elements[0].baseName(), "a");
    EXPECT_EQ(elements[0].text(), "tu<");
    EXPECT_EQ(elements[0].attribute("N"), "2");
    EXPECT_FALSE(elements[0].getAttribute("M"));
    EXPECT_EQ(elements[0].attributeName(1), "N");
    EXPECT_EQ(elements[1].xml(), "<a n=\"q&quot;'\"/>");
    EXPECT_EQ(document.selectSingleNode("//b").text(), "u");
    EXPECT_EQ(elements[1].selectNodes("//b").size(), 1U);
    EXPECT_EQ(document.selectNodes("/r/a[@n]").size(), 1U);
    EXPECT_FALSE(document.selectSingleNode("//none").selectSingleNode("a"));
    EXPECT_EQ(XmlNode().attribute("n", "absent"), "absent");
    EXPECT_THROW(document.selectNodes("//["), RaisedError);

    XmlNode changed = elements[1];
    changed.setAttribute("n", "<&\"\r\n");
    changed.setAttribute("m", "");
    XmlDocument again;
    ASSERT_TRUE(again.loadXML(changed.xml()));
    EXPECT_EQ(again.documentElement().attribute("n"), "<&\"\r\n");
}

TEST_F(XmlTest, LoadsFilesInTheirEncodings) {
    XmlDocument document;
    const auto value = [&](const std::string& bytes) {
        EXPECT_TRUE(document.load(WriteFile("a.xml", bytes))) << document.parseError().reason;
        return document.documentElement().text();
    };
    EXPECT_EQ(value("<?xml version='1.0' encoding='windows-1251'?><a>\xC6</a>"), "Ж");
    EXPECT_EQ(value("\xEF\xBB\xBF<a>Ж</a>"), "Ж");
    EXPECT_EQ(value(std::string("\xFF\xFE<\0a\0>\0\x16\x04<\0/\0a\0>\0", 18)), "Ж");
    EXPECT_FALSE(document.load(WriteFile("a.xml", "<a>\xC6</a>")));
}

TEST_F(XmlTest, NamesTheFileOfAnError) {
    XmlDocument document;
    EXPECT_FALSE(document.load(Path("none.xml")));
    EXPECT_NE(document.parseError().errorCode, 0);
    EXPECT_EQ(document.parseError().url, NativeFolder() + "/none.xml");
    EXPECT_FALSE(document.load(Folder()));
}

} // namespace
} // namespace tovimar
