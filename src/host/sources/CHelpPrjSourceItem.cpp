#include "host/sources/CHelpPrjSourceItem.h"

#include "host/contract/ObjectTypes.h"
#include "project/ComponentFileName.h"

namespace tovimar {

void CHelpPrjSourceItem::InitFromHost(const std::string& vstrProjectName, const std::string& vstrFormName,
                                      const std::string& vstrFormCaption, const std::string& vstrSubType) {
    ProjectName = vstrProjectName;
    FormName = vstrFormName;
    FormCaption = vstrFormCaption;
    SubType = vstrSubType;
}

void CHelpPrjSourceItem::Terminate() {
    *this = {};
}

std::int32_t CHelpPrjSourceItem::ObjType() const {
    return ObjectTypeOfText(SubType);
}

std::string CHelpPrjSourceItem::FormNameNormalized() const {
    return GetComponentFileName(FormName);
}

} // namespace tovimar
