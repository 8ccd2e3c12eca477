#pragma once

#include "host/contract/ObjectTypes.h"
#include "host/sources/XmlSourceProject.h"

namespace tovimar {

/// A project of J#.
class CSourceProjectJS : public XmlSourceProject {
public:
    CSourceProjectJS()
        : XmlSourceProject({"CSourceProjectJS",
                            SourceProjectKind::kJSharp,
                            {"/VisualStudioProject/VISUALJSHARP"},
                            "Files/Include/*",
                            /*readsBuildItems=*/true}) {}
};

} // namespace tovimar
