// The pictures of a topic and their image maps.

#include "topics/TopicSections.h"

#include "foundation/TextEncodings.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "topics/TopicNames.h"
#include "uimodel/CXmlForm.h"
#include "uimodel/SaturatedSum.h"

#include <algorithm>
#include <array>

namespace tovimar {

namespace {

constexpr std::string_view kMapOpening = "<!-- + CONTROLS MAP + -->\r\n<MAP NAME=\"";
constexpr std::string_view kMapClosing = "</MAP>\r\n<!-- - CONTROLS MAP - -->\r\n";

/// How far Access paints the content of a container below its frame's edge, pixels.
std::int32_t EdgeOf(const CXmlForm& form, const CXmlControl& container) {
    if (!text::EqualsIgnoringCase(form.SourceProjectType, "MS ACCESS"))
        return 0;
    if (container.IsClass("Frame") || container.IsClass("OptionGroup"))
        return 8;
    if (container.IsClass("TabControl") || container.IsClass("Page") || container.IsClass("SSTab"))
        return 2;
    return 0;
}

using Corners = std::array<std::int32_t, 4>;

Corners CornersOf(const CXmlControl& control) {
    return {control.HotSpotLeft(), control.HotSpotTop(), control.HotSpotRight(), control.HotSpotBottom()};
}

/// A subform shows a part of its form only: what its frame cuts is cut, what it hides is left empty. Frames
/// within frames cut all of what they hold. False when nothing is left.
bool CutByFrames(Corners& corners, const CXmlControl& control) {
    for (const CXmlControl* up = control.ParentControl(); up != nullptr; up = up->ParentControl()) {
        if (!up->IsClass("SubForm"))
            continue;
        const Corners frame = CornersOf(*up);
        for (const std::size_t i : {0U, 1U}) {
            corners[i] = std::max(corners[i], frame[i]);
            corners[i + 2] = std::min(corners[i + 2], frame[i + 2]);
        }
        if (corners[0] >= corners[2] || corners[1] >= corners[3])
            return false;
    }
    return true;
}

/// From the window's picture to that of a container.
Corners InControlPicture(const Corners& corners, const CXmlForm& form, const CXmlControl& parent) {
    const CXmlControl* page = parent.IsTabPage() ? parent.ParentControl() : nullptr;
    const CXmlControl& reference = page == nullptr ? parent : *page;
    const std::int32_t left = SaturatedSum(0, -std::int64_t{reference.HotSpotLeft()});
    const std::int32_t top = SaturatedSum(EdgeOf(form, reference), -std::int64_t{reference.HotSpotTop()});
    return {SaturatedSum(corners[0], left), SaturatedSum(corners[1], top), SaturatedSum(corners[2], left),
            SaturatedSum(corners[3], top)};
}

} // namespace

std::string TopicSections::AreaName(const CXmlControl& control) const {
    const std::string caption = control.Caption();
    return caption.empty() && switches_.named ? control.Name : caption;
}

void TopicSections::AppendArea(std::string& out, const std::string& prefix, const CXmlControl& control,
                               const CXmlControl* parent, bool ofTab) const {
    Corners corners = CornersOf(control);
    if (ofTab) {
        corners = {control.TabHotSpotLeft(), control.TabHotSpotTop(), control.TabHotSpotRight(),
                   control.TabHotSpotBottom()};
    } else if (parent != nullptr) {
        if (!CutByFrames(corners, control))
            return;
        corners = InControlPicture(corners, form_, *parent);
    }
    out.append("<AREA SHAPE=\"RECT\" COORDS=\"");
    for (std::size_t i = 0; i < corners.size(); ++i)
        out.append(i == 0 ? "" : ",").append(std::to_string(corners[i]));
    out.append("\" HREF=\"#").append(prefix).append("_").append(ControlBookmark(control));
    // The text goes in as it stands, but for what would end the attribute or upset a compiler's reader.
    const std::string alt = WithoutTags(text::ReplaceAll(AreaName(control), "\"", "&quot;"));
    out.append("\" FRAME=\"\" alt=\"").append(alt).append("\" />");
}

void TopicSections::AppendMap(std::string& out) const {
    if (!form_.HasMap)
        return;
    out.append(kMapOpening).append(prefix_).append("\"> \r\n");
    for (const auto& control : form_.Controls) {
        if (control->IsLabel())
            continue;
        if (control->IsClass("TabControl")) {
            AppendAreasOfTabControl(out, *control);
            continue;
        }
        AppendArea(out, prefix_, *control, nullptr, false);
        out.append("\r\n");
    }
    out.append(kMapClosing);
}

void TopicSections::AppendAreasOfTabControl(std::string& out, const CXmlControl& control) const {
    const auto append = [&](const CXmlControl& shown, bool ofTab) {
        AppendArea(out, prefix_, shown, nullptr, ofTab);
        out.append("\r\n");
    };
    bool first = true;
    for (const auto& page : control.Controls) {
        if (page->TabTop > -1)
            append(*page, true);
        // The picture shows the first page; what stands on the others has no place in it.
        if (first)
            for (const auto& child : page->Controls)
                if (!child->IsLabel())
                    append(*child, false);
        first = false;
    }
}

void TopicSections::AppendMapOfControl(std::string& out, const CXmlControl& control) const {
    if (!form_.HasMap || control.Controls.Empty())
        return;
    out.append(kMapOpening).append(Anchor(control)).append("\"> \r\n");
    for (const auto& child : control.Controls)
        if (!child->IsLabel()) {
            const std::size_t before = out.size();
            AppendArea(out, prefix_, *child, &control, false);
            if (out.size() > before)
                out.append("\r\n");
        }
    out.append(kMapClosing);
}

std::string TopicSections::FullImagePath(const std::string& fullPath) const {
    if (switches_.localImagePath || switches_.picsFolder.empty())
        return fullPath;
    return platform::WithTrailingBackslash(switches_.picsFolder) + platform::FileNameOf(fullPath);
}

std::string TopicSections::ImageSource(const std::string& localPath, const std::string& fullPath) const {
    if (switches_.localImagePath)
        return localPath;
    const std::string path = FullImagePath(fullPath);
    const std::string topicFolder = platform::FolderOf(form_.HtmlFullPath());
    const std::string folder = platform::FolderOf(path);
    if (!topicFolder.empty() && text::StartsWithIgnoringCase(folder, topicFolder))
        return text::Mid(path, text::Length(topicFolder) + 1);
    return path;
}

/// Areas count the pixels of the screen, so a picture with more pixels says how large it is shown.
void TopicSections::AppendImageTag(std::string& out, const std::string& source, const std::string& mapName,
                                   const std::string& shown, std::int32_t width, std::int32_t height) const {
    out.append("<IMG SRC=\"").append(source).append("\" BORDER=0 \r\n");
    if (form_.HasMap)
        out.append("USEMAP=\"#").append(mapName).append("\" ");
    if (scaledImages_)
        out.append("WIDTH=\"")
            .append(std::to_string(width))
            .append("\" HEIGHT=\"")
            .append(std::to_string(height))
            .append("\" ");
    // Behind the rest, where whoever looks for the source or the map of a picture reads past it.
    if (switches_.named)
        out.append("ALT=\"").append(EncodeXmlText(shown)).append("\" ");
    out.append("/>\r\n");
}

void TopicSections::AppendMainImage(std::string& out) const {
    if (!platform::Env().files->FileExists(FullImagePath(form_.PicFullPath())))
        return;
    out.append("<!-- + MAIN IMAGE + -->\r\n");
    AppendImageTag(out, ImageSource(form_.PicLocalPath(), form_.PicFullPath()), prefix_,
                   FormDisplayName(form_), form_.Width, form_.Height);
    out.append("<!-- - MAIN IMAGE - -->\r\n");
}

void TopicSections::AppendControlImage(std::string& out, const CXmlControl& control) const {
    out.append("<!-- + CONTROL IMAGE + -->\r\n");
    AppendImageTag(out, ImageSource(control.PicLocalPath(), control.PicFullPath), Anchor(control),
                   ControlDisplayName(control), control.Width, control.Height + EdgeOf(form_, control));
    out.append("<!-- - CONTROL IMAGE - -->\r\n");
}

} // namespace tovimar
