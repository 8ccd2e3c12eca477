#pragma once

#include <string>

/// Names and numbers of the product that stand in its files and messages.
namespace tovimar {

constexpr const char* kProductName = "Tovimar";
/// Form of the name in file names: "vasmoraSettings.xml".
constexpr const char* kProductFileName = "vasmora";
constexpr const char* kApplicationTitle = "Tovimar Add-In";
/// Folder of the user's files below the application data folder.
constexpr const char* kProductFolder = "Tovimar\\";
constexpr const char* kSupportAddress = "support@tovimar.example";

constexpr int kMajorVersion = 2;
constexpr int kMinorVersion = 1;
/// Stands directly behind the minor version. The topics' readers tell the generations of topics apart by
/// the four numbers: from 2.1.0.49 on the headings of a topic carry its anchors.
constexpr const char* kRevision = ".0.100";
/// Fixed with the release, so that one build of the sources writes the same files as another.
constexpr const char* kBuildDate = "2026-11-22";

/// "2.1.0.100 [2026-11-22]".
std::string VersionText();
/// "Tovimar Add-In v.2.1.0.100 [2026-11-22]".
std::string TitleAndVersion();

} // namespace tovimar
