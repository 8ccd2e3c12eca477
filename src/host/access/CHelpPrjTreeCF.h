#pragma once

#include "host/contract/IClassFactory.h"

namespace tovimar {

/// Makes the list classes of Access: "GetAccFormsXml", "GetAccReportsXml", "GetAccTablesXml",
/// "GetAccQueriesXml", "GetAccMacrosXml".
class CHelpPrjTreeCF : public IClassFactory {
public:
    void CreateObject(const std::string& vstrClassName, std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateFormsListObject(std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateReportsListObject(std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateTablesListObject(std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateQueriesListObject(std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateMacrosListObject(std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateWorksheetsListObject(std::unique_ptr<IXmlSerializer>& robj) override;
    void CreateChartsListObject(std::unique_ptr<IXmlSerializer>& robj) override;
};

} // namespace tovimar
