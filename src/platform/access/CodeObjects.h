#pragma once

#include "platform/access/AccessSession.h"
#include "platform/access/Collections.h"

#include <string>
#include <vector>

/// The code editor's objects: `VBE.VBProjects(name).VBComponents("Form_Orders").CodeModule`.
namespace tovimar::platform::access {

/// Source lines, counted from 1, without the lines that the editor hides.
class CodeModule : public LateBound<CodeModule> {
public:
    CodeModule(std::string name, const std::string& code);

    std::string ClassName() const override { return "CodeModule"; }
    static const MemberTable<CodeModule>& Members();

private:
    /// Kinds as the editor numbers them: procedure 0, property Let 1, Set 2, Get 3.
    struct Procedure {
        std::string name;
        int kind = 0;
        int start = 0; ///< first line, with the comments above
        int body = 0;  ///< line of the declaration
        int end = 0;   ///< last line
    };
    void FindProcedures();
    int StartOf(int body, int previousEnd) const;
    /// Raises 35 for a procedure that the module doesn't have.
    const Procedure& Demand(const Arguments& arguments) const;

    Value ReadName(const Arguments&) { return name_; }
    Value ReadCountOfLines(const Arguments&) { return static_cast<std::int32_t>(lines_.size()); }
    Value ReadLines(const Arguments& arguments);
    Value ReadProcStartLine(const Arguments& arguments) { return Demand(arguments).start; }
    Value ReadProcBodyLine(const Arguments& arguments) { return Demand(arguments).body; }
    Value ReadProcCountLines(const Arguments& arguments);

    std::string name_;
    std::vector<std::string> lines_;
    std::vector<Procedure> procedures_;
};

/// The editor of a session.
HostObject MakeCodeEditor(const SessionRef& session);

} // namespace tovimar::platform::access
