#pragma once

#include <string>
#include <unordered_map>

namespace tovimar {
class CHelpPrjTree;
}

namespace tovimar::cli {

/// The icons that the contents name in a project file. A tree that shows in a view gives every entry the icon
/// that the view draws; a command has no view worth that, and must not rewrite what it doesn't change.
class KeptIcons {
public:
    /// To be made before the tree shows in a view.
    explicit KeptIcons(const CHelpPrjTree& tree);
    /// A copy gets the icon of what it was made of; what is new keeps its own.
    void PutBack(const CHelpPrjTree& tree) const;

private:
    std::unordered_map<std::string, std::string> byKey_;
};

} // namespace tovimar::cli
