#include "host/access/NodeReference.h"

#include "foundation/Session.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

namespace tovimar {

std::string NameAsHtml(const std::string& name) {
    return text::ReplaceAll(text::ReplaceAll(name, "&", "&amp;"), "<", "&lt;");
}

std::string NodeReference(const std::string& objectName, const std::string& typeName) {
    const CHelpPrjTree* tree = Session::HelpProjectTree();
    const std::string reference =
        tree == nullptr ? std::string() : tree->GetNodeHtmlRef(objectName, typeName);
    return reference.empty() ? NameAsHtml(objectName) : reference;
}

} // namespace tovimar
