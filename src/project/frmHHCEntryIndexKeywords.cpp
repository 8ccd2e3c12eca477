#include "project/frmHHCEntryIndexKeywords.h"

#include "foundation/Product.h"
#include "foundation/ShowMessage.h"

#include <algorithm>

namespace tovimar {
namespace {

constexpr std::int32_t kEscapeKey = 27;
constexpr std::int32_t kUpKey = 38;
constexpr std::int32_t kDownKey = 40;
constexpr std::int32_t kPlusKey = 43;
constexpr std::int32_t kInsertKey = 45;
constexpr std::int32_t kDeleteKey = 46;
constexpr std::int32_t kNKey = 78;

} // namespace

std::function<void(frmHHCEntryIndexKeywords&)> frmHHCEntryIndexKeywords::ShowDialog;

void frmHHCEntryIndexKeywords::SetIndexesCollection(const KeyedList<std::string>& entries) {
    KeyedList<std::string> copy;
    for (const std::string& entry : entries)
        if (!copy.Contains(entry))
            copy.Add(entry, entry);
    entries_ = std::move(copy);
    ShowEntries(entries_.Empty() ? -1 : 0);
}

void frmHHCEntryIndexKeywords::ShowEntries(std::int32_t selected) {
    lstIndexEntries.entries.clear();
    for (const std::string& entry : entries_)
        lstIndexEntries.entries.push_back(entry);
    lstIndexEntries.selected = selected;
    if (selected >= 0)
        txtIndexEntry.text = lstIndexEntries.SelectedEntry();
    entryFocused_ = false;
    ToggleButtons();
}

void frmHHCEntryIndexKeywords::EntryChange(const std::string& text) {
    txtIndexEntry.text = text;
    ToggleButtons();
}

void frmHHCEntryIndexKeywords::ListClick(std::int32_t entry) {
    lstIndexEntries.selected = entry;
    txtIndexEntry.text = lstIndexEntries.SelectedEntry();
    ToggleButtons();
}

void frmHHCEntryIndexKeywords::AddClick() {
    std::string entry = txtIndexEntry.text;
    std::erase_if(entry, [](char character) { return character == '"' || character == ';'; });
    if (entry.empty()) {
        EntryChange({});
        return;
    }
    if (entries_.Contains(entry))
        return;
    entries_.Add(entry, entry);
    ShowEntries(static_cast<std::int32_t>(entries_.Count()) - 1);
}

void frmHHCEntryIndexKeywords::DeleteClick() {
    const auto selected = lstIndexEntries.selected;
    if (selected < 0 || ShowMessage("Are you sure you wanted to delete this index entry?",
                                    kMsgYesNo | kMsgQuestion | kMsgDefaultSecond, kApplicationTitle, {}, 0,
                                    "frmHHCEnrty.cmdDeleteEntry_Click") != platform::kAnswerYes)
        return;
    entries_.TakeAt(static_cast<std::size_t>(selected) + 1);
    ShowEntries(std::min(selected, static_cast<std::int32_t>(entries_.Count()) - 1));
    entryFocused_ = entries_.Empty();
}

void frmHHCEntryIndexKeywords::MoveBy(std::int32_t step) {
    const auto from = lstIndexEntries.selected;
    const auto to = from + step;
    const auto count = static_cast<std::int32_t>(entries_.Count());
    if (from < 0 || from >= count || to < 0 || to >= count)
        return;
    std::swap(lstIndexEntries.entries[static_cast<std::size_t>(from)],
              lstIndexEntries.entries[static_cast<std::size_t>(to)]);
    KeyedList<std::string> moved;
    for (const std::string& entry : lstIndexEntries.entries)
        moved.Add(entry, entry);
    SetIndexesCollection(moved);
    ListClick(to);
}

void frmHHCEntryIndexKeywords::OKClick() {
    if (!IsValid())
        return;
    accepted_ = closed_ = true;
}

void frmHHCEntryIndexKeywords::ToggleButtons() {
    const auto selected = lstIndexEntries.selected;
    const std::string& text = txtIndexEntry.text;
    cmdOK.enabled = IsValid();
    lstIndexEntries.enabled = !text.empty() || !entries_.Empty();
    cmdAddEntry.enabled = !text.empty() && !entries_.Contains(text);
    cmdDeleteEntry.enabled = selected >= 0;
    cmdMoveUp.enabled = selected > 0;
    cmdMoveDown.enabled = selected >= 0 && selected + 1 < static_cast<std::int32_t>(entries_.Count());
}

bool frmHHCEntryIndexKeywords::ListKeyDown(std::int32_t keyCode, bool ctrl) {
    if (keyCode == kDeleteKey)
        DeleteClick();
    else if (ctrl && keyCode == kNKey)
        AddClick();
    else if (ctrl && keyCode == kUpKey)
        MoveUpClick();
    else if (ctrl && keyCode == kDownKey)
        MoveDownClick();
    else if (keyCode == kEscapeKey)
        CancelClick();
    else
        return false;
    return true;
}

bool frmHHCEntryIndexKeywords::EntryKeyDown(std::int32_t keyCode, bool ctrl) {
    if (keyCode == kEscapeKey) {
        CancelClick();
        return true;
    }
    const bool adds = keyCode == kInsertKey || (ctrl && (keyCode == kNKey || keyCode == kPlusKey));
    if (!adds || txtIndexEntry.text.empty())
        return false;
    AddClick();
    entryFocused_ = true;
    return true;
}

} // namespace tovimar
