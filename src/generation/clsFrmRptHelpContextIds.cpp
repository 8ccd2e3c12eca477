#include "generation/clsFrmRptHelpContextIds.h"

#include "foundation/CAddInProject.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "generation/RunProgress.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTree.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "clsFrmRptHelpContextIds";
constexpr std::int32_t kStep = 10;
constexpr int kMostTries = 100000;
/// Users' own defines, appended to the include file.
constexpr const char* kOwnDefines = "HelpContextIds.h";

DefinitionCache& Definitions() {
    return Session::HelpProjectTree()->Definitions();
}

bool SourceIs(const char* kind) {
    return text::EqualsIgnoringCase(HostAgent().CurrentSourceProjectTypeName(), kind);
}

std::string IncludeFileHead() {
    if (SourceIs(SourceProjectKind::kMSAccess))
        return "#define IDH_ALL_FORMS   1\r\n#define IDH_ALL_REPORTS 2 \r\n";
    return "#define IDH_ALL_DIALOGS 2\r\n";
}

std::string DefineLine(const std::string& name, std::int32_t id) {
    return "#define IDH_" + NormalizeName(text::ReplaceAll(name, " ", "_")) + "  " + std::to_string(id);
}

/// User controls have no F1 of their own: the form that holds them has.
bool IsWithoutOwnId(const CXmlForm& form) {
    return form.GUIObjectSubType == "UserControl" || form.GUIObjectSubType == "UserDocument";
}

/// A control inside another one is told by both names.
std::string OwnerOf(const CXmlControl& control, const CXmlControl& child) {
    return control.Name + '/' + child.Name;
}

std::string Key(const std::string& form, const std::string& control) {
    return form + '\n' + control;
}

/// Other objects have numbers too, but no property to hold them; one may bear the name of a form.
bool HasHelpProperties(const CXmlForm& form) {
    const std::string& type = form.Type_();
    return type != "Table" && type != "Query" && type != "Macro" && type != "Worksheet" && type != "Chart";
}

void WriteIdIntoSource(const CXmlForm& form, std::int32_t type) {
    auto& host = HostAgent();
    host.ActivateComponent(type, form.Name, /*forceOpenInDesignView=*/true, /*forceOpenAsHidden=*/true);
    host.SetComponentHelpContextId(type, form.Name, form.HelpContextId);
    host.CloseComponent(type, form.Name, /*saveComponentFlag=*/true);
}

} // namespace

void clsFrmRptHelpContextIds::Reset() {
    forms_.Clear();
    usedIds_.Clear();
    duplicates_.clear();
    earlier_ = {};
    recalled_.clear();
}

void clsFrmRptHelpContextIds::AddUsedId(std::int32_t id, const std::string& form,
                                        const std::string& control) {
    if (id <= 0)
        return;
    const std::string key = std::to_string(id);
    if (usedIds_.Contains(key))
        duplicates_.push_back(form + "*" + control + "*" + key);
    else
        usedIds_.Add(id, key);
}

void clsFrmRptHelpContextIds::ExtractUsedHelpContextIds(const CXmlForm& rxmlForm,
                                                        const CXmlControl* rxmlControl) {
    Trapped(kClass, "ExtractUsedHelpContextIds", [&] {
        const std::string name = rxmlForm.UniqueName();
        if (name.empty())
            return;
        if (rxmlControl == nullptr) {
            if (IsFormKnown(name))
                return;
            forms_.Add(name, name);
            AddUsedId(rxmlForm.HelpContextId, name, {});
        }
        for (const auto& control : rxmlControl == nullptr ? rxmlForm.Controls : rxmlControl->Controls) {
            AddUsedId(control->HelpContextId, name, control->UniqueNameWithinXmlForm());
            if (!control->Controls.Empty())
                ExtractUsedHelpContextIds(rxmlForm, control.get());
        }
    });
}

std::int32_t clsFrmRptHelpContextIds::NextFreeId(bool vfReserve) {
    for (int tries = 0; tries < kMostTries; ++tries) {
        lastId_ += kStep;
        if (IsIdUsed(lastId_) || earlier_.Holds(lastId_))
            continue;
        if (vfReserve)
            usedIds_.Add(lastId_, std::to_string(lastId_));
        return lastId_;
    }
    return 0;
}

void clsFrmRptHelpContextIds::AssignHelpContextIds() {
    Trapped(kClass, "AssignHelpContextIds", [&] {
        const Hourglass hourglass;
        HostMeter meter("Assigning help context Ids...", static_cast<std::int32_t>(forms_.Count()));
        std::int32_t position = 0;
        for (const std::string& name : forms_) {
            LeaveIfInterrupted();
            AssignHelpContextIdsForForm(name);
            meter.Update(++position);
        }
        recalled_.clear();
    });
}

void clsFrmRptHelpContextIds::AssignHelpContextIdsForForm(const std::string& name) {
    Trapped(kClass, "AssignHelpContextIdsForForm", [&] {
        const std::string path = DefinitionPath(name);
        const auto form = Definitions().Load(path);
        if (form == nullptr)
            return;
        // A definition is written again for a new number only: kept objects keep theirs to the byte.
        newIds_ = 0;
        if (IsWithoutId(form->HelpContextId, name, {}) && !IsWithoutOwnId(*form)) {
            Assign(form->HelpContextId, name, {});
            numbered_.insert(name);
        }
        form->NewHelpContextIdsCount = numbered_.contains(name) ? 1 : 0;
        for (const auto& control : form->Controls) {
            if (IsWithoutId(control->HelpContextId, name, control->Name))
                Assign(control->HelpContextId, name, control->Name);
            AssignHelpContextIdsForSubControls(name, *control);
        }
        if (newIds_ > 0)
            Definitions().Save(form, path);
    });
}

void clsFrmRptHelpContextIds::AssignHelpContextIdsForSubControls(const std::string& form,
                                                                 CXmlControl& control) {
    Trapped(kClass, "AssignHelpContextIdsForSubControls", [&] {
        for (const auto& child : control.Controls) {
            const std::string owner = OwnerOf(control, *child);
            if (child->HelpContextId < 1 || IsWithoutId(child->HelpContextId, form, owner))
                Assign(child->HelpContextId, form, owner);
        }
    });
}

void clsFrmRptHelpContextIds::Assign(std::int32_t& id, const std::string& form, const std::string& owner) {
    id = IdFor(form, owner);
    ++newIds_;
}

void clsFrmRptHelpContextIds::RecallEarlierIds(CXmlForm& rxmlForm) {
    Trapped(kClass, "RecallEarlierIds", [&] {
        const std::string name = rxmlForm.UniqueName();
        if (!IsWithoutOwnId(rxmlForm))
            Recall(rxmlForm.HelpContextId, name, {});
        for (const auto& control : rxmlForm.Controls) {
            Recall(control->HelpContextId, name, control->Name);
            for (const auto& child : control->Controls)
                Recall(child->HelpContextId, name, OwnerOf(*control, *child));
        }
    });
}

void clsFrmRptHelpContextIds::Recall(std::int32_t& id, const std::string& form, const std::string& control) {
    if (id != 0)
        return;
    id = earlier_.IdOf(form, control);
    if (id != 0)
        recalled_.insert(Key(form, control));
}

bool clsFrmRptHelpContextIds::IsWithoutId(std::int32_t id, const std::string& form,
                                          const std::string& control) const {
    return id == 0 || recalled_.contains(Key(form, control));
}

std::int32_t clsFrmRptHelpContextIds::IdFor(const std::string& form, const std::string& control) {
    const std::int32_t earlier = earlier_.IdOf(form, control);
    if (earlier == 0 || IsIdUsed(earlier))
        return NextFreeId(true);
    usedIds_.Add(earlier, std::to_string(earlier));
    return earlier;
}

void clsFrmRptHelpContextIds::SetHelpContextIds() {
    Trapped(kClass, "SetHelpContextIds", [&] {
        // The objects of a compiled application can't be opened in design view.
        if (HostAgent().CurrentSourceProjectIsMDEorADE())
            return;
        const Hourglass hourglass;
        HostMeter meter("Setting help context Ids...", static_cast<std::int32_t>(forms_.Count()));
        std::string defines = IncludeFileHead();
        std::int32_t position = 0;
        for (const std::string& name : forms_) {
            LeaveIfInterrupted();
            if (const std::string line = SetHelpContextIdsForForm(name); !line.empty())
                defines += line + "\r\n";
            meter.Update(++position);
        }
        WriteIncludeFile(std::move(defines));
    });
}

std::string clsFrmRptHelpContextIds::SetHelpContextIdsForForm(const std::string& name) {
    std::string line;
    Trapped(kClass, "SetHelpContextIdsForForm", [&] {
        const auto form = Definitions().Load(DefinitionPath(name));
        if (form == nullptr || form->HelpContextId < 1)
            return;
        const std::int32_t type = form->Type_() == "Report" ? ObjectType::kReport : ObjectType::kForm;
        if (numbered_.contains(name) && Session::Parameters()->SaveApplicationChanges &&
            !SourceIs(SourceProjectKind::kAspNet) && HasHelpProperties(*form))
            WriteIdIntoSource(*form, type);
        line = DefineLine(name, form->HelpContextId);
    });
    return line;
}

std::string clsFrmRptHelpContextIds::DefinitionPath(const std::string& name) const {
    const auto* project = Session::CurrentProject();
    if (project == nullptr)
        throw RaisedError(91, "There is no current project", kClass);
    return platform::Join(project->XmlFormsFolder(), name + ".xml");
}

void clsFrmRptHelpContextIds::WriteIncludeFile(std::string text) {
    auto& files = *platform::Env().files;
    const auto* parameters = Session::Parameters();
    const std::string folder = parameters->FolderForGeneratedHelp();
    text = EncodePlainText(text);
    if (const std::string own = folder + kOwnDefines; files.FileExists(own))
        text += files.ReadFile(own);
    files.WriteFile(folder + parameters->HelpProjectName() + ".h", text);
}

} // namespace tovimar
