// Bringing a control into view by its path.
#include "foundation/ErrorTrap.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

#include <charconv>
#include <optional>
#include <vector>

namespace tovimar {
namespace {

constexpr std::int32_t kRefreshAfterPageChange = 40;

/// "[2]" gives 2.
std::optional<std::int32_t> PageIndex(const std::string& token) {
    if (token.size() < 3 || token.front() != '[' || token.back() != ']')
        return std::nullopt;
    std::int32_t index = 0;
    const char* end = token.data() + token.size() - 1;
    const auto [stop, error] = std::from_chars(token.data() + 1, end, index);
    return error == std::errc() && stop == end ? std::optional(index) : std::nullopt;
}

HostObject ControlOf(const HostObject& form, const std::string& name) {
    return late::Object(form, "Controls", {name});
}

/// Goes through the pairs of a path, type and name each, with the form that they are sought on.
class ControlPathWalk {
public:
    ControlPathWalk(const HostObject& app, HostObject form, bool runtime, bool setFocus)
        : app_(app), form_(std::move(form)), runtime_(runtime), setFocus_(setFocus) {}

    void Walk(const std::vector<std::string>& tokens, std::size_t position) {
        while (position + 1 < tokens.size()) {
            const std::string& type = tokens[position];
            const std::string& name = tokens[position + 1];
            const auto index = position + 2 < tokens.size() ? PageIndex(tokens[position + 2]) : std::nullopt;
            if (text::EqualsIgnoringCase(type, "Subform"))
                EnterSubform(name);
            else if (text::EqualsIgnoringCase(type, "Page"))
                ShowPage(tokens[position - 1], index.value_or(0));
            else if (runtime_)
                FocusControl(type, name);
            position += index ? 3 : 2;
        }
    }

private:
    void EnterSubform(const std::string& name) {
        const HostObject frame = ControlOf(form_, name);
        if (runtime_)
            late::Call(frame, "SetFocus");
        form_ = late::Object(frame, "Form");
    }

    void ShowPage(const std::string& tabName, std::int32_t index) {
        const HostObject tab = ControlOf(form_, tabName);
        const bool designView = late::Integer(form_, "currentview") == 0;
        if (designView || late::Flag(late::Object(tab, "Pages", {index}), "Visible"))
            late::Set(tab, "Value", index);
        if (designView)
            late::Call(late::Object(app_, "DoCmd"), "RunCommand", {kRefreshAfterPageChange});
        platform::Env().doEvents();
    }

    void FocusControl(const std::string& type, const std::string& name) {
        const HostObject control = ControlOf(form_, name);
        if (setFocus_ && !text::EqualsIgnoringCase(type, "Frame"))
            late::Call(control, "SetFocus");
    }

    HostObject app_;
    HostObject form_;
    bool runtime_;
    bool setFocus_;
};

} // namespace

bool CN_IDEAccContext::ActivateControl(const std::string& vstrControlFullPath, bool vfRuntime,
                                       bool vfSetFocus) {
    const ResultCode failure = Trapped("CN_IDEAccContext", "IHostIDEContextCommands_ActivateControl", [&] {
        const std::vector<std::string> tokens = text::Split(vstrControlFullPath, ".");
        if (tokens.size() < 2)
            return;
        const std::int32_t type =
            text::EqualsIgnoringCase(tokens[0], "Report") ? ObjectType::kReport : ObjectType::kForm;
        const HostObject open = FindActual(type, tokens[1], /*hidden=*/false, /*designView=*/false);
        ControlPathWalk(application_, open, vfRuntime, vfSetFocus).Walk(tokens, 2);
        myDoevents();
    });
    return failure == kSuccess;
}

} // namespace tovimar
