#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

class CXmlControl;
class CXmlForm;

/// What a topic shows of its controls.
struct TopicSwitches {
    bool mainImage = false;
    bool controlsMap = false;
    bool localImagePath = false;
    std::string picsFolder;
    /// Pictures get an `ALT`, areas without a caption the control's name. Off, the elements are those that
    /// earlier versions wrote.
    bool named = false;
};

/// Writes the parts of one topic that run over its controls. Knows what is the same for all of them, so that
/// a topic is built in one go: the anchors' prefix, the list's wrappers, where descriptions come from.
class TopicSections {
public:
    explicit TopicSections(const CXmlForm& form, TopicSwitches switches = {});

    void AppendMenusList(std::string& out) const;
    void AppendMenus(std::string& out) const;
    void AppendControlsList(std::string& out) const;
    void AppendListItem(std::string& out, const CXmlControl& control, bool withChildren) const;
    void AppendControls(std::string& out) const;
    /// The control's section and those of its children.
    void AppendSection(std::string& out, const CXmlControl& control) const;

    void AppendMap(std::string& out) const;
    void AppendMapOfControl(std::string& out, const CXmlControl& control) const;
    void AppendMainImage(std::string& out) const;
    void AppendControlImage(std::string& out, const CXmlControl& control) const;

    /// One `AREA` of a map; `prefix` goes before the anchor. A null parent means the object's own picture.
    void AppendArea(std::string& out, const std::string& prefix, const CXmlControl& control,
                    const CXmlControl* parent, bool ofTab) const;

private:
    std::string Anchor(const CXmlControl& control) const;
    void AppendAreasOfTabControl(std::string& out, const CXmlControl& control) const;
    void AppendPageLinks(std::string& out, const CXmlControl& tabControl) const;
    void AppendDescription(std::string& out, const CXmlControl& control) const;
    void AppendImageTag(std::string& out, const std::string& source, const std::string& mapName,
                        const std::string& shown, std::int32_t width, std::int32_t height) const;
    std::string AreaName(const CXmlControl& control) const;
    std::string ImageSource(const std::string& localPath, const std::string& fullPath) const;
    std::string FullImagePath(const std::string& fullPath) const;

    const CXmlForm& form_;
    TopicSwitches switches_;
    std::string prefix_;
    bool bulleted_ = false;
    bool scaledImages_ = false;      ///< pictures have more pixels than they are shown with
    std::string descriptionsFolder_; ///< empty when external descriptions aren't asked for
};

} // namespace tovimar
