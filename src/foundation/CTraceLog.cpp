#include "foundation/CTraceLog.h"

#include "foundation/CUTF8FileWriter.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <cstdio>

namespace tovimar {
namespace {

constexpr std::string_view kClosingTag = "</dataroot>";
constexpr std::uint64_t kRolloverPosition = 262145;

std::string EscapeMessage(const std::string& message) {
    std::string out;
    out.reserve(message.size());
    for (const char byte : message) {
        switch (byte) {
        case '&':
            out += "&amp;";
            break;
        case '"':
            out += "&quot;";
            break;
        case '<':
            out += "&lt;";
            break;
        case '>':
            out += "&gt;";
            break;
        default:
            // Other controls stand in no XML file; the trace must stay readable.
            out += static_cast<unsigned char>(byte) < 0x20 && byte != '\t' && byte != '\r' && byte != '\n'
                       ? '?'
                       : byte;
        }
    }
    return text::MakeValidUtf8(out);
}

std::string Record(const std::string& message) {
    const auto now = platform::Env().clock->Now();
    char time[24];
    std::snprintf(time, sizeof time, "%02d:%02d:%02d", now.hour, now.minute, now.second);
    return "<msg>" + std::string(time) + " - " + EscapeMessage(message) + "</msg>\r\n";
}

std::string FileHead() {
    const auto now = platform::Env().clock->Now();
    char started[48];
    std::snprintf(started, sizeof started, "%04d-%02d-%02d %02d:%02d:%02d", now.year, now.month, now.day,
                  now.hour, now.minute, now.second);
    return std::string("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n"
                       "<dataroot xmlns:od=\"urn:schemas-microsoft-com:officedata\" started=\"") +
           started + "\">\r\n";
}

std::uint64_t ClosingPosition(const std::string& path) {
    const std::uint64_t length = platform::Env().files->FileLength(path);
    return length > kClosingTag.size() ? length - kClosingTag.size() : 0;
}

void WriteAtEnd(const std::string& path, std::uint64_t position, const std::string& record) {
    platform::Env().files->OverwriteTail(path, position, record + std::string(kClosingTag));
}

} // namespace

CTraceLog::CTraceLog(std::string folder) : folder_(platform::WithTrailingBackslash(folder)) {}

const std::string& CTraceLog::Folder() {
    if (folder_.empty())
        folder_ = LogFolder();
    return folder_;
}

bool CTraceLog::IsOn() {
    bool on = false;
    PassOver([&] { on = platform::Env().files->FileExists(Folder() + "trace.txt"); });
    return on;
}

void CTraceLog::addMessage(const std::string& vstrTraceMessage, bool vfIsErrMessage) {
    if (IsOn())
        PassOver([&] { Write(vstrTraceMessage, vfIsErrMessage); });
}

void CTraceLog::Write(const std::string& message, bool isError) {
    auto& files = *platform::Env().files;
    if (!files.FileExists(Folder() + "trace.xml")) {
        StartFile(Folder() + "trace.xml");
        StartFile(Folder() + "tracedErrors.xml");
    }
    const std::string record = Record(message);
    WriteTrace(record);
    if (isError)
        WriteErrors(record);
}

void CTraceLog::StartFile(const std::string& path) {
    platform::Env().files->WriteFile(path, FileHead() + std::string(kClosingTag));
}

void CTraceLog::WriteTrace(const std::string& record) {
    auto& files = *platform::Env().files;
    const std::string path = Folder() + "trace.xml";
    std::uint64_t position = ClosingPosition(path);
    const bool unattended =
        Session::Context().AutomatedTestModeOn() || Session::Context().WizardUnattendedExecution();
    if (!unattended && position >= kRolloverPosition) {
        files.CopyFile(path, Folder() + "trace_back.xml");
        StartFile(path);
        position = ClosingPosition(path);
    }
    if (position == 0)
        return;
    WriteAtEnd(path, position, record);
    files.AppendFile(path + ".txt", EncodePlainText(record));
}

void CTraceLog::WriteErrors(const std::string& record) {
    const std::string path = Folder() + "tracedErrors.xml";
    if (!platform::Env().files->FileExists(path))
        StartFile(path);
    const std::uint64_t position = ClosingPosition(path);
    if (position > 0)
        WriteAtEnd(path, position, record);
}

} // namespace tovimar
