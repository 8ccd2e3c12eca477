#pragma once

#include "platform/KeyedList.h"
#include "platform/Value.h"
#include "platform/access/AccessApplication.h"
#include "platform/access/ApplicationFolder.h"
#include "platform/access/DatabaseReader.h"
#include "platform/access/ExportReader.h"
#include "platform/access/OpenObject.h"
#include "platform/access/QueryReader.h"

#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace tovimar::platform::access {

class DatabaseDesigns;

/// One application as its sources give it, whatever they are. Everything is read once: names at the start,
/// designs, definitions and records when they are first asked for.
class ApplicationModel : public ApplicationSource {
public:
    /// By the folded name of the property.
    using WrittenProperties = std::unordered_map<std::string, Value>;

    /// Raises as OpenAccessApplication.
    explicit ApplicationModel(const std::string& nativePath);
    ~ApplicationModel() override;

    const std::string& FullName() const {
        return fullName_;
    }                                                     ///< Windows path of the database, may be virtual
    const std::string& Folder() const { return folder_; } ///< Windows path without trailing backslash
    /// The name of the code project.
    std::string ProjectName();

    /// Names of a kind, sorted without regard to case.
    const std::vector<std::string>& Names(ObjectKind kind) const;
    bool Contains(ObjectKind kind, const std::string& name) const;
    /// The spelling in the application for a name in any case; the name itself when it is unknown.
    std::string NameOf(ObjectKind kind, const std::string& name) const;

    /// Raises 0x80040001 with the reason for an object that can't be read or of which only the name is known.
    const Design& OpenDesign(ObjectKind kind, const std::string& name);
    /// Empty without a reason against opening the object.
    std::string DesignError(ObjectKind kind, const std::string& name);
    bool DesignKnown(ObjectKind kind, const std::string& name) const;
    /// Forgets designs that were read longest ago, but for the last 8 MiB of export text; they are read again
    /// on demand, and written values come back with them. To be called when no object is open: pointers to
    /// designs end here.
    void TrimDesigns();
    /// Text of the object's export with its code, UTF-8. Raises as OpenDesign.
    std::string ExportText(ObjectKind kind, const std::string& name);
    /// Source of a module; none when there is no such module or its source isn't known.
    std::optional<std::string> ModuleCode(const std::string& name);

    /// "Description" and the like of a form, report, macro or module.
    NamedTexts DocumentProperties(ObjectKind kind, const std::string& name) const;

    /// Null for an unknown name. Raises 0x80040001 for a definition that can't be read.
    const TableDefinition* FindTable(const std::string& name);
    const QueryDefinition* FindQuery(const std::string& name);
    const std::vector<FieldDefinition>& QueryFields(const std::string& name);
    const std::vector<RelationDefinition>& Relations() const { return relations_; }

    /// Sentences for a person on what the sources don't agree in.
    const std::vector<std::string>& Notes() const { return notes_; }

    const Design* FindDesign(ObjectKind kind, const std::string& name) override;
    const Records* FindRecords(const std::string& recordSource, int rows) override;
    std::string FindPicture(const std::string& name) override;
    const std::vector<std::uint32_t>& ThemeColors() override;

    /// Values that were written to an object's properties; they last as long as the application.
    WrittenProperties& WrittenValues(const void* object) { return written_[object]; }
    /// The written help properties of a form or report.
    SavedObject ChangesOf(const Design& design) const;
    /// Null for a property that wasn't written.
    const Value* WrittenValue(const void* object, std::string_view name) const {
        const auto values = written_.find(object);
        if (values == written_.end())
            return nullptr;
        const auto found = values->second.find(text::FoldCase(name));
        return found == values->second.end() ? nullptr : &found->second;
    }

private:
    struct Object {
        std::string name;
        std::string path; ///< Windows path of its export, empty for a database's object
        std::string codePath;
        std::string database; ///< native path, for objects of a database
        NamedTexts properties;
        bool loaded = false;
        std::shared_ptr<Design> design;
        std::size_t length = 0; ///< bytes of text that the design was read from
        /// Written values of a design that was forgotten, by part; "" is the object itself.
        std::map<std::string, WrittenProperties> stowed;
        std::string error;
    };
    struct Table {
        TableDefinition definition;
        bool loaded = false;
        std::string error; ///< why the definition can't be read
        std::string sqlPath, schemaPath, linkPath, dataPath;
        std::string database;
    };
    struct Query {
        QueryDefinition definition;
        bool loaded = false;
        std::string error; ///< why the definition can't be read
        std::string path, infoPath;
        std::vector<FieldDefinition> fields;
        bool resolved = false;
    };
    using Objects = KeyedList<std::unique_ptr<Object>>;

    void OpenDatabaseFile(const std::string& path);
    void OpenFolder(const std::string& path);
    void TakePart(const ApplicationPart& part);
    void TakeObject(ObjectKind kind, const ApplicationPart& part);
    void TakeQuery(const ApplicationPart& part);
    void TakeCode(const std::string& path);
    void TakeRelation(const std::string& path);
    void TakeDocuments(const std::string& path);
    void TakeDatabase(const std::string& path, bool topLevel);
    void NoteDifferences(const DatabaseContent& content, const std::string& nativePath);
    void TakeDatabaseTables(DatabaseContent& content, const std::string& nativePath);
    void SortNames();

    Objects& ListOf(ObjectKind kind);
    Object& Demand(ObjectKind kind, const std::string& name);
    void Load(ObjectKind kind, Object& object);
    /// What a design is read from, and how long that is.
    ExportTree TreeOf(ObjectKind kind, const Object& object, std::size_t& length);
    /// Of the database that an object without an export lies in.
    DatabaseDesigns& DesignsOf(const Object& object);
    void StowWrittenValues(Object& object);
    void RestoreWrittenValues(Object& object);
    Table& TableNamed(const std::string& name);
    void LoadTable(Table& table);
    void ReadTable(Table& table);
    void LoadQuery(Query& query);
    void ReadQuery(Query& query);
    FieldSources Sources();
    Records ReadRecords(const std::string& recordSource, int rows, int depth);
    const Records* KnownRecords(const std::string& source, int rows, int depth);
    Records TableRecords(Table& table);
    std::string ThemeFile();
    std::string FromDesigns(const std::function<std::string(DatabaseDesigns&)>& ask);
    Records QueryRecords(const QueryDefinition& query, const std::vector<FieldDefinition>& fields, int rows,
                         int depth);

    std::string fullName_;
    std::string folder_;
    std::string projectInfoPath_;
    std::string documentsPath_;
    std::vector<std::string> codePaths_;
    std::vector<std::pair<std::string, std::string>> queryInfos_; ///< name, path
    Objects forms_, reports_, macros_, modules_;
    std::deque<Object*> readDesigns_; ///< in the order of reading
    std::size_t readLength_ = 0;
    std::map<std::string, std::unique_ptr<DatabaseDesigns>> databaseDesigns_; ///< by native path
    KeyedList<std::unique_ptr<Table>> tables_;
    KeyedList<std::unique_ptr<Query>> queries_;
    std::vector<RelationDefinition> relations_;
    std::vector<std::uint32_t> theme_; ///< empty until it is asked for
    KeyedList<std::string> pictures_;  ///< Windows paths by picture name
    std::vector<std::string> names_[6];
    bool kindInExports_[6] = {};
    std::vector<std::string> notes_;
    std::unordered_map<std::string, std::unique_ptr<Records>> records_;
    std::unordered_map<const void*, WrittenProperties> written_;
};

/// What the application holds, see AccessApplication.h.
struct ApplicationSummary;
ApplicationSummary SummarizeModel(ApplicationModel& model);

} // namespace tovimar::platform::access
