#include "platform/access/OpenObject.h"

#include "platform/text/Text.h"

namespace tovimar::platform::access {

namespace {

bool IsShown(const OpenObject& object, int section, const DesignObject& design) {
    switch (object.view) {
    case View::Design:
        return true;
    case View::Datasheet:
        return section == 0;
    case View::Form:
        return design.Flag("Visible") && section <= 2;
    case View::Preview:
        return design.Flag("Visible");
    }
    return true;
}

} // namespace

int Records::ColumnIndex(std::string_view name) const {
    for (std::size_t i = 0; i < columns.size(); ++i)
        if (text::EqualsIgnoringCase(columns[i].name, name))
            return static_cast<int>(i);
    return -1;
}

FrameInput OpenObject::FrameSettings() const {
    FrameInput input;
    input.view = view;
    if (!design || !design->root)
        return input;
    input.borderStyle = design->root->Integer("BorderStyle", 2);
    input.recordSelectors = view == View::Datasheet || (view == View::Form && design->root->Flag("RecordSelectors"));
    return input;
}

SectionHeights OpenObject::Sections(const SystemMetrics& metrics) const {
    SectionHeights heights;
    if (!design)
        return heights;
    for (const auto& section : design->Sections()) {
        const auto index = static_cast<std::size_t>(section.number);
        if (index >= heights.pixels.size() || !IsShown(*this, section.number, *section.object))
            continue;
        const int twips = section.object->Integer("Height");
        if (twips <= -503)
            continue;
        heights.present[index] = true;
        heights.pixels[index] = RoundToEven(static_cast<double>(twips) / metrics.twipsPerPixelY);
    }
    return heights;
}

} // namespace tovimar::platform::access
