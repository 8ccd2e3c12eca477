#include "cli/TreeSteps.h"

#include "cli/Stop.h"

#include <algorithm>
#include <array>
#include <limits>

namespace tovimar::cli {
namespace {

constexpr std::size_t kAny = std::numeric_limits<std::size_t>::max();

struct Operation {
    const char* name;
    std::size_t fewest;
    std::size_t most;
    const char* words;
    const char* meaning;
};

constexpr std::array<Operation, 17> kOperations = {{
    {"up", 1, 1, "NODE", "before the entry above it"},
    {"down", 1, 1, "NODE", "behind the entry below it"},
    {"left", 1, 1, "NODE", "out of its group, before it"},
    {"right", 1, 1, "NODE", "into the entry below it, as the first"},
    {"move", 2, 2, "NODE GROUP", "to the end of another group"},
    {"cut", 1, 1, "NODE", "take it out for a \"paste\""},
    {"copy", 1, 1, "NODE", "keep a copy for a \"paste\""},
    {"paste", 1, 1, "GROUP", "put that at the end of a group"},
    {"paste-special", 1, 1, "GROUP", "the same, asking whether with what is below it"},
    {"delete", 1, 1, "NODE", "take it out, asking about its page"},
    {"new", 2, 2, "GROUP TITLE", "write a new, empty page"},
    {"add", 2, 2, "GROUP FILE", "take in a page that exists"},
    {"skip", 1, 1, "NODE", "leave it and what is below it out of the help"},
    {"unskip", 1, 1, "NODE", "take it in again"},
    {"index", 1, kAny, "NODE [WORD...]", "show its index entries, or give it these"},
    {"xml", 1, 1, "NODE", "print it as the project file has it"},
    {"undo", 0, 0, "", "take the last step back"},
}};

const Operation& Known(const std::string& name) {
    const auto found = std::find_if(kOperations.begin(), kOperations.end(),
                                    [&](const Operation& operation) { return name == operation.name; });
    if (found == kOperations.end())
        throw Stop{"'" + name + "' is no operation on the contents\n\"tovimar tree --help\" shows them.",
                   kUsage};
    return *found;
}

void Check(const TreeStep& step) {
    const Operation& operation = Known(step.operation);
    if (step.arguments.size() < operation.fewest || step.arguments.size() > operation.most)
        throw Stop{"\"" + step.operation + "\" is written so: " + operation.name + " " + operation.words +
                       "\n\"then\" stands between two operations.",
                   kUsage};
}

bool Takes(const TreeStep& step) {
    return step.operation == "cut" || step.operation == "copy";
}

bool Pastes(const TreeStep& step) {
    return step.operation == "paste" || step.operation == "paste-special";
}

/// What is taken is lost at the end of the run.
void CheckPastes(const std::vector<TreeStep>& steps) {
    bool held = false;
    const TreeStep* open = nullptr;
    for (const TreeStep& step : steps) {
        if (Pastes(step) && !held)
            throw Stop{"there is nothing to paste; \"cut\" or \"copy\" comes before, as in: copy NODE then "
                       "paste GROUP",
                       kUsage};
        if (Takes(step))
            open = &step;
        else if (Pastes(step) || step.operation == "undo")
            open = nullptr;
        held = held || Takes(step);
    }
    if (open != nullptr)
        throw Stop{"what is " + std::string(open->operation == "cut" ? "cut" : "copied") +
                       " must be pasted in the same run: " + open->operation + " NODE then paste GROUP",
                   kUsage};
}

} // namespace

std::vector<TreeStep> TreeStepsOf(const std::vector<std::string>& words) {
    std::vector<TreeStep> steps;
    bool first = true;
    for (const std::string& word : words) {
        if (!first && word == "then") {
            first = true;
            continue;
        }
        if (first)
            steps.push_back({word, {}});
        else
            steps.back().arguments.push_back(word);
        first = false;
    }
    for (const TreeStep& step : steps)
        Check(step);
    CheckPastes(steps);
    return steps;
}

std::string TreeOperationsText() {
    constexpr std::size_t kWidth = 24;
    std::string text = "Operations, with \"then\" between several:\n";
    for (const Operation& operation : kOperations) {
        std::string line = "  " + std::string(operation.name) + " " + operation.words;
        line.resize(std::max(line.size() + 2, kWidth), ' ');
        text += line + operation.meaning + "\n";
    }
    return text;
}

} // namespace tovimar::cli
