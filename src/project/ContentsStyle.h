#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

class CHelpPrjTreeNode;

/// What the contents file and the web help's contents write differently about a node.
class ContentsStyle {
public:
    virtual ~ContentsStyle() = default;

    /// The entry itself, without its list. The caption is plain text.
    virtual void AppendEntry(std::string& out, std::int32_t level, const std::string& link,
                             const std::string& caption) = 0;
    /// Called once for each node that gets an entry of its own.
    virtual void NoteNode(CHelpPrjTreeNode& /*node*/) {}
    /// A node without children is followed by an empty list.
    virtual bool LeafHasList() const = 0;
    virtual bool RootHasEntry() const = 0;
    virtual bool SkipSerializers() const = 0;
};

} // namespace tovimar
