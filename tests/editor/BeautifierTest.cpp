#include "editor/CHtmlBeautifier.h"

#include "platform/html/HtmlDocument.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

#include <string>

namespace tovimar {
namespace {

constexpr const char* kUrl = "file:///C:/Help/html/page.htm";

std::string Neat(const std::string& page, bool sourceAttributes = false) {
    HtmlDocument document(page, kUrl);
    CHtmlBeautifier beautifier;
    beautifier.UseSourceAttributes = sourceAttributes;
    beautifier.SetDocument(document);
    std::string neat = beautifier.EditModeReadyHTML();
    beautifier.Dispose();
    beautifier.Dispose();
    EXPECT_EQ("", beautifier.EditModeReadyHTML());
    return neat;
}

/// The body's lines without their indentation in front of them, when it is written twice alike.
std::string Body(const std::string& body, bool sourceAttributes = false) {
    const std::string once = Neat("<body>" + body, sourceAttributes);
    EXPECT_EQ(once, Neat(once, sourceAttributes)) << body;
    const std::string open = "  <body>\r\n";
    const auto begin = once.find(open);
    const auto end = once.rfind("\r\n  </body>\r\n</html>");
    if (begin == std::string::npos || end == std::string::npos)
        return once;
    const auto from = begin + open.size();
    return end < from ? "" : once.substr(from, end - from);
}

TEST(BeautifierTest, AWholePage) {
    EXPECT_EQ("<!-- first -->\r\n"
              "<!DOCTYPE html>\r\n"
              "<html lang=\"en\">\r\n"
              "  <head>\r\n"
              "    <title>a &amp; b</title>\r\n"
              "    <meta name=\"x\" content=\"1 &lt; 2\">\r\n"
              "    <script>\r\n"
              "      if (a<b && c)\r\n"
              "      go();\r\n"
              "      </script>\r\n"
              "    <style>\r\n"
              "      p > b {}\r\n"
              "      </style>\r\n"
              "  </head>\r\n"
              "  <body>\r\n"
              "    <h1>Head</h1>\r\n"
              "    <ul>\r\n"
              "      <li>one</li>\r\n"
              "      <li>two</li>\r\n"
              "    </ul>\r\n"
              "    <div>\r\n"
              "      text\r\n"
              "    </div>\r\n"
              "  </body>\r\n"
              "</html>",
              Neat("<!-- first --><!DOCTYPE html><HTML Lang=en><HEAD><TITLE>a &amp; b</TITLE>\r\n\r\n"
                   "<META NAME=x CONTENT='1 &lt; 2'><SCRIPT>if (a<b && c)\r\n\r\n      go();\r\n</SCRIPT>"
                   "<script id=wbh>own()</script><style>\np > b {}</style></HEAD>\n<BODY>\n<h1>Head</h1>"
                   "<UL><LI>one</LI>\n\n<LI>two</UL><div>text</div></BODY>\n</HTML>\n"));
}

TEST(BeautifierTest, RunningTextStaysInItsLine) {
    EXPECT_EQ("    <p>one<br>two</p>", Body("<p>one<br>two</p>"));
    EXPECT_EQ("    <p>un<b>believ</b>able</p>", Body("<p>un<b>believ</b>able</p>"));
    EXPECT_EQ("    <p>one \r\n      <b>two</b> three</p>", Body("<p> one\n <b>two</b>\tthree </p>"));
    EXPECT_EQ("    <p>see <a href=\"x.htm\">x</a>, y</p>", Body("<p>see <a href=x.htm>x</a>, y</p>"));
    EXPECT_EQ("    <a name=\"top\"></a>\r\n    <h2>H</h2>", Body("<a name=top></a><h2>H</h2>"));
    EXPECT_EQ("    <p>word<!-- c -->word</p>", Body("<p>word<!-- c -->word</p>"));
    EXPECT_EQ("    <p>\r\n<!-- c -->a</p>", Body("<p><!-- c --> a</p>"));
    EXPECT_EQ("    <p>a \r\n      <b></b>\r\n      <i>b</i></p>", Body("<p>a <b></b> <i>b</i></p>"));
}

TEST(BeautifierTest, BlanksThatShowNothingWriteNothing) {
    EXPECT_EQ(
        "    <table>\r\n      <tbody>\r\n        <tr>\r\n          <td></td>\r\n          <td>&nbsp;</td>\r\n"
        "        </tr>\r\n      </tbody>\r\n    </table>",
        Body("<table> <tr>\n<td>  \n </td><td>&nbsp;</td></tr></table>"));
    EXPECT_EQ("    <div>\r\n      </div>", Body("<div></div>"));
    EXPECT_EQ("    <div>\r\n      </div>", Body("<div> \n </div>"));
    EXPECT_EQ("<html>\r\n  <head>\r\n    </head>\r\n  <body>\r\n    </body>\r\n</html>", Body(" \r\n "));
}

TEST(BeautifierTest, PreformattedTextStaysAsItStands) {
    EXPECT_EQ("    <pre>a\r\n   b\r\n</pre>", Body("<pre>a\n   b\r\n</pre>"));
    EXPECT_EQ("    <pre>\r\n\r\na <b>x</b><i> y</i><div>z</div></pre>",
              Body("<pre>\n\na <b>x</b><i> y</i><div>z</div></pre>"));
    EXPECT_EQ("    <p style=\"white-space: pre\">a  b</p>", Body("<p style='white-space: pre'>a  b</p>"));
    EXPECT_EQ("    <textarea> &lt;a&gt;\r\n </textarea>", Body("<textarea> <a>\n </textarea>"));
    EXPECT_EQ("    <pre>a &lt;b&gt;</pre>", Body("<plaintext>a <b>"));
}

TEST(BeautifierTest, EntitiesComeBack) {
    EXPECT_EQ("    <p title=\"&quot;&amp;&lt;\">&amp;nbsp; &lt;b&gt; \xC2\xA9&nbsp;&amp;amp;</p>",
              Body("<p title='\"&amp;<'>&amp;nbsp; &lt;b&gt; &copy;&nbsp;&amp;amp;</p>"));
}

TEST(BeautifierTest, AddressesBecomeRelative) {
    const auto href = [](const std::string& address) {
        const std::string line = Body("<a href='" + address + "'>x</a>");
        const auto begin = line.find("href=\"") + 6;
        return line.substr(begin, line.find('"', begin) - begin);
    };
    EXPECT_EQ("#x", href("file:///C:/Help/html/page.htm#x"));
    EXPECT_EQ("", href("file:///c:/help/HTML/Page.htm"));
    EXPECT_EQ("page.html", href("file:///C:/Help/html/page.html"));
    EXPECT_EQ("page.htm#x", href("page.htm#x"));
    EXPECT_EQ("sub/a b.htm", href("C:\\Help\\html\\sub\\a%20b.htm"));
    EXPECT_EQ("D:/x#&amp;^[]{}%.htm", href("file://D:/x%23%26%5e%5B%5D%7B%7D%25.htm"));
    EXPECT_EQ("http://x/a?b=1&amp;c=2", href("http://x/a?b=1&amp;amp;c=2"));
    EXPECT_EQ("a%2520b", href("a%2520b"));
    EXPECT_EQ("    <img src=\"pics/a.jpg\">", Body("<img src=\"file:///C:/Help/html/pics/a.jpg\">"));
    EXPECT_NE(
        std::string::npos,
        Neat("<base href=\"file:///D:/w%20/\"><a href=\"file:///D:/w%20/x.htm\">").find("href=\"x.htm\""));
}

TEST(BeautifierTest, AttributesByName) {
    EXPECT_EQ("    <area nohref=\"-1\" shape=\"\">", Body("<area nohref=true shape>"));
    EXPECT_EQ("    <img width=\"20px\" height=\"0\" style=\"a:b; Width : 20px\">",
              Body("<img width=0 height=0 style='a:b; Width : 20px'>"));
    EXPECT_EQ("    <input type=\"text\" value=\"\" checked=\"\">",
              Body("<input type=text value='' checked>"));
    EXPECT_EQ("    <p a=\"1\">x</p>", Body("<p a=1 <b>x</p>"));
}

TEST(BeautifierTest, AttributesOfTheSource) {
    EXPECT_EQ(
        "    <a HREF=\"x y.htm\" Title=\"a = &amp;  it's\" nowrap=\"\">x</a>",
        Body("<a   HREF = 'file:///c:/help/html/x%20y.htm'\n Title=\"a = &amp;  it's\" nowrap>x</a>", true));
    EXPECT_EQ("    <p a=\"&quot;\" b=\"1\">x</p>", Body("<p a='\"' b=1>x</p>", true));
}

TEST(BeautifierTest, FormsOfOldPages) {
    EXPECT_EQ("    <isindex prompt=\"Find: \" size=\"3\">", Body("<isindex prompt='Find: ' size=3>"));
    EXPECT_EQ("    <xml><o:p>a\r\n    </o:p></xml>", Body("<xml><o:p>a\n </o:p></xml>"));
    EXPECT_EQ("    <iframe src=\"a.htm\">a < b</iframe>", Body("<iframe src=a.htm>a < b</iframe>"));
    EXPECT_EQ("    <select>\r\n      <option>a</option>\r\n      <option>b</option>\r\n    </select>",
              Body("<select><option>a<option>b</select>"));
    EXPECT_EQ("    <p>x<select>\r\n        y\r\n      </select> z</p>",
              Body("<p>x<select> y </select> z</p>"));
}

TEST(BeautifierTest, DeepPagesAreWrittenInTimeAndRoom) {
    HtmlDocument document("<p></p>");
    HtmlNode* inner = document.getElementsByTagName("p").front();
    for (int i = 0; i < 50000; ++i)
        inner = &inner->appendChild(document.createElement("div"));
    CHtmlBeautifier beautifier;
    beautifier.SetDocument(document);
    EXPECT_GT(50000U * 300, beautifier.EditModeReadyHTML().size());
    EXPECT_EQ("on", document.designMode);
}

} // namespace
} // namespace tovimar
