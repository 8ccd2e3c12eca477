#pragma once

#include "cli/Console.h"

#include <memory>
#include <string>

namespace tovimar::cli {

struct Arguments;

/// The program's surroundings: the real ones with console messages, the installation that belongs to the
/// program and the help compiler that stands beside it.
class Surroundings {
public:
    explicit Surroundings(const Arguments& arguments);
    ~Surroundings();
    Surroundings(const Surroundings&) = delete;
    Surroundings& operator=(const Surroundings&) = delete;

    ProgressLine& Progress() { return progress_; }
    ConsoleMessageBoxes& Boxes() { return *boxes_; }
    /// Somebody is there to answer questions.
    bool Asks() const { return asks_; }

    /// Empty when the installation is complete; else what to tell.
    std::string MissingInstallation() const;

private:
    ProgressLine progress_;
    bool asks_;
    ConsoleMessageBoxes* boxes_ = nullptr;
    std::unique_ptr<platform::Environment> before_;
};

} // namespace tovimar::cli
