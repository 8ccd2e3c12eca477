#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <memory>
#include <string>

namespace tovimar {

class CHelpPrjSourceItem; // host/sources/CHelpPrjSourceItem.h

/// Objects of one kind, by name.
using SourceItems = KeyedList<std::unique_ptr<CHelpPrjSourceItem>>;

/// The application that is documented, as lists of named objects. Every list exists; one that a kind of
/// project doesn't have stays empty.
class IHelpPrjSourceProject {
public:
    virtual ~IHelpPrjSourceProject() = default;

    /// 0 when this class read the project, 0x80040001 when the kind isn't its own or nothing could be read.
    virtual ResultCode Init(const std::string& vstrSourceProjectTypeName,
                            const std::string& vstrProjectFileFullPath) = 0;
    /// Terminates every item; a second call does nothing.
    virtual void Terminate() = 0;
    virtual bool IsValid() const = 0;
    /// One of `SourceProjectKind`.
    virtual std::string ProjectType() const = 0;

    virtual const SourceItems& Forms() const = 0;
    virtual bool CouldHaveReports() const = 0;
    virtual const SourceItems& Reports() const = 0;
    virtual bool CouldHaveTables() const = 0;
    virtual const SourceItems& Tables() const = 0;
    virtual bool CouldHaveQueries() const = 0;
    virtual const SourceItems& Queries() const = 0;
    virtual bool CouldHaveMacros() const = 0;
    virtual const SourceItems& Macros() const = 0;

    virtual std::string Name() const = 0;
    virtual bool IsProjectGroup() const = 0;
    /// The projects of a group.
    virtual const KeyedList<std::unique_ptr<IHelpPrjSourceProject>>& projects() const = 0;
    virtual const SourceItems& Worksheets() const = 0;
    virtual const SourceItems& Charts() const = 0;
};

} // namespace tovimar
