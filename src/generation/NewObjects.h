#pragma once

#include "host/sources/SourceProjectLists.h"

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace tovimar {

class CHelpPrjTree;
class CHelpPrjTreeNode;
class IClassFactory;
class IXmlSerializer;

/// One kind of source object: the tag of its nodes, and how the node is told under which they stand.
struct ObjectKind {
    const char* tag;
    std::array<const char*, 2> listTags; ///< the second may be empty
    std::int32_t listProcessCode;
    const SourceItems& (IHelpPrjSourceProject::*items)() const;
    void (IClassFactory::*makeSerializer)(std::unique_ptr<IXmlSerializer>&);
};

constexpr std::size_t kObjectKinds = 7;
/// Forms, reports, tables, queries, macros, worksheets, charts.
const std::array<ObjectKind, kObjectKinds>& ObjectKinds();

/// The object nodes of a tree, by kind and name; both compare without regard to case. A node that names no
/// source project stands for the object of that name in every one.
class KnownObjects {
public:
    explicit KnownObjects(const CHelpPrjTree& tree);
    bool NodeExists(const std::string& name, const std::string& tag,
                    const std::string& sourceProjectName) const;

private:
    /// Folded names of source projects, empty for none, by name and kind.
    std::unordered_map<std::string, std::vector<std::string>> projects_;
};

/// What of an application a help project doesn't have yet; everything else is taken out of the lists.
class NewSourceObjects : public SourceProjectLists {
public:
    NewSourceObjects(const IHelpPrjSourceProject& source, const KnownObjects& known);
    bool Empty() const;

protected:
    bool Read(const std::string&) override { return false; }
};

/// The objects of one or several applications, to tell which nodes have lost theirs.
class SourceObjects {
public:
    void Add(const IHelpPrjSourceProject& source);
    bool Holds(const CHelpPrjTreeNode& node) const;

private:
    std::unordered_set<std::string> objects_;
};

} // namespace tovimar
