#include "host/contract/ObjectTypes.h"

#include "platform/text/Text.h"

#include <array>
#include <utility>

namespace tovimar {
namespace {

constexpr std::array<std::pair<std::int32_t, const char*>, 7> kWords{{{ObjectType::kTable, "Table"},
                                                                      {ObjectType::kQuery, "Query"},
                                                                      {ObjectType::kForm, "Form"},
                                                                      {ObjectType::kReport, "Report"},
                                                                      {ObjectType::kMacro, "Macro"},
                                                                      {ObjectType::kWorksheet, "Worksheet"},
                                                                      {ObjectType::kChart, "Chart"}}};

} // namespace

std::string ObjectTypeText(std::int32_t objectType) {
    for (const auto& [code, word] : kWords)
        if (code == objectType)
            return word;
    return {};
}

std::int32_t ObjectTypeOfText(const std::string& word) {
    for (const auto& [code, known] : kWords)
        if (text::EqualsIgnoringCase(known, word))
            return code;
    return 0;
}

} // namespace tovimar
