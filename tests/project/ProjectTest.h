#pragma once

#include "foundation/CAddInProjects.h"
#include "foundation/CXmlMessages.h"
#include "generation/CTovimarParameters.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ITreeView.h"
#include "support/FakeEnvironment.h"

#include <memory>
#include <string>
#include <vector>

namespace tovimar::test {

/// A tree view in memory.
class FakeTreeView : public ITreeView {
public:
    class Node : public ITreeViewNode {
    public:
        std::string Key() const override { return key; }
        std::string Text() const override { return text; }
        void SetText(const std::string& value) override { text = value; }
        std::string Image() const override { return image; }
        void SetImage(const std::string& value) override { image = value; }
        void SetTag(const std::string& value) override { tag = value; }
        bool Expanded() const override { return expanded; }
        void SetExpanded(bool value) override { expanded = value; }
        bool Selected() const override { return view->selected == this; }
        void SetSelected(bool value) override { view->selected = value ? this : nullptr; }
        ITreeViewNode* Parent() const override { return parent; }
        ITreeViewNode* Next() const override { return Neighbour(1); }
        ITreeViewNode* Previous() const override { return Neighbour(-1); }
        ITreeViewNode* Child() const override { return children.empty() ? nullptr : children.front().get(); }
        std::size_t Children() const override { return children.size(); }
        ITreeViewNode* Neighbour(int step) const;

        std::string key, text, image, tag;
        bool expanded = false;
        FakeTreeView* view = nullptr;
        Node* parent = nullptr;
        std::vector<std::unique_ptr<Node>> children;
    };

    void ClearNodes() override { top.children.clear(); }
    ITreeViewNode* AddNode(ITreeViewNode* relative, TreeViewRelation relation, const std::string& key,
                           const std::string& text, const std::string& image) override;
    void RemoveNode(const std::string& key) override;
    ITreeViewNode* SelectedItem() const override { return selected; }
    /// "Key[image]" of all entries, children in brackets.
    std::string Outline() const { return Outline(top); }

    Node top;
    Node* selected = nullptr;

private:
    static std::string Outline(const Node& node);
    static Node* Find(Node& node, const std::string& key);
};

/// A current project in the fresh folder, parameters and an empty tree.
class ProjectTest : public EnvironmentTest {
protected:
    ProjectTest();
    ~ProjectTest() override;

    /// Loads a project file text into the tree.
    void LoadTree(const std::string& xml, bool loadControls = false);
    /// Compares with a file of tests/golden/project, byte by byte. With TOVIMAR_UPDATE_GOLDEN in the
    /// environment the file is written instead.
    void ExpectGolden(const std::string& name, const std::string& text);
    CHelpPrjTreeNode& Node(const std::string& key);
    std::string LastBox() const { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; }

    CTovimarParameters parameters;
    CAddInProjects projects;
    CAddInProject* project = nullptr;
    CXmlMessages messages;
    FakeTreeView view; ///< outlives the tree, which takes its entries out of it
    CHelpPrjTree tree;
};

} // namespace tovimar::test
