#include "foundation/CCodePages.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

namespace tovimar {

ResultCode CCodePages::Load(const std::string& vstrXmlDefFileFullPath) {
    loaded_ = true;
    pages_.Clear();
    return Trapped("CCodePages", "Load", [&] {
        XmlDocument document;
        CXMLFile file;
        if (file.Load(vstrXmlDefFileFullPath, document) != 0)
            throw RaisedError(file.XmlParseError.errorCode,
                              file.XmlParseError.reason + " in '" + vstrXmlDefFileFullPath + "'",
                              "CCodePages.Load");
        const auto textOf = [](const XmlNode& language, const char* name) {
            return text::TrimWhitespace(language.selectSingleNode(name).text());
        };
        for (const XmlNode& language : document.selectSingleNode("/CodePages").childElements()) {
            CCodePage page{textOf(language, "LName"), textOf(language, "LCode"),
                           textOf(language, "CP1"),   textOf(language, "CP2"),
                           textOf(language, "CP3"),   textOf(language, "HHPLName")};
            if (!page.LCode.empty() && !pages_.Contains(page.LCode))
                pages_.Add(page, page.LCode);
        }
    });
}

const CCodePage* CCodePages::GetCodePageByLanguageCode(const std::string& vstrLanguageCode) {
    if (!loaded_)
        Load(SettingsFolder() + "CodePages.xml");
    return pages_.Find(vstrLanguageCode);
}

void CCodePages::Terminate() {
    pages_.Clear();
    loaded_ = false;
}

} // namespace tovimar
