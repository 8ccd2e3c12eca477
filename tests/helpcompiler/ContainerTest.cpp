#include "helpcompiler/Container.h"
#include "Tools.h"
#include "helpcompiler/Lzx.h"

#include <gtest/gtest.h>

#include <random>

using namespace tovimar::helpcompiler;

namespace {

enum class Kind { Random, Text, Zeros, Repeated };

std::string Filling(Kind kind, std::size_t size, unsigned seed) {
    std::minstd_rand random(seed);
    std::string bytes;
    while (bytes.size() < size) {
        if (kind == Kind::Random)
            bytes.push_back(static_cast<char>(random() >> 7U));
        else if (kind == Kind::Text)
            bytes += "word" + std::to_string(random() % 300) + (random() % 9 == 0 ? ".\r\n" : " ");
        else if (kind == Kind::Zeros)
            bytes.resize(size, '\0');
        else
            bytes += "<td class=\"field\">" + std::string(random() % 40, 'x') + "</td>";
    }
    bytes.resize(size);
    return bytes;
}

} // namespace

/// Each size with others around it, those at the ends of frames alone too, read back by readers that share no
/// code with us.
TEST(ContainerTest, GivesBackWhatWentIn) {
    const Folder folder;
    std::vector<std::size_t> sizes{0,     1,     2,     3,     100,   32765, 32766,
                                   32767, 32768, 32769, 65535, 65536, 65537, 200000};
    for (std::size_t size = 5000; size < 200000; size += 13331)
        sizes.push_back(size);
    for (const Kind kind : {Kind::Random, Kind::Text, Kind::Zeros, Kind::Repeated}) {
        Container all(0x409, 0);
        for (const std::size_t size : sizes) {
            const std::string bytes = Filling(kind, size, static_cast<unsigned>(size));
            all.Add("/" + std::to_string(size) + ".bin", bytes);
            if (size % kLzxFrame > 2 && size % kLzxFrame < kLzxFrame - 3)
                continue;
            Container alone(0x409, 0);
            alone.Add("/a.bin", bytes);
            folder.Write("alone" + std::to_string(size) + ".chm", alone.Finish());
        }
        EXPECT_TRUE(folder.Run("7z t 'alone*.chm'")) << static_cast<int>(kind) << folder.Read("printed");
        folder.Write("all.chm", all.Finish());
        ASSERT_TRUE(folder.Run("rm -rf seven other && 7z x -oseven all.chm && extract_chmLib all.chm other"));
        for (const std::size_t size : sizes) {
            const std::string bytes = Filling(kind, size, static_cast<unsigned>(size));
            EXPECT_EQ(folder.Read("seven/" + std::to_string(size) + ".bin") == bytes, true) << size;
            EXPECT_EQ(folder.Read("other/" + std::to_string(size) + ".bin") == bytes, true) << size;
        }
    }
}

TEST(ContainerTest, HoldsThousandsOfNames) {
    const Folder folder;
    Container container(0x409, 0);
    const auto nameOf = [](int i) {
        return "/folder_" + std::to_string(i % 7) + "/Some_Longer Name" + std::to_string(i) + ".htm";
    };
    for (int i = 0; i < 6500; ++i)
        ASSERT_TRUE(container.Add(nameOf(i), std::to_string(i)));
    EXPECT_FALSE(container.Add(nameOf(5), "again"));
    EXPECT_FALSE(container.Add("/" + std::string(2000, 'x'), ""));
    folder.Write("many.chm", container.Finish());
    ASSERT_TRUE(folder.Run("7z t many.chm && extract_chmLib many.chm out"));
    for (int i = 0; i < 6500; i += 11)
        EXPECT_EQ(folder.Read("out" + nameOf(i)), std::to_string(i));
}

/// A chunk of the directory holds few names of 260 characters, so the chunks stand in many levels.
TEST(ContainerTest, HoldsFiftyThousandLongNames) {
    const Folder folder;
    Container container(0x409, 0);
    const auto nameOf = [](int i) {
        const std::string number = std::to_string(i);
        return "/" + std::string(150, 'd') + "/" + number + std::string(109 - number.size(), 'n');
    };
    for (int i = 0; i < 50000; ++i)
        ASSERT_TRUE(container.Add(nameOf(i), i % 3 == 0 ? "" : std::to_string(i)));
    folder.Write("many.chm", container.Finish());
    ASSERT_TRUE(folder.Run("7z t many.chm")) << folder.Read("printed");
    EXPECT_NE(folder.Read("printed").find("Files: 50000"), std::string::npos) << folder.Read("printed");
    ASSERT_TRUE(folder.Run("7z x -r -oout many.chm '*99nnn*'"));
    for (const int i : {1099, 25099, 49999})
        EXPECT_EQ(folder.Read("out" + nameOf(i)), i % 3 == 0 ? "" : std::to_string(i));
}

TEST(ContainerTest, IsTheSameOnAnyNumberOfThreads) {
    std::string last;
    for (const unsigned threads : {1U, 2U, 7U}) {
        Container container(0x409, 5, threads);
        for (unsigned i = 0; i < 40; ++i)
            container.Add("/" + std::to_string(i), Filling(Kind::Text, 30000, i));
        const std::string bytes = container.Finish();
        EXPECT_TRUE(last.empty() || bytes == last);
        last = bytes;
    }
}
