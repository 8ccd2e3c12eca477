#pragma once

#include "host/sources/SourceProjectLists.h"

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace tovimar {

class CTovimarServerAgent;

/// The application that the host has open, read by commands: lists of names, and for objects with a design
/// a text copy of it, which is deleted again.
class HostSourceProject : public SourceProjectLists {
public:
    using SourceProjectLists::SourceProjectLists;

    bool CouldHaveReports() const override { return true; }
    bool CouldHaveTables() const override { return true; }
    bool CouldHaveQueries() const override { return true; }
    bool CouldHaveMacros() const override { return true; }

protected:
    /// One of the lists and its words.
    struct Pass {
        SourceItems& items;
        const char* subType; ///< "Table"
        KeyedList<std::string> names;
        std::string loading;     ///< "Loading tables..."
        std::string processing;  ///< "Processing table [", with the name and `behindName` behind it
        const char* behindName;  ///< "]..."
        std::string skipped;     ///< "Source table skipped "
        bool readsDesign;        ///< from a text copy
        const char* designWord;  ///< behind "Begin " in it; empty for any
        const char* filePrefix;  ///< of the copies
        std::int32_t objectType; ///< in "SaveAsText"
    };
    /// A list of names alone: a table's words are "Loading tables...", "Processing table [" ...
    static Pass PlainPass(SourceItems& items, const char* subType, KeyedList<std::string> names);

    /// The lists that are asked for, in the order in which they are read.
    virtual std::vector<Pass> Passes(CTovimarServerAgent& agent) = 0;
    /// True for names that are no objects of the application's own.
    virtual bool IsPassedOver(CTovimarServerAgent& agent, const std::string& name);

private:
    /// User and used object.
    using Uses = std::vector<std::pair<std::string, std::string>>;

    bool Read(const std::string& path) override;
    void ReadPass(CTovimarServerAgent& agent, const Pass& pass);
    void ReadObject(CTovimarServerAgent& agent, const Pass& pass, const std::string& name, Uses& uses);
    std::string ReadTextCopy(CTovimarServerAgent& agent, const Pass& pass, const std::string& name,
                             Uses& uses) const;
    static void MarkUsed(SourceItems& items, const Uses& uses);

    std::string stamp_;
    std::int32_t maximum_ = 0; ///< of the progress meter
    std::int32_t position_ = 0;
};

} // namespace tovimar
