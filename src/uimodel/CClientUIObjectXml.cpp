#include "uimodel/CClientUIObjectXml.h"

#include "foundation/ErrorTrap.h"
#include "foundation/TextEncodings.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/ComponentFileName.h"
#include "uimodel/CNonClientMetrics.h"
#include "uimodel/CXmlForm.h"
#include "uimodel/SaturatedSum.h"

#include <algorithm>
#include <array>

namespace tovimar {

namespace {

constexpr const char* kClass = "CClientUIObjectRawXml";

bool IsAnyOf(const std::string& word, std::initializer_list<const char*> words) {
    return std::any_of(words.begin(), words.end(),
                       [&](const char* known) { return text::EqualsIgnoringCase(word, known); });
}

/// Containers that get a picture of their own.
bool IsPicturedContainer(const CXmlControl& control) {
    return IsAnyOf(control.ClassName(), {"Toolbar", "Subform", "Subreport", "GroupBox", "Frame",
                                         "OptionGroup", "PictureBox", "Panel", "DataGridView"});
}

void Move(CXmlControl& control, std::int32_t x, std::int32_t y) {
    control.Left = SaturatedSum(control.Left, x);
    control.Top = SaturatedSum(control.Top, y);
}

void TakeRectangle(CXmlControl& page, const CXmlControl& from) {
    page.Left = from.Left;
    page.Top = from.Top;
    page.Width = from.Width;
    page.Height = from.Height;
}

void ShiftSubtree(CXmlControl& parent, std::int32_t x, std::int32_t y) {
    for (auto& child : parent.Controls) {
        if (child->IsClass("Page"))
            TakeRectangle(*child, parent);
        else
            Move(*child, x, y);
        ShiftSubtree(*child, x, y);
    }
}

void RecalcPages(CXmlControl& parent) {
    for (auto& child : parent.Controls) {
        if (!child->IsClass("Page")) {
            RecalcPages(*child);
            continue;
        }
        const std::int32_t x = child->Left;
        const std::int32_t y = child->Top;
        TakeRectangle(*child, parent);
        ShiftSubtree(*child, x, y);
    }
}

void MakeAbsolute(CXmlControl& control) {
    for (const CXmlControl* up = control.ParentControl(); up != nullptr; up = up->ParentControl())
        if (IsAnyOf(up->ClassName(), {"Subform", "Subreport"})) {
            Move(control, up->Left, up->Top);
            break;
        }
    for (auto& child : control.Controls)
        MakeAbsolute(*child);
}

/// A raw control's text is the seed of its section; what it is called is its caption.
void EncodeTexts(CXmlControl& control) {
    if (!control.HostCaption.empty() && control.HostCaption != control.Text()) {
        control.SetText(control.HostCaption);
        control.Indexes.clear();
    }
    // Before the text is encoded: a keyword shows the caption as it reads.
    control.FillIndexes();
    control.SetText(EncodeXmlText(control.Text()));
    for (auto& child : control.Controls)
        EncodeTexts(*child);
}

void SetClientArea(CXmlForm& form) {
    if (text::EqualsIgnoringCase(form.SourceProjectType, "MS ACCESS"))
        return;
    CNonClientMetrics metrics;
    metrics.SearchMetrics();
    if (form.ClientAreaOffsetX == 0 && form.BorderStyle > 0)
        form.ClientAreaOffsetX = metrics.borderWidth * 4;
    if (form.ClientAreaOffsetY != 0)
        return;
    form.ClientAreaOffsetY = metrics.GetFormNCM(form.BorderStyle);
    if (form.ClientAreaOffsetY > 0)
        form.ClientAreaOffsetY += metrics.borderWidth * 4;
    if (form.HasMenu())
        form.ClientAreaOffsetY += metrics.HeightMenus;
}

void StackSections(CXmlForm& form, bool designView) {
    std::int32_t offset = 0;
    for (auto& section : form.Sections) {
        section->ClientAreaOffsetX = 0;
        section->ClientAreaOffsetY = offset;
        offset = SaturatedSum(offset, section->Height);
        if (designView)
            offset = SaturatedSum(offset, section->DesignTimeHeaderHeight);
    }
}

} // namespace

/// What the walk over files needs of the form and its paths.
struct CClientUIObjectXml::FileAdjustment {
    std::string baseName; ///< of the topic's file
    std::string extension;
    std::string picSubFolder;
    bool locationIsAbsolute = false;

    std::string PicturePath(const CXmlControl& control) const {
        return picSubFolder + GetComponentFileName(baseName, control.Name) + "." +
               (extension == "jpg" ? "jpg" : "bmp");
    }
};

std::string CClientUIObjectXml::Adjust(const std::string& vstrUIObjectXml, std::int32_t /*vlngObjectType*/,
                                       bool vfCompIsInDesignView, std::int32_t lngPicType,
                                       const std::string& vstrPicFullPath,
                                       const std::string& vstrHtmlFullPath,
                                       const std::string& vstrPicSubFolder,
                                       bool vfControlLocationIsAbsolute) {
    std::string adjusted;
    Trapped(kClass, "Adjust", [&] {
        CXmlForm form;
        if (form.LoadXml(vstrUIObjectXml) != kSuccess)
            return;
        form.HasMap = true;
        if (!vstrPicFullPath.empty())
            form.SetPicFullPath(vstrPicFullPath);
        if (!vstrHtmlFullPath.empty())
            form.SetHtmlFullPath(vstrHtmlFullPath);
        const std::string& topic = vstrHtmlFullPath.empty() ? vstrPicFullPath : vstrHtmlFullPath;
        AdjustForm(form, vfCompIsInDesignView,
                   {platform::BaseNameOf(topic), lngPicType == 2 ? "jpg" : "bmp", vstrPicSubFolder,
                    vfControlLocationIsAbsolute});
        adjusted = form.XMLSTr();
    });
    return adjusted;
}

void CClientUIObjectXml::AdjustForm(CXmlForm& form, bool designView, const FileAdjustment& files) {
    SetClientArea(form);
    StackSections(form, designView);
    const bool vsNet = IsAnyOf(form.SourceProjectType, {"VB.NET", "C#", "J#", "C++"});
    const bool access = IsAnyOf(form.SourceProjectType, {"MS ACCESS"});
    for (auto& control : form.Controls) {
        if (vsNet)
            RecalcVSNetPageControlsAttributes(*control);
        else if (access)
            MakeSubFormControlsPositionsAbsolute(*control);
    }
    for (auto& control : form.Controls) {
        std::vector<std::int32_t> offsets;
        Trapped(kClass, "AdjustFileControl", [&] { AdjustControl(files, *control, offsets); });
    }
    for (auto& control : form.Controls)
        EncodeTexts(*control);
}

void CClientUIObjectXml::RecalcVSNetPageControlsAttributes(CXmlControl& ctl) {
    Trapped(kClass, "RecalcVSNetPageControlsAttributes", [&] { RecalcPages(ctl); });
}

void CClientUIObjectXml::MakeSubFormControlsPositionsAbsolute(CXmlControl& ctl) {
    Trapped(kClass, "MakeSubFormControlsPositionsAbsolute", [&] { MakeAbsolute(ctl); });
}

void CClientUIObjectXml::AdjustFileControl(std::int32_t /*level*/, CXmlForm& /*form*/, CXmlControl& ctl,
                                           const std::string& /*folder*/, const std::string& htmlFile,
                                           const std::string& extension, const std::string& picSubFolder,
                                           std::vector<std::int32_t>& offsets,
                                           bool vfControlLocationIsAbsolute) {
    const FileAdjustment files{platform::BaseNameOf(htmlFile), extension, picSubFolder,
                               vfControlLocationIsAbsolute};
    Trapped(kClass, "AdjustFileControl", [&] { AdjustControl(files, ctl, offsets); });
}

void CClientUIObjectXml::AdjustControl(const FileAdjustment& files, CXmlControl& ctl,
                                       std::vector<std::int32_t>& offsets) {
    const bool placedByParent = IsAnyOf(ctl.ClassName(), {"ToolbarButton", "Page"});
    if (!files.locationIsAbsolute && !placedByParent && offsets.size() >= 2)
        Move(ctl, offsets[offsets.size() - 2], offsets.back());
    if (ctl.IsClass("TabControl")) {
        AdjustTabControl(files, ctl, offsets);
        return;
    }
    if (!IsPicturedContainer(ctl))
        return;
    ctl.PicFullPath = files.PicturePath(ctl);
    offsets.insert(offsets.end(), {ctl.Left, ctl.Top});
    for (auto& child : ctl.Controls)
        AdjustControl(files, *child, offsets);
    offsets.resize(offsets.size() - 2);
}

void CClientUIObjectXml::AdjustTabControl(const FileAdjustment& files, CXmlControl& ctl,
                                          std::vector<std::int32_t>& offsets) {
    offsets.insert(offsets.end(), {ctl.Left, ctl.Top});
    for (auto& page : ctl.Controls) {
        page->PicFullPath = files.PicturePath(*page);
        const bool takesSize =
            files.locationIsAbsolute || page->Width == 0 || IsAnyOf(page->OriginalClassName, {"SSTab"});
        page->Left = ctl.Left;
        page->Top = ctl.Top;
        if (takesSize) {
            page->Width = ctl.Width;
            page->Height = ctl.Height;
        }
        if (!files.locationIsAbsolute && offsets.size() > 2) {
            // The tab moves with the container that the tab control stands in.
            page->TabLeft = SaturatedSum(page->TabLeft, offsets[offsets.size() - 4]);
            page->TabTop = SaturatedSum(page->TabTop, offsets[offsets.size() - 3]);
        }
        for (auto& child : page->Controls)
            AdjustControl(files, *child, offsets);
    }
    offsets.resize(offsets.size() - 2);
}

} // namespace tovimar
