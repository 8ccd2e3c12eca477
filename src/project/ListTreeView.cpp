#include "project/ListTreeView.h"

#include "platform/Error.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <vector>

namespace tovimar {

class ListTreeView::Entry : public ITreeViewNode {
public:
    explicit Entry(ListTreeView& view) : view_(view) {}

    std::string Key() const override { return key; }
    std::string Text() const override { return text_; }
    void SetText(const std::string& text) override { text_ = text; }
    std::string Image() const override { return image_; }
    void SetImage(const std::string& image) override { image_ = image; }
    void SetTag(const std::string& tag) override { tag_ = tag; }
    bool Expanded() const override { return expanded_; }
    void SetExpanded(bool expanded) override { expanded_ = expanded; }
    bool Selected() const override { return view_.selected_ == this; }
    void SetSelected(bool selected) override {
        if (selected || Selected())
            view_.selected_ = selected ? this : nullptr;
    }
    ITreeViewNode* Parent() const override { return IsTop(parent) ? nullptr : parent; }
    ITreeViewNode* Next() const override { return Neighbour(1); }
    ITreeViewNode* Previous() const override { return Neighbour(-1); }
    ITreeViewNode* Child() const override { return children.empty() ? nullptr : children.front().get(); }
    std::size_t Children() const override { return children.size(); }

    std::vector<std::unique_ptr<Entry>>::iterator Place() const {
        auto& siblings = parent->children;
        return std::find_if(siblings.begin(), siblings.end(),
                            [this](const auto& sibling) { return sibling.get() == this; });
    }
    Entry* Neighbour(std::ptrdiff_t step) const {
        const auto at = Place() - parent->children.begin() + step;
        const bool there = at >= 0 && at < static_cast<std::ptrdiff_t>(parent->children.size());
        return there ? parent->children[static_cast<std::size_t>(at)].get() : nullptr;
    }

    std::string key;
    Entry* parent = nullptr;
    std::vector<std::unique_ptr<Entry>> children;

private:
    static bool IsTop(const Entry* entry) { return entry == nullptr || entry->parent == nullptr; }

    ListTreeView& view_;
    std::string text_, image_, tag_;
    bool expanded_ = false;
};

ListTreeView::ListTreeView() : top_(std::make_unique<Entry>(*this)) {}
ListTreeView::~ListTreeView() = default;

void ListTreeView::ClearNodes() {
    selected_ = nullptr;
    entries_.clear();
    top_->children.clear();
}

ITreeViewNode* ListTreeView::AddNode(ITreeViewNode* relative, TreeViewRelation relation,
                                     const std::string& key, const std::string& text,
                                     const std::string& image) {
    const std::string folded = text::FoldCase(key);
    if (entries_.contains(folded))
        throw RaisedError(457, "This key is already associated with an element of the view: " + key,
                          "ListTreeView");
    auto* beside = dynamic_cast<Entry*>(relative);
    auto made = std::make_unique<Entry>(*this);
    made->key = key;
    made->SetText(text);
    made->SetImage(image);
    const bool below = beside == nullptr || relation == TreeViewRelation::LastChild;
    made->parent = beside == nullptr ? top_.get() : below ? beside : beside->parent;
    auto& siblings = made->parent->children;
    auto place = siblings.end();
    if (!below)
        place = beside->Place() + (relation == TreeViewRelation::After ? 1 : 0);
    auto* entry = siblings.insert(place, std::move(made))->get();
    entries_[folded] = entry;
    return entry;
}

void ListTreeView::RemoveNode(const std::string& key) {
    const auto found = entries_.find(text::FoldCase(key));
    if (found == entries_.end())
        return;
    Entry& entry = *found->second;
    const bool wasSelected = selected_ != nullptr;
    Forget(entry);
    if (wasSelected && selected_ == nullptr) {
        auto* next = entry.Neighbour(1);
        selected_ = next != nullptr ? next : entry.Neighbour(-1);
        if (selected_ == nullptr && entry.parent != top_.get())
            selected_ = entry.parent;
    }
    entry.parent->children.erase(entry.Place());
}

void ListTreeView::Forget(const Entry& entry) {
    if (selected_ == &entry)
        selected_ = nullptr;
    entries_.erase(text::FoldCase(entry.key));
    for (const auto& child : entry.children)
        Forget(*child);
}

ITreeViewNode* ListTreeView::SelectedItem() const {
    return selected_;
}

ITreeViewNode* ListTreeView::Find(const std::string& key) const {
    const auto found = entries_.find(text::FoldCase(key));
    return found == entries_.end() ? nullptr : found->second;
}

void ListTreeView::Select(ITreeViewNode* entry) {
    selected_ = dynamic_cast<Entry*>(entry);
}

} // namespace tovimar
