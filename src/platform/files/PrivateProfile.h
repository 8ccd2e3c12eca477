#pragma once

#include <string>
#include <vector>

/// Ini files as the platform's private profile functions read and write them: sections `[name]`, lines
/// `name=value`, comments behind ";". Names compare without regard to case, and of two sections with one name
/// the first counts. Files are text of the ANSI code page, or UTF-8 with its header; paths are Windows paths.
/// A missing file has no sections and is made by the first writing; what isn't changed keeps its place.
/// Readers never fail, writers raise as FileSystem does.
namespace tovimar::platform {

std::vector<std::string> PrivateProfileSectionNames(const std::string& path);
/// The section's lines without their outer blanks; empty ones and comments are left out.
std::vector<std::string> PrivateProfileSection(const std::string& path, const std::string& section);
/// Puts the lines in place of the section's, or adds the section at the end.
void WritePrivateProfileSection(const std::string& path, const std::string& section,
                                const std::vector<std::string>& lines);
/// Takes the section out, its heading too.
void DeletePrivateProfileSection(const std::string& path, const std::string& section);
/// Sets one item; the others and the comments of its section stay.
void WritePrivateProfileString(const std::string& path, const std::string& section, const std::string& name,
                               const std::string& value);

} // namespace tovimar::platform
