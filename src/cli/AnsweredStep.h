#pragma once

namespace tovimar::cli {

class FixedAnswer;

/// Answers every question with the same button as long as it lives, for whoever has answered it on the
/// command line. Boxes without a choice are shown.
class AnsweredStep {
public:
    explicit AnsweredStep(int answer);
    ~AnsweredStep();
    AnsweredStep(const AnsweredStep&) = delete;
    AnsweredStep& operator=(const AnsweredStep&) = delete;

private:
    FixedAnswer* fixed_; ///< owned by the environment
};

} // namespace tovimar::cli
