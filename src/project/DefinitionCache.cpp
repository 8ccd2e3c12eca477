#include "project/DefinitionCache.h"

#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/ObjectContents.h"
#include "uimodel/CXmlForm.h"

#include <functional>
#include <string_view>

namespace tovimar {

namespace {

constexpr std::size_t kMostBytes = 16U << 20U;

std::uint64_t HashOf(const std::string& bytes) {
    return std::hash<std::string_view>()(bytes);
}

} // namespace

DefinitionCache::DefinitionCache() = default;
DefinitionCache::~DefinitionCache() = default;

std::shared_ptr<CXmlForm> DefinitionCache::Load(const std::string& path) {
    auto& files = *platform::Env().files;
    if (!files.FileExists(path))
        return nullptr;
    std::string bytes;
    const auto key = text::FoldCase(path);
    if (holders_ > 0) {
        bytes = files.ReadFile(path);
        const auto known = entries_.find(key);
        if (known != entries_.end() && known->second.length == bytes.size() &&
            known->second.hash == HashOf(bytes))
            return known->second.form;
    }
    auto form = std::make_shared<CXmlForm>();
    if (form->Load(path) != kSuccess)
        return nullptr;
    if (holders_ > 0)
        Keep(key, form, bytes);
    return form;
}

bool DefinitionCache::Save(const std::shared_ptr<CXmlForm>& form, const std::string& path) {
    contents_.erase(text::FoldCase(path));
    const bool saved = !form->SaveXml({}, path).empty();
    if (holders_ > 0 && saved)
        Keep(text::FoldCase(path), form, platform::Env().files->ReadFile(path));
    else
        Forget(path);
    return saved;
}

void DefinitionCache::Forget(const std::string& path) {
    const auto key = text::FoldCase(path);
    contents_.erase(key);
    Drop(key);
}

std::shared_ptr<const ObjectContents> DefinitionCache::KnownContents(const std::string& path) const {
    const auto known = contents_.find(text::FoldCase(path));
    return known == contents_.end() ? nullptr : known->second;
}

std::shared_ptr<const ObjectContents> DefinitionCache::NoteContents(const std::string& path,
                                                                    ObjectContents contents) {
    auto noted = std::make_shared<const ObjectContents>(std::move(contents));
    if (holders_ > 0)
        contents_[text::FoldCase(path)] = noted;
    return noted;
}

void DefinitionCache::Drop(const std::string& key) {
    const auto known = entries_.find(key);
    if (known == entries_.end())
        return;
    bytes_ -= known->second.length;
    entries_.erase(known);
}

void DefinitionCache::Keep(const std::string& key, std::shared_ptr<CXmlForm> form, const std::string& bytes) {
    Drop(key);
    bytes_ += bytes.size();
    entries_[key] = {std::move(form), bytes.size(), HashOf(bytes)};
    order_.push_back(key);
    while (bytes_ > kMostBytes && order_.size() > 1) {
        // A definition that was kept anew stands in the order twice; pushing it out early does no harm.
        Drop(order_.front());
        order_.pop_front();
    }
}

void DefinitionCache::Leave() {
    if (--holders_ > 0)
        return;
    entries_.clear();
    order_.clear();
    contents_.clear();
    bytes_ = 0;
}

} // namespace tovimar
