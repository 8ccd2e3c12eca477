#include "cli/AnsweredStep.h"

#include "platform/Environment.h"

#include <memory>
#include <utility>

namespace tovimar::cli {

class FixedAnswer : public platform::MessageBoxes {
public:
    explicit FixedAnswer(int answer) : answer_(answer), before_(std::move(platform::Env().messageBoxes)) {}
    int Show(const std::string& text, std::uint32_t flags, const std::string& title) override {
        constexpr std::uint32_t kButtons = 7;
        return (flags & kButtons) == 0 ? before_->Show(text, flags, title) : answer_;
    }
    std::unique_ptr<platform::MessageBoxes> Before() { return std::move(before_); }

private:
    int answer_;
    std::unique_ptr<platform::MessageBoxes> before_;
};

AnsweredStep::AnsweredStep(int answer) {
    auto boxes = std::make_unique<FixedAnswer>(answer);
    fixed_ = boxes.get();
    platform::Env().messageBoxes = std::move(boxes);
}

AnsweredStep::~AnsweredStep() {
    // The boxes before must be out of the fixed ones before these go.
    auto before = fixed_->Before();
    platform::Env().messageBoxes = std::move(before);
}

} // namespace tovimar::cli
