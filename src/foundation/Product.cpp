#include "foundation/Product.h"

namespace tovimar {

std::string VersionText() {
    return std::to_string(kMajorVersion) + "." + std::to_string(kMinorVersion) + kRevision + " [" +
           kBuildDate + "]";
}

std::string TitleAndVersion() {
    return std::string(kApplicationTitle) + " v." + VersionText();
}

} // namespace tovimar
