#include "host/sources/SourceProjectLists.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar {

SourceProjectLists::SourceProjectLists(const char* className, const char* kind)
    : className_(className), kind_(kind) {}
SourceProjectLists::~SourceProjectLists() = default;

ResultCode SourceProjectLists::Init(const std::string& vstrSourceProjectTypeName,
                                    const std::string& vstrProjectFileFullPath) {
    if (!text::EqualsIgnoringCase(vstrSourceProjectTypeName, kind_))
        return kFailure1;
    name_ = platform::BaseNameOf(vstrProjectFileFullPath);
    Trapped(className_, "IHelpPrjSourceProject_Init", [&] { isValid_ = Read(vstrProjectFileFullPath); });
    return isValid_ ? kSuccess : kFailure1;
}

void SourceProjectLists::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    for (const SourceItems* items :
         {&forms_, &reports_, &tables_, &queries_, &macros_, &worksheets_, &charts_})
        for (const auto& item : *items)
            item->Terminate();
}

bool SourceProjectLists::HelpForFormsWanted() {
    const CTovimarParameters* parameters = Session::Parameters();
    return parameters == nullptr || parameters->GenerateHelpForForms;
}

bool SourceProjectLists::IsUsableName(const std::string& skippedWords, const std::string& name) {
    if (name.find('"') == std::string::npos)
        return true;
    ShowMessage(skippedWords + name + ".\r\nPlease remove double quotes from its name.", kMsgExclamation,
                kApplicationTitle);
    return false;
}

void SourceProjectLists::Add(SourceItems& items, std::unique_ptr<CHelpPrjSourceItem> item) {
    const std::string key = items.Contains(item->FormName) ? std::string() : item->FormName;
    items.Add(std::move(item), key);
}

} // namespace tovimar
