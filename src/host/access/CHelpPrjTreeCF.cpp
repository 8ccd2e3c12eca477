#include "host/access/CHelpPrjTreeCF.h"

#include "host/access/AccObjectsList.h"

namespace tovimar {

void CHelpPrjTreeCF::CreateObject(const std::string& vstrClassName, std::unique_ptr<IXmlSerializer>& robj) {
    robj.reset();
    if (vstrClassName == "GetAccFormsXml")
        CreateFormsListObject(robj);
    else if (vstrClassName == "GetAccReportsXml")
        CreateReportsListObject(robj);
    else if (vstrClassName == "GetAccTablesXml")
        CreateTablesListObject(robj);
    else if (vstrClassName == "GetAccQueriesXml")
        CreateQueriesListObject(robj);
    else if (vstrClassName == "GetAccMacrosXml")
        CreateMacrosListObject(robj);
}

void CHelpPrjTreeCF::CreateFormsListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj = std::make_unique<clsAccFormsList>();
}

void CHelpPrjTreeCF::CreateReportsListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj = std::make_unique<clsAccReportsList>();
}

void CHelpPrjTreeCF::CreateTablesListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj = std::make_unique<clsAccTablesList>();
}

void CHelpPrjTreeCF::CreateQueriesListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj = std::make_unique<clsAccQueriesList>();
}

void CHelpPrjTreeCF::CreateMacrosListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj = std::make_unique<clsAccMacrosList>();
}

void CHelpPrjTreeCF::CreateWorksheetsListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj.reset();
}

void CHelpPrjTreeCF::CreateChartsListObject(std::unique_ptr<IXmlSerializer>& robj) {
    robj.reset();
}

} // namespace tovimar
