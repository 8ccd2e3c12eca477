#include "platform/files/Paths.h"
#include "support/FakeEnvironment.h"

#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace tovimar::platform {
namespace {

namespace fs = std::filesystem;

class FilesTest : public test::EnvironmentTest {
protected:
    FileSystem& files = *environment->files;

    int FailureOf(const std::function<void()>& operation) {
        try {
            operation();
        } catch (const RaisedError& error) {
            EXPECT_NE(std::string(error.what()).find('/'), std::string::npos) << error.what();
            return error.Number();
        }
        return 0;
    }
};

TEST(PathParts, AreTakenApart) {
    EXPECT_EQ(FolderOf("C:\\a\\b.c.htm"), "C:\\a\\");
    EXPECT_EQ(FolderOf("b.htm"), "");
    EXPECT_EQ(FolderOf("C:b.htm"), "C:\\");
    EXPECT_EQ(FileNameOf("C:\\a\\b.c.htm"), "b.c.htm");
    EXPECT_EQ(FileNameOf("C:\\a\\"), "");
    EXPECT_EQ(FileNameOf("images/b.jpg"), "b.jpg");
    EXPECT_EQ(BaseNameOf("C:\\a.b\\c.d.htm"), "c.d");
    EXPECT_EQ(BaseNameOf("C:\\a.b\\c"), "c");
    EXPECT_EQ(ExtensionOf("C:\\a.b\\c"), "");
    EXPECT_EQ(ExtensionOf("c.HTM"), ".HTM");
    EXPECT_EQ(Join("C:\\a", "b"), "C:\\a\\b");
    EXPECT_EQ(Join("C:\\a\\", "\\b"), "C:\\a\\b");
    EXPECT_EQ(Join("", "b"), "b");
    EXPECT_EQ(WithTrailingBackslash(""), "");
    EXPECT_TRUE(HasDrive("\\\\server\\share"));
    EXPECT_FALSE(HasFolder("a.htm"));
}

TEST(PathPatterns, MatchAsThePlatformDoes) {
    EXPECT_TRUE(MatchesPattern("Form.HTM", "*.htm"));
    EXPECT_TRUE(MatchesPattern("noextension", "*.*"));
    EXPECT_TRUE(MatchesPattern("z1_a.tvp.bak", "z?_*.bak"));
    EXPECT_FALSE(MatchesPattern("a.html", "*.htm"));
    EXPECT_FALSE(MatchesPattern("", "?"));
    EXPECT_TRUE(MatchesPattern("Ёлка.htm", "ё*"));
}

TEST_F(FilesTest, DrivesMapToFolders) {
    EXPECT_EQ(files.ToNative(Path("a\\b.txt")), NativeFolder() + "/a/b.txt");
    EXPECT_EQ(files.FromNative(NativeFolder() + "/a/../b"), Path("b"));
    EXPECT_EQ(files.ToNative("C:\\Help\\x.htm"), NativeFolder() + "/.data/drive_c/Help/x.htm");
    EXPECT_EQ(files.FromNative(NativeFolder() + "/.data/drive_c/Help"), "C:\\Help");
    // Nothing climbs out of the drive.
    EXPECT_EQ(files.ToNative("C:\\..\\..\\etc"), NativeFolder() + "/.data/drive_c/etc");
    EXPECT_FALSE(files.FileExists("D:\\a.txt"));
    EXPECT_EQ(FailureOf([&] { files.MakeFolders("D:/x"); }), 76);
    EXPECT_FALSE(files.FileExists("\\\\server\\share\\a"));
    EXPECT_FALSE(files.FileExists(""));
}

TEST_F(FilesTest, LooksUpWithoutRegardToCase) {
    WriteFile("Images\\Форма.JPG", "x");
    EXPECT_TRUE(files.FileExists(Path("IMAGES\\форма.jpg")));
    EXPECT_EQ(files.ToNative(Path("images\\форма.jpg")), NativeFolder() + "/Images/Форма.JPG");
    // Writing finds the file that stands there in another case.
    files.WriteFile(Path("images\\ФОРМА.jpg"), "y");
    EXPECT_EQ(files.ListFiles(Path("Images"), "*.*"), std::vector<std::string>{"Форма.JPG"});
    EXPECT_EQ(ReadFile(Path("Images\\Форма.JPG")), "y");
    // The exact name wins over another case of it.
    std::ofstream(NativeFolder() + "/Images/форма.jpg") << "lower";
    EXPECT_EQ(ReadFile(Path("Images\\форма.jpg")), "lower");
}

TEST_F(FilesTest, SeesWhatOthersDo) {
    WriteFile("a\\one.txt", "1");
    EXPECT_FALSE(files.FileExists(Path("a\\TWO.txt")));
    WriteFile("a\\Two.txt", "2");
    EXPECT_TRUE(files.FileExists(Path("a\\TWO.txt")));
    files.DeleteFile(Path("a\\TWO.txt"));
    EXPECT_FALSE(files.FileExists(Path("a\\two.txt")));
    fs::remove(NativeFolder() + "/a/one.txt");
    EXPECT_FALSE(files.FileExists(Path("a\\ONE.TXT")));
}

TEST_F(FilesTest, ReplacesFilesWhole) {
    const std::string path = WriteFile("a.txt", "old");
    fs::create_symlink(NativeFolder() + "/a.txt", NativeFolder() + "/link.txt");
    files.WriteFile(Path("link.txt"), std::string("n\0w", 3));
    EXPECT_TRUE(fs::is_symlink(NativeFolder() + "/link.txt"));
    EXPECT_EQ(ReadFile(path), std::string("n\0w", 3));
    EXPECT_EQ(files.ListFiles(Folder(), ".tovimar*").size(), 0U);

    files.OverwriteTail(path, 1, "12345");
    EXPECT_EQ(ReadFile(path), "n12345");
    files.OverwriteTail(path, 2, "x");
    EXPECT_EQ(ReadFile(path), "n1x");
    files.AppendFile(path, "+");
    EXPECT_EQ(files.FileLength(path), 4U);
}

TEST_F(FilesTest, LastingFilesKeepLinkAndRights) {
    const std::string path = Path("new.txt");
    files.WriteFileToDisk(path, "1");
    chmod((NativeFolder() + "/new.txt").c_str(), 0640);
    fs::create_symlink(NativeFolder() + "/new.txt", NativeFolder() + "/link.txt");
    files.WriteFileToDisk(Path("LINK.txt"), "2");
    EXPECT_TRUE(fs::is_symlink(NativeFolder() + "/link.txt"));
    EXPECT_EQ(ReadFile(path), "2");
    struct stat info {};
    EXPECT_EQ(stat((NativeFolder() + "/new.txt").c_str(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777U, 0640U);
    EXPECT_EQ(files.ListFiles(Folder(), "*.*"), (std::vector<std::string>{"link.txt", "new.txt"}));
    EXPECT_EQ(FailureOf([&] { files.WriteFileToDisk(Path("none\\a.txt"), "x"); }), 76);
}

TEST_F(FilesTest, ALockedFolderIsFreeOnceTheLockIsGone) {
    const int other = open(NativeFolder().c_str(), O_RDONLY | O_DIRECTORY);
    {
        const auto lock = files.LockFolder(Folder());
        ASSERT_NE(lock, nullptr);
        EXPECT_NE(flock(other, LOCK_EX | LOCK_NB), 0);
    }
    EXPECT_EQ(flock(other, LOCK_EX | LOCK_NB), 0);
    close(other);
    EXPECT_EQ(files.LockFolder(Path("none")), nullptr);
}

TEST_F(FilesTest, ReadOnlyFilesStand) {
    const std::string path = WriteFile("a.txt", "old");
    chmod((NativeFolder() + "/a.txt").c_str(), 0444);
    EXPECT_TRUE(files.IsReadOnly(path));
    EXPECT_EQ(FailureOf([&] { files.WriteFile(path, "new"); }), 75);
    EXPECT_EQ(FailureOf([&] { files.DeleteFile(path); }), 75);
    EXPECT_EQ(ReadFile(path), "old");
}

TEST_F(FilesTest, FailuresCarryTheirNumbers) {
    const std::string path = WriteFile("a.txt", "x");
    EXPECT_EQ(FailureOf([&] { files.ReadFile(Path("none.txt")); }), 53);
    EXPECT_EQ(FailureOf([&] { files.ReadFile(Path("none\\a.txt")); }), 76);
    EXPECT_EQ(FailureOf([&] { files.WriteFile(Path("none\\a.txt"), "x"); }), 76);
    EXPECT_EQ(FailureOf([&] { files.ReadFile(Folder()); }), 75);
    EXPECT_EQ(FailureOf([&] { files.DeleteFile(Path("none.txt")); }), 53);
    EXPECT_EQ(FailureOf([&] { files.MakeFolders(path); }), 76);
    EXPECT_EQ(FailureOf([&] { files.ListFiles(Path("none"), "*.*"); }), 76);
    WriteFile("b.txt", "y");
    EXPECT_EQ(FailureOf([&] { files.RenameFile(path, Path("B.TXT")); }), 58);
    files.RenameFile(path, Path("A.TXT"));
    EXPECT_EQ(files.ListFiles(Folder(), "?.txt"), (std::vector<std::string>{"A.TXT", "b.txt"}));
    mkfifo((NativeFolder() + "/pipe").c_str(), 0600);
    EXPECT_EQ(FailureOf([&] { files.ReadFile(Path("pipe")); }), 75);
}

TEST_F(FilesTest, ListsInOneOrder) {
    for (const char* name : {"b.htm", "A.htm", "c.HTM", "a1.htm", "x.txt"})
        WriteFile(std::string("l\\") + name, "");
    files.MakeFolders(Path("l\\Sub\\Deeper"));
    EXPECT_EQ(files.ListFiles(Path("l\\"), "*.htm"),
              (std::vector<std::string>{"A.htm", "a1.htm", "b.htm", "c.HTM"}));
    EXPECT_EQ(files.ListFolders(Path("L")), std::vector<std::string>{"Sub"});
}

} // namespace
} // namespace tovimar::platform
