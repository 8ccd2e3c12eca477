#include "platform/access/OpenObject.h"

#include "platform/painting/ObjectLayout.h"
#include "platform/painting/ReportPage.h"
#include "platform/painting/SampleData.h"
#include "platform/text/Text.h"

#include <algorithm>

/// What an open object answers about its own layout; the painter asks the same functions.
namespace tovimar::platform::access {

namespace {

constexpr std::int32_t kUsualColumn = 1440;
constexpr std::int32_t kBroadestColumn = 22 * 1440;

bool IsColumn(const DesignObject& control) {
    // A group's buttons show the group's value, which has a column of its own.
    const bool member = control.parent != nullptr && control.parent->Is("OptionGroup");
    return !member && BuiltInDefault(control.type, "ColumnOrder").has_value();
}

void AddColumns(const DesignObject& owner, std::vector<const DesignObject*>& columns) {
    for (const auto& child : owner.children) {
        if (IsColumn(*child))
            columns.push_back(child.get());
        AddColumns(*child, columns);
    }
}

} // namespace

int Records::ColumnIndex(std::string_view name) const {
    for (std::size_t i = 0; i < columns.size(); ++i)
        if (text::EqualsIgnoringCase(columns[i].name, name))
            return static_cast<int>(i);
    return -1;
}

FrameInput OpenObject::FrameSettings() const {
    return painting::FrameSettingsOf(*design, view);
}

int OpenObject::ShownRecords(const SystemMetrics& metrics) const {
    return painting::ShownRecordsOf(*design, view, insideHeight, metrics);
}

SectionHeights OpenObject::Sections(const SystemMetrics& metrics) const {
    return painting::HeightsOf(*design, view, ShownRecords(metrics), metrics);
}

std::map<int, std::pair<int, int>> OpenObject::PrintedSections(const SystemMetrics& metrics,
                                                               bool nested) const {
    std::map<int, std::pair<int, int>> places;
    if (view != View::Preview || design == nullptr || !design->root)
        return places;
    const painting::SampleData sample(*design, application);
    painting::ReportPage page;
    if (nested)
        page.sections = painting::PlanPrintedBody(*design, sample, metrics);
    else
        page = painting::PlanReportPage(*design, sample, metrics);
    const int left = nested ? 0 : painting::kDeskMargin + page.left, top = nested ? 0 : painting::kDeskMargin;
    std::map<const DesignObject*, int> numbers;
    for (const auto& section : design->Sections())
        numbers[section.object] = section.number;
    for (const auto& section : page.sections)
        places.emplace(numbers[section.object], std::pair(left + section.left, top + section.top));
    return places;
}

std::vector<const DesignObject*> DatasheetColumns(const Design& design) {
    std::vector<const DesignObject*> columns;
    if (const auto* detail = design.Section(0))
        AddColumns(*detail, columns);
    std::stable_sort(columns.begin(), columns.end(), [](const DesignObject* left, const DesignObject* right) {
        return left->Integer("ColumnOrder", 0) < right->Integer("ColumnOrder", 0);
    });
    return columns;
}

std::int32_t DatasheetColumnWidth(const DesignObject& control) {
    if (control.Flag("ColumnHidden"))
        return 0;
    const auto width = control.Integer("ColumnWidth", -1);
    return width < 0 ? kUsualColumn : std::min(width, kBroadestColumn);
}

} // namespace tovimar::platform::access
