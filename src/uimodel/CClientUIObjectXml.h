#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar {

class CXmlControl;
class CXmlForm;

/// Turns raw object XML into a definition: file names, client area and section offsets, and positions of
/// all controls in the form instead of in their containers. Keeps no state.
class CClientUIObjectXml {
public:
    /// The adjusted definition, empty on a reported failure. `lngPicType` 2 gives jpg pictures, any other
    /// bmp. `vstrPicSubFolder` is put before the names of the containers' own pictures as it stands.
    std::string Adjust(const std::string& vstrUIObjectXml, std::int32_t vlngObjectType,
                       bool vfCompIsInDesignView, std::int32_t lngPicType, const std::string& vstrPicFullPath,
                       const std::string& vstrHtmlFullPath, const std::string& vstrPicSubFolder,
                       bool vfControlLocationIsAbsolute);

    void RecalcVSNetPageControlsAttributes(CXmlControl& ctl);
    void MakeSubFormControlsPositionsAbsolute(CXmlControl& ctl);
    /// `offsets` is a stack: left, then top, of each open container.
    void AdjustFileControl(std::int32_t level, CXmlForm& form, CXmlControl& ctl, const std::string& folder,
                           const std::string& htmlFile, const std::string& extension,
                           const std::string& picSubFolder, std::vector<std::int32_t>& offsets,
                           bool vfControlLocationIsAbsolute);

private:
    struct FileAdjustment;
    void AdjustControl(const FileAdjustment& files, CXmlControl& ctl, std::vector<std::int32_t>& offsets);
    void AdjustTabControl(const FileAdjustment& files, CXmlControl& ctl, std::vector<std::int32_t>& offsets);
    void AdjustForm(CXmlForm& form, bool designView, const FileAdjustment& files);
};

} // namespace tovimar
