#pragma once

#include <cstdint>
#include <string>

/// The fixed vocabulary shared by commands, project files and source projects.
namespace tovimar {

/// Object type codes; 0 to 4 are the host's own numbers.
namespace ObjectType {
constexpr std::int32_t kTable = 0;
constexpr std::int32_t kQuery = 1;
constexpr std::int32_t kForm = 2;
constexpr std::int32_t kReport = 3;
constexpr std::int32_t kMacro = 4;
constexpr std::int32_t kWorksheet = 81;
constexpr std::int32_t kChart = 82;
/// A further kind of form, known to `IClientFormProcessor::IsCorrectTypeForAForm` alone.
constexpr std::int32_t kOtherForm = 100;
} // namespace ObjectType

/// "Table", "Query", "Form", "Report", "Macro", "Worksheet", "Chart"; empty for any other code.
std::string ObjectTypeText(std::int32_t objectType);
/// The code of such a word, ignoring case; 0 for any other word.
std::int32_t ObjectTypeOfText(const std::string& word);

/// Kinds of source projects; compared without regard to case.
namespace SourceProjectKind {
constexpr const char* kAspNet = "ASP.NET";
constexpr const char* kMSAccess = "MS ACCESS";
constexpr const char* kVB6 = "VB6";
constexpr const char* kVBNet = "VB.NET";
constexpr const char* kCSharp = "C#";
constexpr const char* kJSharp = "J#";
constexpr const char* kCpp = "C++";
constexpr const char* kMSExcel = "MS EXCEL";
} // namespace SourceProjectKind

} // namespace tovimar
