#pragma once

#include <string>

namespace tovimar {

/// The file-safe name of an object, or of a control of it: the name, or the predefined name where one is
/// given, then "_" and the control's name where one is given, all transliterated. Topics and pictures
/// are named by it, so that a link finds its target. A name of more than 150 characters, with a control's
/// of more than 220, is cut and ends in a digest of the whole name, so that long names stay apart and files
/// can be made of them.
std::string GetComponentFileName(const std::string& vstrObjName, const std::string& vstrCtlName = {},
                                 const std::string& vstrPredefinedFileName = {});
/// The same of a control, uncut: the anchor in its object's topic.
std::string GetComponentAnchor(const std::string& objectName, const std::string& controlName);

} // namespace tovimar
