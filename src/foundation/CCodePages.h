#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <string>

namespace tovimar {

/// Code pages of one language.
class CCodePage {
public:
    const std::string& Key() const { return LCode; }

    std::string LName;    ///< language name
    std::string LCode;    ///< language code, such as "EN"
    std::string CP1;      ///< Windows code page number as text
    std::string CP2, CP3; ///< further code pages
    std::string HHPLName; ///< the language in the `.hhp` file: "0x409 English (United States)"
};

/// The table of code pages by language: "CodePages.xml" of the settings folder.
class CCodePages {
public:
    /// 0, or the parser's code; the error is reported.
    ResultCode Load(const std::string& vstrXmlDefFileFullPath);
    const KeyedList<CCodePage>& Pages() const { return pages_; }
    /// Null for a language that isn't in the table. Loads the table of the settings folder at the first use.
    const CCodePage* GetCodePageByLanguageCode(const std::string& vstrLanguageCode);
    void Terminate();

private:
    KeyedList<CCodePage> pages_;
    bool loaded_ = false;
};

} // namespace tovimar
