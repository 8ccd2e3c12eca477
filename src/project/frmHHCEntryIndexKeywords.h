#pragma once

#include "foundation/DialogControls.h"
#include "platform/KeyedList.h"

#include <cstdint>
#include <functional>
#include <string>

namespace tovimar {

/// Edits the index entries of one node, without its window: a window shows the controls, calls an operation
/// for each thing that the user does and shows them again. It closes when `Closed` says so.
class frmHHCEntryIndexKeywords {
public:
    const std::string Title = "Node Index Entries";
    dialog::ListBox lstIndexEntries{{""}};
    dialog::TextBox txtIndexEntry{{""}};
    dialog::Button cmdOK{{"OK"}};
    dialog::Button cmdCancel{{"Cancel"}};
    dialog::Button cmdHelp{{"Help"}};
    // The captions of these are tool tips.
    dialog::Button cmdAddEntry{{"Add a new argument"}};
    dialog::Button cmdDeleteEntry{{"Delete selected argument"}};
    dialog::Button cmdMoveUp{{"Move selected argument up"}};
    dialog::Button cmdMoveDown{{"Move selected argument down"}};

    /// A copy of the entries, each its own key; Cancel leaves the caller's list alone.
    const KeyedList<std::string>& IndexesCollection() const { return entries_; }
    void SetIndexesCollection(const KeyedList<std::string>& entries);

    void EntryChange(const std::string& text);
    void ListClick(std::int32_t entry);
    /// Without its double quotes and semicolons. One that stands in the list isn't added.
    void AddClick();
    /// Asks first.
    void DeleteClick();
    void MoveUpClick() { MoveBy(-1); }
    void MoveDownClick() { MoveBy(1); }
    /// At least one entry.
    bool IsValid() const { return !entries_.Empty(); }
    void OKClick();
    void CancelClick() { closed_ = true; }

    /// Key codes with Ctrl held or not: Delete 46, Insert 45, N 78, Up 38, Down 40, Plus 43, Escape 27. True
    /// when the key was used.
    bool ListKeyDown(std::int32_t keyCode, bool ctrl);
    bool EntryKeyDown(std::int32_t keyCode, bool ctrl);
    /// The text box has the focus, its text selected.
    bool EntryFocused() const { return entryFocused_; }

    bool Accepted() const { return accepted_; }
    bool Closed() const { return closed_; }

    /// Runs the dialog to its end. Set by a program that can ask.
    static std::function<void(frmHHCEntryIndexKeywords&)> ShowDialog;

private:
    void ShowEntries(std::int32_t selected);
    void MoveBy(std::int32_t step);
    void ToggleButtons();

    KeyedList<std::string> entries_;
    bool entryFocused_ = false;
    bool accepted_ = false;
    bool closed_ = false;
};

} // namespace tovimar
