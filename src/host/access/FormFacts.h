#pragma once

#include "host/access/CN_IDEAccFormProcessor.h"

#include <string>
#include <unordered_map>

namespace tovimar {

/// Questions about one form that each of its controls asks again: worked out at the first.
struct CN_IDEAccFormProcessor::FormFacts {
    explicit FormFacts(HostObject openForm);

    HostObject form; ///< keeps its identity from being used anew
    /// Caption of the label that is attached to a control, by the control's name; of several the last.
    std::unordered_map<std::string, std::string> labelCaptions;
    struct Column {
        std::int32_t left = 0;  ///< twips
        std::int32_t width = 0; ///< twips
    };
    /// Columns of a datasheet, by the control's name.
    std::unordered_map<std::string, Column> columns;
    bool isDatasheet = false;

private:
    void CollectLabels();
    void CollectColumns();
};

} // namespace tovimar
