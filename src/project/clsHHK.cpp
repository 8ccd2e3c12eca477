#include "project/clsHHK.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/ObjectContents.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {

namespace {

constexpr std::size_t kLongestCaption = 32;

} // namespace

clsHHK::clsHHK() {
    Reset();
}

clsHHK::~clsHHK() = default;

void clsHHK::Terminate() {
    root_->Terminate();
}

void clsHHK::Reset() {
    root_ = std::make_unique<clsHHKObject>();
    root_->ObjectType = "ROOT";
    root_->IsRoot = true;
}

void clsHHK::AddCustomLink(const std::string& vstrIndexCaption, const std::string& vstrIndexKey,
                           const std::string& vstrGeneratedFileName, const std::string& vstrBookmarkName) {
    Trapped("clsHHK", "AddLink_NEW", [&] {
        auto local = platform::FileNameOf(vstrGeneratedFileName);
        if (!vstrBookmarkName.empty())
            local += '#' + vstrBookmarkName;
        auto* group = root_->GetObject(vstrIndexKey);
        const bool groupExisted = group != nullptr;
        if (!groupExisted) {
            auto made = std::make_unique<clsHHKObject>();
            made->Key = vstrIndexKey;
            made->Parameters.reserve(2);
            made->Parameters.emplace_back("name", vstrIndexKey);
            made->Parameters.emplace_back("Local", local);
            group = made.get();
            root_->Add(std::move(made));
        }
        auto link = std::make_unique<clsHHKObject>();
        link->Key = vstrIndexKey;
        link->Parameters.reserve(2);
        link->Parameters.emplace_back("Name", vstrIndexCaption);
        link->Parameters.emplace_back("Local", std::move(local));
        if (groupExisted) {
            link->SetIndexGroupDisplayValue(vstrIndexCaption);
            link->Key = link->Parameters[1].Value();
        }
        group->Add(std::move(link));
    });
}

void clsHHK::AddXmlFormLinks(const CXmlForm& rxmlForm, const std::string& /*vstrGeneratedHtmlFile*/) {
    AddLinks(IndexLinksOf(rxmlForm), platform::FileNameOf(rxmlForm.HtmlFullPath()));
}

void clsHHK::AddLinks(const std::vector<IndexLink>& links, const std::string& file) {
    for (const auto& link : links)
        AddCustomLink(link.caption, link.keyword, file, link.bookmark);
}

std::string clsHHK::TruncateCaption(const std::string& text) {
    const auto words = text::Split(text, " ");
    if (words.size() < 2)
        return text;
    std::string joined;
    for (const auto& word : words) {
        if (word.empty())
            continue;
        if (!joined.empty())
            joined += ' ';
        joined += word;
        if (text::Length(joined) > kLongestCaption)
            return text::Left(joined, kLongestCaption) + "...";
    }
    return joined;
}

std::string clsHHK::HHKContents() const {
    std::string out = "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n"
                      "<HTML>\r\n"
                      "<HEAD>\r\n"
                      "<!-- Sitemap 1.0 -->\r\n"
                      "<!-- Put Java help object tag here -->\r\n"
                      "</HEAD>\r\n"
                      "<BODY>\r\n"
                      "<UL>\r\n";
    const auto* parameters = Session::Parameters();
    if (parameters != nullptr && parameters->FillIndexFromAppObjectsAndControls)
        root_->AppendHHK(out, 0);
    out += "</UL>\r\n</BODY>\r\n</HTML>\r\n";
    return out;
}

} // namespace tovimar
