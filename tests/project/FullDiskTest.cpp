#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CTraceLog.h"
#include "platform/xml/XmlDocument.h"
#include "project/ProjectTest.h"
#include "support/SmallDisk.h"
#include "topics/clsHTMLFile.h"

#include <filesystem>
#include <sys/stat.h>

/// What can't be saved, on a full disk or over a read-only file: a message tells, the old file stands, and
/// nothing else is left behind.
namespace tovimar::test {
namespace {

/// One kind of file that the system keeps for its user; `round` makes each saving a different one.
struct Saver {
    std::string name;
    std::function<ResultCode(const std::string& path, int round)> save;
};

class NothingIsLostTest : public ProjectTest {
protected:
    NothingIsLostTest() {
        LoadTree("<TovimarProject><Project key='root' title='Root'/></TovimarProject>");
        environment->files->MakeFolders(Path("disk"));
        savers = {{"settings.xml",
                   [this](const std::string& path, int round) {
                       settings.SetOptionValue("Author", "Author " + std::to_string(round));
                       return settings.Save(path);
                   }},
                  {"page.htm",
                   [](const std::string& path, int round) {
                       clsHTMLFile page;
                       page.HTML = "<html><head><title></title></head><body></body></html>";
                       page.Title = "Page " + std::to_string(round);
                       return page.Save(path);
                   }},
                  {"shop.tvp",
                   [this](const std::string& path, int round) {
                       return tree.SaveXml(path, /*vfSkipSerializers=*/true,
                                           "SUID = \"" + std::to_string(round) + "\" ");
                   }},
                  {"catalogue.xml", [this](const std::string& path, int round) {
                       CAddInProjects catalogue;
                       catalogue.Init(path);
                       const std::string name = "P" + std::to_string(round);
                       WriteFile("p\\" + name + ".tvp", "<TovimarProject><Project/></TovimarProject>");
                       auto listed = std::make_unique<CAddInProject>();
                       listed->Name = listed->FileName = name;
                       listed->Folder = Path("p");
                       catalogue.Add(std::move(listed));
                       return catalogue.Save();
                   }}};
    }

    std::vector<std::string> Files() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(NativeFolder() + "/disk"))
            if (entry.path().filename() != "filler")
                names.push_back(entry.path().filename().string());
        std::sort(names.begin(), names.end());
        return names;
    }

    /// Saves twice; then `hinder`s the third saving, which must fail without harm, and the fourth goes well.
    void ExpectNoHarm(const Saver& saver, const std::function<void()>& hinder,
                      const std::function<void()>& relieve) {
        SCOPED_TRACE(saver.name);
        const std::string path = Path("disk\\" + saver.name);
        ASSERT_EQ(saver.save(path, 1), kSuccess);
        ASSERT_EQ(saver.save(path, 2), kSuccess);
        const std::string before = ReadFile(path);
        const auto files = Files();
        boxes->shown.clear();
        hinder();
        EXPECT_NE(saver.save(path, 3), kSuccess);
        ASSERT_FALSE(boxes->shown.empty());
        EXPECT_NE(boxes->shown[0].text.find(NativeFolder() + "/disk/" + saver.name), std::string::npos)
            << boxes->shown[0].text;
        EXPECT_EQ(ReadFile(path), before);
        EXPECT_EQ(Files(), files);
        relieve();
        EXPECT_EQ(saver.save(path, 4), kSuccess);
        EXPECT_NE(ReadFile(path), before);
    }

    std::vector<Saver> savers;
    CAddInSettingsXmlFile settings;
};

TEST_F(NothingIsLostTest, OnAFullDisk) {
    SmallDisk disk(NativeFolder() + "/disk");
    if (!disk.Mounted())
        GTEST_SKIP() << "mounting a small disk takes the rights of root";
    for (const Saver& saver : savers) {
        ExpectNoHarm(
            saver, [&] { disk.Fill(); }, [&] { disk.Free(); });
        EXPECT_NE(boxes->shown[0].text.find("Error 61: Disk full"), std::string::npos)
            << boxes->shown[0].text;
    }
}

TEST_F(NothingIsLostTest, OverAReadOnlyFile) {
    for (const Saver& saver : savers) {
        const std::string native = NativeFolder() + "/disk/" + saver.name;
        ExpectNoHarm(
            saver, [&] { chmod(native.c_str(), 0440); }, [&] { chmod(native.c_str(), 0640); });
        EXPECT_NE(boxes->shown[0].text.find("Error 75: Path/File access error"), std::string::npos)
            << boxes->shown[0].text;
        struct stat info {};
        EXPECT_EQ(stat(native.c_str(), &info), 0);
        EXPECT_EQ(info.st_mode & 0777U, 0640U) << "the rights of the file are kept";
    }
}

TEST_F(NothingIsLostTest, TheTraceStaysReadableWhenTheDiskRunsFull) {
    SmallDisk disk(NativeFolder() + "/disk");
    if (!disk.Mounted())
        GTEST_SKIP() << "mounting a small disk takes the rights of root";
    WriteFile("disk\\trace.txt", "");
    CTraceLog log(Path("disk\\"));
    log.addMessage("first");
    disk.Fill();
    for (int i = 0; i < 100; ++i)
        log.addMessage(std::string(100, 'x'), /*vfIsErrMessage=*/true);
    for (const char* name : {"trace.xml", "tracedErrors.xml"}) {
        XmlDocument document;
        EXPECT_TRUE(document.load(Path(std::string("disk\\") + name))) << document.parseError().reason;
    }
    EXPECT_TRUE(boxes->shown.empty());
}

} // namespace
} // namespace tovimar::test
