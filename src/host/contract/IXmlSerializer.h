#pragma once

#include "platform/KeyedList.h"

#include <string>

namespace tovimar {

class CHelpPrjTree;
class IHelpPrjSourceProject;

/// Fills a list node of the project tree: one XML fragment per source object.
class IXmlSerializer {
public:
    virtual ~IXmlSerializer() = default;

    /// All collected fragments, each followed by CRLF.
    virtual std::string XmlText() = 0;
    /// Appends the fragments of the project and gives the whole list; without a `Reset` in between the
    /// fragments of several projects add up. The tree tells which file names are taken.
    virtual const KeyedList<std::string>& XmlCollection(CHelpPrjTree& robjTree,
                                                        const IHelpPrjSourceProject& rprj) = 0;
    virtual void Reset() = 0;
};

} // namespace tovimar
