#include "host/access/FormFacts.h"

#include "host/access/LateBound.h"
#include "platform/text/Text.h"
#include "uimodel/clsAccFormColumn.h"

#include <algorithm>
#include <vector>

namespace tovimar {
namespace {

constexpr std::int32_t kDatasheet = 2;

} // namespace

CN_IDEAccFormProcessor::FormFacts::FormFacts(HostObject openForm) : form(std::move(openForm)) {
    CollectLabels();
    isDatasheet = late::IntegerOrZero(form, "currentview") == kDatasheet;
    if (isDatasheet)
        CollectColumns();
}

void CN_IDEAccFormProcessor::FormFacts::CollectLabels() {
    late::ForEach(late::Object(form, "Controls"), [this](const HostObject& control) {
        if (!text::EqualsIgnoringCase(late::ClassName(control), "Label"))
            return;
        if (const HostObject parent = late::ObjectOrNull(control, "Parent"))
            labelCaptions[late::Text(parent, "Name")] = late::TextOrEmpty(control, "Caption");
    });
}

void CN_IDEAccFormProcessor::FormFacts::CollectColumns() {
    std::vector<clsAccFormColumn> inOrder;
    late::ForEach(late::Object(form, "Controls"), [&inOrder](const HostObject& control) {
        clsAccFormColumn column;
        if (column.Init(control))
            inOrder.push_back(column);
    });
    std::stable_sort(inOrder.begin(), inOrder.end(), [](const auto& left, const auto& right) {
        return left.ColumnOrder < right.ColumnOrder;
    });
    std::int32_t left = 0;
    for (const clsAccFormColumn& column : inOrder) {
        columns[column.Name] = {left, column.ColumnWidth};
        left += std::max(column.ColumnWidth, 0);
    }
}

} // namespace tovimar
