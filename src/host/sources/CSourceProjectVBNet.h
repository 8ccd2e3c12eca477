#pragma once

#include "host/contract/ObjectTypes.h"
#include "host/sources/XmlSourceProject.h"

namespace tovimar {

/// A project of Visual Basic .NET.
class CSourceProjectVBNet : public XmlSourceProject {
public:
    CSourceProjectVBNet()
        : XmlSourceProject({"CSourceProjectVBNet",
                            SourceProjectKind::kVBNet,
                            {"/VisualStudioProject/VisualBasic"},
                            "Files/Include/*",
                            /*readsBuildItems=*/true}) {}
};

} // namespace tovimar
