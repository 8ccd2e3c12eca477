#include "topics/clsHTMLFile.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "generation/HelpUtilities.h"
#include "platform/Environment.h"
#include "topics/CFormHtmlTemplates.h"
#include "topics/TopicText.h"

namespace tovimar {

namespace {

constexpr std::string_view kStyleSheetTag = "{{StyleSheetLinkHtml}}";

struct Span {
    std::size_t begin = std::string::npos;
    std::size_t length = 0;
    explicit operator bool() const { return begin != std::string::npos; }
};

/// The text between the first `opening` and the first `closing` behind it.
Span ContentOf(const std::string& page, std::string_view opening, std::string_view closing) {
    std::size_t begin = FindAscii(page, opening);
    if (begin == std::string::npos)
        return {};
    begin += opening.size();
    const std::size_t end = FindAscii(page, closing, begin);
    return end == std::string::npos ? Span() : Span{begin, end - begin};
}

void Read(const std::string& page, std::string_view opening, std::string_view closing, std::string& value) {
    if (const Span content = ContentOf(page, opening, closing))
        value = page.substr(content.begin, content.length);
}

void Write(std::string& page, std::string_view opening, std::string_view closing, const std::string& value) {
    if (const Span content = ContentOf(page, opening, closing))
        page.replace(content.begin, content.length, value);
}

std::string WithProjectTags(std::string text) {
    if (const CTovimarParameters* parameters = Session::Parameters())
        parameters->ReplaceTags(text);
    return text;
}

} // namespace

ResultCode clsHTMLFile::Load(const std::string& vstrFullPath) {
    fullPath_ = vstrFullPath;
    if (fullPath_.empty())
        return kFailure1;
    if (!platform::Env().files->FileExists(fullPath_))
        return kFailure2;
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped("clsHTMLFile", "Load", [&] {
        CUTF8FileReader reader;
        result = reader.LoadFile(fullPath_);
        if (result == kSuccess)
            result = LoadText(fullPath_, reader.Text());
    });
    return failure != kSuccess ? failure : result;
}

ResultCode clsHTMLFile::LoadText(const std::string& vstrFullPath, std::string text) {
    fullPath_ = vstrFullPath;
    return Trapped("clsHTMLFile", "Load", [&] {
        HTML = WithProjectTags(std::move(text));
        Read(HTML, "<title>", "</title>", Title);
        Read(HTML, "<h1>", "</h1>", Caption);
    });
}

ResultCode clsHTMLFile::Save(const std::string& vstrFullPath) {
    if (!vstrFullPath.empty())
        fullPath_ = vstrFullPath;
    if (fullPath_.empty())
        return kFailure1;
    // The file system puts the finished page in the place of the old one: whoever ends the program at any
    // moment finds one of the two whole, so that no copy beside it is needed.
    const bool stood = platform::Env().files->FileExists(fullPath_);
    ResultCode result = SetAttributes();
    if (result == kSuccess)
        result = CUTF8FileWriter().SaveFile(fullPath_, HTML, /*vfAddUTF8FileHeader=*/false,
                                            /*vfSaveAsUsualTextFileIfNotUTF8=*/true);
    if (result != kSuccess)
        TellNotSaved(stood);
    return result;
}

void clsHTMLFile::TellNotSaved(bool originalStands) const {
    std::string message = "Can't save file '" + fullPath_ + "'.";
    if (originalStands)
        message += "\r\nThe original file is restored.";
    ShowMessage(message, kMsgExclamation, "Tovimar Add-In");
}

ResultCode clsHTMLFile::SetAttributes() {
    return Trapped("clsHTMLFile", "SetAttributes", [&] {
        Title = WithProjectTags(Title);
        Write(HTML, "<title>", "</title>", Title);
        Caption = WithProjectTags(Caption);
        Write(HTML, "<h1>", "</h1>", Caption);
        FillTags();
        if (FindAscii(HTML, "{{MAP}}") != std::string::npos)
            PutScreenshotsMessage();
        if (FindAscii(HTML, "{{Datamodelimage}}") != std::string::npos) {
            ReplaceTag(HTML, "{{Datamodelimage}}", "");
            ReplaceTag(HTML, "{{Relationships}}",
                       "<p>" + Session::Messages()->GetMessage("{{DatamodelScreenshot}}") + "</p>");
        }
    });
}

void clsHTMLFile::FillTags() {
    const CTovimarParameters* parameters = Session::Parameters();
    ReplaceTag(HTML, "{{charset}}", Charset.empty() && parameters != nullptr ? parameters->Charset : Charset);
    if (!ZoomFactor.empty())
        ReplaceTag(HTML, kStyleSheetTag, std::string(kStyleSheetTag) + "\r\n" + ZoomBlock(ZoomFactor));
    ReplaceTag(HTML, kStyleSheetTag, GetStyleSheetLinkHtml(CSSFullPath));
    ReplaceTag(HTML, "{{BODY}}", Body);
}

void clsHTMLFile::PutScreenshotsMessage() {
    constexpr std::string_view kHeadingEnd = "</h1>";
    std::size_t begin = FindAscii(HTML, kHeadingEnd);
    if (begin == std::string::npos)
        return;
    begin += kHeadingEnd.size();
    const std::size_t end = FindAscii(HTML, "</body>", begin);
    if (end == std::string::npos)
        return;
    // The first character of the line end behind the heading stays.
    if (begin < end)
        ++begin;
    HTML.replace(begin, end - begin, Session::Messages()->GetMessage("{{HelpScreenshots}}"));
}

} // namespace tovimar
