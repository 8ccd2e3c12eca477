// How a definition is rendered as a topic and the topic read back.

#include "uimodel/CXmlForm.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "platform/text/Text.h"
#include "topics/CFormHtmlTemplates.h"
#include "topics/TopicText.h"

namespace tovimar {

/// What one rendering is asked for.
struct CXmlForm::Rendering {
    const std::string& path; ///< of the topic; empty renders to nowhere
    std::string templateName;
    bool report;
    bool zoom;
    bool localImagePath;
    const std::string& picsFolder;
    std::string queryXml = {};
    bool fillsDescription = false;              ///< tables and worksheets have "{{Description}}"
    const std::string* worksheetHtml = nullptr; ///< worksheets have "{{Objects}}"
};

namespace {

/// Bytes in which a reader looks for the mark of UTF-8.
constexpr std::size_t kMarkedHead = 2048;

/// A text that carries the mark in its head reads back from the file as it was written.
bool ReadsBackAsWritten(const std::string& topic) {
    return HasUtf8Mark(topic.substr(0, kMarkedHead));
}

} // namespace

ResultCode CXmlForm::SaveHTMLEx(const std::string& htmlFileFullPath, bool HtmlOfReport,
                                bool vfApplyZoomFactor, bool vfUseLocalImagePath,
                                const std::string& vstrPicsDir) {
    return Render("SaveHTMLEx", {htmlFileFullPath, "form.htm", HtmlOfReport, vfApplyZoomFactor,
                                 vfUseLocalImagePath, vstrPicsDir});
}

ResultCode CXmlForm::SaveHTML4Table(const std::string& htmlFileFullPath, const std::string& vstrHtmlFileName,
                                    bool HtmlOfReport, bool vfApplyZoomFactor, bool vfUseLocalImagePath,
                                    const std::string& vstrPicsDir, const std::string& vstrQryXml) {
    return Render("SaveHTML4Table",
                  {htmlFileFullPath, vstrHtmlFileName, HtmlOfReport, vfApplyZoomFactor, vfUseLocalImagePath,
                   vstrPicsDir, vstrQryXml, /*fillsDescription=*/true});
}

ResultCode CXmlForm::SaveHTML4Worksheet(const std::string& htmlFileFullPath,
                                        const std::string& vstrHtmlFileName, bool HtmlOfReport,
                                        bool vfApplyZoomFactor, bool vfUseLocalImagePath,
                                        const std::string& vstrPicsDir, const std::string& vstrQryXml,
                                        const std::string& vstrWksHtml) {
    return Render("SaveHTML4Worksheet",
                  {htmlFileFullPath, vstrHtmlFileName, HtmlOfReport, vfApplyZoomFactor, vfUseLocalImagePath,
                   vstrPicsDir, vstrQryXml, /*fillsDescription=*/true, &vstrWksHtml});
}

ResultCode CXmlForm::Render(const char* operation, const Rendering& rendering) {
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped("CXmlForm", operation, [&] {
        std::string topic = RenderText(rendering);
        if (rendering.path.empty())
            return;
        if (HeldTopic != nullptr && ReadsBackAsWritten(topic)) {
            result = MakeDefsFromText(topic, false);
            *HeldTopic = std::move(topic);
            return;
        }
        result = CUTF8FileWriter().SaveFile(rendering.path, topic, /*vfAddUTF8FileHeader=*/false,
                                            /*vfSaveAsUsualTextFileIfNotUTF8=*/true);
        if (result != kSuccess)
            return;
        result = ReadsBackAsWritten(topic) ? MakeDefsFromText(topic, false) : MakeDefs(rendering.path, false);
    });
    return failure != kSuccess ? failure : result;
}

std::string CXmlForm::RenderText(const Rendering& rendering) {
    const CTovimarParameters none;
    const CTovimarParameters& options = Session::Parameters() == nullptr ? none : *Session::Parameters();
    const bool report = rendering.report;
    std::string topic = CFormHtmlTemplates().FileTemplate(
        *this, /*vfMainImage=*/report ? options.AddImageForReport : options.AddImageForForm,
        /*vfControlsMap=*/!report && options.AddHotSpotsForForm,
        /*vfMenusList=*/!report && options.AddControlsListForMenuList,
        /*vfMenus=*/!report && options.AddControlsSectionForMenuList,
        /*vfControlsList=*/report ? options.AddControlsListForReport : options.AddControlsListForForm,
        /*vfControls=*/report ? options.AddControlsSectionForReport : options.AddControlsSectionForForm,
        ParameterizedFile(rendering.templateName), rendering.zoom ? ZoomFactor : std::string(),
        rendering.localImagePath, rendering.picsFolder, rendering.queryXml);
    options.ReplaceTags(topic);
    topic = text::ReplaceAll(topic, "{{charset}}", Charset);
    topic = text::ReplaceAll(topic, "{{StyleSheetLinkHtml}}", GetStyleSheetLinkHtml(stylesheetFullPath_));
    if (rendering.fillsDescription)
        ReplaceTag(topic, "{{Description}}", Description);
    if (rendering.worksheetHtml != nullptr)
        ReplaceTag(topic, "{{Objects}}", *rendering.worksheetHtml);
    if (rendering.fillsDescription)
        topic = Session::Messages()->ReplaceParameters(topic);
    return topic;
}

} // namespace tovimar
