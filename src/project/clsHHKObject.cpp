#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarStats.h"
#include "host/server/CTovimarServerData.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/SitemapText.h"
#include "project/clsHHK.h"

namespace tovimar {

namespace {

bool Is(const clsHHKObjectParameter& parameter, const char* name) {
    return text::EqualsIgnoringCase(parameter.Name, name);
}

std::string Indent(std::int32_t level) {
    return std::string(static_cast<std::size_t>(2 * level + 1), ' ');
}

void AppendOpen(std::string& out, const std::string& indent) {
    out += indent + "<LI> <OBJECT type=\"text/sitemap\">" + kCrLf;
}

void AppendClose(std::string& out, const std::string& indent) {
    out += indent + "</OBJECT>" + kCrLf;
}

void AppendParameter(std::string& out, const std::string& indent, const std::string& name,
                     const std::string& value) {
    out += indent + "<param name=\"" + name + "\" Value = \"" + HhcCaption(value) + "\">" + kCrLf;
}

void AppendParameter(std::string& out, const std::string& indent, const clsHHKObjectParameter& parameter) {
    AppendParameter(out, indent, parameter.Name, parameter.Value());
}

} // namespace

std::string clsHHKObjectParameter::Value() const {
    return text::EqualsIgnoringCase(Name, "Local") ? platform::FileNameOf(value_) : value_;
}

clsHHKObject::clsHHKObject() {
    if (auto* data = Session::ServerData())
        ++data->GenerationStats().IndexEntriesQty;
}

std::string clsHHKObject::IndexGroupDisplayValue() const {
    return displayValue_.empty() ? Key : displayValue_;
}

std::string clsHHKObject::DisplayName(const std::string& parentKey) const {
    for (const auto& parameter : Parameters)
        if (Is(parameter, "Name")) {
            const auto value = parameter.Value();
            if (!value.empty() && !text::EqualsIgnoringCase(value, parentKey))
                return value;
            break;
        }
    return IndexGroupDisplayValue();
}

clsHHKObject* clsHHKObject::GetObject(const std::string& vstrKey) const {
    const auto folded = text::FoldCase(vstrKey);
    if (byName_ != nullptr) {
        const auto found = byName_->find(folded);
        return found == byName_->end() ? nullptr : found->second;
    }
    const auto found = children_.find(folded);
    return found == children_.end() ? nullptr : found->second.get();
}

void clsHHKObject::Add(std::unique_ptr<clsHHKObject> robj) {
    constexpr std::size_t kFew = 16;
    Trapped("clsHHKObject", "Add", [&] {
        const auto [place, added] =
            children_.try_emplace(text::FoldCase(robj->DisplayName(Key)), std::move(robj));
        if (byName_ != nullptr && added) {
            byName_->emplace(place->first, place->second.get());
        } else if (byName_ == nullptr && children_.size() > kFew) {
            byName_ = std::make_unique<std::unordered_map<std::string_view, clsHHKObject*>>();
            for (const auto& [name, child] : children_)
                byName_->emplace(name, child.get());
        }
    });
}

void clsHHKObject::Terminate() {
    byName_.reset();
    children_.clear();
}

std::string clsHHKObject::GenerateHHK(std::int32_t vlngLevel) const {
    std::string out;
    AppendHHK(out, vlngLevel);
    return out;
}

void clsHHKObject::AppendHHK(std::string& out, std::int32_t level) const {
    if (IsRoot && !children_.empty()) {
        for (const auto& [name, child] : children_)
            child->AppendHHK(out, level + 1);
        return;
    }
    if (!children_.empty()) {
        AppendGroup(out, level);
        return;
    }
    const auto indent = Indent(level);
    AppendOpen(out, indent);
    for (const auto& parameter : Parameters)
        AppendParameter(out, indent, parameter);
    AppendClose(out, indent);
}

/// With one topic the group is the entry itself; with more its entry names all of them, for a viewer that
/// asks which one is meant, and the list below shows each.
void clsHHKObject::AppendGroup(std::string& out, std::int32_t level) const {
    const auto indent = Indent(level);
    const bool single = children_.size() == 1;
    AppendOpen(out, indent);
    for (const auto& parameter : Parameters) {
        if (!Is(parameter, "Local"))
            AppendParameter(out, indent, parameter.Name, single ? Key : parameter.Value());
        else if (single)
            AppendParameter(out, indent, parameter);
    }
    if (single) {
        AppendClose(out, indent);
        return;
    }
    for (const auto& [name, child] : children_)
        for (const auto& parameter : child->Parameters)
            AppendParameter(out, indent, parameter);
    AppendClose(out, indent);
    out += indent + "<UL>" + kCrLf;
    for (const auto& [name, child] : children_)
        child->AppendHHK(out, level + 1);
    out += indent + "</UL>" + kCrLf;
    AppendClose(out, indent);
}

} // namespace tovimar
