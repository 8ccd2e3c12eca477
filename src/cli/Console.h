#pragma once

#include "platform/Environment.h"

#include <memory>
#include <string>

/// What the program shows: messages on standard error, results on standard output, paths native.
namespace tovimar::cli {

/// "tovimar: error: " and the text; further lines indented.
void PrintError(const std::string& text);
void PrintWarning(const std::string& text);
/// Without a prefix, on standard error.
void PrintHint(const std::string& text);
/// On standard error, and the line stays open for an answer.
void PrintPrompt(const std::string& text);
/// On standard output.
void PrintResult(const std::string& text);
/// On standard output, byte by byte.
void PrintRaw(const std::string& bytes);

/// On a terminal one line with a bar that is written over and over; elsewhere a line per phase, and with
/// `verbose` one per object.
class ProgressLine {
public:
    explicit ProgressLine(bool verbose);
    ~ProgressLine() { Clear(); }
    ProgressLine(const ProgressLine&) = delete;
    ProgressLine& operator=(const ProgressLine&) = delete;

    void Phase(const std::string& text);
    void Object(const std::string& kind, const std::string& name, int position, int maximum);
    /// What is done within a phase or an object: beside the bar, and only there.
    void Detail(const std::string& text);
    /// Takes the line away before something else is printed.
    void Clear();

private:
    void Draw(const std::string& text);

    bool terminal_;
    bool verbose_;
    bool drawn_ = false;
    std::string bar_;
};

/// Boxes are printed. One with a choice is asked on the terminal when there is somebody to answer; else its
/// default button answers. What would leave the program, such as a mail with a report, is declined.
class ConsoleMessageBoxes : public platform::MessageBoxes {
public:
    ConsoleMessageBoxes(ProgressLine& progress, bool verbose, bool mayAsk)
        : progress_(progress), verbose_(verbose), mayAsk_(mayAsk) {}
    int Show(const std::string& text, std::uint32_t flags, const std::string& title) override;

    /// Warnings are why the program stops, as long as this is set.
    bool warningsStop = false;
    /// How many errors were told.
    int errors = 0;

private:
    void Tell(const std::string& text, std::uint32_t flags);

    ProgressLine& progress_;
    bool verbose_;
    bool mayAsk_;
};

/// The progress window's messages, which change with every field of a table.
class DetailView : public platform::ProgressView {
public:
    explicit DetailView(ProgressLine& progress) : progress_(progress) {}
    void Begin(const std::string& message, std::int32_t) override { progress_.Detail(message); }
    void Update(const std::string& message, std::int32_t) override { progress_.Detail(message); }
    void End() override {}

private:
    ProgressLine& progress_;
};

} // namespace tovimar::cli
