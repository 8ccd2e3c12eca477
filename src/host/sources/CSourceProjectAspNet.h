#pragma once

#include "host/sources/XmlSourceProject.h"

namespace tovimar {

/// A web project of any of three languages: its pages and user controls. The tool that has it open may keep
/// the file to itself, so a copy beside it is read, which is deleted again.
class CSourceProjectAspNet : public XmlSourceProject {
public:
    CSourceProjectAspNet();

private:
    bool Read(const std::string& path) override;
    /// A page is one by its extension too, which then tells its subtype.
    bool IsListed(CHelpPrjSourceItem& item) const override;
};

} // namespace tovimar
