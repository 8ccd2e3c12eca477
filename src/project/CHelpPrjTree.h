#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"
#include "project/DefinitionCache.h"
#include "project/NodeMap.h"
#include "project/TreeIndex.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace tovimar {

class CAddInProject;
class CFormHTMLControlDef;
class CHelpPrjCheckSums;
class CHelpPrjFileCheckSum;
class CHelpPrjTreeNode;
class CXmlForm;
class IClassFactory;
class IHelpPrjSourceProject;
class ITreeView;
class ITreeViewNode;
class XmlDocument;
class XmlNode;

/// The table of contents of one help project: a tree of nodes, a key map over all of them and, while an
/// editor is open, a view that mirrors them. It is loaded from a project file or a piece of its XML, saved
/// back, and it writes the contents file, the index file and the web help. Every node stands in the key map
/// exactly once; keys compare without regard to case. All of it works without a view.
///
/// Failures of the public operations are reported with the class name "CHelpPrjTree" and end the operation.
class CHelpPrjTree {
public:
    CHelpPrjTree();
    ~CHelpPrjTree();
    CHelpPrjTree(const CHelpPrjTree&) = delete;
    CHelpPrjTree& operator=(const CHelpPrjTree&) = delete;

    /// The tree came from the initial template, its placeholders are not expanded yet.
    bool NewHtmlHelpProject = false;
    /// Set by the tree operations, read and cleared by the callers that save.
    bool WasChanged = false;
    /// Not owned; set by `DisplayInTreeview`.
    ITreeView* TreeView = nullptr;

    /// Null after `Reset`.
    CHelpPrjTreeNode* Root() const { return root_.get(); }
    /// Moves the root out, to be pasted into another tree.
    std::unique_ptr<CHelpPrjTreeNode> TakeRoot();
    /// Null when the key is absent.
    CHelpPrjTreeNode* MapItem(const std::string& vstrMapKey) const { return map_.Find(vstrMapKey); }
    const NodeMap& MapItems() const { return map_; }
    bool Loaded() const { return loaded_; }
    /// Nodes below the root.
    std::int32_t NodesQty() const;
    /// No root, empty key map.
    void Reset();
    /// A second call does nothing. A root that is to survive is taken out with `TakeRoot` before.
    void Terminate(bool vfKeepChildrenNodes = false, bool vfKeepRootNode = false);

    // Nodes in and out.
    /// Empty, after a report, when no key is free.
    std::string GetNewKeyIfGivenExists(const std::string& vstrGivenKey, const std::string& vstrSrcPrjName);
    /// The one road by which a node enters the tree. Null, after a report, when its key is taken.
    CHelpPrjTreeNode* addItem(CHelpPrjTreeNode* robjXMLParent, std::unique_ptr<CHelpPrjTreeNode> robjXml,
                              bool vfAutoUniqueKey = false, CHelpPrjTreeNode* robjXmlPrevious = nullptr,
                              CHelpPrjTreeNode* robjXmlNext = nullptr, bool vfAddChildNodesToMap = false,
                              bool vfBeforePrevious = false, bool vfAfterNext = false);
    void RemoveItem(const std::string& vstrMapKey);
    void AddToMap(CHelpPrjTreeNode& robjXml);
    void AddChildNodesToMap(CHelpPrjTreeNode& robjXml);
    void RemoveFromMap(CHelpPrjTreeNode& robjXml);
    void RemoveChildNodesFromMap(CHelpPrjTreeNode& robjXml);
    void ExpandSerializerNodes(IClassFactory& rIClassFactory, IHelpPrjSourceProject* rprj);

    // Project file.
    /// With a non-empty `vstrXml` that text is loaded, else the file. 0 or the parser's error number.
    ResultCode Load(const std::string& vstrTreeDefFullPath, bool vfNewHtmlHelpProject = false,
                    bool vfLoadingExternalProject = false, const std::string& vstrXml = {},
                    bool vfLoadControls = false);
    ResultCode SaveXml(const std::string& vstrXmlFileFullPath, bool vfSkipSerializers = false,
                       const std::string& vstrExtraAttrs = {});
    std::string GetXMLStr(bool vfSkipSerializers, const std::string& vstrExtraAttrs = {});

    // View.
    void DisplayInTreeview(ITreeView* rtvw, bool vfSkipSerializers = false);
    /// Nodes and view let go of each other; the view keeps its entries.
    void LeaveTreeview();
    void Collapse(ITreeViewNode* node);
    void Expand(ITreeViewNode* node);
    bool KeyDown(std::int32_t& KeyCode, std::int32_t& Shift);
    void SetNodeCaption(const std::string& vstrNodeKey, const std::string& vstrCaption);
    bool TopicSkipped(const std::string& vstrNodeKey) const;
    void Traverse(bool vfSkipSerializers = false) const;

    // Definitions of the objects and their control nodes. Null where there is no definition file.
    std::shared_ptr<CXmlForm> MakeXmlFormControlDefs(CHelpPrjTreeNode& node, bool external,
                                                     const std::string& treeFile, bool& changed);
    std::shared_ptr<CXmlForm> AddControls(CHelpPrjTreeNode& node, std::int32_t& level, bool external,
                                          const std::string& treeFile);
    std::shared_ptr<CXmlForm> AddControlsIfAbsent(CHelpPrjTreeNode& node, std::int32_t& level, bool external,
                                                  const std::string& treeFile);
    /// Loaded definitions, kept while somebody holds the cache.
    DefinitionCache& Definitions() { return definitions_; }

    // Contents, index, web help.
    ResultCode SaveHHC(const std::string& vstrHHCFileFullPath, bool vfForceContentsRebuild);
    std::string GetHHCStr(bool vfForceContentsRebuild);
    ResultCode MakeAndSaveHHK(const std::string& vstrHHKFileFullPath);
    ResultCode MakeJavaHelp(CAddInProject& robjPrj);
    ResultCode MakeJavaHelp2(CAddInProject& robjPrj);
    std::string GetTreeStr(std::string& rstrOptions, bool vfForceContentsRebuild = false);
    /// Sorted by caption, one line per caption, each led by `indent` blanks.
    static void SortIndexOptions(std::string& lines, std::int32_t indent);
    /// Raises 30001 when the indexer is in neither place.
    bool BuildSiteSearch(CAddInProject& robjPrj);
    static void PatchSiteSearchPage(const std::string& path);
    KeyedList<std::string> GetFilesHTMLCollection() const;

    // Checksums of the topics.
    ResultCode SaveCheckSums(bool vfSaveCurrentCheckSum = false);
    /// Null while no checksums are loaded.
    CHelpPrjFileCheckSum* GetCheckSumObject(const std::string& vstrFileFullPath);
    void RecalcCheckSums();
    void InitCheckSums(const std::string& path);

    // Look-ups over the whole tree.
    std::string GetNodeHtmlRef(const std::string& vstrObjName, const std::string& vstrObjTypeName) const;
    std::string GetNodeHtmlFileNameNoExt(const std::string& vstrObjName,
                                         const std::string& vstrObjTypeName) const;
    bool HtmlFileNameIsUsed(const std::string& vstrHTMLFileNameNoExt) const;
    /// Source object nodes in pre-order, by tag; null starts at the root.
    void CollectObjectNodes(std::vector<CHelpPrjTreeNode*>& list, CHelpPrjTreeNode* start = nullptr) const;
    /// The tags whose nodes stand for source objects.
    static bool IsObjectTag(const std::string& tag);
    static bool IsGroupTemplateNode(const CHelpPrjTreeNode& node);
    /// The user's skipped flag on a group page overrides the option of its kind.
    void SyncGenerateFlagsFromTree(const CHelpPrjTreeNode* start = nullptr) const;

    // What properties need for tags in their values; asked of the host once per operation.
    const std::string& SourceProjectLocation();
    const std::string& SourceProjectName();
    /// The next read asks the host anew. Called at the head of every operation, and to be called by whoever
    /// switches the source project.
    void ForgetSourceProject() { sourceProjectKnown_ = false; }
    /// Look-up tables over the nodes; nodes keep them in step.
    TreeIndex& Index() const { return index_; }

private:
    struct LoadRun;

    ResultCode LoadTree(LoadRun& run, const std::string& xml);
    static ResultCode LoadDocument(LoadRun& run, const std::string& xml);
    ResultCode BuildXmlNodes(LoadRun& run, std::int32_t level, const XmlNode& element,
                             CHelpPrjTreeNode* parent);
    CHelpPrjTreeNode* PlaceBuiltNode(std::int32_t level, CHelpPrjTreeNode* parent,
                                     std::unique_ptr<CHelpPrjTreeNode> node);
    std::string MakeNumberedKey(const std::string& key) const;
    void MakeKeyUnique(CHelpPrjTreeNode& node, bool autoUnique) const;
    void PlaceAmongSiblings(CHelpPrjTreeNode& parent, std::unique_ptr<CHelpPrjTreeNode> node,
                            const CHelpPrjTreeNode* previous, const CHelpPrjTreeNode* next,
                            bool beforePrevious, bool afterNext);
    void AddControlNode(CHelpPrjTreeNode& object, std::int32_t level, const CXmlForm& form,
                        const CFormHTMLControlDef& entry, bool isMenu);
    void SyncRootWithParameters();
    std::string ProjectFileText(bool skipSerializers, const std::string& extraAttrs);
    void AskSourceProject();

    std::unique_ptr<CHelpPrjTreeNode> root_;
    NodeMap map_;
    /// Nodes that are in the map only, and nodes that were taken out by key.
    std::vector<std::unique_ptr<CHelpPrjTreeNode>> unplaced_;
    std::shared_ptr<XmlDocument> document_;
    std::unique_ptr<CHelpPrjCheckSums> checkSums_;
    mutable TreeIndex index_;
    DefinitionCache definitions_;
    bool loaded_ = false;
    bool terminated_ = false;
    bool sourceProjectKnown_ = false;
    std::string sourceProjectLocation_;
    std::string sourceProjectName_;
};

} // namespace tovimar
