#include "SearchPage.h"

#include "Packing.h"
#include "PageSource.h"

#include <string_view>

namespace tovimar::search {

namespace {

constexpr std::string_view kIndexPlace = "{{index}}";

std::string WithCrLf(std::string_view text) {
    std::string out;
    out.reserve(text.size() + text.size() / 16);
    for (const char c : text) {
        if (c == '\n')
            out += '\r';
        out += c;
    }
    return out;
}

} // namespace

std::string SearchPageText(const SearchIndex& index) {
    const auto page = WithCrLf(kPageSource);
    const auto place = page.find(kIndexPlace);
    return page.substr(0, place) + Pack(index.Text()) + page.substr(place + kIndexPlace.size());
}

} // namespace tovimar::search
