#include "platform/access/ApplicationFolder.h"

#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/AccessApplication.h"
#include "platform/access/ExportReader.h"
#include "platform/access/HexDigit.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>

namespace tovimar::platform::access {

namespace {

constexpr int kMaxDepth = 3;
constexpr std::size_t kMaxFiles = 20000;
/// The start of a file tells what it is; the whole is read when it is asked for.
constexpr std::size_t kStartBytes = 16384;

/// Lower case, without the dot.
std::string Extension(const std::string& path) {
    const auto extension = ExtensionOf(path);
    return extension.empty() ? extension : text::ToLower(extension.substr(1));
}

/// What a folder's name says about its files.
enum class FolderHint {
    None,
    Forms,
    Reports,
    Queries,
    Macros,
    Modules,
    TableDefinitions,
    Tables,
    Relations,
    Images
};

FolderHint HintOf(const std::string& folderName) {
    static const std::map<std::string, FolderHint> kHints = {{"forms", FolderHint::Forms},
                                                             {"form", FolderHint::Forms},
                                                             {"reports", FolderHint::Reports},
                                                             {"report", FolderHint::Reports},
                                                             {"queries", FolderHint::Queries},
                                                             {"query", FolderHint::Queries},
                                                             {"macros", FolderHint::Macros},
                                                             {"macro", FolderHint::Macros},
                                                             {"scripts", FolderHint::Macros},
                                                             {"modules", FolderHint::Modules},
                                                             {"module", FolderHint::Modules},
                                                             {"tbldef", FolderHint::TableDefinitions},
                                                             {"tbldefs", FolderHint::TableDefinitions},
                                                             {"tabledefs", FolderHint::TableDefinitions},
                                                             {"tables", FolderHint::Tables},
                                                             {"relations", FolderHint::Relations},
                                                             {"images", FolderHint::Images}};
    const auto found = kHints.find(text::ToLower(folderName));
    return found == kHints.end() ? FolderHint::None : found->second;
}

/// A name that begins with the text of two points is an object's, with its backslashes encoded.
bool IsHidden(const std::string& name) {
    return name.starts_with('.') && !name.starts_with("..");
}

bool IsObject(PartKind kind) {
    return kind <= PartKind::Table || kind == PartKind::LinkedTable;
}

bool IsDatabase(const std::string& extension) {
    return extension == "accdb" || extension == "mdb" || extension == "accde" || extension == "mde";
}

bool IsPicture(const std::string& extension) {
    static const std::set<std::string> kPictures = {"png", "jpg", "jpeg", "bmp", "gif", "ico", "emf", "wmf"};
    return kPictures.contains(extension);
}

bool IsText(const std::string& extension) {
    static const std::set<std::string> kTexts = {"bas",  "form", "report", "txt",  "macro", "sql",
                                                 "json", "xml",  "cls",    "qdef", "query", "def"};
    return kTexts.contains(extension);
}

std::optional<PartKind> KindOfJson(const std::string& start, FolderHint hint) {
    const auto has = [&](std::string_view word) { return start.find(word) != std::string::npos; };
    if (has("\"clsDbTableDef\""))
        return PartKind::LinkedTable;
    if (has("\"clsDbDocument\""))
        return PartKind::Documents;
    if (has("\"clsDbQuery\"") || hint == FolderHint::Queries)
        return PartKind::QueryInfo;
    if (has("\"clsDbRelation\"") || hint == FolderHint::Relations)
        return PartKind::Relation;
    if (has("\"clsDbSharedImage\"") || hint == FolderHint::Images)
        return PartKind::PictureInfo;
    if (has("\"clsDbVbeProject\"") || has("\"clsVbeProject\""))
        return PartKind::ProjectInfo;
    return std::nullopt;
}

std::optional<PartKind> KindOfXml(const std::string& start, FolderHint hint) {
    if (hint == FolderHint::TableDefinitions || start.find(":schema") != std::string::npos)
        return PartKind::TableProperties;
    if (hint == FolderHint::Tables)
        return PartKind::TableData;
    return std::nullopt;
}

/// By name where the content says nothing: a damaged file stays in the list of its folder.
std::optional<PartKind> KindByName(FolderHint hint, const std::string& extension, const std::string& stem) {
    const bool note = text::EqualsIgnoringCase(stem, "readme") || text::EqualsIgnoringCase(stem, "license");
    if (extension == "form")
        return PartKind::Form;
    if (extension == "report")
        return PartKind::Report;
    if (extension == "macro")
        return PartKind::Macro;
    if (note || extension == "cls" || extension == "json" || extension == "xml")
        return std::nullopt;
    switch (hint) {
    case FolderHint::Forms:
        return PartKind::Form;
    case FolderHint::Reports:
        return PartKind::Report;
    case FolderHint::Queries:
        return PartKind::Query;
    case FolderHint::Macros:
        return PartKind::Macro;
    case FolderHint::Modules:
        return PartKind::Module;
    case FolderHint::TableDefinitions:
        return extension == "sql" ? std::optional(PartKind::Table) : std::nullopt;
    case FolderHint::Tables:
        return PartKind::TableData;
    case FolderHint::Relations:
        return PartKind::Relation;
    default:
        return std::nullopt;
    }
}

std::optional<PartKind> KindOfText(const std::string& start, FolderHint hint, const std::string& extension,
                                   const std::string& stem) {
    if (hint == FolderHint::Tables && extension == "txt")
        return PartKind::TableData;
    switch (RecognizeExport(start)) {
    case ExportContent::Form:
        return PartKind::Form;
    case ExportContent::Report:
        return PartKind::Report;
    case ExportContent::Macro:
        return PartKind::Macro;
    case ExportContent::Query:
        return PartKind::Query;
    case ExportContent::Module:
        return extension == "txt" && hint == FolderHint::None ? std::nullopt
                                                              : std::optional(PartKind::Module);
    case ExportContent::TableSql:
        // A query may define a table; a statement alone in a folder of its own kind defines one.
        return hint == FolderHint::Queries ? PartKind::Query : PartKind::Table;
    case ExportContent::QuerySql:
        return hint == FolderHint::Queries || extension == "qdef" ? std::optional(PartKind::Query)
                                                                  : std::nullopt;
    case ExportContent::Json:
        return KindOfJson(start, hint);
    case ExportContent::Xml:
        return KindOfXml(start, hint);
    case ExportContent::Unknown:
        break;
    }
    return KindByName(hint, extension, stem);
}

class FolderScanner {
public:
    explicit FolderScanner(const std::string& path) { folder_.path = path; }

    ApplicationFolder Run() {
        std::vector<std::string> level{folder_.path};
        for (int depth = 0; depth <= kMaxDepth && !level.empty(); ++depth) {
            std::vector<std::string> next;
            for (const auto& path : level)
                ScanLevel(path, depth, next);
            level = std::move(next);
            // Deeper folders belong to the application only where nothing lies higher up.
            if (depth >= 1 && HasObjects())
                break;
        }
        MarkCode();
        std::sort(folder_.parts.begin(), folder_.parts.end(), [](const auto& left, const auto& right) {
            return text::CompareIgnoringCase(left.path, right.path) < 0;
        });
        return std::move(folder_);
    }

private:
    bool HasObjects() const {
        return std::any_of(folder_.parts.begin(), folder_.parts.end(),
                           [](const ApplicationPart& part) { return IsObject(part.kind); });
    }

    void ScanLevel(const std::string& path, int depth, std::vector<std::string>& next) {
        auto& files = *Env().files;
        // The folder that was asked for is read in any case: copies may have been put over it, note and all.
        if (depth > 0 && files.FileExists(path + "\\" + kNoApplicationMark))
            return;
        const auto hint = HintOf(FileNameOf(path));
        for (const auto& name : files.ListFiles(path, "*.*"))
            if (!IsHidden(name) && ++seen_ <= kMaxFiles)
                TakeFile(path + "\\" + name, hint, depth);
        for (const auto& name : files.ListFolders(path))
            if (!IsHidden(name) && next.size() < kMaxFiles)
                next.push_back(path + "\\" + name);
    }

    void TakeFile(const std::string& path, FolderHint hint, int depth) {
        const auto stem = BaseNameOf(path);
        const auto extension = Extension(path);
        if (IsDatabase(extension)) {
            if (depth <= 1)
                folder_.databases.push_back(path);
            folder_.topLevelDatabases += depth == 0 ? 1 : 0;
            return;
        }
        std::optional<PartKind> kind;
        if (hint == FolderHint::Images && IsPicture(extension))
            kind = PartKind::Picture;
        else if (IsText(extension))
            kind = KindOfText(ReadStart(path), hint, extension, stem);
        if (kind)
            folder_.parts.push_back({*kind, DecodeObjectName(stem), path});
    }

    static std::string ReadStart(const std::string& path) {
        try {
            return DecodeExportText(std::string_view(Env().files->ReadFile(path)).substr(0, kStartBytes));
        } catch (const RaisedError&) {
            return {}; // its name still tells where it belongs; opening it gives the reason
        }
    }

    /// A class module beside a form or report of its name is the code of that object.
    void MarkCode() {
        std::set<std::string> designs;
        for (const auto& part : folder_.parts)
            if (part.kind == PartKind::Form || part.kind == PartKind::Report)
                designs.insert(text::FoldCase(BaseNameOf(part.path)));
        for (auto& part : folder_.parts)
            if (part.kind == PartKind::Module && Extension(part.path) == "cls" &&
                designs.contains(text::FoldCase(BaseNameOf(part.path))))
                part.kind = PartKind::Code;
    }

    ApplicationFolder folder_;
    std::size_t seen_ = 0;
};

} // namespace

ApplicationFolder ScanApplicationFolder(const std::string& path) {
    return FolderScanner(path).Run();
}

std::string DecodeObjectName(const std::string& fileName) {
    constexpr std::string_view kForbidden = "<>:\"/\\|?*%.";
    std::string name;
    for (std::size_t i = 0; i < fileName.size(); ++i) {
        if (fileName[i] == '%' && i + 2 < fileName.size()) {
            const int high = HexDigit(fileName[i + 1]);
            const int low = HexDigit(fileName[i + 2]);
            const char decoded = static_cast<char>(high * 16 + low);
            if (high >= 0 && low >= 0 && kForbidden.find(decoded) != std::string_view::npos) {
                name += decoded;
                i += 2;
                continue;
            }
        }
        name += fileName[i];
    }
    return name;
}

} // namespace tovimar::platform::access
