// A topic as a whole: a template or the built-in layout, filled in.

#include "topics/CFormHtmlTemplates.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "topics/TopicNames.h"
#include "topics/TopicSections.h"
#include "topics/TopicText.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

constexpr std::string_view kStyleSheetTag = "{{StyleSheetLinkHtml}}";
constexpr std::string_view kMenusListBegin = "<!-- + MENUS LIST + -->";
constexpr std::string_view kMenusListEnd = "<!-- - MENUS LIST - -->";
constexpr std::string_view kMenusBegin = "<!-- + MENUS + -->";
constexpr std::string_view kMenusEnd = "<!-- - MENUS - -->";
constexpr std::string_view kControlsListBegin = "<!-- + CONTROLS LIST + -->";
constexpr std::string_view kControlsListEnd = "<!-- - CONTROLS LIST - -->";
constexpr std::string_view kControlsBegin = "<!-- + CONTROLS + -->";
constexpr std::string_view kControlsEnd = "<!-- - CONTROLS - -->";

constexpr std::string_view kBuiltInHead =
    "<HTML>\r\n"
    "<HEAD>\r\n"
    "<meta name=\"GENERATOR\" content=\"{{HtmlTovimarTitleAndVersion}}\">\r\n"
    "<meta name=\"TOVIMAR-VERSION\" content=\"{{HtmlTovimarVersion}}\" >\r\n"
    "<meta name=\"TOVIMAR-FORM-NAME\" content=\"{{FormName}}\" >\r\n"
    "<meta name=\"TOVIMAR-TOC-EXCLUDE-LIST\" content=\"{{HtmlTovimarExcludeList}}\" >"
    "<meta http-equiv=\"Content-Type\" content=\"text/html; charset={{charset}}\">\r\n"
    "{{StyleSheetLinkHtml}}\r\n"
    "<TITLE>";

/// "%1" stands for the web help's frame page.
constexpr std::string_view kWebHelpScript =
    "<script type=\"text/javascript\" id=\"wbh\">\r\n"
    "<!--\r\n"
    "try {\r\n"
    "    var ext = window.external;\r\n"
    "    if (top == self) if (window.document.designMode == \"Inherit\") "
    "top.location.href=\"%1?\"+String.fromCharCode(34)+location.href+String.fromCharCode(34);\r\n"
    "}\r\n"
    "catch(e){\r\n"
    "}\r\n"
    "//-->\r\n"
    "</script>";

/// One rendering: what is shown of a form, and what with.
struct Topic {
    CXmlForm& form;
    bool mainImage, controlsMap, menusList, menus, controlsList, controls;
    const std::string& zoom;
    const std::string& queryXml;
    TopicSections sections;

    using Writer = void (TopicSections::*)(std::string&) const;
    /// The piece when it is shown, else nothing.
    std::string Piece(bool shown, Writer write) const {
        std::string out;
        if (shown)
            (sections.*write)(out);
        return out;
    }
};

std::string ReadTemplate(const std::string& path) {
    CUTF8FileReader reader;
    if (!platform::Env().files->FileExists(path) || reader.LoadFile(path) != kSuccess)
        return {};
    return reader.Text();
}

void FillMenuRegions(std::string& page, const Topic& topic) {
    if (!topic.form.HasMenu()) {
        CutRegion(page, kMenusListBegin, kMenusEnd);
        return;
    }
    if (topic.menusList)
        ReplaceTagWith(page, "{{MenusList}}",
                       [&] { return topic.Piece(true, &TopicSections::AppendMenusList); });
    else
        CutRegion(page, kMenusListBegin, kMenusListEnd);
    if (topic.menus)
        ReplaceTagWith(page, "{{Menus}}", [&] { return topic.Piece(true, &TopicSections::AppendMenus); });
    else
        CutRegion(page, kMenusBegin, kMenusEnd);
}

void FillControlRegions(std::string& page, const Topic& topic) {
    if (topic.controlsList)
        ReplaceTagWith(page, "{{ControlsList}}",
                       [&] { return topic.Piece(true, &TopicSections::AppendControlsList); });
    else
        CutRegion(page, kControlsListBegin, kControlsListEnd);
    if (!topic.controls) {
        CutRegion(page, kControlsBegin, kControlsEnd);
        return;
    }
    ReplaceTagWith(page, "{{Controls}}", [&] { return topic.Piece(true, &TopicSections::AppendControls); });
    ReplaceTagWith(page, "{{Fields}}", [&]() -> std::string {
        if (topic.queryXml.empty())
            return {};
        return CFormHtmlTemplates().GenerateQueryFieldsHTML(topic.form.UniqueName(), topic.queryXml);
    });
}

std::string FilledTemplate(const Topic& topic, const std::string& templateFile) {
    std::string page = ReadTemplate(templateFile);
    if (!topic.zoom.empty())
        ReplaceTag(page, kStyleSheetTag, std::string(kStyleSheetTag) + "\r\n" + ZoomBlock(topic.zoom));
    const std::string displayName = FormDisplayName(topic.form);
    ReplaceTag(page, "{{HtmlTopicCaption}}", displayName);
    ReplaceTag(page, "{{HtmlPageTitle}}", displayName);
    ReplaceTagWith(page, "{{MAP}}",
                   [&] { return topic.Piece(topic.controlsMap, &TopicSections::AppendMap); });
    ReplaceTagWith(page, "{{IMAGE}}",
                   [&] { return topic.Piece(topic.mainImage, &TopicSections::AppendMainImage); });
    FillMenuRegions(page, topic);
    FillControlRegions(page, topic);
    return page;
}

std::string BuiltInLayout(const Topic& topic) {
    std::string page(kBuiltInHead);
    page.append(FormDisplayName(topic.form)).append("</TITLE>\r\n");
    if (!topic.zoom.empty())
        page.append(ZoomBlock(topic.zoom));
    page.append("</HEAD>\r\n<BODY>\r\n").append(CFormHtmlTemplates().FormTitle(topic.form));
    const auto append = [&](bool shown, Topic::Writer write) {
        if (shown)
            (topic.sections.*write)(page);
    };
    append(topic.controlsMap, &TopicSections::AppendMap);
    append(topic.mainImage, &TopicSections::AppendMainImage);
    append(topic.menusList, &TopicSections::AppendMenusList);
    append(topic.menus, &TopicSections::AppendMenus);
    append(topic.controlsList, &TopicSections::AppendControlsList);
    append(topic.controls, &TopicSections::AppendControls);
    return page.append("</BODY>\r\n</HTML>\r\n");
}

/// What both roads end with. The markers of the lists stay in the topic, those of the sections go.
void Finish(std::string& page, const CXmlForm& form) {
    ReplaceTag(page, "{{FormName}}", NormalizeName(form.Name));
    for (const std::string_view marker : {kMenusBegin, kMenusEnd, kControlsBegin, kControlsEnd})
        ReplaceTag(page, marker, "");
    ReplaceTag(page, "{{HtmlTovimarExcludeList}}", "");
    if (FindAscii(page, "wbh") == std::string::npos)
        page.append("\r\n\r\n").append(WebHelpScript());
    page = Session::Messages()->ReplaceParameters(page);
}

} // namespace

std::string ZoomBlock(std::string_view zoom) {
    std::string block = "<style type=\"text/css\" media=\"screen\">\r\nbody {zoom: ";
    return block.append(zoom).append("}\r\n</style>\r\n");
}

std::string WebHelpScript(std::string_view framePage) {
    return text::ReplaceAll(kWebHelpScript, "%1", framePage);
}

std::string CFormHtmlTemplates::FileTemplate(CXmlForm& robjXmlForm, bool vfMainImage, bool vfControlsMap,
                                             bool vfMenusList, bool vfMenus, bool vfControlsList,
                                             bool vfControls, const std::string& vstrTemplateFile,
                                             const std::string& vstrZoom, bool vfUseLocalImagePath,
                                             const std::string& vstrPicsDir, const std::string& vstrQryXml) {
    std::string page;
    Trapped("CFormHtmlTemplates", "FileTemplate", [&] {
        const Topic topic{
            robjXmlForm,
            vfMainImage,
            vfControlsMap,
            vfMenusList,
            vfMenus,
            vfControlsList,
            vfControls,
            vstrZoom,
            vstrQryXml,
            TopicSections(robjXmlForm, {vfMainImage, vfControlsMap, vfUseLocalImagePath, vstrPicsDir,
                                        /*named=*/!vstrTemplateFile.empty()})};
        page = vstrTemplateFile.empty() ? BuiltInLayout(topic) : FilledTemplate(topic, vstrTemplateFile);
        Finish(page, robjXmlForm);
    });
    return page;
}

} // namespace tovimar
