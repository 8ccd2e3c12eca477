#include "foundation/LoadedForms.h"

#include "foundation/Session.h"
#include "platform/text/Text.h"

#include <utility>

namespace tovimar {

LoadedForm::LoadedForm(std::string name) : name_(std::move(name)) {
    Session::Forms().forms_.push_back(this);
}

LoadedForm::~LoadedForm() {
    std::erase(Session::Forms().forms_, this);
}

LoadedForm* LoadedForms::Find(const std::string& name) const {
    for (LoadedForm* form : forms_)
        if (text::EqualsIgnoringCase(form->FormName(), name))
            return form;
    return nullptr;
}

} // namespace tovimar
