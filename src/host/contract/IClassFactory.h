#pragma once

#include "host/contract/IXmlSerializer.h"

#include <memory>
#include <string>

namespace tovimar {

/// Makes the serializer that a list node names.
class IClassFactory {
public:
    virtual ~IClassFactory() = default;

    /// The class of a node's `Serializer` value, compared exactly; null for an unknown name.
    virtual void CreateObject(const std::string& vstrClassName, std::unique_ptr<IXmlSerializer>& robj) = 0;

    virtual void CreateFormsListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
    virtual void CreateReportsListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
    virtual void CreateTablesListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
    virtual void CreateQueriesListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
    virtual void CreateMacrosListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
    /// Null on hosts without them.
    virtual void CreateWorksheetsListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
    virtual void CreateChartsListObject(std::unique_ptr<IXmlSerializer>& robj) = 0;
};

} // namespace tovimar
