#include "platform/access/database/Storage.h"
#include "platform/access/Fixtures.h"
#include "platform/access/database/Attachment.h"
#include "platform/access/database/CompoundFile.h"
#include "platform/access/database/MemberList.h"
#include "platform/access/database/VbaProject.h"
#include "platform/database/ByteText.h"

#include <zlib.h>

namespace tovimar::platform::access {
namespace {

std::string NameEntry(std::string_view name, int folder) {
    return "\x04" + std::string(1, static_cast<char>(Wide(name).size() + 4)) + Wide(name) +
           Le32(static_cast<std::uint64_t>(folder));
}

TEST(Storage, NamesLeadToFolders) {
    const auto names = ReadFolderNames(Le32(0) + NameEntry("Orders", 17) + NameEntry("Größe", 3));
    ASSERT_EQ(names.size(), 2U);
    EXPECT_EQ(names[0].name, "Orders");
    EXPECT_EQ(names[0].folder, 17U);
    EXPECT_EQ(names[1].name, "Größe");
    EXPECT_EQ(RaisedBy([] { ReadFolderNames(Le32(0) + "\x04\x02zz"); }).text,
              "The list of names holds an entry without a folder.");
    EXPECT_EQ(RaisedBy([] { ReadFolderNames(Le32(0) + "\x04\x60zz"); }).text,
              "The list of names ends too early.");
}

TEST(Storage, IsWalkedFromItsRoot) {
    const Storage storage({{1, 1, true, "ROOT", {}},
                           {5, 1, true, "Forms", {}},
                           {6, 5, true, "0", {}},
                           {7, 6, false, "Blob", "design"},
                           {8, 9, true, "circle", {}},
                           {9, 8, true, "circle", {}}});
    ASSERT_NE(storage.Find({"forms", "0", "Blob"}), nullptr);
    EXPECT_EQ(storage.Find({"Forms", "0", "Blob"})->bytes, "design");
    EXPECT_EQ(storage.Find({"Forms", "1", "Blob"}), nullptr);
    EXPECT_EQ(storage.Find({"circle"}), nullptr);
    EXPECT_EQ(Storage().Find({"Forms"}), nullptr);
}

MemberList ReadList(std::string_view bytes) {
    return ReadMemberList(bytes, text::CodePage(1252));
}

TEST(MemberList, TellsNamesAndFields) {
    const auto member = [](int id, const char* identifier, const char* name) {
        return Le16(static_cast<std::uint64_t>(id)) + Le16(0) + Le32(0) + identifier + '\0' + name + '\0';
    };
    const std::string head = Le32(0xACCDEAF7) + Le16(0x96) + Le16(0) + Le32(0xFFFFFFFF);
    const auto list =
        ReadList(head + Le32(3) + std::string(16, 'g') + member(0x0D64, "lbl_One", "lbl One") +
                 member(0x1EFF, "Price", "") + member(0x0277, "ocx", "") + std::string(36, 'c'));
    ASSERT_EQ(list.members.size(), 3U);
    EXPECT_EQ(list.members[0].name, "lbl One");
    EXPECT_TRUE(list.members[1].isField);
    EXPECT_EQ(list.members[2].name, "ocx");
    EXPECT_EQ(RaisedBy([&] { ReadList(head + Le32(0xFFFFFFFF) + std::string(16, 'g')); }).text,
              "The member list ends too early.");
    EXPECT_EQ(RaisedBy([] { ReadList("none"); }).text, "The member list begins with something else.");
}

/// The first one is the example of the published description of the format.
TEST(UnpackCode, FollowsItsChunks) {
    constexpr unsigned char kPacked[] = {
        0x01, 0x2F, 0xB0, 0x00, 0x23, 0x61, 0x61, 0x61, 0x62, 0x63, 0x64, 0x65, 0x82, 0x66, 0x00, 0x70, 0x61,
        0x67, 0x68, 0x69, 0x6A, 0x01, 0x38, 0x08, 0x61, 0x6B, 0x6C, 0x00, 0x30, 0x6D, 0x6E, 0x6F, 0x70, 0x06,
        0x71, 0x02, 0x70, 0x04, 0x10, 0x72, 0x73, 0x74, 0x75, 0x76, 0x10, 0x77, 0x78, 0x79, 0x7A, 0x00, 0x3C};
    EXPECT_EQ(UnpackCode({reinterpret_cast<const char*>(kPacked), sizeof kPacked}),
              "#aaabcdefaaaaghijaaaaaklaaamnopqaaaaaaaaaaaarstuvwxyzaaa");
    const std::string plain(4096, 'x');
    EXPECT_EQ(UnpackCode("\x01" + Le16(0x3FFF) + plain), plain);
    const auto reason = [](const std::string& packed) {
        return RaisedBy([&] { UnpackCode(packed, 20000); }).text;
    };
    EXPECT_EQ(reason("\x02"), "The code isn't packed in a known way.");
    EXPECT_EQ(reason("\x01" + Le16(0xB002) + "\x01" + Le16(0x0000)), "The code goes back before its start.");
    // One letter and copies of it, as far as a chunk lets them go: little that unpacks to much.
    const std::string bomb = Le16(0xB003) + "\x02x" + Le16(0x0FFC);
    std::string many = "\x01";
    for (int i = 0; i < 1000; ++i)
        many += bomb;
    EXPECT_EQ(reason(many), "The code unpacks to more than 20000 bytes.");
}

std::string Directory(const std::string& modules) {
    const auto record = [](int id, const std::string& value) {
        return Le16(static_cast<std::uint64_t>(id)) + Le32(value.size()) + value;
    };
    return record(3, Le16(1250)) + record(4, "Shop") + Le16(9) + Le32(4) + "abcdef" + modules +
           record(0x10, "");
}

TEST(VbaProject, ModulesComeInTheirCodePage) {
    const auto record = [](int id, const std::string& value) {
        return Le16(static_cast<std::uint64_t>(id)) + Le32(value.size()) + value;
    };
    const auto packed = [](const std::string& plain) {
        std::string padded = plain;
        padded.resize(4096, ' ');
        return "\x01" + Le16(0x3FFF) + padded;
    };
    const auto dir = Directory(record(0x19, "Form_Orders") + record(0x47, Wide("Form_Orders")) +
                               record(0x1A, "AAA") + record(0x32, Wide("AAA")) + record(0x31, Le32(2)) +
                               record(0x22, "") + record(0x19, "Lost") + record(0x1A, "BBB"));
    const Storage storage({{1, 1, true, "ROOT", {}},
                           {2, 1, true, "VBA", {}},
                           {3, 2, true, "VBAProject", {}},
                           {4, 3, true, "VBA", {}},
                           {5, 4, false, "dir", packed(dir)},
                           {6, 4, false, "AAA",
                            "??" + packed("' \xA3\xF3"
                                          "d\x9F")}});
    const auto project = ReadVbaProject(storage);
    EXPECT_EQ(project.name, "Shop");
    ASSERT_EQ(project.modules.size(), 1U);
    EXPECT_EQ(project.modules[0].name, "Form_Orders");
    EXPECT_TRUE(project.modules[0].isClass);
    EXPECT_EQ(text::TrimWhitespace(project.modules[0].source), "' Łódź");
    EXPECT_EQ(project.faults, std::vector<std::string>{"Lost: The code is missing."});
    EXPECT_TRUE(ReadVbaProject(Storage()).modules.empty());
}

/// A file of 512-byte sectors: table, directory, small sectors and their table, one stream in each size.
std::string CompoundBytes() {
    const auto entry = [](std::string_view name, int type, std::uint64_t left, std::uint64_t child, int start,
                          int size) {
        auto wide = Wide(name);
        const auto length = Le16(wide.size() + 2);
        wide.resize(64);
        return wide + length + static_cast<char>(type) + '\0' + Le32(left) + Le32(0xFFFFFFFF) + Le32(child) +
               std::string(36, '\0') + Le32(static_cast<std::uint64_t>(start)) +
               Le32(static_cast<std::uint64_t>(size)) + Le32(0);
    };
    std::string header = "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1" + std::string(16, '\0') + Le16(0x3E) + Le16(3) +
                         Le16(0xFFFE) + Le16(9) + Le16(6) + std::string(10, '\0') + Le32(1) + Le32(1) +
                         Le32(0) + Le32(4096) + Le32(2) + Le32(1) + Le32(0xFFFFFFFE) + Le32(0) + Le32(0);
    for (int i = 1; i < 109; ++i)
        header += Le32(0xFFFFFFFF);
    std::string table = Le32(0xFFFFFFFD) + Le32(0xFFFFFFFE) + Le32(0xFFFFFFFE) + Le32(0xFFFFFFFE);
    for (int i = 4; i < 128; ++i)
        table += Le32(i < 11 ? static_cast<std::uint64_t>(i) + 1 : i == 11 ? 0xFFFFFFFE : 0xFFFFFFFF);
    const std::string directory = entry("Root", 5, 0xFFFFFFFF, 1, 3, 128) + entry("Forms", 1, 3, 2, 0, 0) +
                                  entry("Blob", 2, 0xFFFFFFFF, 0xFFFFFFFF, 0, 70) +
                                  entry("Large", 2, 0xFFFFFFFF, 0xFFFFFFFF, 4, 4096);
    std::string smallTable = Le32(1) + Le32(0xFFFFFFFE);
    smallTable.resize(512, '\xFF');
    std::string smallSectors = std::string(70, 's');
    smallSectors.resize(512);
    return header + table + directory + smallTable + smallSectors + std::string(4096, 'L');
}

TEST(CompoundFile, GivesItsTree) {
    const auto bytes = CompoundBytes();
    const Storage storage(ReadCompoundFile(bytes));
    ASSERT_NE(storage.Find({"Forms", "Blob"}), nullptr);
    EXPECT_EQ(storage.Find({"Forms", "Blob"})->bytes, std::string(70, 's'));
    ASSERT_NE(storage.Find({"Large"}), nullptr);
    EXPECT_EQ(storage.Find({"Large"})->bytes, std::string(4096, 'L'));
}

TEST(CompoundFile, CirclesAndLiesEnd) {
    EXPECT_EQ(RaisedBy([] { ReadCompoundFile("none"); }).text, "The compound file ends too early.");
    const auto sound = CompoundBytes();
    for (std::size_t i = 0; i < 2048; i += 4)
        for (const auto value : {std::uint64_t{0}, std::uint64_t{1}, std::uint64_t{0x7FFFFFF0}}) {
            auto damaged = sound;
            damaged.replace(i, 4, Le32(value));
            try {
                std::size_t total = 0;
                for (const auto& node : ReadCompoundFile(damaged))
                    total += node.bytes.size();
                EXPECT_LE(total, sound.size());
            } catch (const RaisedError&) {
                continue;
            }
        }
}

TEST(Attachment, IsUnpacked) {
    const std::string content = Le32(20) + Le32(1) + Le32(4) + Wide("png") + std::string(2, '\0') + "PICTURE";
    std::string packed(compressBound(content.size()), '\0');
    auto length = static_cast<uLongf>(packed.size());
    compress(reinterpret_cast<Bytef*>(packed.data()), &length, reinterpret_cast<const Bytef*>(content.data()),
             static_cast<uLong>(content.size()));
    packed.resize(length);
    EXPECT_EQ(AttachmentContent(Le32(1) + Le32(content.size()) + packed), "PICTURE");
    EXPECT_EQ(AttachmentContent(Le32(0) + Le32(content.size()) + content), "PICTURE");
    EXPECT_EQ(AttachmentContent(Le32(1) + Le32(0xFFFFFFF0) + packed), "");
    EXPECT_EQ(AttachmentContent("x"), "");
}

} // namespace
} // namespace tovimar::platform::access
