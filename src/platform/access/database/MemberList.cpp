#include "platform/access/database/MemberList.h"

#include "platform/access/database/Bytes.h"

namespace tovimar::platform::access {

namespace {

constexpr std::uint32_t kMagic = 0xACCDEAF7U;
constexpr std::uint16_t kFieldId = 0x1EFF;
/// Custom controls tell their class behind their names.
constexpr std::uint8_t kCustomControl = 0x77;
constexpr std::size_t kCustomControlBytes = 36;

Member ReadMember(ByteReader& reader, const text::CodePage& codePage) {
    Member member;
    member.typeId = reader.U16();
    reader.Skip(2);
    member.ordinal = reader.U32();
    member.identifier = codePage.Decode(reader.ZeroTerminated());
    member.name = codePage.Decode(reader.ZeroTerminated());
    if (member.name.empty())
        member.name = member.identifier;
    member.isField = member.typeId == kFieldId;
    if ((member.typeId & 0xFFU) == kCustomControl)
        reader.Skip(kCustomControlBytes);
    return member;
}

} // namespace

MemberList ReadMemberList(std::string_view bytes, const text::CodePage& codePage) {
    ByteReader reader(bytes, "The member list");
    if (reader.U32() != kMagic)
        reader.Fail("begins with something else");
    MemberList list;
    list.kind = reader.U16() & 0xFFU;
    reader.Skip(6);
    const auto count = reader.U32();
    reader.Skip(16); // the class of the object's module
    for (std::uint32_t i = 0; i < count; ++i)
        list.members.push_back(ReadMember(reader, codePage));
    return list;
}

} // namespace tovimar::platform::access
