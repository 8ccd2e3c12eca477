#pragma once

#include "platform/Environment.h"

namespace tovimar::platform {

/// Splits a command line at blanks outside of double quotes; the quotes go.
std::vector<std::string> SplitCommandLine(const std::string& commandLine);

/// Programs of the machine. Their paths are looked up through `files`, which must outlive this object.
class RealProcesses : public Processes {
public:
    explicit RealProcesses(FileSystem& files) : files_(files) {}

    Outcome RunAndWait(const std::string& commandLine) override;
    bool Open(const std::string& pathOrAddress) override;

private:
    std::vector<std::string> NativeArguments(const std::string& commandLine);

    FileSystem& files_;
};

} // namespace tovimar::platform
