#include "topics/CFormHTMLManipulator.h"

#include "foundation/BackupFileName.h"
#include "foundation/CUTF8FileReader.h"
#include "foundation/CUTF8FileWriter.h"
#include "foundation/ErrorTrap.h"
#include "platform/Environment.h"
#include "platform/html/HtmlDocument.h"
#include "topics/TopicText.h"

#include <cstdint>

namespace tovimar {

namespace {

constexpr const char* kClass = "CFormHTMLManipulator";

bool EndsLine(std::string_view text) {
    return text.empty() || text.ends_with('\n');
}

/// Where the body ends in the page's text, in front of its end tag and of the blanks that indent it.
std::size_t EndOfBody(const HtmlDocument& document) {
    const std::string_view text = document.Source();
    std::size_t end = text.size();
    for (const HtmlNode* node : {static_cast<const HtmlNode*>(document.body()),
                                 static_cast<const HtmlNode*>(document.documentElement())})
        if (node != nullptr && !node->SourceEnd().empty()) {
            end = static_cast<std::size_t>(node->SourceEnd().data() - text.data());
            break;
        }
    const std::size_t shown = text.substr(0, end).find_last_not_of(" \t");
    return shown != std::string_view::npos && text[shown] == '\n' ? shown + 1 : end;
}

} // namespace

/// What is known of the file beside its document.
struct CFormHTMLManipulator::Page {
    bool hasHeader = false;
    std::string text;          ///< without the script
    std::string script;        ///< behind the page's end
    std::string added;         ///< elements, each with its line end
    std::uint64_t changes = 0; ///< of the document, as far as `added` tells them
    bool changedElsewhere = false;

    bool IsTold(const HtmlDocument& document) const {
        return !changedElsewhere && document.Changes() == changes;
    }
    std::string_view LineEnd() const {
        return text.find('\n') != std::string::npos && text.find("\r\n") == std::string::npos ? "\n" : "\r\n";
    }
};

CFormHTMLManipulator::CFormHTMLManipulator() = default;
CFormHTMLManipulator::~CFormHTMLManipulator() = default;

ResultCode CFormHTMLManipulator::LoadHtmlDocument(const std::string& vstrURLorFullPath, HtmlDocument* rdoc) {
    Terminate();
    if (vstrURLorFullPath.empty())
        return kGeneralFailure;
    path_ = vstrURLorFullPath;
    if (rdoc != nullptr) {
        document_ = rdoc;
        return kSuccess;
    }
    return Trapped(
        kClass, "LoadHtmlDocument", [&] { Load(path_); }, [&] { return "File = " + path_; });
}

void CFormHTMLManipulator::Load(const std::string& path) {
    constexpr std::string_view kPageEnd = "</html>";
    CUTF8FileReader reader;
    if (const ResultCode code = reader.LoadFile(path); code != kSuccess)
        throw RaisedError(code, "The page can't be read: " + platform::Env().files->ToNative(path), kClass);
    page_ = std::make_unique<Page>();
    page_->hasHeader = reader.HasUTF8Header();
    page_->text = reader.Text();
    const std::size_t end = FindAscii(page_->text, kPageEnd);
    const std::size_t behind = end == std::string::npos ? end : end + kPageEnd.size();
    if (behind != std::string::npos && FindAscii(page_->text, "<script", behind) != std::string::npos) {
        page_->script = page_->text.substr(behind);
        page_->text.resize(behind);
    }
    own_ = std::make_unique<HtmlDocument>(page_->text, path);
    document_ = own_.get();
}

ResultCode CFormHTMLManipulator::AddHTMLElementToBody(const std::string& vstrHTMLTag,
                                                      const std::string& vstrInnerHtml) {
    if (document_ == nullptr)
        return kGeneralFailure;
    return Trapped(kClass, "AddHTMLElementToBody", [&] {
        const bool told = page_ != nullptr && page_->IsTold(*document_);
        HtmlNode& element = document_->createElement(vstrHTMLTag);
        element.setInnerHTML(vstrInnerHtml);
        Append(element);
        if (page_ == nullptr)
            return;
        page_->changedElsewhere = !told;
        page_->added += element.outerHTML().append(page_->LineEnd());
        page_->changes = document_->Changes();
    });
}

void CFormHTMLManipulator::Append(HtmlNode& element) {
    HtmlNode* body = document_->body();
    if (body == nullptr || !body->Is("body"))
        throw RaisedError(kFailure1, "The page has no body: " + platform::Env().files->ToNative(path_),
                          kClass);
    body->appendChild(element);
}

ResultCode CFormHTMLManipulator::SaveDoc() {
    if (path_.empty() || document_ == nullptr)
        return kGeneralFailure;
    if (page_ != nullptr && page_->added.empty() && page_->IsTold(*document_))
        return kSuccess;
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped(
        kClass, "SaveDoc", [&] { result = Replace(Text()); }, [&] { return "File = " + path_; });
    return failure != kSuccess ? failure : result;
}

/// The page as it was written with the added lines at the end of its body; a document that was changed in
/// other ways as it stands.
std::string CFormHTMLManipulator::Text() const {
    if (page_ == nullptr)
        return document_->outerHTML();
    if (!page_->IsTold(*document_))
        return document_->outerHTML() + page_->script;
    const std::string_view text = page_->text;
    const std::size_t end = EndOfBody(*document_);
    std::string finished(text.substr(0, end));
    if (!EndsLine(finished))
        finished += page_->LineEnd();
    return finished.append(page_->added).append(text.substr(end)).append(page_->script);
}

/// The old file stands until the finished one takes its place, and is there as a copy afterwards.
ResultCode CFormHTMLManipulator::Replace(const std::string& finished) const {
    auto& files = *platform::Env().files;
    const std::string backup = files.FileExists(path_) ? BackupFileName(path_) : std::string();
    if (!backup.empty())
        files.CopyFile(path_, backup);
    const bool hasHeader = page_ != nullptr && page_->hasHeader;
    const ResultCode result = CUTF8FileWriter().SaveFile(path_, finished, /*vfAddUTF8FileHeader=*/hasHeader,
                                                         /*vfSaveAsUsualTextFileIfNotUTF8=*/!hasHeader);
    if (result != kSuccess && !backup.empty())
        PassOver([&] { files.DeleteFile(backup); });
    return result;
}

void CFormHTMLManipulator::Terminate() {
    document_ = nullptr;
    own_.reset();
    page_.reset();
    path_.clear();
}

} // namespace tovimar
