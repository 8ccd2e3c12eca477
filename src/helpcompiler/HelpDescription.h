#pragma once

#include "helpcompiler/Sitemap.h"

#include <array>
#include <cstdint>
#include <string>
#include <vector>

/// What a compiled help says about itself. All texts are bytes of its code page; files are named from the
/// project's folder on, with slashes.
namespace tovimar::helpcompiler {

/// A window of the viewer. Numbers count where the project gives them.
struct WindowDefinition {
    struct Number {
        std::uint32_t value = 0;
        bool given = false;
    };
    std::string name, caption, contentsFile, indexFile, defaultTopic, home;
    std::array<std::string, 2> jumpUrls, jumpTexts;
    Number paneStyle, navigationWidth, buttons, style, extendedStyle, showState, closed, tab, tabPosition,
        notify;
    std::array<std::uint32_t, 4> rectangle{}; ///< left, top, right, bottom
    bool hasRectangle = false;
};

/// A page of the project, or a place that only contents or index lead to.
struct Topic {
    std::string url;
    std::string title;
    bool hasTitle = false;
    bool inArchive = false;
    bool inContents = false;
};

struct ContextTarget {
    std::uint32_t id = 0;
    std::string target;
    int line = 0; ///< of the page's alias in the project, for messages
};

struct HelpDescription {
    std::uint32_t language = 0x409;
    int codePage = 1252;
    bool fullTextSearch = false;
    bool binaryIndex = false;
    std::uint32_t time = 0; ///< seconds since 1970, for the reader alone
    std::string title, defaultTopic, contentsFile, indexFile, defaultWindow, defaultFont;
    std::string compiledFile; ///< name of the result, with its extension
    std::vector<WindowDefinition> windows;
    std::vector<ContextTarget> contexts;
    std::vector<std::string> mergedFiles;
    std::vector<std::string> stopWords; ///< folded
    std::vector<Topic> pages;           ///< the pages of the archive in the order of the project
    Sitemap contents, index;
};

/// A stream of the compiled help that the viewer reads and nobody sees.
struct InternalFile {
    std::string name; ///< "/#SYSTEM"
    std::string bytes;
    bool compressed = true;
};

} // namespace tovimar::helpcompiler
