#pragma once

#include "cli/CommandLine.h"

namespace tovimar::cli {

class Surroundings;

/// Each gives the program's exit code and tells its failures itself.
int Generate(const Arguments& arguments, Surroundings& surroundings);
int RetakeScreenshot(const Arguments& arguments, Surroundings& surroundings);
int List(const Arguments& arguments);
int ShowOptions();

} // namespace tovimar::cli
