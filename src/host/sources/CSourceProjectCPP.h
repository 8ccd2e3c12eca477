#pragma once

#include "host/contract/ObjectTypes.h"
#include "host/sources/XmlSourceProject.h"

namespace tovimar {

/// A project of managed C++. Forms are header files; what depends on such a file is none.
class CSourceProjectCPP : public XmlSourceProject {
public:
    CSourceProjectCPP()
        : XmlSourceProject({"CSourceProjectCPP",
                            SourceProjectKind::kCpp,
                            {"/VisualStudioProject[@ProjectType='Visual C++']"},
                            "Files/Filter[@Name='Header Files']//*[@RelativePath][not(parent::File)]",
                            /*readsBuildItems=*/false}) {}
};

} // namespace tovimar
