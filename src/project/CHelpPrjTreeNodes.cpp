#include "foundation/ErrorTrap.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

/// Nodes into the tree and its key map, and out again.
namespace tovimar {

namespace {

constexpr int kMostNumberedKeys = 1000;

/// 1-based position of the child that has a sibling's key; 0 when it is none of them.
std::size_t SiblingPosition(const CHelpPrjTreeNode& parent, const CHelpPrjTreeNode& sibling) {
    return parent.Children().PositionOf(sibling.Key());
}

} // namespace

std::string CHelpPrjTree::MakeNumberedKey(const std::string& key) const {
    for (int number = 1; number <= kMostNumberedKeys; ++number) {
        auto candidate = key + std::to_string(number);
        if (!map_.Contains(candidate))
            return candidate;
    }
    return {};
}

std::string CHelpPrjTree::GetNewKeyIfGivenExists(const std::string& vstrGivenKey,
                                                 const std::string& vstrSrcPrjName) {
    std::string key;
    const auto failed = Trapped(
        "CHelpPrjTree", "GetNewKeyIfGivenExists",
        [&] {
            key = text::StartsWithIgnoringCase(vstrGivenKey, vstrSrcPrjName)
                      ? vstrGivenKey
                      : vstrSrcPrjName + "." + vstrGivenKey;
            if (map_.Contains(key))
                key = MakeNumberedKey(vstrGivenKey);
            if (key.empty())
                throw RaisedError(kFailure1,
                                  "Can't get unique key for given key value = '" + vstrGivenKey + "'.",
                                  "CHelpPrjTree.GetNewKeyIfGivenExists");
        },
        [&] { return "GivenKey = " + vstrGivenKey + ", MapKey = " + key; });
    return failed == kSuccess ? key : std::string();
}

void CHelpPrjTree::MakeKeyUnique(CHelpPrjTreeNode& node, bool autoUnique) const {
    const auto key = node.Key();
    if (!map_.Contains(key))
        return;
    const auto taken = "Duplicate node key value '" + key + "'.";
    if (!autoUnique)
        throw RaisedError(kFailure1, taken, "CHelpPrjTree.AddItem");
    const auto numbered = MakeNumberedKey(key);
    if (numbered.empty())
        throw RaisedError(kFailure2, taken, "CHelpPrjTree.AddItem");
    node.SetKey(numbered);
}

CHelpPrjTreeNode* CHelpPrjTree::addItem(CHelpPrjTreeNode* robjXMLParent,
                                        std::unique_ptr<CHelpPrjTreeNode> robjXml, bool vfAutoUniqueKey,
                                        CHelpPrjTreeNode* robjXmlPrevious, CHelpPrjTreeNode* robjXmlNext,
                                        bool vfAddChildNodesToMap, bool vfBeforePrevious, bool vfAfterNext) {
    CHelpPrjTreeNode* placed = nullptr;
    Trapped(
        "CHelpPrjTree", "addItem",
        [&] {
            auto& node = *robjXml;
            MakeKeyUnique(node, vfAutoUniqueKey);
            node.HelpPrjTree = this;
            if (robjXMLParent != nullptr) {
                PlaceAmongSiblings(*robjXMLParent, std::move(robjXml), robjXmlPrevious, robjXmlNext,
                                   vfBeforePrevious, vfAfterNext);
            } else {
                unplaced_.push_back(std::move(robjXml));
            }
            AddToMap(node);
            if (vfAddChildNodesToMap)
                AddChildNodesToMap(node);
            placed = &node;
        },
        [&] {
            if (robjXml == nullptr)
                return std::string();
            return "Tag = " + robjXml->Tag + ", Name = " + robjXml->Name() +
                   ", Caption = " + robjXml->Caption() + ", MapKey = " + robjXml->Key();
        });
    return placed;
}

void CHelpPrjTree::PlaceAmongSiblings(CHelpPrjTreeNode& parent, std::unique_ptr<CHelpPrjTreeNode> node,
                                      const CHelpPrjTreeNode* previous, const CHelpPrjTreeNode* next,
                                      bool beforePrevious, bool afterNext) {
    auto& made = *node;
    made.Parent = &parent;
    const auto* sibling = previous != nullptr ? previous : next;
    if (sibling == nullptr) {
        parent.children_.Add(std::move(node));
        index_.Added(made);
        return;
    }
    const auto position = SiblingPosition(parent, *sibling);
    if (position == 0) {
        // A sibling that isn't there leaves no place: the node can be found by its key, and nowhere else.
        unplaced_.push_back(std::move(node));
        return;
    }
    const bool behind = previous != nullptr ? !beforePrevious : afterNext;
    parent.children_.Insert(behind ? position + 1 : position, std::move(node));
    index_.Added(made);
}

void CHelpPrjTree::AddToMap(CHelpPrjTreeNode& robjXml) {
    robjXml.HelpPrjTree = this;
    map_.Add(&robjXml, robjXml.Key());
}

void CHelpPrjTree::AddChildNodesToMap(CHelpPrjTreeNode& robjXml) {
    for (const auto& child : robjXml.Children()) {
        AddToMap(*child);
        AddChildNodesToMap(*child);
    }
}

void CHelpPrjTree::RemoveFromMap(CHelpPrjTreeNode& robjXml) {
    // A copy in another tree may have the same key: only the node's own entry goes.
    if (!robjXml.Terminated() && map_.Find(robjXml.Key()) == &robjXml)
        map_.Remove(robjXml.Key());
}

void CHelpPrjTree::RemoveChildNodesFromMap(CHelpPrjTreeNode& robjXml) {
    for (const auto& child : robjXml.Children()) {
        RemoveFromMap(*child);
        RemoveChildNodesFromMap(*child);
    }
}

void CHelpPrjTree::RemoveItem(const std::string& vstrMapKey) {
    auto* node = MapItem(vstrMapKey);
    if (node == nullptr)
        return;
    map_.Remove(vstrMapKey);
    index_.Forget();
    if (node->Parent == nullptr)
        return;
    if (auto taken = node->Parent->TakeChild(*node))
        unplaced_.push_back(std::move(taken));
}

} // namespace tovimar
