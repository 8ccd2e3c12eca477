#pragma once

#include "generation/EarlierContextIds.h"
#include "platform/KeyedList.h"

#include <cstdint>
#include <string>
#include <unordered_set>
#include <vector>

namespace tovimar {

class CXmlControl;
class CXmlForm;

/// Help context ids of a run: which are in use, new ones for objects and controls that have none, the numbers
/// written back into the source application, and the include file of the help project. 0 means no id.
class clsFrmRptHelpContextIds {
public:
    /// Forgets objects, used ids and duplicates; the last number given out stays.
    void Reset();
    void Terminate() { Reset(); }

    /// Takes over the ids of an object and its controls, or of one control's children; an object counts once.
    void ExtractUsedHelpContextIds(const CXmlForm& rxmlForm, const CXmlControl* rxmlControl = nullptr);
    /// Reads what an earlier run of the project has given, before its definitions are written over.
    void LoadEarlierIds(const std::string& definitionsFolder) { earlier_.Load(definitionsFolder); }
    /// Puts the earlier ids into a definition whose source has none, so that they outlive a run that is
    /// stopped. They are confirmed when ids are assigned: a number that the application uses elsewhere by
    /// now is replaced.
    void RecallEarlierIds(CXmlForm& rxmlForm);
    /// Gives ids to what has none, in the saved definitions: the earlier one, else a new number.
    void AssignHelpContextIds();
    /// Writes new ids into the source's objects, where that is asked for, and the include file.
    void SetHelpContextIds();

    /// Next free number in steps of ten, 0 when none was found.
    std::int32_t NextFreeId(bool vfReserve);
    bool IsFormKnown(const std::string& name) const { return forms_.Contains(name); }
    bool IsIdUsed(std::int32_t id) const { return usedIds_.Contains(std::to_string(id)); }
    /// "form*control*id" per id that was met again.
    const std::vector<std::string>& Duplicates() const { return duplicates_; }

private:
    void AddUsedId(std::int32_t id, const std::string& form, const std::string& control);
    void Recall(std::int32_t& id, const std::string& form, const std::string& control);
    bool IsWithoutId(std::int32_t id, const std::string& form, const std::string& control) const;
    std::int32_t IdFor(const std::string& form, const std::string& control);
    void AssignHelpContextIdsForForm(const std::string& name);
    void AssignHelpContextIdsForSubControls(const std::string& form, CXmlControl& control);
    void Assign(std::int32_t& id, const std::string& form, const std::string& owner);
    std::string SetHelpContextIdsForForm(const std::string& name);
    std::string DefinitionPath(const std::string& name) const;
    void WriteIncludeFile(std::string text);

    KeyedList<std::string> forms_;
    KeyedList<std::int32_t> usedIds_;
    std::vector<std::string> duplicates_;
    EarlierContextIds earlier_;
    std::int32_t newIds_ = 0;                  ///< given out for the form at hand
    std::unordered_set<std::string> numbered_; ///< forms whose own number is of this run
    std::unordered_set<std::string> recalled_; ///< owners whose number isn't confirmed yet
    std::int32_t lastId_ = 0;
};

} // namespace tovimar
