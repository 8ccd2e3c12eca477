#pragma once

#include "host/contract/ObjectTypes.h"
#include "host/sources/XmlSourceProject.h"

namespace tovimar {

/// A project of C#.
class CSourceProjectCS : public XmlSourceProject {
public:
    CSourceProjectCS()
        : XmlSourceProject({"CSourceProjectCS",
                            SourceProjectKind::kCSharp,
                            {"/VisualStudioProject/CSHARP"},
                            "Files/Include/*",
                            /*readsBuildItems=*/true}) {}
};

} // namespace tovimar
