#pragma once

#include "support/Tags.h"

#include <filesystem>
#include <map>
#include <set>
#include <string>
#include <vector>

/// Reads what a run has written as a browser would.
namespace tovimar::test {

/// Width and height in pixels as the file's frame header says; 0 for a file that isn't JPEG.
std::pair<int, int> SizeOfJpeg(const std::string& bytes);

class HelpFolder {
public:
    explicit HelpFolder(std::filesystem::path folder) : folder_(std::move(folder)) {}

    /// One line for each link of contents, index and topics that leads nowhere, each picture that is missing,
    /// each area that isn't inside its picture, each page, picture and area that readers who don't see it
    /// aren't told of, and each tag that nothing filled in. Topics that open in the frame page's stead count
    /// as it.
    std::vector<std::string> Faults();
    /// Entries of the project's file list.
    std::vector<std::string> ListedFiles() const;
    /// What the two checks above have looked at, so that a check of nothing is told.
    int links = 0;
    int areas = 0;

private:
    std::vector<std::string> FilesWith(const std::string& extension) const;
    void CheckLink(const std::string& from, const std::string& link);
    void CheckNames(const std::string& page, const std::string& html, const std::vector<Tag>& tags);
    void CheckPictures(const std::string& page, const std::vector<Tag>& tags);
    void CheckArea(const std::string& page, const Tag& area, std::pair<int, int> size);
    const std::set<std::string>& AnchorsOf(const std::string& page);

    std::filesystem::path folder_;
    std::map<std::string, std::set<std::string>> anchors_;
    std::vector<std::string> faults_;
};

} // namespace tovimar::test
