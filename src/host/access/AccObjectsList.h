#pragma once

#include "host/contract/IHelpPrjSourceProject.h"
#include "host/contract/IXmlSerializer.h"

#include <cstdint>
#include <string>
#include <unordered_set>

namespace tovimar {

/// What the five list classes share: one element in one line per source object,
///
///     <FORM Name="..." Key="..." caption="..." icon = "form" ProcessCode="999" GeneratedHTMLFile = "..."
///     TemplateHTMLFile = "Form.htm" title = "..." type = "2" Skipped = "0" ExtraValue = ""/>
///
/// with ` Description = "..."` in front of the end for kinds that have descriptions. No two fragments name
/// one file, and none names a file that the tree holds already.
class AccObjectsList : public IXmlSerializer {
public:
    std::string XmlText() override;
    const KeyedList<std::string>& XmlCollection(CHelpPrjTree& robjTree,
                                                const IHelpPrjSourceProject& rprj) override;
    void Reset() override { fragments_.Clear(); }

protected:
    struct Kind {
        const char* className;
        const char* element;
        const char* word; ///< of keys and file names
        std::int32_t objectType;
        const SourceItems& (IHelpPrjSourceProject::*items)() const;
    };
    explicit AccObjectsList(const Kind& kind) : kind_(kind) {}

private:
    std::string Fragment(CHelpPrjTree& tree, const CHelpPrjSourceItem& item);
    std::string FreeFileName(CHelpPrjTree& tree, const std::string& project, const std::string& base);
    bool Taken(CHelpPrjTree& tree, const std::string& file) const;

    Kind kind_;
    KeyedList<std::string> fragments_;
    /// Files of this list's own fragments, case folded: their nodes come into the tree later.
    std::unordered_set<std::string> given_;
};

class clsAccFormsList : public AccObjectsList {
public:
    clsAccFormsList();
};
class clsAccReportsList : public AccObjectsList {
public:
    clsAccReportsList();
};
class clsAccTablesList : public AccObjectsList {
public:
    clsAccTablesList();
};
class clsAccQueriesList : public AccObjectsList {
public:
    clsAccQueriesList();
};
class clsAccMacrosList : public AccObjectsList {
public:
    clsAccMacrosList();
};

} // namespace tovimar
