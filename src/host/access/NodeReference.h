#pragma once

#include <string>

namespace tovimar {

/// HTML that links to the topic of an object of the application, "Table" and so on; the name itself for an
/// object without a topic.
std::string NodeReference(const std::string& objectName, const std::string& typeName);

/// A name as text of a page.
std::string NameAsHtml(const std::string& name);

} // namespace tovimar
