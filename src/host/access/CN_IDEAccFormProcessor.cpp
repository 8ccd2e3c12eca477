// Names, captions and kinds of controls; the section questions, which the form's dimensions answer.
#include "host/access/CN_IDEAccFormProcessor.h"

#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "host/access/FormFacts.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

#include <charconv>

namespace tovimar {
namespace {

constexpr const char* kClass = "CN_IDEAccFormProcessor";
/// No host nests objects deeper; a chain of parents that goes on is a circle.
constexpr int kMostParents = 64;

bool IsFormOrReport(const std::string& className) {
    return text::StartsWithIgnoringCase(className, "Form_") ||
           text::StartsWithIgnoringCase(className, "Report_");
}

HostObject TopOfParents(HostObject object) {
    for (int i = 0; i < kMostParents; ++i) {
        HostObject parent = late::ObjectOrNull(object, "Parent");
        if (!parent)
            break;
        object = std::move(parent);
    }
    return object;
}

bool IsNumeric(const std::string& text) {
    double number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    return error == std::errc() && end == text.data() + text.size();
}

template <typename Result, typename Question>
Result Answered(const char* operation, Result absent, Question question) {
    Result answer = absent;
    Trapped(kClass, operation, [&] { answer = question(); });
    return answer;
}

} // namespace

CN_IDEAccFormProcessor::CN_IDEAccFormProcessor() = default;
CN_IDEAccFormProcessor::~CN_IDEAccFormProcessor() = default;

void CN_IDEAccFormProcessor::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    ForgetForms();
    commandBars_.reset();
    application_.reset();
}

void CN_IDEAccFormProcessor::myDoevents() {
    platform::Env().doEvents();
}

void CN_IDEAccFormProcessor::ForgetForms() {
    forms_.clear();
    dimensions_.Forget();
}

const CN_IDEAccFormProcessor::FormFacts& CN_IDEAccFormProcessor::FactsOf(const HostObject& form) {
    std::unique_ptr<FormFacts>& facts = forms_[form->Identity()];
    if (!facts)
        facts = std::make_unique<FormFacts>(form);
    return *facts;
}

bool CN_IDEAccFormProcessor::HasProperty(const HostObject& robjComp, const std::string& vstrPropertyName) {
    return robjComp && robjComp->FindProperty(vstrPropertyName).has_value();
}

Value CN_IDEAccFormProcessor::PropertyValue(const HostObject& robjComp, const std::string& vstrPropertyName) {
    return Answered("IClientFormProcessor_PropertyValue", Value(),
                    [&] { return late::Property(robjComp, vstrPropertyName); });
}

std::string CN_IDEAccFormProcessor::ComponentTypeName(const HostObject& robjComp) {
    const std::string className = late::ClassName(robjComp);
    if (text::StartsWithIgnoringCase(className, "Form_"))
        return "Form";
    return text::StartsWithIgnoringCase(className, "Report_") ? "Report" : className;
}

std::string CN_IDEAccFormProcessor::ObjectTypeName(const HostObject& rctl) {
    const std::string className = late::ClassName(rctl);
    if (text::EqualsIgnoringCase(className, "SubForm") &&
        text::StartsWithIgnoringCase(late::ClassName(TopOfParents(rctl)), "Report"))
        return "SubReport";
    return className;
}

bool CN_IDEAccFormProcessor::IsSkippedControlType(const std::string& typeName, std::int32_t objectType) {
    constexpr const char* kNeverListed[] = {
        "Data",        "HScrollBar", "VScrollBar",       "Timer",    "ImageList", "Line", "Rectangle",
        "ObjectFrame", "Image",      "BoundObjectFrame", "PageBreak"};
    for (const char* skipped : kNeverListed)
        if (text::EqualsIgnoringCase(typeName, skipped))
            return true;
    return objectType == ObjectType::kReport &&
           (text::EqualsIgnoringCase(typeName, "TabControl") || text::EqualsIgnoringCase(typeName, "Page"));
}

bool CN_IDEAccFormProcessor::IsCorrectTypeForAForm(std::int32_t TypeComponent) {
    return TypeComponent == ObjectType::kForm || TypeComponent == ObjectType::kReport ||
           TypeComponent == ObjectType::kOtherForm;
}

std::string CN_IDEAccFormProcessor::ControlNameGet(const HostObject& TheControl) {
    if (!TheControl)
        return {};
    return Answered("IClientFormProcessor_ControlNameGet", std::string(),
                    [&] { return late::Text(TheControl, "Name"); });
}

std::string CN_IDEAccFormProcessor::ComponentCaptionGet(const HostObject& robjComp) {
    return Answered("IClientFormProcessor_ComponentCaptionGet", std::string(), [&] {
        std::string caption = late::PropertyOrNull(robjComp, "Caption").AsString();
        if (text::Trim(caption).empty())
            caption = AttachedLabel(robjComp);
        return caption.empty() ? late::Text(robjComp, "Name") : caption;
    });
}

std::string CN_IDEAccFormProcessor::ControlCaptionGet(const HostObject& TheControl) {
    return Answered("IClientFormProcessor_ControlCaptionGet", std::string(), [&] {
        std::string caption = late::TextOrEmpty(TheControl, "Caption");
        if (caption.empty())
            caption = AttachedLabel(TheControl);
        return caption.empty() ? CleanedName(late::Text(TheControl, "Name")) : caption;
    });
}

// The prefix that tells a control's kind goes: "txtCustomerName" reads "CustomerName". A name without any
// capital letter has no such prefix.
std::string CN_IDEAccFormProcessor::CleanedName(const std::string& name) const {
    if (text::ToLower(name) == name)
        return name;
    std::u32string rest = text::ToCodePoints(name);
    std::size_t start = 0;
    while (rest.size() - start > 1) {
        const std::string first = text::FromCodePoint(rest[start]);
        if (first != text::ToLower(first) ||
            IsNumeric(text::FromCodePoints(std::u32string_view(rest).substr(start))))
            break;
        ++start;
    }
    return text::FromCodePoints(std::u32string_view(rest).substr(start));
}

std::string CN_IDEAccFormProcessor::AttachedLabel(const HostObject& control) {
    // The labels that lie right on a form belong to none of its controls and not to the form either.
    if (IsFormOrReport(late::ClassName(control)))
        return {};
    const HostObject form = clsAccFormDimensions::FormOf(control);
    if (!form)
        return {};
    const FormFacts& facts = FactsOf(form);
    const auto label = facts.labelCaptions.find(late::Text(control, "Name"));
    return label == facts.labelCaptions.end() ? std::string() : label->second;
}

std::string CN_IDEAccFormProcessor::ControlSeedTextGet(const HostObject& rfrmActual, const HostObject& rctl) {
    std::string text = late::TextOrEmpty(rctl, "StatusBarText");
    if (text.empty())
        text = late::TextOrEmpty(rctl, "ControlTipText");
    // A control of a subform has its code in the subform's own module.
    const HostObject own = clsAccFormDimensions::FormOf(rctl);
    const std::string action = GetOnClickActionDescription(application_, own ? own : rfrmActual, rctl);
    if (action.empty())
        return text;
    return text.empty() ? action : text + "<BR><BR>" + action;
}

std::string CN_IDEAccFormProcessor::ComponentWindowCaptionGet(const HostObject& robjComp) {
    constexpr std::size_t kClassPrefix = 5;
    return Answered("IClientFormProcessor_ComponentWindowCaptionGet", std::string(),
                    [&] { return text::Mid(late::Text(robjComp, "Name"), kClassPrefix + 1); });
}

std::int32_t CN_IDEAccFormProcessor::BorderStyle(const HostObject& rfrmActual) {
    return Answered("IClientFormProcessor_BorderStyle", std::int32_t{0},
                    [&] { return late::Integer(rfrmActual, "BorderStyle"); });
}

void CN_IDEAccFormProcessor::GetControlIndexes(const HostObject& rctl, std::int32_t& rlngTabIndex,
                                               std::int32_t& rlngIndex) {
    rlngTabIndex = -1;
    rlngIndex = -1;
    PassOver([&] {
        if (const auto value = rctl->FindProperty("TabIndex"))
            rlngTabIndex = value->AsInteger();
    });
}

std::string CN_IDEAccFormProcessor::GetLabelControlParentName(const HostObject& rctl) {
    if (!text::EqualsIgnoringCase(late::ClassName(rctl), "Label"))
        return {};
    return Answered("IClientFormProcessor_GetLabelControlParentName", std::string(),
                    [&] { return late::Text(late::Object(rctl, "Parent"), "Name"); });
}

void CN_IDEAccFormProcessor::SetComponentHelpContextId(const HostObject&, const HostObject& rfrmActual,
                                                       std::int32_t vlngHelpContextId) {
    const CAddInProject* project = Session::CurrentProject();
    late::Set(rfrmActual, "HelpContextId", vlngHelpContextId);
    late::Set(rfrmActual, "HelpFile", (project == nullptr ? std::string() : project->Name) + ".chm");
}

std::int32_t CN_IDEAccFormProcessor::GetComponentHelpContextId(const HostObject& robjComp,
                                                               const HostObject& rfrmActual) {
    return GetControlHelpContextId(rfrmActual ? rfrmActual : robjComp);
}

std::int32_t CN_IDEAccFormProcessor::GetControlHelpContextId(const HostObject& robjControl) {
    return late::IntegerOrZero(robjControl, "HelpContextId");
}

std::int32_t CN_IDEAccFormProcessor::ControlSectionOffsetY(const HostObject& rctl) {
    return Answered("IClientFormProcessor_ControlSectionOffsetY", std::int32_t{0},
                    [&] { return dimensions_.ControlSectionOffsetY(*this, rctl, /*vfRulerOn=*/false); });
}

std::int32_t CN_IDEAccFormProcessor::ControlSectionOffsetX(const HostObject& rctl) {
    return Answered("IClientFormProcessor_ControlSectionOffsetX", std::int32_t{0},
                    [&] { return dimensions_.ControlSectionOffsetX(*this, rctl, /*vfRulerOn=*/false); });
}

std::int32_t CN_IDEAccFormProcessor::ControlSectionTitleHeight(const HostObject& rctl) {
    return Answered("IClientFormProcessor_ControlSectionTitleHeight", std::int32_t{0},
                    [&] { return dimensions_.ControlSectionTitleHeight(*this, rctl, /*vfRulerOn=*/false); });
}

std::string CN_IDEAccFormProcessor::ControlSectionName(const HostObject& rctl) {
    return Answered("IClientFormProcessor_ControlSectionName", std::string(),
                    [&] { return dimensions_.ControlSectionName(*this, rctl, /*vfRulerOn=*/false); });
}

std::int32_t CN_IDEAccFormProcessor::FormClientAreaOffsetX(const HostObject& rfrmActual) {
    return Answered("IClientFormProcessor_FormClientAreaOffsetX", std::int32_t{0}, [&] {
        return dimensions_.FormClientAreaOffsetX(*this, rfrmActual, /*vfRulerOn=*/false);
    });
}

std::int32_t CN_IDEAccFormProcessor::FormClientAreaOffsetY(const HostObject& rfrmActual) {
    return Answered("IClientFormProcessor_FormClientAreaOffsetY", std::int32_t{0}, [&] {
        return dimensions_.FormClientAreaOffsetY(*this, rfrmActual, /*vfRulerOn=*/false);
    });
}

std::string CN_IDEAccFormProcessor::FormSectionsXML(const HostObject& rfrmActual) {
    return Answered("IClientFormProcessor_FormSectionsXML", std::string(),
                    [&] { return dimensions_.SectionsXML(*this, rfrmActual, /*vfRulerOn=*/false); });
}

} // namespace tovimar
