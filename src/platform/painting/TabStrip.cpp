#include "platform/painting/TabStrip.h"

#include "platform/access/Design.h"

namespace tovimar::platform::painting {

using access::DesignObject;

namespace {

constexpr std::size_t kMostPages = 200;

std::string PageCaption(const DesignObject& page) {
    const auto caption = page.Text("Caption");
    return caption.empty() ? page.name : caption;
}

} // namespace

std::vector<const DesignObject*> PagesOf(const DesignObject& tab) {
    std::vector<const DesignObject*> pages;
    for (const auto& child : tab.children)
        if (child->Is("Page") && pages.size() < kMostPages)
            pages.push_back(child.get());
    return pages;
}

access::TabInput TabInputOf(const DesignObject& tab, int left, int top) {
    access::TabInput input;
    input.controlLeft = left;
    input.controlTop = top;
    input.fixedWidth = tab.Integer("TabFixedWidth", 0);
    input.fixedHeight = tab.Integer("TabFixedHeight", 0);
    input.fontSize = tab.Integer("FontSize", 8);
    input.fontWeight = tab.Integer("FontWeight", 400);
    for (const auto* page : PagesOf(tab))
        input.captions.push_back(PageCaption(*page));
    return input;
}

int TabStripWidth(const DesignObject& tab, const SystemMetrics& metrics) {
    const auto input = TabInputOf(tab, 0, 0);
    if (input.captions.empty())
        return 0;
    return access::TabRectangle(metrics, input, static_cast<int>(input.captions.size()) - 1).right;
}

} // namespace tovimar::platform::painting
