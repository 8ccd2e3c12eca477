#pragma once

#include "platform/Environment.h"

#include <memory>

/// How a command-line program shows a help, a page or a folder: with the program that the environment
/// variable TOVIMAR_VIEWER names, else with the desktop's. Where neither is there, the path or address is
/// printed.
namespace tovimar::cli {

/// The real processes, but for what they open.
std::unique_ptr<platform::Processes> ShowingProcesses(std::unique_ptr<platform::Processes> real);
/// Opens compiled help as any other file: viewers here can't be told a topic.
std::unique_ptr<platform::HelpViewer> ShowingHelpViewer();

} // namespace tovimar::cli
