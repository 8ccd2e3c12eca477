#include "cli/KeptIcons.h"

#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

namespace tovimar::cli {

KeptIcons::KeptIcons(const CHelpPrjTree& tree) {
    for (const auto* node : tree.MapItems())
        byKey_.emplace(text::FoldCase(node->Key()), node->Icon());
}

void KeptIcons::PutBack(const CHelpPrjTree& tree) const {
    for (auto* node : tree.MapItems()) {
        auto found = byKey_.find(text::FoldCase(node->Key()));
        if (found == byKey_.end())
            found = byKey_.find(text::FoldCase(node->OriginalKey()));
        if (found != byKey_.end() && node->Icon() != found->second)
            node->SetIcon(found->second);
    }
}

} // namespace tovimar::cli
