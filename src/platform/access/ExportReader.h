#pragma once

#include "platform/access/Design.h"

#include <memory>
#include <string>
#include <string_view>

/// Text exports as `SaveAsText` writes them: blocks "Begin Type ... End" with "Name =value" lines, blobs
/// "Name = Begin" of hexadecimal lines, quoted texts that go on over quoted lines, and behind the design of
/// a form or report a line "CodeBehindForm" with the module's source.
namespace tovimar::platform::access {

/// UTF-8 text of a file's bytes: UTF-8 with or without mark, UTF-16 of either order with a mark or by its
/// zero bytes, else the ANSI code page.
std::string DecodeExportText(std::string_view bytes);

/// What a text is by its first lines, whatever its file is called.
enum class ExportContent { Unknown, Form, Report, Macro, Query, Module, TableSql, QuerySql, Json, Xml };
ExportContent RecognizeExport(std::string_view text);

/// The blocks of an export as they nest, without any meaning: a root of type "" with the leading properties
/// and one child per block; a nameless block has type "". Properties may repeat and keep their order.
/// What follows a line "CodeBehindForm" or "CodeBehindReport" goes to `code`.
/// Raises 0x80040001 "<file>, line <n>: <reason>" for a block that isn't closed, an "End" too many, a text
/// without its closing quote, nesting deeper than 200 and sources above 256 MiB.
struct ExportTree {
    std::unique_ptr<DesignObject> root;
    std::string code;
};
ExportTree ParseExportTree(std::string_view text, const std::string& nativePath);

/// The design of a form, report or macro. Nameless blocks are dissolved, the first one inside a form gives
/// the prototypes; every object has a name and its prototype. Raises as ParseExportTree, and for a text
/// that holds no object of the kind.
std::unique_ptr<Design> ReadDesign(std::string_view text, ObjectKind kind, const std::string& name,
                                   const std::string& nativePath);

/// The design of what ParseExportTree gave, or of blocks that were read from a database.
std::unique_ptr<Design> DesignOfTree(ExportTree tree, ObjectKind kind, const std::string& name,
                                     const std::string& nativePath);

/// Module source as the host's editor counts its lines: without the class header and "Attribute" lines.
std::string VisibleCode(std::string_view code);

} // namespace tovimar::platform::access
