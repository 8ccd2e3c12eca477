#pragma once

#include "host/contract/IHelpPrjSourceProject.h"

#include <string>

namespace tovimar {

/// What every kind of source project has in common: its kind, its name and the lists, all empty at first.
class SourceProjectLists : public IHelpPrjSourceProject {
public:
    /// `className` goes into reports of failures; `kind` is one of `SourceProjectKind`. Both outlive the
    /// object.
    SourceProjectLists(const char* className, const char* kind);
    ~SourceProjectLists() override;

    /// Compares the kind, names the project after its file and reads it. A failure is reported; it and a
    /// project that isn't of the kind give 0x80040001.
    ResultCode Init(const std::string& vstrSourceProjectTypeName,
                    const std::string& vstrProjectFileFullPath) override;
    void Terminate() override;
    bool IsValid() const override { return isValid_; }
    std::string ProjectType() const override { return kind_; }
    const SourceItems& Forms() const override { return forms_; }
    bool CouldHaveReports() const override { return false; }
    const SourceItems& Reports() const override { return reports_; }
    bool CouldHaveTables() const override { return false; }
    const SourceItems& Tables() const override { return tables_; }
    bool CouldHaveQueries() const override { return false; }
    const SourceItems& Queries() const override { return queries_; }
    bool CouldHaveMacros() const override { return false; }
    const SourceItems& Macros() const override { return macros_; }
    std::string Name() const override { return name_; }
    bool IsProjectGroup() const override { return false; }
    const KeyedList<std::unique_ptr<IHelpPrjSourceProject>>& projects() const override { return projects_; }
    const SourceItems& Worksheets() const override { return worksheets_; }
    const SourceItems& Charts() const override { return charts_; }

protected:
    /// Fills the lists from the project at `path`. False for a file that isn't a project of the kind.
    virtual bool Read(const std::string& path) = 0;

    /// Projects of files have nothing but forms to read.
    static bool HelpForFormsWanted();
    /// True for a name that a topic can have. Of any other the user is told: `skippedWords` is
    /// "Source Form skipped " and the like.
    static bool IsUsableName(const std::string& skippedWords, const std::string& name);
    /// Of two names that differ in case only, the first is found by its name.
    static void Add(SourceItems& items, std::unique_ptr<CHelpPrjSourceItem> item);

    const char* ClassName() const { return className_; }

    SourceItems forms_, reports_, tables_, queries_, macros_, worksheets_, charts_;

private:
    const char* className_;
    const char* kind_;
    std::string name_;
    bool isValid_ = false;
    bool terminated_ = false;
    KeyedList<std::unique_ptr<IHelpPrjSourceProject>> projects_;
};

} // namespace tovimar
