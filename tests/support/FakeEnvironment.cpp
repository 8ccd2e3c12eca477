#include "support/FakeEnvironment.h"

#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "platform/Interrupt.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <utility>

namespace tovimar::test {
namespace fs = std::filesystem;
namespace {

std::string MakeTemporaryFolder() {
    std::string pattern = (fs::temp_directory_path() / "tovimar-test-XXXXXX").string();
    if (mkdtemp(pattern.data()) == nullptr)
        throw std::runtime_error("no temporary folder: " + pattern);
    return pattern;
}

/// Puts one fake in its place and keeps hold of it.
template <typename Fake, typename Part> Fake* Place(std::unique_ptr<Part>& part) {
    auto fake = std::make_unique<Fake>();
    Fake* held = fake.get();
    part = std::move(fake);
    return held;
}

/// Nothing of an earlier test may be seen in a later one.
void ForgetSession() {
    Session::Run() = {};
    Session::SetContext(nullptr);
    Session::SetTraceLog(nullptr);
    Session::SetMessages(nullptr);
    Session::SetProjects(nullptr);
    Session::SetSettings(nullptr);
    Session::SetParameters(nullptr);
    Session::SetHelpProjectTree(nullptr);
    SetUnattendedMessages(false, nullptr);
    ForgetNameEncodingTable();
    text::SetAnsiCodePage(1252);
    platform::ClearInterrupt();
}

} // namespace

platform::DateTime FakeClock::Now() {
    const int whole = static_cast<int>(seconds_);
    return {2026, 1, 2, whole / 3600, whole / 60 % 60, whole % 60, seconds_};
}

std::string CountedIdentifiers::NewGuid() {
    char text[40];
    std::snprintf(text, sizeof text, "{00000000-0000-0000-0000-%012X}", ++last_);
    return text;
}

int FakeMessageBoxes::Show(const std::string& text, std::uint32_t flags, const std::string& title) {
    shown.push_back({text, flags, title});
    if (answers.empty())
        return platform::DefaultMessageBoxAnswer(flags);
    const int answer = answers.front();
    answers.pop_front();
    return answer;
}

void RecordedProgress::Begin(const std::string& message, std::int32_t maximum) {
    lines.push_back("begin " + message + " " + std::to_string(maximum));
}

void RecordedProgress::Update(const std::string& message, std::int32_t value) {
    lines.push_back("update " + message + " " + std::to_string(value));
}

platform::Processes::Outcome FakeProcesses::RunAndWait(const std::string& commandLine) {
    commandLines.push_back(commandLine);
    return run ? run(commandLine) : Outcome{};
}

bool FakeProcesses::Open(const std::string& pathOrAddress) {
    opened.push_back(pathOrAddress);
    return canOpen;
}

std::int32_t FakeHelpViewer::Show(std::int32_t, const std::string& helpFile, std::uint32_t command,
                                  const std::string& data) {
    calls.push_back(std::to_string(command) + " " + helpFile + " " + data);
    if (!canShow)
        return 0;
    open.insert(++last_);
    return last_;
}

void FakeHelpViewer::Close(std::int32_t window) {
    calls.push_back("close " + std::to_string(window));
    open.erase(window);
}

std::int32_t FakeTimers::Start(std::int32_t milliseconds, std::function<void()> tick) {
    lastInterval = milliseconds;
    running_[++last_] = std::move(tick);
    return last_;
}

void FakeTimers::Fire() {
    for (const auto& [timer, tick] : std::exchange(running_, {}))
        tick();
}

EnvironmentTest::EnvironmentTest() : nativeFolder_(MakeTemporaryFolder()) {
    auto made = platform::MakeRealEnvironment(
        {nativeFolder_ + "/.data", nativeFolder_ + "/.config", SourceFolder() + "install"});
    environment = made.get();
    before_ = platform::SetEnvironment(std::move(made));
    clock = Place<FakeClock>(environment->clock);
    Place<CountedIdentifiers>(environment->identifiers);
    boxes = Place<FakeMessageBoxes>(environment->messageBoxes);
    meter = Place<RecordedProgress>(environment->hostMeter);
    progress = Place<RecordedProgress>(environment->progressWindow);
    processes = Place<FakeProcesses>(environment->processes);
    viewer = Place<FakeHelpViewer>(environment->helpViewer);
    timers = Place<FakeTimers>(environment->timers);
    environment->userName = "tester";
    environment->languageId = 1033;
    folder_ = platform::WithTrailingBackslash(environment->files->FromNative(nativeFolder_));
    environment->folders.temporary = folder_ + ".tmp\\";
    environment->files->MakeFolders(environment->folders.temporary);
    ForgetSession();
}

EnvironmentTest::~EnvironmentTest() {
    ForgetSession();
    platform::SetEnvironment(std::move(before_));
    std::error_code ignored;
    fs::remove_all(nativeFolder_, ignored);
}

std::string EnvironmentTest::WriteFile(const std::string& name, std::string_view bytes) {
    const std::string path = Path(name);
    environment->files->MakeFolders(platform::FolderOf(path));
    environment->files->WriteFile(path, bytes);
    return path;
}

std::string EnvironmentTest::ReadFile(const std::string& path) {
    return environment->files->ReadFile(path);
}

void EnvironmentTest::SetInstallation(const std::string& folder) {
    environment->registry->Write("HKEY_LOCAL_MACHINE\\SOFTWARE\\Tovimar\\Microsoft Access", "InstallPath",
                                 folder);
}

} // namespace tovimar::test
