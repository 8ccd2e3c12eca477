#include "platform/Error.h"
#include "platform/access/DesignValues.h"
#include "platform/access/ExportReader.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>

namespace tovimar::platform::access {

namespace {

using Children = std::vector<std::unique_ptr<DesignObject>>;

/// Moves the objects of nameless blocks up to their owner; a nameless block only groups what it holds.
void DissolveNameless(DesignObject& owner) {
    Children flat;
    flat.reserve(owner.children.size());
    for (auto& child : owner.children) {
        DissolveNameless(*child);
        if (!child->type.empty()) {
            flat.push_back(std::move(child));
            continue;
        }
        for (auto& inner : child->children)
            flat.push_back(std::move(inner));
    }
    owner.children = std::move(flat);
    for (auto& child : owner.children)
        child->parent = &owner;
}

bool BelongsToRoot(const DesignObject& object) {
    for (const auto* type : {"Section", "FormHeader", "FormFooter", "PageHeader", "PageFooter", "BreakHeader",
                             "BreakFooter", "BreakLevel"})
        if (object.Is(type))
            return true;
    return false;
}

/// Names, prototypes and a stable name for what the source leaves without one.
class DesignFinisher {
public:
    explicit DesignFinisher(Design& design) {
        for (const auto& prototype : design.prototypes)
            prototypes_.try_emplace(text::FoldCase(prototype->type), prototype.get());
    }

    void Finish(DesignObject& object) {
        const auto* name = object.FindOwn("Name");
        object.name = name ? name->text : object.type + std::to_string(++unnamed_);
        if (const auto found = prototypes_.find(text::FoldCase(object.type)); found != prototypes_.end())
            object.prototype = found->second;
        for (auto& child : object.children)
            Finish(*child);
    }

private:
    std::unordered_map<std::string, const DesignObject*> prototypes_;
    int unnamed_ = 0;
};

void TakePrototypes(Design& design) {
    auto& children = design.root->children;
    const auto inRoot = std::stable_partition(children.begin(), children.end(),
                                              [](const auto& child) { return BelongsToRoot(*child); });
    for (auto child = inRoot; child != children.end(); ++child) {
        (*child)->parent = nullptr;
        (*child)->name = (*child)->type;
        design.prototypes.push_back(std::move(*child));
    }
    children.erase(inRoot, children.end());
}

std::unique_ptr<DesignObject> TakeBlock(ExportTree& tree, std::string_view type) {
    for (auto& child : tree.root->children)
        if (child->Is(type))
            return std::move(child);
    return nullptr;
}

void ReadWindowDesign(Design& design, ExportTree& tree) {
    const auto* type = design.kind == ObjectKind::Form ? "Form" : "Report";
    design.root = TakeBlock(tree, type);
    if (!design.root)
        throw RaisedError(kFailure1,
                          design.sourceFile + ", line 1: the file holds no block \"Begin " + type + "\".",
                          "ExportReader");
    design.root->parent = nullptr;
    DissolveNameless(*design.root);
    TakePrototypes(design);
    DesignFinisher(design).Finish(*design.root);
}

/// A macro's rows are nameless blocks; they become objects of type "Action".
void ReadMacroDesign(Design& design, ExportTree& tree) {
    design.root = std::move(tree.root);
    design.root->type = "Macro";
    for (auto& child : design.root->children)
        if (child->type.empty())
            child->type = "Action";
    DesignFinisher(design).Finish(*design.root);
}

} // namespace

std::unique_ptr<Design> ReadDesign(std::string_view source, ObjectKind kind, const std::string& name,
                                   const std::string& nativePath) {
    return DesignOfTree(ParseExportTree(source, nativePath), kind, name, nativePath);
}

std::unique_ptr<Design> DesignOfTree(ExportTree tree, ObjectKind kind, const std::string& name,
                                     const std::string& nativePath) {
    auto design = std::make_unique<Design>();
    design->kind = kind;
    design->name = name;
    design->sourceFile = nativePath;
    design->code = std::move(tree.code);
    if (kind == ObjectKind::Form || kind == ObjectKind::Report)
        ReadWindowDesign(*design, tree);
    else
        ReadMacroDesign(*design, tree);
    design->root->name = name;
    return design;
}

} // namespace tovimar::platform::access
