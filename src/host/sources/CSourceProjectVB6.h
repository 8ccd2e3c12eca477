#pragma once

#include "host/sources/SourceProjectLists.h"

#include <string>
#include <string_view>

namespace tovimar {

/// A project of Visual Basic 6: a text file whose lines "Form=", "UserControl=" and "UserDocument=" name the
/// files of its forms. A file that isn't there, or that holds no such object, is passed over.
class CSourceProjectVB6 : public SourceProjectLists {
public:
    CSourceProjectVB6();

private:
    struct FormKind;
    struct FormHead;

    /// Raises what reading the project's file raises.
    bool Read(const std::string& path) override;
    void ReadForm(const FormKind& kind, const std::string& path);
    static FormHead ReadHead(const FormKind& kind, std::string_view text);
};

} // namespace tovimar
