#pragma once

#include <string>
#include <string_view>

namespace tovimar {

class CXmlControl;
class CXmlForm;
class CXmlMenu;

/// Takes the marks of keyboard accelerators out of a caption: a doubled "&" leaves one, an accelerator's
/// none, a numeric entity stands. With `vfEncoded`, "&#38;" counts as a mark too.
std::string StripAccelerators(std::string_view caption, bool vfEncoded = true);

/// Angle brackets as references: names go into pages as they stand, but for what would open a tag there, as
/// the caption of a button "<New>" would.
std::string WithoutTags(const std::string& text);

/// Names that a topic shows or links by. The shown ones follow the option that says whether objects and
/// controls go by caption or by name.
std::string FormBookmarkPrefix(const CXmlForm& form);
std::string FormDisplayName(const CXmlForm& form);
std::string MenuDisplayName(const CXmlMenu& menu);
std::string ControlDisplayName(const CXmlControl& ctl);
std::string ControlBookmark(const CXmlControl& ctl);
std::string MenuBookmark(const CXmlMenu& menu);

} // namespace tovimar
