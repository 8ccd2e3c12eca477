#pragma once

#include "platform/Environment.h"

#include <gtest/gtest.h>

#include <deque>
#include <functional>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace tovimar::test {

/// A clock that stands at 2026-01-02 03:04:05 until it is told to move.
class FakeClock : public platform::Clock {
public:
    platform::DateTime Now() override;
    double Timer() override { return seconds_; }
    /// Within the same day.
    void Advance(double seconds) { seconds_ += seconds; }

private:
    double seconds_ = 3 * 3600 + 4 * 60 + 5;
};

/// Gives {00000000-0000-0000-0000-000000000001} and so on.
class CountedIdentifiers : public platform::Identifiers {
public:
    std::string NewGuid() override;

private:
    int last_ = 0;
};

/// Records boxes and answers them by the scripted answers, then by their default buttons.
class FakeMessageBoxes : public platform::MessageBoxes {
public:
    struct Shown {
        std::string text;
        std::uint32_t flags = 0;
        std::string title;
    };
    int Show(const std::string& text, std::uint32_t flags, const std::string& title) override;

    std::vector<Shown> shown;
    std::deque<int> answers;
};

/// Lines "begin <message> <maximum>", "update <message> <value>", "end".
class RecordedProgress : public platform::ProgressView {
public:
    void Begin(const std::string& message, std::int32_t maximum) override;
    void Update(const std::string& message, std::int32_t value) override;
    void End() override { lines.push_back("end"); }

    std::vector<std::string> lines;
};

/// Records command lines; `run` says what a program does (exit code 0 and no output without one).
class FakeProcesses : public platform::Processes {
public:
    Outcome RunAndWait(const std::string& commandLine) override;
    bool Open(const std::string& pathOrAddress) override;

    std::vector<std::string> commandLines;
    std::vector<std::string> opened;
    std::function<Outcome(const std::string&)> run;
    bool canOpen = true;
};

/// Calls "<command> <help file> <data>", "top <window>", "close <window>". Windows are numbered from 1.
class FakeHelpViewer : public platform::HelpViewer {
public:
    std::int32_t Show(std::int32_t callerWindow, const std::string& helpFile, std::uint32_t command,
                      const std::string& data) override;
    void MakeTopmost(std::int32_t window) override { calls.push_back("top " + std::to_string(window)); }
    bool IsOpen(std::int32_t window) override { return open.count(window) != 0; }
    void Close(std::int32_t window) override;

    std::vector<std::string> calls;
    std::set<std::int32_t> open;
    bool canShow = true;

private:
    std::int32_t last_ = 0;
};

/// Timers that a test lets end by hand.
class FakeTimers : public platform::Timers {
public:
    std::int32_t Start(std::int32_t milliseconds, std::function<void()> tick) override;
    void Stop(std::int32_t timer) override { running_.erase(timer); }
    /// Ends every timer that runs now.
    void Fire();
    std::size_t Running() const { return running_.size(); }

    std::int32_t lastInterval = 0;

private:
    std::map<std::int32_t, std::function<void()>> running_;
    std::int32_t last_ = 0;
};

/// Base of tests that touch the surroundings: real files in a fresh folder, everything else faked. The
/// installation is that of the source tree's `install` folder unless a test sets its own.
class EnvironmentTest : public ::testing::Test {
protected:
    EnvironmentTest();
    ~EnvironmentTest() override;

    /// The fresh folder: as a Windows path with a trailing backslash, and native without one.
    const std::string& Folder() const { return folder_; }
    const std::string& NativeFolder() const { return nativeFolder_; }
    /// Windows path of a file in the fresh folder.
    std::string Path(const std::string& name) const { return folder_ + name; }
    /// Writes a file in the fresh folder, making its folders, and gives its Windows path.
    std::string WriteFile(const std::string& name, std::string_view bytes);
    std::string ReadFile(const std::string& path);
    /// Native path of the project's sources, with a slash behind.
    static std::string SourceFolder() { return TOVIMAR_SOURCE_DIR "/"; }
    /// Points the registry at an installation folder (Windows path).
    void SetInstallation(const std::string& folder);

    FakeClock* clock = nullptr;
    FakeMessageBoxes* boxes = nullptr;
    RecordedProgress* meter = nullptr;
    RecordedProgress* progress = nullptr;
    FakeProcesses* processes = nullptr;
    FakeHelpViewer* viewer = nullptr;
    FakeTimers* timers = nullptr;
    platform::Environment* environment = nullptr;

private:
    std::string folder_;
    std::string nativeFolder_;
    std::unique_ptr<platform::Environment> before_;
};

} // namespace tovimar::test
