#pragma once

#include "cli/CommandLine.h"

namespace tovimar::cli {

class Surroundings;

/// Each gives the program's exit code and tells its failures itself.
int CreateProject(const Arguments& arguments, Surroundings& surroundings);
int Generate(const Arguments& arguments, Surroundings& surroundings);
int Regenerate(const Arguments& arguments, Surroundings& surroundings);
int Recompile(const Arguments& arguments, Surroundings& surroundings);
int RetakeScreenshot(const Arguments& arguments, Surroundings& surroundings);
int Open(const Arguments& arguments, Surroundings& surroundings);
int ListProjects(const Arguments& arguments);
int ForgetProject(const Arguments& arguments, Surroundings& surroundings);
int ShowContents(const Arguments& arguments, Surroundings& surroundings);
int EditTree(const Arguments& arguments, Surroundings& surroundings);
int ListSettings(const Arguments& arguments, Surroundings& surroundings);
int GetSetting(const Arguments& arguments, Surroundings& surroundings);
int SetSetting(const Arguments& arguments, Surroundings& surroundings);
int List(const Arguments& arguments);
int InspectDatabase(const Arguments& arguments, Surroundings& surroundings);
int ExportTexts(const Arguments& arguments, Surroundings& surroundings);
int ShowOptions();
int ConvertContents(const Arguments& arguments, Surroundings& surroundings);

} // namespace tovimar::cli
