#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"
#include "project/NodeList.h"
#include "project/NodeProperties.h"

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

class CHelpPrjTree;
class CXmlForm;
class ContentsStyle;
class IClassFactory;
class IHelpPrjSourceProject;
class ITreeView;
class ITreeViewNode;
class IXmlSerializer;
class clsHHK;
struct ObjectContents;
enum class TreeViewRelation;

/// One entry of the table of contents: a group, a topic, a source object (form, report, table, query,
/// macro, worksheet, chart), or a control or menu of an object. A node owns its children. Its properties
/// live in the attributes of the element that it was built from; a caption may hold project tags such as
/// {ProjectName}, which are resolved on every read and never stored.
///
/// A terminated node reads as empty and ignores writes. It stays in memory with its former parent, so a
/// reference that somebody still holds doesn't dangle.
class CHelpPrjTreeNode {
public:
    using ChildList = NodeList;

    CHelpPrjTreeNode();
    ~CHelpPrjTreeNode();
    CHelpPrjTreeNode(const CHelpPrjTreeNode&) = delete;
    CHelpPrjTreeNode& operator=(const CHelpPrjTreeNode&) = delete;

    /// Null for the root and for a node that isn't placed yet. Not owned.
    CHelpPrjTreeNode* Parent = nullptr;
    /// The element's tag name; "Control" and "MenuItem" for nodes made from a definition.
    std::string Tag;
    /// 1 for the root.
    std::int32_t Level = 0;
    bool IsRootNode = false;
    bool IsControl = false;
    bool IsMenu = false;
    /// The view's entry and the view; null while the node isn't shown. Not owned.
    ITreeViewNode* TreeViewNode = nullptr;
    ITreeView* TreeView = nullptr;
    /// The tree whose key map holds the node. Not owned.
    CHelpPrjTree* HelpPrjTree = nullptr;
    /// The topic must be rewritten; the object was found new. Marks of the generator.
    bool RegenerateHelpFiles = false;
    bool NewUIObject = false;
    /// Set by the generation pass.
    std::string UniqueObjectName;

    /// Puts the node on an element; nothing is copied out of it. The document is kept alive by the node.
    /// View, tree and the last flag are of no use to it. Always True.
    bool Build(std::int32_t vlngLevel, std::shared_ptr<XmlDocument> robjDomXmlTree, XmlNode robjDomXmlNode,
               ITreeView* rtvw = nullptr, CHelpPrjTree* robjHelpPrjTree = nullptr, bool vfNewProject = false);
    bool IsXmlDocNode() const { return properties_.HasElement(); }
    bool Terminated() const { return terminated_; }

    std::string Name() const;
    void SetName(const std::string& value);
    /// A value in double braces is a message code: its localised text when there is one.
    std::string Caption() const;
    void SetCaption(const std::string& value);
    std::string HtmlTitle() const;
    void SetHtmlTitle(const std::string& value);
    /// The tag when the attribute is empty.
    std::string Key() const;
    void SetKey(const std::string& value);
    std::string ParentKey() const;
    void SetParentKey(const std::string& value);
    std::string PreviousNodeKey() const;
    void SetPreviousNodeKey(const std::string& value);
    std::string NextNodeKey() const;
    void SetNextNodeKey(const std::string& value);
    std::string OriginalKey() const;
    void SetOriginalKey(const std::string& value);
    std::string ParentOriginalKey() const;
    void SetParentOriginalKey(const std::string& value);
    /// 0 table, 1 query, 2 form, 3 report, 4 macro, 81 worksheet, 82 chart, -1 none.
    std::int32_t ObjectType() const;
    void SetObjectType(std::int32_t value);
    /// 0 a page by itself, 999 a source object, 1 to 5, 81 and 82 group pages.
    std::int32_t ProcessCode() const;
    void SetProcessCode(std::int32_t value);
    bool Skipped() const;
    void SetSkipped(bool value);
    std::string Icon() const;
    void SetIcon(const std::string& value);
    std::string Bookmark() const;
    void SetBookmark(const std::string& value);
    std::string Serializer() const;
    void SetSerializer(const std::string& value);
    bool HasSerializer() const;
    std::string Charset() const;
    void SetCharset(const std::string& value);
    std::string ExtraValue() const;
    void SetExtraValue(const std::string& value);
    /// Full path in the current project's folder; empty without a style sheet.
    std::string CSSFullPath() const;
    void SetCSSFullPath(const std::string& value);
    std::string PicsSubfolderName() const;
    void SetPicsSubfolderName(const std::string& value);
    std::string SourceProjectType() const;
    void SetSourceProjectType(const std::string& value);
    std::string SourceProjectName() const;
    void SetSourceProjectName(const std::string& value);
    /// "Table", "Query", "Form", "Report", "Macro" for the object types 0 to 4, else empty.
    std::string NodeComponentTypeName() const;
    /// True for a source object of one of the seven types.
    bool IsObjectNode() const;

    // Files of the node.
    std::string TemplateHtmlFile() const;
    void SetTemplateHtmlFile(const std::string& value);
    std::string TemplateHtmlFileNameExtOnly() const;
    /// The first template folder that has the file; the last candidate when none has it.
    std::string TemplateHtmlFileFullPath() const;
    /// File name only.
    std::string GeneratedHTMLFile() const;
    void SetGeneratedHTMLFile(const std::string& value);
    std::string GeneratedHTMLFileFullPath() const;
    std::string HTMLFileNameNoExt() const;
    std::string XmlFormFileName() const;
    std::string XmlFormFullPath() const;
    std::string HTMLFileRef(bool vfBold) const;
    /// The object's definition; null for other nodes and when there is no file.
    std::shared_ptr<CXmlForm> LoadXmlForm() const;
    /// Raises 0x80040001 for other types than form and report.
    void SaveXmlForm(CXmlForm& rfrm) const;

    // Children.
    ChildList& Children() { return children_; }
    const ChildList& Children() const { return children_; }
    /// Count of all descendants.
    std::int32_t NodesQty() const;
    void Traverse(bool vfSkipSerializers = false) const;
    void AdjustChildrenNodesLevel(std::int32_t vlngParentLevel, bool vfSkipSerializers);
    void DropChildrenControls();
    void ClearChildrenCollection(bool vfKeepChildrenNodes = false);
    /// Out of parent, key map and view, with the whole subtree. A second call does nothing.
    void Terminate();
    void RemoveKeysFromKeyMap();

    // Keys of copied subtrees.
    static std::string GeneratedKeySuffix();
    /// Null takes the node's own tree.
    void AssignNewKeyIfDuplicate(CHelpPrjTree* robjHelpPrjTree);
    void AssignNewKeysToAllNodesIfDuplicateInANewTree(CHelpPrjTree* robjTreeView2Merge,
                                                      bool vfSkipSerializers);
    /// Places `node` with its subtree; needs a view. Gives the placed node, null when it failed.
    static CHelpPrjTreeNode* Paste(std::unique_ptr<CHelpPrjTreeNode> node, CHelpPrjTreeNode* robjParent,
                                   ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree,
                                   CHelpPrjTreeNode* robjXmlPrevious, CHelpPrjTreeNode* robjXmlNext,
                                   bool vfBeforePrevious, bool vfAfterNext);

    // View.
    void DisplayInTreeview(ITreeView* rtvw, CHelpPrjTree* robjHelpPrjTree, bool vfSkipSerializers,
                           ITreeViewNode* robjParentNode = nullptr, ITreeViewNode* robjPreviousNode = nullptr,
                           ITreeViewNode* robjNextNode = nullptr, bool vfBeforePrevious = false,
                           bool vfAfterNext = false, bool vfDisplayChildrenOnly = false);
    /// Adds the view's entry with key, display caption and image, and keeps it.
    void rtvwNodesAdd(ITreeViewNode* relative, TreeViewRelation relation, const std::string& image);
    void RemoveFromTreview();
    void Expand();
    void Collapse();
    /// True when the key was used: 45 (Insert) toggles `Skipped` for the subtree.
    bool KeyDown(std::int32_t KeyCode, std::int32_t Shift, const CHelpPrjTreeNode* robjParent = nullptr);
    void SetNodeCaption(const std::string& vstrCaption);
    void SwitchNameCaption(bool vfUseCaption);
    void SetFormsReportsProcessCode(std::int32_t vlngProcessCode = -1);

    // Keywords: the word is its own key, so no word stands twice in any case.
    KeyedList<std::string>& IndexesCollection();
    void SetIndexesCollection(KeyedList<std::string> words);
    /// The keyword attributes of the project file.
    std::string IndexesXmlStr();
    void AddIndexLinks(clsHHK& robjIndex);

    // Source objects.
    void ExpandSerializerNodes(IClassFactory& rIClassFactory, CHelpPrjTree& robjTree,
                               IHelpPrjSourceProject* rprj);
    void ExpandSerializerNodes4CurrentProject(CHelpPrjTree& robjTree, IHelpPrjSourceProject* rprj,
                                              IXmlSerializer& rIXML);
    /// The first form or report node of this type and name below.
    CHelpPrjTreeNode* GetUIObjectXMLNode(std::int32_t vlngObjectType, const std::string& vstrObjectName);

    // Look-ups; on the root of a tree they take constant time.
    bool NodeFileNameDefined(const std::string& vstrFileNameToCheck) const;
    std::string GetNodeHtmlRef(const std::string& vstrObjName, const std::string& vstrObjTypeName) const;
    std::string GetNodeHtmlFileNameNoExt(const std::string& vstrObjName,
                                         const std::string& vstrObjTypeName) const;
    bool HtmlFileNameIsUsed(const std::string& vstrHTMLFileNameNoExt) const;
    /// Full paths of the subtree's topics; the path is the key, a second equal one is dropped.
    void GetHtmlFilesCollection(KeyedList<std::string>& rcol) const;

    // Texts.
    std::string XMLSTr(std::int32_t vlngLevel, bool vfSkipSerializers, bool vfExtInfo,
                       bool vfIncludeXMLHeader, const std::string& vstrExtraAttrs);
    std::string HHCStr(std::int32_t vlngLevel, bool vfSkipSerializers, bool vfForceContentsRebuild);
    std::string ContentsHTML(std::int32_t vlngLevel, bool vfSkipControlsNodes);
    /// Appends the subtree's option lines to `rstrIndexes`.
    std::string TreeStr(std::int32_t vlngLevel, std::string& rstrIndexes, bool vfSkipSerializers = false,
                        bool vfForceContentsRebuild = false);
    /// What a contents entry shows: caption, or the name where the project identifies by name. Not encoded.
    std::string ContentsText() const;
    /// Target of a contents entry: the generated file, with the anchor for a control or menu.
    std::string ContentsLink() const;

private:
    friend class CHelpPrjTree;

    std::string PropertyValue(NodeProperty property) const;
    void SetPropertyValue(NodeProperty property, const std::string& value);
    std::int32_t NumberValue(NodeProperty property, std::int32_t absent) const;
    std::string MessageOr(std::string value) const;
    std::string TemplateAttribute() const;
    std::string GeneratedAttribute() const;

    void Release();
    void ReleaseSubtree();
    std::unique_ptr<CHelpPrjTreeNode> TakeChild(const CHelpPrjTreeNode& child);
    void ShowInView(bool displayChildrenOnly, ITreeViewNode* parent, ITreeViewNode* previous,
                    ITreeViewNode* next, bool beforePrevious, bool afterNext);
    std::string DisplayCaption() const;
    struct XmlPass;
    void NoteNeighbours();
    void AppendXml(XmlPass& pass, std::int32_t level, const std::string& encodedParentKey,
                   const std::string& extraAttributes);
    void AppendXmlFirstLine(XmlPass& pass, const NodePropertyViews& values, bool nameIsGiven) const;
    void AppendXmlLines(XmlPass& pass, const NodePropertyViews& values, std::int32_t level,
                        const std::string& encodedKey, const std::string& encodedParentKey);
    void AppendXmlIndexes(XmlPass& pass, const NodePropertyViews& values);
    std::string_view Resolved(const NodePropertyViews& values, NodeProperty property,
                              std::string& buffer) const;
    void AppendContents(std::string& out, std::int32_t level, ContentsStyle& style);
    void AppendObjectChildren(std::string& out, std::int32_t level, ContentsStyle& style);
    bool RenewDefinition();
    std::shared_ptr<const ObjectContents> ReadContents(bool renewControls);
    std::shared_ptr<CXmlForm> RenewControls();
    bool HasContentsEntry() const;
    void AppendContentsHtml(std::string& out, std::int32_t level, bool skipControlsNodes) const;
    void LoadIndexes();
    void ExpandProjectGroup(CHelpPrjTree& tree, IXmlSerializer& serializer);
    void ReadFragment(CHelpPrjTree& tree, const std::string& fragment, const std::string& projectName);
    void AppendFragment(CHelpPrjTree& tree, const std::string& fragment,
                        const std::shared_ptr<XmlDocument>& document, const XmlNode& element,
                        const std::string& projectName);
    const CHelpPrjTreeNode* FindByNameAndTag(const std::string& name, const std::string& tag,
                                             bool needsFile) const;

    NodeProperties properties_;
    ChildList children_;
    /// Children that were terminated one by one; kept for references that others still hold.
    std::vector<std::unique_ptr<CHelpPrjTreeNode>> formerChildren_;
    mutable std::string templateFile_;
    mutable std::string generatedFile_;
    mutable bool templateFileKnown_ = false;
    mutable bool generatedFileKnown_ = false;
    /// Null until they are asked for or set.
    std::unique_ptr<KeyedList<std::string>> indexes_;
    bool terminated_ = false;
};

} // namespace tovimar
