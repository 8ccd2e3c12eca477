#include "platform/html/HtmlDocument.h"

#include "platform/Error.h"
#include "platform/html/GumboMemory.h"

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace tovimar {
namespace {

HtmlNode& First(const HtmlDocument& document, const char* name) {
    return *document.getElementsByTagName(name).at(0);
}

std::string Repeated(const std::string& text, int count) {
    std::string all;
    for (int i = 0; i < count; ++i)
        all += text;
    return all;
}

TEST(HtmlDocumentTest, WhatAWriterWroteIsWrittenBack) {
    for (const char* page :
         {"<!DOCTYPE html PUBLIC \"-//W3C//DTD HTML 4.01//EN\">\r\n<!-- first -->\r\n<HTML lang=en><HEAD>"
          "<TITLE>a &amp; b</TITLE></HEAD><BODY onload='go( \"x\" )'>\r\n<P Align=left>&copy; 1 &lt; "
          "2&nbsp;<BR>"
          "<IMG SRC=a.jpg ALT=\"\"  border = 0 ><!-- c --></P>\r\n</BODY>\r\n</HTML>",
          "<html><head></head><body><pre>\r\n\r\n two</pre><script>if (a<b && c) x('</p>');</script>"
          "<svg viewBox=\"0 0 1 1\"><path d='M0'/></svg></body></html>"})
        EXPECT_EQ(page, HtmlDocument(page).outerHTML());
}

TEST(HtmlDocumentTest, LeftOutTagsAndLooseTextsArePutRight) {
    const auto body = [](const char* html) { return HtmlDocument(html).body()->innerHTML(); };
    EXPECT_EQ("<p>one</p><p>two</p>", body("<p>one<p>two"));
    EXPECT_EQ("ab", body("a</x>b"));
    EXPECT_EQ("a&amp;b &lt; &nbsp;", body("a&amp;b</x> &lt; &nbsp;"));
    EXPECT_EQ("R&D", body("R&D"));
    EXPECT_EQ("<ul><li>a</li><LI>b</LI></ul>", body("<ul><li>a<LI>b</LI></ul>"));
    EXPECT_EQ("<b><i>x</i></b><i>y</i>", body("<b><i>x</b>y</i>"));
    EXPECT_EQ("<table><tbody><tr><td>x</td></tr></tbody></table>", body("<table><tr><td>x</table>"));
    EXPECT_EQ("<img src=\"a\">", body("<image src=\"a\">"));
    EXPECT_EQ("x&copy;&#150;", body("<html><body>x&copy;&#150;</body></html>"));
    EXPECT_EQ("<pre>a &lt;b&gt;</pre>", body("<plaintext>a <b>"));
    EXPECT_EQ("&#144;b", body("&#144;</x>b"));
    EXPECT_EQ("", HtmlDocument("").body()->innerHTML());
    EXPECT_EQ("<html><head></head><body></body></html>", HtmlDocument().outerHTML());
}

TEST(HtmlDocumentTest, TheTailOfThePageStaysBehindTheBody) {
    HtmlDocument document("<html><body>x\r\n</body>\r\n<!-- c -->\r\n</html>\r\n");
    EXPECT_EQ("x\r\n", document.body()->innerHTML());
    const std::string once = document.outerHTML();
    EXPECT_EQ(once, HtmlDocument(once).outerHTML());
    EXPECT_EQ("x\r\n\r\n", HtmlDocument("<body>x\r\n\r\n").body()->innerHTML());
    EXPECT_EQ("x y", HtmlDocument("<body>x</body> y").body()->textContent());
}

TEST(HtmlDocumentTest, AttributesKnowHowTheyWereWritten) {
    HtmlDocument document("<a HREF='page.htm?a=1&amp;b=\"2\"#x' Name=top nowrap title=\"\">x</a>");
    HtmlNode& link = First(document, "A");
    EXPECT_EQ("page.htm?a=1&b=\"2\"#x", link.getAttribute("href"));
    ASSERT_EQ(4U, link.attributes().size());
    EXPECT_EQ("'page.htm?a=1&amp;b=\"2\"#x'", link.attributes()[0].text);
    EXPECT_TRUE(link.attributes()[2].specified);
    EXPECT_EQ("", link.getAttribute("nowrap"));
    EXPECT_FALSE(link.getAttribute("class").has_value());
    link.setAttribute("TITLE", "\"<b>\"");
    link.setAttribute("Class", "c");
    link.removeAttribute("nowrap");
    link.removeAttribute("absent");
    EXPECT_EQ(
        "<a href='page.htm?a=1&amp;b=\"2\"#x' name=top title=\"&quot;&lt;b&gt;&quot;\" class=\"c\">x</a>",
        link.outerHTML());
}

TEST(HtmlDocumentTest, NodesHaveNamesAndAnIdentityOfTheirOwn) {
    HtmlDocument document("<!doctype html><!--c--><p id=P>t<x-y></x-y><svg><linearGradient/></svg>");
    std::string names;
    std::set<std::string> identities;
    const HtmlNode& root = document.Root();
    for (const HtmlNode* node = &root; node != nullptr; node = node->NextWithin(root)) {
        names += node->nodeName() + " ";
        EXPECT_TRUE(identities.insert(node->uniqueID()).second);
    }
    EXPECT_EQ("#document #doctype #comment HTML HEAD BODY P #text X-Y svg linearGradient ", names);
    EXPECT_TRUE(First(document, "x-y").IsUnknown());
    EXPECT_FALSE(First(document, "p").IsUnknown());
    EXPECT_EQ(&First(document, "p"), document.getElementById("P"));
    EXPECT_EQ(nullptr, document.getElementById("p"));
}

TEST(HtmlDocumentTest, NodesAreMovedPutInAndTakenOut) {
    HtmlDocument document("<p>a<b>b</b>c</p><ul></ul>");
    HtmlNode& paragraph = First(document, "p");
    HtmlNode& bold = First(document, "b");
    HtmlNode& list = First(document, "ul");
    list.appendChild(bold);
    EXPECT_EQ("<p>ac</p><ul><b>b</b></ul>", document.body()->innerHTML());
    paragraph.insertBefore(bold, paragraph.firstChild());
    paragraph.insertBefore(bold, &bold);
    list.appendChild(document.createElement("LI")).appendChild(document.createTextNode("<&>"));
    list.insertBefore(document.createComment(" c "), list.firstChild());
    EXPECT_EQ("<p><b>b</b>ac</p><ul><!-- c --><li>&lt;&amp;&gt;</li></ul>", document.body()->innerHTML());
    bold.removeNode(/*deep=*/false);
    list.replaceNode(document.createElement("<A name='x'></A>"));
    EXPECT_EQ("<p>bac</p><A name='x'></A>", document.body()->innerHTML());
    paragraph.firstChild()->setNodeValue("1 < 2\n");
    EXPECT_EQ("<p>1 &lt; 2\r\nac</p>", paragraph.outerHTML());
    EXPECT_EQ(nullptr, bold.parentNode());
    EXPECT_NE(0U, document.Changes());

    HtmlDocument other("");
    EXPECT_THROW(paragraph.appendChild(*document.body()), RaisedError);
    EXPECT_THROW(paragraph.appendChild(paragraph), RaisedError);
    EXPECT_THROW(paragraph.appendChild(*other.body()), RaisedError);
    EXPECT_THROW(paragraph.insertBefore(bold, document.body()), RaisedError);
    for (const char* name : {"", "1", "a b", "a>", "<"})
        EXPECT_THROW(document.createElement(name), RaisedError) << name;
}

TEST(HtmlDocumentTest, InnerHtmlIsReadInItsPlace) {
    HtmlDocument document("<table><tr id=r></tr></table><div id=d>old</div>");
    document.getElementById("r")->setInnerHTML("<td>1<td>2");
    EXPECT_EQ("<tr id=r><td>1</td><td>2</td></tr>", document.getElementById("r")->outerHTML());
    document.getElementById("d")->setInnerHTML("<td>1</td><p>2");
    EXPECT_EQ("1<p>2</p>", document.getElementById("d")->innerHTML());
    EXPECT_EQ("<div id=d>", document.getElementById("d")->startTag());
}

TEST(HtmlDocumentTest, TextAsItShows) {
    const auto text = [](const char* html) { return HtmlDocument(html).body()->innerText(); };
    EXPECT_EQ("", text(" <p> </p>\n"));
    EXPECT_EQ("Heading\r\none two\r\nthree", text("<h1>Heading</h1>\n<p>one\n <b>two</b><br>three</p>"));
    EXPECT_EQ("a\r\n  b", text("<pre>a\n  b\n</pre>"));
    EXPECT_EQ("seen & known", text("<script>x</script>seen &amp; <style>p{}</style>known<!-- c -->"));
    HtmlDocument document("<a href=x>1</a><a name=y>2</a><area href=z><img src=i><a id=w>3</a>");
    EXPECT_EQ(2U, document.links().size());
    EXPECT_EQ(2U, document.anchors().size());
    EXPECT_EQ(1U, document.images().size());
}

TEST(HtmlDocumentTest, NestedPagesAreBoundedAndNothingRecurses) {
    const auto reads = [](const std::string& page) {
        try {
            HtmlDocument document(page);
            EXPECT_FALSE(document.outerHTML().empty());
            document.body()->innerText();
            return true;
        } catch (const RaisedError& error) {
            EXPECT_EQ(kFailure1, error.Number()) << error.what();
            return false;
        }
    };
    EXPECT_FALSE(reads(Repeated("<div>", 100000)));
    EXPECT_FALSE(reads(Repeated("<b x=1><!-- </b> --></c>", 100000)));
    EXPECT_FALSE(reads(Repeated("<dd><li>", 50000)));
    EXPECT_FALSE(reads("<p " + Repeated("a b='c' ", 2000) + ">"));
    EXPECT_TRUE(reads(Repeated("<div>", 1900)));
    EXPECT_FALSE(reads(Repeated("<ul><li>", 5000)));
    EXPECT_FALSE(reads(Repeated("<rt>x", 5000)));
    EXPECT_FALSE(reads(Repeated("<dl><dd><ol></ol><li>", 5000)));
    EXPECT_TRUE(reads(Repeated("<p>x<li>y<tr><td>", 15000)));
    // Lists of old pages close nothing but themselves.
    EXPECT_TRUE(reads("<ul>" + Repeated("<li>x", 50000) + "</ul>"));
    EXPECT_TRUE(reads(Repeated("<ul><li>x<dl><dt>y<dd>z<ol><li>1<li>2</ol></dl><li>u</ul>", 5000)));
    EXPECT_TRUE(reads(Repeated("<select><optgroup><option>x<optgroup><option>y</select>", 5000)));
    EXPECT_TRUE(reads(Repeated("<ruby>x<rb>y<rt>z<rp>u</ruby>", 5000)));
    EXPECT_TRUE(reads(Repeated("<div title='>' x></div><br/><!--><b></b>", 3000)));

    HtmlDocument document("<div></div>");
    HtmlNode* inner = &First(document, "div");
    for (int i = 0; i < 100000; ++i)
        inner = &inner->appendChild(document.createElement("i"));
    inner->appendChild(document.createTextNode("deep"));
    EXPECT_EQ("deep", document.body()->innerText());
    EXPECT_LT(700000U, document.outerHTML().size());
}

TEST(HtmlDocumentTest, MemoryIsBoundedThroughTheParser) {
    GumboMemory memory(1000);
    EXPECT_NE(nullptr, GumboMemory::Allocate(&memory, 900));
    EXPECT_THROW(GumboMemory::Allocate(&memory, 100), RaisedError);
    // Each paragraph opens all the elements before it again.
    std::string growing;
    for (int i = 0; i < 1900; ++i)
        growing += "<p><font x" + std::to_string(i) + ">";
    EXPECT_THROW(HtmlDocument{growing + Repeated("<p>x", 3000)}, RaisedError);
}

} // namespace
} // namespace tovimar
