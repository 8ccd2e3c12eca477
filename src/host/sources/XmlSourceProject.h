#pragma once

#include "host/sources/SourceProjectLists.h"

#include <vector>

namespace tovimar {

class XmlNode;

/// How the XML project files of one development tool differ from the others'.
struct XmlProjectFormat {
    const char* className;
    const char* kind; ///< the programming language too
    /// Elements of which the first that the document has tells that the file is of the kind.
    std::vector<const char*> elements;
    /// The items, below that element.
    const char* items;
    /// The kind also has the newer format, with the root element `Project`.
    bool readsBuildItems;
};

/// A project file that lists its source files as XML. Forms and user controls are its objects; a file that
/// isn't there is passed over.
class XmlSourceProject : public SourceProjectLists {
public:
    explicit XmlSourceProject(XmlProjectFormat format);

protected:
    /// Without help for forms the project is empty, and its file isn't looked at.
    bool Read(const std::string& path) override;
    /// Raises for a file that can't be parsed; false for one of another kind.
    bool ReadDocument(const std::string& path);

    /// By its `SubType` the item is a form or a user control.
    virtual bool IsListed(CHelpPrjSourceItem& item) const;

private:
    void ReadItems(const XmlNode& element, const std::string& folder);
    void ReadBuildItems(const XmlNode& project, const std::string& folder);
    void AddItem(std::unique_ptr<CHelpPrjSourceItem> item);

    XmlProjectFormat format_;
};

} // namespace tovimar
