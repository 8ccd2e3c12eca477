#include "foundation/InputBox.h"
#include "project/ListTreeView.h"
#include "project/ProjectTest.h"
#include "project/cStack.h"
#include "project/clsTreeViewManipulator.h"
#include "project/frmHHCEntryIndexKeywords.h"

#include <gmock/gmock.h>

#include <random>
#include <set>

namespace tovimar::test {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;

/// A tree in a view, and what a user does in it.
class TreeOperationsTest : public ProjectTest {
protected:
    TreeOperationsTest() {
        // Keys of copies wait for the clock.
        environment->doEvents = [this] { clock->Advance(0.01); };
        LoadTree(
            "<Project key=\"root\" caption=\"Home\" GeneratedHtmlFile=\"Home.htm\">"
            "<A key=\"a\" caption=\"A\"><A1 key=\"a1\" caption=\"A1\"/>"
            "<A2 key=\"a2\" caption=\"A2\" GeneratedHtmlFile=\"A2.htm\"><X key=\"x\" caption=\"X\"/></A2>"
            "<A3 key=\"a3\" caption=\"A3\"/></A>"
            "<B key=\"b\" caption=\"B\"/><C key=\"c\" caption=\"C\"/></Project>");
        tree.DisplayInTreeview(&list);
        manipulator.Init(&list, &tree);
    }
    ~TreeOperationsTest() override {
        manipulator.Terminate();
        SetInputBox({});
        frmHHCEntryIndexKeywords::ShowDialog = {};
        tree.LeaveTreeview();
    }
    void Select(const std::string& key) { list.Select(list.Find(key)); }
    /// Runs an operation on a node and gives the tree as it is then.
    std::string After(const std::string& key, void (clsTreeViewManipulator::*operation)()) {
        Select(key);
        (manipulator.*operation)();
        EXPECT_EQ(Discord(), "");
        return Outline();
    }
    std::string Outline() const { return OutlineOf(*tree.Root()); }
    static std::string OutlineOf(const CHelpPrjTreeNode& node) {
        std::string out;
        for (const auto& child : node.Children()) {
            out += (out.empty() ? "" : " ") + child->Key();
            if (!child->Children().Empty())
                out += "(" + OutlineOf(*child) + ")";
        }
        return out;
    }
    /// What of tree, key map and view isn't in step; empty when all is.
    std::string Discord() const {
        std::size_t nodes = 0;
        const auto* entry = list.Find(tree.Root()->Key());
        auto discord = DiscordBelow(*tree.Root(), entry, nodes);
        if (discord.empty() && tree.MapItems().Count() != nodes)
            discord = "the map holds " + std::to_string(tree.MapItems().Count()) + " of " +
                      std::to_string(nodes) + " nodes";
        if (discord.empty() && list.Count() != nodes)
            discord = "the view holds " + std::to_string(list.Count()) + " of " + std::to_string(nodes);
        return discord;
    }

    ListTreeView list;
    clsTreeViewManipulator manipulator;

private:
    std::string DiscordBelow(const CHelpPrjTreeNode& node, const ITreeViewNode* entry,
                             std::size_t& nodes) const {
        ++nodes;
        const auto key = node.Key();
        if (tree.MapItem(key) != &node)
            return key + " isn't in the map";
        if (entry == nullptr || entry != node.TreeViewNode || entry->Key() != key)
            return key + " isn't where the view has it";
        const auto* below = entry->Child();
        for (const auto& child : node.Children()) {
            if (child->Parent != &node || child->Level != node.Level + 1)
                return child->Key() + " has another parent or level";
            if (auto discord = DiscordBelow(*child, below, nodes); !discord.empty())
                return discord;
            below = below->Next();
        }
        return below == nullptr ? std::string() : below->Key() + " is only in the view";
    }
};

TEST_F(TreeOperationsTest, StepsAndTheirUndo) {
    const auto start = Outline();
    EXPECT_EQ(start, "a(a1 a2(x) a3) b c");
    struct Case {
        const char* key;
        void (clsTreeViewManipulator::*operation)();
        const char* after;
    };
    const Case cases[] = {
        {"a2", &clsTreeViewManipulator::Up, "a(a2(x) a1 a3) b c"},
        {"a2", &clsTreeViewManipulator::Down, "a(a1 a3 a2(x)) b c"},
        {"b", &clsTreeViewManipulator::Right, "a(a1 a2(x) a3) c(b)"},
        {"a1", &clsTreeViewManipulator::Right, "a(a2(a1 x) a3) b c"},
        {"a2", &clsTreeViewManipulator::Cut, "a(a1 a3) b c"},
        {"a1", &clsTreeViewManipulator::Cut, "a(a2(x) a3) b c"},
    };
    for (const auto& one : cases) {
        EXPECT_EQ(After(one.key, one.operation), one.after);
        EXPECT_EQ(manipulator.RetCode, 0);
        EXPECT_EQ(After("root", &clsTreeViewManipulator::Undo), start) << one.after;
    }
    // In front of its old parent; taken back it is that one's first child.
    EXPECT_EQ(After("a2", &clsTreeViewManipulator::Left), "a2(x) a(a1 a3) b c");
    EXPECT_EQ(After("root", &clsTreeViewManipulator::Undo), "a(a2(x) a1 a3) b c");
    EXPECT_TRUE(tree.WasChanged);
}

TEST_F(TreeOperationsTest, WhatCanNotMoveStays) {
    const auto start = Outline();
    for (const auto& [key, operation] :
         std::vector<std::pair<const char*, void (clsTreeViewManipulator::*)()>>{
             {"a", &clsTreeViewManipulator::Up},
             {"c", &clsTreeViewManipulator::Down},
             {"b", &clsTreeViewManipulator::Left},
             {"c", &clsTreeViewManipulator::Right},
             {"root", &clsTreeViewManipulator::Up},
             {"root", &clsTreeViewManipulator::Cut},
             {"b", &clsTreeViewManipulator::Paste},
             {"b", &clsTreeViewManipulator::Edit}}) {
        EXPECT_EQ(After(key, operation), start) << key;
        EXPECT_NE(manipulator.RetCode, 0) << key;
    }
    EXPECT_TRUE(boxes->shown.empty());
    EXPECT_EQ(manipulator.UndoStackLength(), 0U);
    Node("c").SetSkipped(true);
    EXPECT_EQ(After("b", &clsTreeViewManipulator::Right), start);
    EXPECT_TRUE(boxes->shown.empty());
    After("root", &clsTreeViewManipulator::Delete);
    EXPECT_EQ(LastBox(), "Root node cannot be deleted!");
}

TEST_F(TreeOperationsTest, ACopyPastedTwiceHasKeysOfItsOwn) {
    After("a2", &clsTreeViewManipulator::Copy);
    After("b", &clsTreeViewManipulator::Paste);
    After("c", &clsTreeViewManipulator::Paste);
    EXPECT_EQ(tree.MapItems().Count(), 12U);
    ASSERT_EQ(Node("b").Children().Count(), 1U);
    EXPECT_THAT(Node("b").Children().At(1)->Key(), ::testing::MatchesRegex("a2_[0-9]+_"));
    EXPECT_EQ(Node("c").Children().At(1)->Children().At(1)->Caption(), "X");
    EXPECT_EQ(manipulator.UndoStackLength(), 3U);
    After("root", &clsTreeViewManipulator::Undo);
    // The undo took the paste's place.
    EXPECT_EQ(manipulator.UndoStackLength(), 3U);
    After("root", &clsTreeViewManipulator::Undo);
    EXPECT_EQ(Outline(), "a(a1 a2(x) a3) b c");
    boxes->answers.push_back(7);
    After("a2", &clsTreeViewManipulator::Copy);
    After("b", &clsTreeViewManipulator::PasteSpecial);
    EXPECT_EQ(LastBox(), "Would you like to paste child nodes?");
    EXPECT_TRUE(Node("b").Children().At(1)->Children().Empty());
}

TEST_F(TreeOperationsTest, DeletingAsksAboutThePage) {
    WriteFile("A2.htm", "page");
    const auto page = Path("A2.htm");
    boxes->answers = {2, 6};
    EXPECT_EQ(After("a2", &clsTreeViewManipulator::Delete), "a(a1 a2(x) a3) b c");
    EXPECT_EQ(LastBox(), "Delete action removes the node from the contents tree.\r\n"
                         "Do you also want to delete the corresponding HTML page?");
    EXPECT_EQ(manipulator.UndoStackLength(), 0U);
    EXPECT_EQ(After("a2", &clsTreeViewManipulator::Delete), "a(a1 a3) b c");
    EXPECT_FALSE(environment->files->FileExists(page));
    // The entry comes back between its neighbours, the page doesn't.
    EXPECT_EQ(After("root", &clsTreeViewManipulator::Undo), "a(a1 a2(x) a3) b c");
    EXPECT_FALSE(environment->files->FileExists(page));
}

TEST_F(TreeOperationsTest, MovesByDragAndDrop) {
    EXPECT_NE(manipulator.MoveNode(list.Find("x"), list.Find("a")), 0);
    EXPECT_EQ(LastBox(), "Node cannot be moved!");
    EXPECT_NE(manipulator.MoveNode(list.Find("a"), list.Find("a")), 0);
    EXPECT_NE(manipulator.MoveNode(list.Find("a"), list.Find("root")), 0);
    EXPECT_EQ(manipulator.MoveNode(list.Find("b"), list.Find("a1")), 0);
    EXPECT_EQ(Outline(), "a(a2(x) a3) b(a1) c");
    EXPECT_EQ(Discord(), "");
    EXPECT_EQ(After("root", &clsTreeViewManipulator::Undo), "a(a2(x) a3 a1) b c");
}

TEST_F(TreeOperationsTest, ARequestThatComesInBetweenIsDropped) {
    ResultCode inBetween = 0;
    SetInputBox([&](const auto&, const auto&, const auto&) {
        inBetween = manipulator.MoveNode(list.Find("c"), list.Find("b"));
        manipulator.Cut();
        return std::string();
    });
    Select("b");
    std::string title;
    manipulator.AddNew("Any", title);
    EXPECT_EQ(inBetween, MakeResultCode(0x80040001U));
    EXPECT_EQ(Outline(), "a(a1 a2(x) a3) b c");
    EXPECT_EQ(manipulator.UndoStackLength(), 0U);
}

TEST_F(TreeOperationsTest, ControlsStayWhereTheyAre) {
    auto control = std::make_unique<CHelpPrjTreeNode>();
    control->IsControl = true;
    control->SetKey("b.ok");
    control->Level = 3;
    control->DisplayInTreeview(&list, &tree, false, list.Find("b"));
    tree.addItem(&Node("b"), std::move(control));
    After("b.ok", &clsTreeViewManipulator::Cut);
    EXPECT_EQ(LastBox(), "Forbidden operation for controls: controls can't be copied, moved or deleted.");
    std::string title;
    Select("b.ok");
    manipulator.AddNew("New", title);
    EXPECT_EQ(LastBox(),
              "Forbidden operation for controls: control can't have manually assigned children nodes.");
    const auto told = boxes->shown.size();
    After("b.ok", &clsTreeViewManipulator::ToggleSkippedFlag);
    EXPECT_EQ(boxes->shown.size(), told);
    Select("c");
    EXPECT_NE(manipulator.MoveNode(list.Find("b.ok"), list.Find("c")), 0);
    EXPECT_EQ(LastBox(), "Forbidden operation for controls: control can't be a target of copy, move or "
                         "paste operation.");
    EXPECT_NE(manipulator.MoveNode(list.Find("c"), list.Find("b.ok")), 0);
    EXPECT_THAT(LastBox(), HasSubstr("controls can't be copied"));
    EXPECT_EQ(manipulator.UndoStackLength(), 0U);
}

TEST_F(TreeOperationsTest, SixteenOperationsCanBeUndone) {
    for (int i = 0; i < 17; ++i)
        After("a1", i % 2 == 0 ? &clsTreeViewManipulator::Down : &clsTreeViewManipulator::Up);
    EXPECT_EQ(manipulator.UndoStackLength(), 16U);
    After("a1", &clsTreeViewManipulator::Cut);
    for (int i = 0; i < 16; ++i)
        After("b", &clsTreeViewManipulator::Copy);
    After("root", &clsTreeViewManipulator::Undo);
    EXPECT_EQ(tree.MapItem("a1"), nullptr);
}

TEST_F(TreeOperationsTest, NewPagesAndPagesThatExist) {
    environment->files->MakeFolders(Path("help"));
    project->Folder = Path("help\\");
    std::vector<std::string> titles = {"First steps", "First steps", ""};
    SetInputBox([&](const std::string& prompt, const std::string&, const std::string&) {
        EXPECT_EQ(prompt, "Give topic title");
        const auto title = titles.front();
        titles.erase(titles.begin());
        return title;
    });
    std::string title;
    Select("b");
    manipulator.AddNew("", title);
    ASSERT_EQ(manipulator.RetCode, 0) << LastBox();
    EXPECT_EQ(title, "First steps");
    EXPECT_EQ(Discord(), "");
    const auto& added = *Node("b").Children().At(1);
    EXPECT_EQ(added.Caption() + "|" + added.HtmlTitle() + "|" + added.TemplateHtmlFile(),
              "First steps|First steps|Default.htm");
    EXPECT_THAT(ReadFile(added.GeneratedHTMLFileFullPath()), HasSubstr("First steps"));
    Select("b");
    manipulator.AddNew("", title);
    EXPECT_EQ(LastBox(), "'First steps' - HTML page with this file name already exists.");
    EXPECT_NE(manipulator.RetCode, 0);
    EXPECT_EQ(manipulator.UndoStackLength(), 1U);

    const auto page = WriteFile("My & own_page.htm", "<html><body>Mine</body></html>");
    Select("c");
    manipulator.AddSelected(page);
    ASSERT_EQ(manipulator.RetCode, 0) << LastBox();
    EXPECT_EQ(Node("c").Children().At(1)->Caption(), "My & own page");
    EXPECT_THAT(ReadFile(Path("help\\My & own_page.htm")), HasSubstr("<html><body>Mine</body></html>"));
    After("root", &clsTreeViewManipulator::Undo);
    EXPECT_TRUE(Node("c").Children().Empty());
    EXPECT_TRUE(environment->files->FileExists(Path("help\\My & own_page.htm")));
}

TEST_F(TreeOperationsTest, IndexEntries) {
    frmHHCEntryIndexKeywords::ShowDialog = [](frmHHCEntryIndexKeywords& dialog) {
        dialog.EntryChange("one; \"two\"");
        dialog.AddClick();
        dialog.OKClick();
    };
    After("b", &clsTreeViewManipulator::EditIndex);
    EXPECT_EQ(manipulator.RetCode, 0);
    EXPECT_EQ(Node("b").IndexesCollection().At(1), "one two");
    // Its undo is used up and restores nothing.
    After("b", &clsTreeViewManipulator::Undo);
    EXPECT_EQ(Node("b").IndexesCollection().Count(), 1U);
    frmHHCEntryIndexKeywords::ShowDialog = [](frmHHCEntryIndexKeywords& dialog) { dialog.CancelClick(); };
    After("b", &clsTreeViewManipulator::EditIndex);
    EXPECT_NE(manipulator.RetCode, 0);
}

TEST_F(TreeOperationsTest, IndexDialog) {
    frmHHCEntryIndexKeywords dialog;
    EXPECT_FALSE(dialog.cmdOK.enabled = dialog.IsValid());
    for (const char* word : {"a", "b", "A", "c"}) {
        dialog.EntryChange(word);
        dialog.AddClick();
    }
    EXPECT_THAT(dialog.lstIndexEntries.entries, ElementsAre("a", "b", "c"));
    EXPECT_FALSE(dialog.cmdMoveDown.enabled);
    EXPECT_TRUE(dialog.ListKeyDown(38, /*ctrl=*/true));
    EXPECT_THAT(dialog.lstIndexEntries.entries, ElementsAre("a", "c", "b"));
    EXPECT_EQ(dialog.txtIndexEntry.text, "c");
    EXPECT_FALSE(dialog.cmdAddEntry.enabled);
    boxes->answers = {7, 6, 6, 6};
    dialog.DeleteClick();
    EXPECT_EQ(dialog.lstIndexEntries.entries.size(), 3U);
    EXPECT_EQ(LastBox(), "Are you sure you wanted to delete this index entry?");
    dialog.DeleteClick();
    EXPECT_EQ(dialog.lstIndexEntries.SelectedEntry(), "b");
    dialog.DeleteClick();
    dialog.DeleteClick();
    EXPECT_TRUE(dialog.EntryFocused());
    dialog.OKClick();
    EXPECT_FALSE(dialog.Closed());
    EXPECT_TRUE(dialog.EntryKeyDown(27, false));
    EXPECT_TRUE(dialog.Closed() && !dialog.Accepted());
}

TEST_F(TreeOperationsTest, TextsOfANode) {
    Select("a2");
    EXPECT_THAT(manipulator.GetXML(), HasSubstr("caption = \"A2\""));
    EXPECT_THAT(manipulator.GetHHC(), HasSubstr("A2.htm"));
    EXPECT_EQ(manipulator.UndoStackLength(), 2U);
    EXPECT_FALSE(tree.WasChanged);
    After("a2", &clsTreeViewManipulator::ToggleSkippedFlag);
    EXPECT_TRUE(Node("x").Skipped());
    EXPECT_EQ(list.Find("x")->Image(), "no");
    EXPECT_EQ(manipulator.UndoStackLength(), 2U);
}

TEST(StackTest, CursorWalksAndAPushDropsWhatLiesAbove) {
    cStack<std::string> stack;
    const auto failure = [](const auto& step) {
        try {
            step();
        } catch (const RaisedError& error) {
            return std::string(error.what());
        }
        return std::string();
    };
    EXPECT_EQ(failure([&] { stack.Pop(); }), "Stack is empty");
    for (const char* page : {"a", "b", "c"})
        stack.Push(page, /*Top=*/false);
    EXPECT_EQ(failure([&] { stack.Up(); }), "Already top");
    EXPECT_EQ(stack.Down(), "b");
    EXPECT_EQ(stack.Down(), "a");
    EXPECT_EQ(stack.Current(), "a");
    EXPECT_EQ(failure([&] { stack.Down(); }), "Already bottom");
    stack.Push("d", /*Top=*/false);
    EXPECT_EQ(stack.StackCount(), 2);
    EXPECT_EQ(stack.Top() + stack.Item(2), "da");
    EXPECT_EQ(stack.Pop(), "d");
}

/// What a user may do next, drawn from a seed.
class RandomEdits : public TreeOperationsTest, public ::testing::WithParamInterface<unsigned> {
protected:
    std::string AnyKey(std::mt19937& random) const {
        std::vector<std::string> keys;
        for (const auto* node : tree.MapItems())
            keys.push_back(node->Key());
        return keys[random() % keys.size()];
    }
    void Step(std::mt19937& random) {
        using Manipulator = clsTreeViewManipulator;
        static constexpr void (Manipulator::*kOperations[])() = {
            &Manipulator::Cut,          &Manipulator::Copy,  &Manipulator::Delete,
            &Manipulator::Up,           &Manipulator::Down,  &Manipulator::Left,
            &Manipulator::Right,        &Manipulator::Paste, &Manipulator::Paste,
            &Manipulator::PasteSpecial, &Manipulator::Undo,  &Manipulator::Undo,
            &Manipulator::Left,         &Manipulator::Right, &Manipulator::ToggleSkippedFlag};
        // A growing tree is cut back.
        const auto operation = random() % (std::size(kOperations) + 1);
        Select(AnyKey(random));
        if (operation == std::size(kOperations))
            manipulator.MoveNode(list.Find(AnyKey(random)), list.Find(AnyKey(random)));
        else if (tree.MapItems().Count() > 60)
            manipulator.Cut();
        else
            (manipulator.*kOperations[operation])();
    }
};

/// Wherever the tree has got to: what an operation does is taken back to the letter, except where the undo of
/// a move has a place of its own.
TEST_P(RandomEdits, UndoRestoresTheTree) {
    using Manipulator = clsTreeViewManipulator;
    static constexpr void (Manipulator::*kInvertible[])() = {&Manipulator::Cut,   &Manipulator::Delete,
                                                             &Manipulator::Up,    &Manipulator::Down,
                                                             &Manipulator::Right, &Manipulator::Paste};
    std::mt19937 random(GetParam());
    int undone = 0;
    for (int step = 0; step < 500; ++step) {
        boxes->answers = {7};
        Step(random);
        boxes->shown.clear();
        Select(AnyKey(random));
        const auto before = Outline();
        boxes->answers = {7};
        (manipulator.*kInvertible[random() % std::size(kInvertible)])();
        if (manipulator.RetCode != 0) {
            ASSERT_EQ(Outline(), before) << "step " << step;
            continue;
        }
        ++undone;
        manipulator.Undo();
        ASSERT_EQ(Outline(), before) << "step " << step;
        ASSERT_EQ(Discord(), "") << "step " << step;
    }
    EXPECT_GT(undone, 100);
}

TEST_P(RandomEdits, KeepTreeMapAndViewInStep) {
    std::mt19937 random(GetParam());
    for (int step = 0; step < 2500; ++step) {
        boxes->answers = {step % 2 == 0 ? 6 : 7};
        Step(random);
        ASSERT_EQ(Discord(), "") << "step " << step;
        boxes->shown.clear();
    }
    // What is saved is what is there.
    const auto outline = Outline();
    CHelpPrjTree read;
    ASSERT_EQ(read.Load({}, false, false, tree.GetXMLStr(true)), 0);
    EXPECT_EQ(OutlineOf(*read.Root()), outline);
    read.Terminate();
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomEdits, ::testing::Values(1U, 2U, 3U, 4U));

} // namespace
} // namespace tovimar::test
