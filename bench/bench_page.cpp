// Measures what is done with one page: reading it, writing it back as it was, writing it as neat HTML,
// reading its topics. Sizes double: the time for each byte should stay.
//
//     bench_page [KILOBYTES]            the largest page, default 1024
//
// Every figure is processor time, the least of three runs.

#include "editor/CHtmlBeautifier.h"
#include "platform/Environment.h"
#include "platform/html/HtmlDocument.h"
#include "topics/CFormHTMLControlDefs.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <functional>
#include <string>

using namespace tovimar;

namespace {

double Milliseconds(const std::function<void()>& step) {
    double least = 1e12;
    for (int i = 0; i < 3; ++i) {
        const auto start = std::clock();
        step();
        least = std::min(least, 1000.0 * static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC);
    }
    return least;
}

/// A topic of so many bytes, with a section, a list and a table row for each control.
std::string Topic(std::size_t size) {
    std::string page = "<html><head><meta name=\"TOVIMAR-VERSION\" content=\"2.5 [x]\">\r\n"
                       "<meta name=\"TOVIMAR-FORM-NAME\" content=\"Orders\"></head><body>\r\n<table>";
    for (int i = 0; page.size() < size; ++i) {
        const std::string name = "Field" + std::to_string(i);
        page += "<tr><td><H2><a name=\"Orders_" + name + "\">" + name +
                " &amp; more</a></H2>\r\n<ul><li>un<b>believ"
                "</b>able &copy;</ul><p>See <A HREF=\"file:///C:/Help/html/other.htm#" +
                name + "\">there</A>.<br><img src='pics/" + name + ".jpg' alt=\"\"></td></tr>\r\n";
    }
    return page + "</table></body></html>";
}

std::string Neat(HtmlDocument& document) {
    CHtmlBeautifier beautifier;
    beautifier.SetDocument(document);
    return beautifier.EditModeReadyHTML();
}

} // namespace

int main(int argc, char** argv) {
    platform::SetEnvironment(platform::MakeRealEnvironment({"/nonexistent", "/nonexistent", "/nonexistent"}));
    const std::size_t most = argc > 1 ? std::strtoul(argv[1], nullptr, 10) : 1024;
    std::printf("%10s %10s %10s %10s %10s\n", "KB", "read ms", "write ms", "neat ms", "topics ms");
    for (std::size_t size = std::max<std::size_t>(most / 16, 1); size <= most; size *= 2) {
        const std::string page = Topic(size * 1024);
        HtmlDocument document(page, "file:///C:/Help/html/page.htm");
        CFormHTMLControlDefs defs;
        std::printf("%10zu %10.1f %10.1f %10.1f %10.1f\n", size,
                    Milliseconds([&] { HtmlDocument again(page); }),
                    Milliseconds([&] { document.outerHTML(); }), Milliseconds([&] { Neat(document); }),
                    Milliseconds([&] { defs.ParseText(page); }));
    }
}
