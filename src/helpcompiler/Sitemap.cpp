#include "helpcompiler/Sitemap.h"

#include "helpcompiler/Markup.h"
#include "helpcompiler/ProjectFolder.h"

#include <algorithm>

namespace tovimar::helpcompiler {
namespace {

/// True for text in which a "&#" still stands for a character.
bool HasReference(std::string_view text, const text::CodePage& page) {
    return text.find("&#") != std::string_view::npos && DecodeReferences(text, page, Unheld::Blank) != text;
}

class SitemapReader {
public:
    SitemapReader(std::string_view bytes, const text::CodePage& page) : scanner_(bytes), page_(page) {}

    Sitemap Read() {
        for (MarkupToken token; scanner_.Next(token);) {
            if (token.kind == MarkupToken::Kind::OpenTag)
                Open(token);
            else if (token.kind == MarkupToken::Kind::CloseTag)
                Close(token.name);
        }
        FinishEntry();
        return std::move(map_);
    }

private:
    void Open(const MarkupToken& token) {
        if (token.name == "ul") {
            FinishEntry();
            ++level_;
        } else if (token.name == "object") {
            FinishEntry();
            inProperties_ = EqualsCaseless(token.Attribute("type"), "text/site properties");
            inEntry_ = EqualsCaseless(token.Attribute("type"), "text/sitemap");
            entry_.line = scanner_.LineOf(token.source);
            entry_.level = std::min(level_, kDeepestSitemapLevel);
        } else if (token.name == "param") {
            AddParameter(token);
        }
    }

    void Close(std::string_view name) {
        if (name == "ul") {
            FinishEntry();
            level_ = std::max(level_ - 1, 0);
        } else if (name == "object") {
            FinishEntry();
        }
    }

    void AddParameter(const MarkupToken& token) {
        if (!inEntry_ && !inProperties_)
            return;
        SitemapParameter parameter{std::string(token.Attribute("name")),
                                   DecodeReferences(token.Attribute("value"), page_, Unheld::Keep)};
        const bool shown = inEntry_ && EqualsCaseless(parameter.name, "Name");
        if (shown && HasReference(parameter.value, page_))
            map_.unheld.push_back({scanner_.LineOf(token.source), parameter.value});
        (inEntry_ ? entry_ : map_.properties).parameters.push_back(std::move(parameter));
    }

    void FinishEntry() {
        if (inEntry_ && !entry_.parameters.empty())
            map_.entries.push_back(std::move(entry_));
        entry_ = {};
        inEntry_ = inProperties_ = false;
    }

    MarkupScanner scanner_;
    const text::CodePage& page_;
    Sitemap map_;
    SitemapEntry entry_;
    int level_ = 0;
    bool inEntry_ = false;
    bool inProperties_ = false;
};

} // namespace

std::string SitemapEntry::Value(std::string_view name) const {
    for (const SitemapParameter& parameter : parameters)
        if (EqualsCaseless(parameter.name, name))
            return parameter.value;
    return {};
}

bool Sitemap::UsesFolderIcons() const {
    return EqualsCaseless(properties.Value("ImageType"), "Folder");
}

Sitemap ReadSitemap(std::string_view bytes, const text::CodePage& page) {
    return SitemapReader(bytes, page).Read();
}

std::vector<SitemapTarget> TargetsOf(const SitemapEntry& entry) {
    std::vector<SitemapTarget> targets;
    std::string title;
    for (const SitemapParameter& parameter : entry.parameters) {
        if (EqualsCaseless(parameter.name, "Name")) {
            title = parameter.value;
        } else if (EqualsCaseless(parameter.name, "Local") && !parameter.value.empty()) {
            targets.push_back({title, WithSlashes(parameter.value)});
        }
    }
    return targets;
}

} // namespace tovimar::helpcompiler
