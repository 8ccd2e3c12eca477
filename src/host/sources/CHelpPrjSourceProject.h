#pragma once

#include "host/contract/IHelpPrjSourceProject.h"

#include <memory>

namespace tovimar {

/// The front of all source projects: it tries one class after another until one can read the project, and
/// that one answers every further question.
class CHelpPrjSourceProject : public IHelpPrjSourceProject {
public:
    CHelpPrjSourceProject();
    ~CHelpPrjSourceProject() override;

    ResultCode Init(const std::string& vstrHostAppTypeName,
                    const std::string& vstrProjectFileFullPath) override;
    void Terminate() override;
    bool IsValid() const override;
    std::string ProjectType() const override;
    const SourceItems& Forms() const override;
    bool CouldHaveReports() const override;
    const SourceItems& Reports() const override;
    bool CouldHaveTables() const override;
    const SourceItems& Tables() const override;
    bool CouldHaveQueries() const override;
    const SourceItems& Queries() const override;
    bool CouldHaveMacros() const override;
    const SourceItems& Macros() const override;
    std::string Name() const override;
    bool IsProjectGroup() const override;
    const KeyedList<std::unique_ptr<IHelpPrjSourceProject>>& projects() const override;
    const SourceItems& Worksheets() const override;
    const SourceItems& Charts() const override;

private:
    std::unique_ptr<IHelpPrjSourceProject> project_;
};

} // namespace tovimar
