#include "generation/EarlierContextIds.h"

#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {
namespace {

std::string KeyOf(const std::string& object, const std::string& control) {
    return text::FoldCase(object) + '\n' + text::FoldCase(control);
}

} // namespace

void EarlierContextIds::Take(const std::string& object, const std::string& control, std::int32_t id) {
    if (id <= 0)
        return;
    byOwner_.try_emplace(KeyOf(object, control), id);
    ids_.insert(id);
}

void EarlierContextIds::Load(const std::string& definitionsFolder) {
    auto& files = *platform::Env().files;
    if (!files.FolderExists(definitionsFolder))
        return;
    for (const std::string& file : files.ListFiles(definitionsFolder, "*.xml")) {
        CXmlForm form;
        if (form.Load(platform::Join(definitionsFolder, file)) != kSuccess)
            continue;
        const std::string object = platform::BaseNameOf(file);
        Take(object, {}, form.HelpContextId);
        for (const auto& control : form.Controls) {
            Take(object, control->Name, control->HelpContextId);
            for (const auto& child : control->Controls)
                Take(object, control->Name + '/' + child->Name, child->HelpContextId);
        }
    }
}

std::int32_t EarlierContextIds::IdOf(const std::string& object, const std::string& control) const {
    const auto found = byOwner_.find(KeyOf(object, control));
    return found == byOwner_.end() ? 0 : found->second;
}

} // namespace tovimar
