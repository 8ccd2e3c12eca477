#include "project/SitemapText.h"

#include "foundation/CUTF8FileWriter.h"
#include "foundation/Session.h"
#include "foundation/TextEncodings.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"

#include <algorithm>

namespace tovimar {

std::string HhcCaption(const std::string& text) {
    auto plain = DecodeHtmlEntities(text);
    plain.erase(std::remove(plain.begin(), plain.end(), '"'), plain.end());
    return EncodeSpecialChars(plain);
}

bool IdentifiedByName() {
    const auto* parameters = Session::Parameters();
    return parameters != nullptr && parameters->IdentifyControls == 1;
}

void PrintSitemap(const std::string& path, std::string text) {
    text += kCrLf;
    platform::Env().files->WriteFile(path, EncodePlainText(std::move(text)));
}

bool ExistsAndReadOnly(const std::string& path) {
    auto& files = *platform::Env().files;
    return files.FileExists(path) && files.IsReadOnly(path);
}

std::string ReadOnlyDetail(bool readOnly) {
    return std::string("READ_ONLY = ") + (readOnly ? "True" : "False");
}

} // namespace tovimar
