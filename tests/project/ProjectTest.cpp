#include "project/ProjectTest.h"

#include "foundation/Session.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <iterator>

namespace tovimar::test {

ProjectTest::ProjectTest() {
    auto made = std::make_unique<CAddInProject>();
    made->Name = "Sales";
    made->FileName = "Sales";
    made->Folder = Folder();
    made->IsNew = false;
    project = &projects.SetCurrentProject(std::move(made));
    parameters.FillIndexFromAppObjectsAndControls = true;
    parameters.SetHelpProjectName("Sales");
    Session::SetProjects(&projects);
    Session::SetParameters(&parameters);
    Session::SetHelpProjectTree(&tree);
    Session::SetMessages(&messages);
}

ProjectTest::~ProjectTest() {
    tree.Terminate();
    Session::SetHelpProjectTree(nullptr);
    Session::SetParameters(nullptr);
    Session::SetProjects(nullptr);
    Session::SetMessages(nullptr);
}

void ProjectTest::LoadTree(const std::string& xml, bool loadControls) {
    const auto path = WriteFile("Sales.tvp", "<TovimarProject>" + xml + "</TovimarProject>");
    ASSERT_EQ(tree.Load(path, false, false, {}, loadControls), 0) << LastBox();
    ASSERT_NE(tree.Root(), nullptr);
}

CHelpPrjTreeNode& ProjectTest::Node(const std::string& key) {
    auto* node = tree.MapItem(key);
    if (node == nullptr)
        throw std::runtime_error("no node " + key);
    return *node;
}

void ProjectTest::ExpectGolden(const std::string& name, const std::string& text) {
    const auto path = SourceFolder() + "tests/golden/project/" + name;
    if (std::getenv("TOVIMAR_UPDATE_GOLDEN") != nullptr) {
        std::ofstream(path, std::ios::binary) << text;
        return;
    }
    std::ifstream in(path, std::ios::binary);
    ASSERT_TRUE(in) << path;
    EXPECT_EQ(text, std::string(std::istreambuf_iterator<char>(in), {})) << path;
}

ITreeViewNode* FakeTreeView::Node::Neighbour(int step) const {
    if (parent == nullptr)
        return nullptr;
    const auto& siblings = parent->children;
    const auto at =
        std::find_if(siblings.begin(), siblings.end(), [&](const auto& n) { return n.get() == this; });
    const auto index = at - siblings.begin() + step;
    const auto count = static_cast<std::ptrdiff_t>(siblings.size());
    return index < 0 || index >= count ? nullptr : siblings[static_cast<std::size_t>(index)].get();
}

FakeTreeView::Node* FakeTreeView::Find(Node& node, const std::string& key) {
    for (const auto& child : node.children) {
        if (text::EqualsIgnoringCase(child->key, key))
            return child.get();
        if (auto* found = Find(*child, key))
            return found;
    }
    return nullptr;
}

ITreeViewNode* FakeTreeView::AddNode(ITreeViewNode* relative, TreeViewRelation relation,
                                     const std::string& key, const std::string& text,
                                     const std::string& image) {
    if (Find(top, key) != nullptr)
        throw RaisedError(457, "view key taken: " + key);
    auto node = std::make_unique<Node>();
    node->key = key;
    node->text = text;
    node->image = image;
    node->view = this;
    auto* beside = static_cast<Node*>(relative);
    auto* parent = beside == nullptr                         ? &top
                   : relation == TreeViewRelation::LastChild ? beside
                                                             : beside->parent;
    node->parent = parent;
    auto& siblings = parent->children;
    auto place = siblings.end();
    if (relation != TreeViewRelation::LastChild && beside != nullptr) {
        place =
            std::find_if(siblings.begin(), siblings.end(), [&](const auto& n) { return n.get() == beside; });
        if (relation == TreeViewRelation::After)
            ++place;
    }
    return siblings.insert(place, std::move(node))->get();
}

void FakeTreeView::RemoveNode(const std::string& key) {
    auto* node = Find(top, key);
    if (node == nullptr)
        return;
    auto& siblings = node->parent->children;
    siblings.erase(
        std::find_if(siblings.begin(), siblings.end(), [&](const auto& n) { return n.get() == node; }));
}

std::string FakeTreeView::Outline(const Node& node) {
    std::string out;
    for (const auto& child : node.children) {
        out += (out.empty() ? "" : " ") + child->key + "[" + child->image + "]";
        if (!child->children.empty())
            out += "(" + Outline(*child) + ")";
    }
    return out;
}

} // namespace tovimar::test
