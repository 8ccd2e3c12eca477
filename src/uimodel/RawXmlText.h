#pragma once

#include <cstdint>
#include <string>
#include <vector>

/// The elements of raw object XML, written by concatenation: their spacing is the format.
namespace tovimar {

struct RawRoot {
    std::string tag; ///< "Form", "Report", "Table", ...
    std::string name;
    std::string caption;
    std::int32_t width = 0;
    std::int32_t height = 0;
    std::int32_t borderStyle = 0;
    std::string namePrefix;
    std::int32_t clientAreaOffsetX = 0;
    std::int32_t clientAreaOffsetY = 0;
    std::string originalClassName;
    std::int32_t helpContextId = 0; ///< written from 1 on, and -1
    std::string sourceProjectType;
    std::int32_t window = 0;
    std::string description;
};

struct RawControl {
    std::string type;
    std::string name;
    std::string text; ///< the seed of the control's section
    std::string caption;
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;
    std::string tabPageTab; ///< left, top, width, height of a page's tab
    std::int32_t tabIndex = -1;
    std::int32_t index = -1;
    std::int32_t helpContextId = 0;
    std::string description;
    std::string sectionName;
    std::string parentControlName;
    std::string originalClassName;
    std::int32_t level = 0;
    std::int32_t tabPageIndex = -1;
};

/// The root's opening line, CRLF included.
void AppendRawRoot(std::string& out, const RawRoot& root);
/// A control with its children's elements, without a line end.
void AppendRawControl(std::string& out, const RawControl& control, const std::vector<std::string>& children);

} // namespace tovimar
