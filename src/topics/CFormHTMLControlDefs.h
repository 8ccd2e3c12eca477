#pragma once

#include "platform/KeyedList.h"
#include "topics/CFormHTMLControlDef.h"

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

namespace tovimar {

/// Reads a saved topic back: which controls and menu entries it documents, by whatever anchors and headings
/// stand in it. The version of the program that wrote it chooses the reader.
class CFormHTMLControlDefs {
public:
    KeyedList<std::unique_ptr<CFormHTMLControlDef>> Menus; ///< without keys
    KeyedList<std::unique_ptr<CFormHTMLControlDef>> Controls;

    /// 0 or the number of a reported failure.
    ResultCode Parse(const std::string& vstrFullPath);
    /// The same over the topic's text.
    ResultCode ParseText(std::string_view html);
    /// The reader of anchors.
    void Parse1(std::string_view vstrBuf, const std::string& vstrFormName,
                const std::string& vstrExcludeList);
    /// The reader of headings.
    void Parse2(std::string_view vstrBuf, const std::string& vstrFormName,
                const std::string& vstrExcludeList);

    /// Value of a meta element by its name; empty when absent.
    static std::string MetaValue(std::string_view html, std::string_view name);

private:
    void ReadMetadata(std::string_view html);
    void ReadVersion();
    void ReadByMarkers(std::string_view html);
    void ReadMarkedSections(std::string_view html, std::string_view kind, bool isMenu);
    void ReadHeadings(std::string_view buffer, const std::string& tag, const std::string& formName,
                      const std::string& excludeList);

    std::string formName_;
    std::string excludeList_;
    std::string version_;
    std::array<std::int32_t, 4> versionNumbers_{2, 0, 1, 1};
};

} // namespace tovimar
