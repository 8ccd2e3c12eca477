#include "project/ProjectTest.h"

#include "host/contract/IClassFactory.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "project/ComponentFileName.h"

namespace tovimar::test {
namespace {

using TreeNodeTest = ProjectTest;

TEST_F(TreeNodeTest, ReadsAttributesWhateverTheirCase) {
    LoadTree("<Project><P KEY='k' TYPE='2' sKipped='-1' pROCESScode='999' Caption='{{no such "
             "message}}'/></Project>");
    auto& node = Node("k");
    EXPECT_EQ(node.ObjectType(), 2);
    EXPECT_EQ(node.ProcessCode(), 999);
    EXPECT_EQ(node.Caption(), "{{no such message}}");
    EXPECT_TRUE(node.IsObjectNode());
    node.SetSourceProjectName("in memory");
    EXPECT_EQ(node.SourceProjectName(), "in memory");
}

TEST_F(TreeNodeTest, SkippedByText) {
    const std::pair<const char*, bool> cases[] = {{"-1", true},     {"1", true}, {"true", true},
                                                  {"TRUE", true},   {"", false}, {"0", false},
                                                  {"false", false}, {"x", false}};
    for (const auto& [text, skipped] : cases) {
        LoadTree(std::string("<Project><P key='k' skipped='") + text + "'/></Project>");
        EXPECT_EQ(Node("k").Skipped(), skipped) << text;
    }
}

TEST_F(TreeNodeTest, CaptionsInDoubleBracesAreLocalised) {
    messages.Load(WriteFile("Messages.xml", "<Messages><m Code='{{Forms}}' Text='Formulare'/></Messages>"));
    LoadTree("<Project><P key='k' caption='{{Forms}}'/></Project>");
    EXPECT_EQ(Node("k").Caption(), "Formulare");
}

TEST_F(TreeNodeTest, FilesOfANode) {
    LoadTree(
        "<Project><P key='k' GeneratedHtmlFile='..\\..\\up.htm' CSSFullPath='Z:\\x\\Office.css' type='2' "
        "ProcessCode='999' Name='A&amp;B' caption='&amp;Save'/></Project>");
    auto& node = Node("k");
    EXPECT_EQ(node.GeneratedHTMLFile(), "up.htm");
    EXPECT_EQ(node.GeneratedHTMLFileFullPath(), Path("up.htm"));
    EXPECT_EQ(node.CSSFullPath(), Path("Office.css"));
    EXPECT_EQ(node.XmlFormFullPath(), Path("xml\\up.xml"));
    EXPECT_EQ(node.HTMLFileRef(true), "<a href=\"up.htm\"><B>Save</B></a>");
    EXPECT_TRUE(tree.HtmlFileNameIsUsed("UP"));
    node.SetGeneratedHTMLFile("Z:\\else\\new.htm");
    EXPECT_FALSE(tree.HtmlFileNameIsUsed("up"));
    EXPECT_TRUE(tree.Root()->NodeFileNameDefined("new.htm"));
    EXPECT_EQ(tree.GetNodeHtmlFileNameNoExt("a&b", "p"), "new");
    EXPECT_EQ(tree.GetNodeHtmlRef("absent", "P"), "");
}

TEST_F(TreeNodeTest, TerminatedNodeReadsAsEmpty) {
    LoadTree("<Project><A key='a' Name='n'><B key='b'/></A><C key='c'/></Project>");
    auto& node = Node("a");
    node.Terminate();
    node.Terminate();
    EXPECT_EQ(node.Name() + node.Key(), "");
    node.SetName("x");
    EXPECT_EQ(node.Name(), "");
    EXPECT_EQ(tree.MapItem("b"), nullptr);
    EXPECT_EQ(tree.NodesQty(), 1);
}

TEST_F(TreeNodeTest, NewKeysCarryTheProjectUnlessTheyDo) {
    LoadTree("<Project><A key='Sales.Form_A'/></Project>");
    EXPECT_EQ(tree.GetNewKeyIfGivenExists("Form_B", "Sales"), "Sales.Form_B");
    EXPECT_EQ(tree.GetNewKeyIfGivenExists("SALES.Form_B", "Sales"), "SALES.Form_B");
    EXPECT_EQ(tree.GetNewKeyIfGivenExists("Form_A", "Sales"), "Form_A1") << "numbered without the prefix";
}

TEST_F(TreeNodeTest, SiblingsOfANewItem) {
    LoadTree("<Project><A key='a'/><B key='b'/></Project>");
    const auto add = [&](const char* key, CHelpPrjTreeNode* previous, CHelpPrjTreeNode* next, bool before,
                         bool after) {
        auto node = std::make_unique<CHelpPrjTreeNode>();
        node->Tag = key;
        tree.addItem(tree.Root(), std::move(node), false, previous, next, false, before, after);
    };
    add("p", &Node("a"), nullptr, false, false);
    add("q", &Node("a"), nullptr, true, false);
    add("r", nullptr, &Node("b"), false, false);
    add("s", nullptr, &Node("b"), false, true);
    add("t", nullptr, nullptr, false, false);
    add("u", tree.Root(), nullptr, false, false);
    std::string order;
    for (const auto& child : tree.Root()->Children())
        order += child->Key();
    EXPECT_EQ(order, "qaprbst");
    EXPECT_NE(tree.MapItem("u"), nullptr) << "a sibling that isn't there leaves the key only";
}

TEST_F(TreeNodeTest, ViewMirrorsTheTree) {
    LoadTree(
        "<Project key='root'><A key='a'><B key='b' skipped='-1'/></A><S key='s' serializer='x'/></Project>");
    tree.DisplayInTreeview(&view);
    EXPECT_EQ(view.Outline(), "root[openedBook](a[hlpclose](b[no]))");
    view.selected = static_cast<FakeTreeView::Node*>(Node("a").TreeViewNode);
    std::int32_t insert = 45;
    std::int32_t shift = 0;
    EXPECT_TRUE(tree.KeyDown(insert, shift));
    EXPECT_EQ(view.Outline(), "root[openedBook](a[no](b[no]))");
    EXPECT_TRUE(tree.TopicSkipped("a"));
    EXPECT_NE(tree.Root()->XMLSTr(1, false, true, false, {}).find("nnodekey"), 0U);
    Node("a").Terminate();
    EXPECT_EQ(view.Outline(), "root[openedBook]");
}

TEST_F(TreeNodeTest, PastedCopiesGetKeysOfTheirOwn) {
    LoadTree("<Project key='root'><A key='a'><B key='b'/></A></Project>");
    tree.DisplayInTreeview(&view);
    environment->doEvents = [&] { clock->Advance(0.01); };
    const auto paste = [&](const std::string& xml) {
        CHelpPrjTree temporary;
        EXPECT_EQ(temporary.Load({}, true, false, xml), 0);
        temporary.Root()->AssignNewKeysToAllNodesIfDuplicateInANewTree(&tree, true);
        auto* placed = CHelpPrjTreeNode::Paste(temporary.TakeRoot(), tree.Root(), &view, &tree, nullptr,
                                               nullptr, false, false);
        temporary.Terminate(true, false);
        return placed;
    };
    auto* first = paste(Node("a").XMLSTr(1, true, true, false, {}));
    ASSERT_NE(first, nullptr) << LastBox();
    EXPECT_EQ(first->Key(), "a_1104500_");
    EXPECT_EQ(first->Children().At(1)->Key(), "b_1104500_");
    auto* second = paste(first->XMLSTr(1, true, true, false, {}));
    ASSERT_NE(second, nullptr) << LastBox();
    EXPECT_EQ(second->Key(), "a_1104501_") << "the old suffix is replaced, and the clock had to move";
    EXPECT_EQ(tree.NodesQty(), 6);
    EXPECT_EQ(second->Level, 2);
    EXPECT_NE(tree.MapItem(second->Children().At(1)->Key()), nullptr);
    EXPECT_EQ(view.top.children[0]->children.size(), 3U);
}

class ListSerializer : public IXmlSerializer {
public:
    std::string XmlText() override { return {}; }
    const KeyedList<std::string>& XmlCollection(CHelpPrjTree& tree, const IHelpPrjSourceProject&) override {
        for (int i = 0; i < 3; ++i) {
            const auto number = std::to_string(i);
            taken += tree.Root()->NodeFileNameDefined("f" + number + ".htm") ? "1" : "0";
            list.Add("<FORM Name='f" + number + "' Key='Sales.Form_" + number + "' GeneratedHTMLFile='f" +
                     number + ".htm' type='2' ProcessCode='999'/>");
        }
        list.Add("<FORM");
        return list;
    }
    void Reset() override { list.Clear(); }

    KeyedList<std::string> list;
    static inline std::string taken;
};

class ListFactory : public IClassFactory {
public:
    void CreateObject(const std::string& name, std::unique_ptr<IXmlSerializer>& object) override {
        object.reset();
        if (name == "list")
            object = std::make_unique<ListSerializer>();
    }
    void CreateFormsListObject(std::unique_ptr<IXmlSerializer>&) override {}
    void CreateReportsListObject(std::unique_ptr<IXmlSerializer>&) override {}
    void CreateTablesListObject(std::unique_ptr<IXmlSerializer>&) override {}
    void CreateQueriesListObject(std::unique_ptr<IXmlSerializer>&) override {}
    void CreateMacrosListObject(std::unique_ptr<IXmlSerializer>&) override {}
    void CreateWorksheetsListObject(std::unique_ptr<IXmlSerializer>&) override {}
    void CreateChartsListObject(std::unique_ptr<IXmlSerializer>&) override {}
};

class EmptySource : public IHelpPrjSourceProject {
public:
    ResultCode Init(const std::string&, const std::string&) override { return 0; }
    void Terminate() override {}
    bool IsValid() const override { return true; }
    std::string ProjectType() const override { return {}; }
    const SourceItems& Forms() const override { return items; }
    bool CouldHaveReports() const override { return false; }
    const SourceItems& Reports() const override { return items; }
    bool CouldHaveTables() const override { return false; }
    const SourceItems& Tables() const override { return items; }
    bool CouldHaveQueries() const override { return false; }
    const SourceItems& Queries() const override { return items; }
    bool CouldHaveMacros() const override { return false; }
    const SourceItems& Macros() const override { return items; }
    std::string Name() const override { return {}; }
    bool IsProjectGroup() const override { return false; }
    const KeyedList<std::unique_ptr<IHelpPrjSourceProject>>& projects() const override { return none; }
    const SourceItems& Worksheets() const override { return items; }
    const SourceItems& Charts() const override { return items; }

    SourceItems items;
    KeyedList<std::unique_ptr<IHelpPrjSourceProject>> none;
};

TEST_F(TreeNodeTest, PlaceholderGivesSiblingsBehindAllOthers) {
    LoadTree(
        "<Project><Forms key='g'><All key='all' serializer='list'/><X key='x'/><No key='no' serializer='?'/>"
        "</Forms></Project>");
    ListFactory factory;
    EmptySource source;
    ListSerializer::taken.clear();
    tree.ExpandSerializerNodes(factory, &source);
    std::string order;
    for (const auto& child : Node("g").Children())
        order += child->Key() + ' ';
    EXPECT_EQ(order, "all x no Sales.Form_0 Sales.Form_1 Sales.Form_2 ");
    EXPECT_TRUE(Node("all").Skipped());
    EXPECT_TRUE(Node("no").Skipped());
    EXPECT_TRUE(Node("Sales.Form_1").NewUIObject);
    EXPECT_EQ(Node("Sales.Form_1").Level, Node("all").Level);
    EXPECT_EQ(ListSerializer::taken, "000");
    EXPECT_TRUE(tree.Root()->NodeFileNameDefined("F2.htm"));
    EXPECT_EQ(boxes->shown.size(), 1U) << "the fragment that is no XML is reported and costs nothing else";
}

TEST_F(TreeNodeTest, ComponentNamesFitFiles) {
    EXPECT_EQ(GetComponentFileName("Orders"), "Orders");
    EXPECT_EQ(GetComponentFileName("Orders", "Name"), "Orders_Name");
    EXPECT_EQ(GetComponentFileName("Orders", "Name", "Other"), "Other_Name");
    const auto longName = GetComponentFileName(std::string(200, 'x') + "1");
    EXPECT_EQ(longName.size(), 150U);
    EXPECT_NE(longName, GetComponentFileName(std::string(200, 'x') + "2"));
    for (const char* hostile : {"..\\..\\x", "a\"b", "a#b%c", "a/b:c*?"})
        EXPECT_EQ(GetComponentFileName(hostile).find_first_of("\\/:*?\"<>|#%"), std::string::npos) << hostile;
}

TEST_F(TreeNodeTest, GroupPagesOverrideTheOptions) {
    LoadTree("<Project><A key='a' TemplateHtmlFile='FORMS.htm' skipped='-1'/><B key='b' "
             "html='tables.htm'/></Project>");
    parameters.GenerateHelpForTables = false;
    tree.SyncGenerateFlagsFromTree();
    EXPECT_FALSE(parameters.GenerateHelpForForms);
    EXPECT_TRUE(parameters.GenerateHelpForTables);
    EXPECT_TRUE(CHelpPrjTree::IsGroupTemplateNode(Node("b")));
}

} // namespace
} // namespace tovimar::test
