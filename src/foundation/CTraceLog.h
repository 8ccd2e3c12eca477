#pragma once

#include <string>

namespace tovimar {

/// The trace. It is on exactly while the file "trace.txt" stands in the log folder; then every message is
/// written to "trace.xml", which is well-formed after each, and plainly to "trace.xml.txt". Error messages
/// also go to "tracedErrors.xml". Over 256 KB "trace.xml" rolls to "trace_back.xml", but not in unattended
/// runs. Nothing here ever fails.
class CTraceLog {
public:
    /// The log folder of the paths in force at the first use.
    CTraceLog() = default;
    explicit CTraceLog(std::string folder);

    bool IsOn();
    void addMessage(const std::string& vstrTraceMessage, bool vfIsErrMessage = false);

private:
    void Write(const std::string& message, bool isError);
    void WriteTrace(const std::string& record);
    void WriteErrors(const std::string& record);
    void StartFile(const std::string& path);
    const std::string& Folder();

    std::string folder_;
};

} // namespace tovimar
