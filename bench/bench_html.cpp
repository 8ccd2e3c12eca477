// Measures pages: reading one into its tree, writing it as it stands, writing it neat, its text, and one
// added line in a saved page. Pages are of ordinary sections with headings, pictures, lists and tables; every
// figure is given for pages of growing size with what it comes to per megabyte, which stays the same when the
// time is linear.
//
//     bench_html [KILOBYTES]            the largest page, default 4096
//
// Every figure is processor time, and the least of several runs.

#include "editor/CHtmlBeautifier.h"
#include "platform/html/HtmlDocument.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <functional>
#include <string>

using namespace tovimar;

namespace {

std::string Section(int number) {
    const auto name = std::to_string(number);
    return "<h2><a name=\"Orders_c" + name + "\">Control " + name +
           "</a></h2>\r\n<p>Shows the <b>order's</b> date &amp; "
           "place; see <a href=\"file:///C:/Help/html/other" +
           name + ".htm#top\">more</a>.<br>\r\n<img src=\"images/c" + name +
           ".jpg\" width=\"40\" height=\"20\" alt=\"Control\"></p>\r\n<ul>\r\n<li>one</li>\r\n<li>two "
           "<i>and</i> "
           "three\r\n</ul>\r\n"
           "<table border=\"1\"><tr><td>Field</td><td>Value&nbsp;" +
           name + "</td></tr></table>\r\n";
}

std::string PageOf(std::size_t bytes) {
    std::string page = "<!DOCTYPE html>\r\n<html>\r\n<head><title>Orders</title></head>\r\n<body>\r\n";
    for (int number = 1; page.size() < bytes; ++number)
        page += Section(number);
    return page + "</body>\r\n</html>\r\n";
}

double Least(const std::function<void()>& step) {
    double least = 1e12;
    for (int i = 0; i < 5; ++i) {
        const auto start = std::clock();
        step();
        least = std::min(least, 1000.0 * static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC);
    }
    return least;
}

void Print(const char* what, double milliseconds, std::size_t bytes) {
    const double megabytes = static_cast<double>(bytes) / (1024.0 * 1024.0);
    std::printf("  %-12s %9.2f ms %9.2f ms/MB\n", what, milliseconds, milliseconds / megabytes);
}

std::string Neat(HtmlDocument& document, bool sourceAttributes) {
    CHtmlBeautifier beautifier;
    beautifier.UseSourceAttributes = sourceAttributes;
    beautifier.SetDocument(document);
    return beautifier.EditModeReadyHTML();
}

void Measure(std::size_t bytes) {
    const std::string page = PageOf(bytes);
    std::size_t sum = 0;
    std::printf("page of %zu KB\n", page.size() / 1024);
    HtmlDocument document(page, "file:///C:/Help/html/page.htm");
    Print("read", Least([&] { sum += HtmlDocument(page).Source().size(); }), page.size());
    Print("write", Least([&] { sum += document.outerHTML().size(); }), page.size());
    Print("text", Least([&] { sum += document.body()->innerText().size(); }), page.size());
    Print("neat", Least([&] { sum += Neat(document, /*sourceAttributes=*/false).size(); }), page.size());
    Print("neat, source", Least([&] { sum += Neat(document, /*sourceAttributes=*/true).size(); }),
          page.size());
    if (sum == 0)
        std::exit(1);
}

} // namespace

int main(int argc, char** argv) {
    const std::size_t most = argc > 1 ? std::strtoul(argv[1], nullptr, 10) : 4096;
    for (std::size_t kilobytes = 64; kilobytes <= most; kilobytes *= 4)
        Measure(kilobytes * 1024);
    return 0;
}
