#pragma once

#include "platform/text/Text.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

/// The list of a form's or report's members for code ("TypeInfo" of the object's folder): controls,
/// sections and fields of the record source. It repeats the names of the design, which makes it a check.
namespace tovimar::platform::access {

struct Member {
    std::uint16_t typeId = 0; ///< low byte: the kind of object of the design
    std::uint32_t ordinal = 0;
    std::string identifier; ///< as code calls it
    std::string name;       ///< in the design; the same unless it is no identifier
    bool isField = false;   ///< of the record source; there is no such object in the design
};

struct MemberList {
    std::uint16_t kind = 0; ///< 0x96 form, 0x97 report
    std::vector<Member> members;
};

/// Names are in the code page of the database's language.
/// Raises 0x80040001 "The member list ..." for bytes that end too early or are none.
MemberList ReadMemberList(std::string_view bytes, const text::CodePage& codePage);

} // namespace tovimar::platform::access
