#pragma once

#include "host/contract/IHelpPrjSourceProject.h"

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace tovimar {

class CTovimarServerAgent;

/// The database that the host has open, read by commands. Captions of forms and reports, and which of them
/// are shown inside others, are taken from text copies of their designs.
class CSourceProjectMSAccess : public IHelpPrjSourceProject {
public:
    CSourceProjectMSAccess();
    ~CSourceProjectMSAccess() override;

    ResultCode Init(const std::string& vstrSourceProjectTypeName,
                    const std::string& vstrProjectFileFullPath) override;
    void Terminate() override;
    bool IsValid() const override { return isValid_; }
    std::string ProjectType() const override;
    const SourceItems& Forms() const override { return forms_; }
    bool CouldHaveReports() const override { return true; }
    const SourceItems& Reports() const override { return reports_; }
    bool CouldHaveTables() const override { return true; }
    const SourceItems& Tables() const override { return tables_; }
    bool CouldHaveQueries() const override { return true; }
    const SourceItems& Queries() const override { return queries_; }
    bool CouldHaveMacros() const override { return true; }
    const SourceItems& Macros() const override { return macros_; }
    std::string Name() const override { return name_; }
    bool IsProjectGroup() const override { return false; }
    const KeyedList<std::unique_ptr<IHelpPrjSourceProject>>& projects() const override { return projects_; }
    const SourceItems& Worksheets() const override { return worksheets_; }
    const SourceItems& Charts() const override { return charts_; }

private:
    struct Pass;
    using Names = KeyedList<std::string>;
    /// User and used object.
    using Uses = std::vector<std::pair<std::string, std::string>>;

    void Read(CTovimarServerAgent& agent);
    bool Begin(CTovimarServerAgent& agent, const Pass& pass, const std::string& name);
    void ReadPlain(CTovimarServerAgent& agent, const Pass& pass, const Names& names);
    void ReadDesigned(CTovimarServerAgent& agent, const Pass& pass, const Names& names);
    std::string ReadTextCopy(CTovimarServerAgent& agent, const Pass& pass, const std::string& name,
                             Uses& uses);
    void AddItem(const Pass& pass, const std::string& name, const std::string& caption);
    static void MarkUsed(SourceItems& items, const Uses& uses);

    bool isValid_ = false;
    bool terminated_ = false;
    std::string name_;
    std::string location_;
    std::string stamp_;
    std::int32_t maximum_ = 0; ///< of the progress meter
    std::int32_t position_ = 0;
    SourceItems forms_, reports_, tables_, queries_, macros_, worksheets_, charts_;
    KeyedList<std::unique_ptr<IHelpPrjSourceProject>> projects_;
};

} // namespace tovimar
