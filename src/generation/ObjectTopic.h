#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <memory>
#include <string>

namespace tovimar {

class CHelpPrjTreeNode;
class CTovimar;
class CXmlForm;
class clsHTMLFile;

/// Documents one object of the source project: asks the host for it, takes its picture, renders and saves its
/// topic and its definition. Made for one node.
class ObjectTopic {
public:
    ObjectTopic(CTovimar& generator, CHelpPrjTreeNode& node) : generator_(generator), node_(node) {}

    /// False for an object that is gone: it is marked as skipped and keeps its files.
    bool Find();
    /// Raises what fails; `SavingDetail` then says what was being saved, if anything.
    void Make();
    const std::string& SavingDetail() const { return savingDetail_; }

private:
    void FixPaths();
    void DeleteOldTopic() const;
    void CountObject() const;
    void TakeOver();
    void TakePicture();
    void Render();
    void RenderWorksheet(const char* templateFile);
    void SaveDefinition();
    void FinishPage();

    CTovimar& generator_;
    CHelpPrjTreeNode& node_;
    std::int32_t type_ = 0;
    std::string topic_;
    std::string topicText_; ///< rendered, not yet written
    std::string picture_;
    std::shared_ptr<CXmlForm> form_;
    std::string savingDetail_;
};

/// Style sheet and charset of a page: the node's own, else the run's.
void SetPageLook(clsHTMLFile& page, const CHelpPrjTreeNode& node);
/// Writes into a page that is loaded already; does nothing when the load failed.
void SavePage(clsHTMLFile& page, const CHelpPrjTreeNode& node, const std::string& title,
              const std::string& caption);

} // namespace tovimar
