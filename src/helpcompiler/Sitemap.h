#pragma once

#include "platform/text/Text.h"

#include <string>
#include <string_view>
#include <vector>

/// Contents and index files: lists of objects with parameters. They come from any tool, so tags may stand
/// anywhere, in any case, unclosed; what can't be made out is left out and nothing fails.
namespace tovimar::helpcompiler {

struct SitemapParameter {
    std::string name;
    std::string value; ///< entities of the markup decoded
};

struct SitemapEntry {
    int level = 0; ///< lists around it, from 1; 0 outside of all
    int line = 1;
    std::vector<SitemapParameter> parameters;

    /// The first parameter of the name, without regard to case; empty without one.
    std::string Value(std::string_view name) const;
    /// The entry's own name: of several, as the entries of an index have them, the first.
    std::string Name() const { return Value("Name"); }
};

/// A page that an entry leads to, and what it is called there.
struct SitemapTarget {
    std::string title;
    std::string url; ///< with slashes, never empty
};

struct UnheldText {
    int line = 1;
    std::string value;
};

struct Sitemap {
    SitemapEntry properties;           ///< of the whole file
    std::vector<SitemapEntry> entries; ///< in the order of the file
    /// Names with characters that the code page can't hold: most viewers show the reference's digits.
    std::vector<UnheldText> unheld;

    bool UsesFolderIcons() const;
};

/// Lists in lists count up to this depth; deeper entries stand at it.
constexpr int kDeepestSitemapLevel = 100;

/// `bytes` is text of the code page. The texts of the result are of the code page too; a reference to a
/// character that it can't hold stays as it was written.
Sitemap ReadSitemap(std::string_view bytes, const text::CodePage& page);

/// An entry of the contents has one target at most; one of the index a list, each under the name before it.
std::vector<SitemapTarget> TargetsOf(const SitemapEntry& entry);

} // namespace tovimar::helpcompiler
