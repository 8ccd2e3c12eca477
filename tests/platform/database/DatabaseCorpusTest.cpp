#include "platform/Environment.h"
#include "platform/access/ApplicationModel.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/Fixtures.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/access/database/Inspection.h"
#include "platform/access/database/TextExport.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <fstream>

namespace tovimar::platform::access {
namespace {

using ::testing::HasSubstr;
using ::testing::IsEmpty;

/// Real databases; designs in them were written by the host itself.
class DatabaseCorpusTest : public ApplicationTest {
protected:
    void SetUp() override {
        if (CorpusFolder().empty())
            GTEST_SKIP() << "The real applications beside the project are absent.";
    }
    static std::vector<std::string> Databases() {
        std::vector<std::string> paths;
        for (const auto* folder : {"/databases", "/access-forms"})
            for (const auto& entry : std::filesystem::directory_iterator(CorpusFolder() + folder))
                if (entry.path().extension() == ".accdb" || entry.path().extension() == ".mdb")
                    paths.push_back(entry.path().string());
        std::sort(paths.begin(), paths.end());
        return paths;
    }
};

void ExpectSame(const DesignObject& left, const DesignObject& right, const std::string& where) {
    EXPECT_EQ(left.type, right.type) << where;
    EXPECT_EQ(left.name, right.name) << where;
    ASSERT_EQ(left.properties.size(), right.properties.size()) << where << " " << left.name;
    for (std::size_t i = 0; i < left.properties.size(); ++i) {
        const auto& [name, value] = left.properties[i];
        EXPECT_EQ(name, right.properties[i].first) << where << " " << left.name;
        EXPECT_EQ(value.text, right.properties[i].second.text) << where << " " << left.name << " " << name;
        EXPECT_EQ(value.form, right.properties[i].second.form) << where << " " << left.name << " " << name;
    }
    ASSERT_EQ(left.children.size(), right.children.size()) << where << " " << left.name;
    for (std::size_t i = 0; i < left.children.size(); ++i)
        ExpectSame(*left.children[i], *right.children[i], where);
}

TEST_F(DatabaseCorpusTest, EveryDesignAgreesWithItself) {
    std::size_t designs = 0;
    std::size_t unknown = 0;
    for (const auto& path : Databases()) {
        DatabaseDesigns database(path);
        for (const auto& object : InspectAll(database)) {
            EXPECT_THAT(object.faults, IsEmpty()) << path << " " << object.name;
            designs += object.objects > 0 ? 1 : 0;
            unknown += object.unknown;
        }
        EXPECT_THAT(database.Code().faults, IsEmpty()) << path;
    }
    EXPECT_GE(designs, 79U);
    EXPECT_LE(unknown, 10U);
}

TEST_F(DatabaseCorpusTest, ExportsReadBackAsTheSameTrees) {
    for (const auto& path : Databases()) {
        std::map<std::string, std::string> files;
        EXPECT_THAT(ExportDatabase(path, [&](const ExportedFile& file) { files[file.path] = file.bytes; }),
                    IsEmpty());
        DatabaseDesigns database(path);
        for (const auto& [kind, folder, extension] : {std::tuple(ObjectKind::Form, "forms/", ".form"),
                                                      std::tuple(ObjectKind::Report, "reports/", ".report"),
                                                      std::tuple(ObjectKind::Macro, "macros/", ".macro")})
            for (const auto& name : database.Names(kind)) {
                const auto where = path + " " + name;
                const auto found = files.find(folder + EncodeObjectName(name) + extension);
                ASSERT_NE(found, files.end()) << where;
                const auto direct = DesignOfTree(database.Tree(kind, name), kind, name, path);
                const auto again = ReadDesign(DecodeExportText(found->second), kind, name, path);
                ExpectSame(*direct->root, *again->root, where);
                ASSERT_EQ(direct->prototypes.size(), again->prototypes.size()) << where;
                for (std::size_t i = 0; i < direct->prototypes.size(); ++i)
                    ExpectSame(*direct->prototypes[i], *again->prototypes[i], where);
            }
    }
}

/// The whole application from its exports answers as the database does.
TEST_F(DatabaseCorpusTest, ExportsAreAnApplicationOfTheirOwn) {
    const auto path = CorpusFolder() + "/access-forms/FormExamples.accdb";
    ExportDatabase(
        path, [&](const ExportedFile& file) { Part(text::ReplaceAll(file.path, "/", "\\"), file.bytes); });
    ApplicationModel exports(NativeApplication());
    ApplicationModel database(path);
    for (const auto kind : {ObjectKind::Form, ObjectKind::Report, ObjectKind::Module})
        EXPECT_EQ(exports.Names(kind), database.Names(kind));
    const auto& form = database.OpenDesign(ObjectKind::Form, "frmCustomers");
    EXPECT_EQ(VisibleCode(exports.OpenDesign(ObjectKind::Form, "frmCustomers").code), VisibleCode(form.code));
    EXPECT_THAT(form.code, HasSubstr("Private Sub Form_"));
    EXPECT_EQ(VisibleCode(*exports.ModuleCode("modKeys")), VisibleCode(*database.ModuleCode("modKeys")));
    EXPECT_EQ(database.ThemeColors().size(), 12U);
}

TEST_F(DatabaseCorpusTest, ExportsWinAndDifferencesAreTold) {
    const auto path = CorpusFolder() + "/databases/vbaV2007.accdb";
    std::filesystem::create_directories(NativeApplication());
    std::filesystem::copy(path, NativeApplication() + "/shop.accdb");
    Part("forms\\Other.form", SmallForm({}));
    ApplicationModel model(NativeApplication());
    EXPECT_EQ(model.Names(ObjectKind::Form), std::vector<std::string>{"Other"});
    EXPECT_EQ(model.Notes(),
              (std::vector<std::string>{
                  "1 form (Form1) of " + NativeApplication() +
                      "/shop.accdb isn't among the exports and left out; export again to document "
                      "the database as it is.",
                  "1 form (Other) of the exports isn't in " + NativeApplication() + "/shop.accdb."}));
    EXPECT_EQ(model.Names(ObjectKind::Module), (std::vector<std::string>{"Class1", "Module1"}));
    EXPECT_THAT(*model.ModuleCode("Module1"), HasSubstr("Hello"));
}

TEST_F(DatabaseCorpusTest, EncryptedOnesAreTold) {
    std::filesystem::create_directories(NativeApplication());
    const auto path = NativeApplication() + "/secret.accdb";
    std::filesystem::copy(CorpusFolder() + "/databases/vbaV2007.accdb", path);
    std::fstream file(path, std::ios::binary | std::ios::in | std::ios::out);
    file.seekp(0x299);
    file.write("\xC8\x00\x04", 3);
    file.close();
    EXPECT_EQ(
        RaisedBy([&] { ApplicationModel model(path); }).text,
        path + ": the database is encrypted with a password, so nothing in it can be read; save it without "
               "one to document it.");
}

TEST_F(DatabaseCorpusTest, DamageInsideADesignIsTold) {
    const auto path = CorpusFolder() + "/databases/vbaV2007.accdb";
    DatabaseDesigns database(path);
    EXPECT_EQ(RaisedBy([&] { database.Tree(ObjectKind::Form, "Gone"); }).text,
              path + ", form Gone: its design isn't in the database.");
    DatabaseDesigns old(CorpusFolder() + "/databases/queryTestV1997.mdb");
    EXPECT_EQ(RaisedBy([&] { old.Tree(ObjectKind::Form, "Any"); }).text,
              old.NativePath() +
                  ", form Any: the database is of 1997 or older, which keeps designs in a form that "
                  "can't be read.");
    EXPECT_EQ(DecodeObjectName(EncodeObjectName("a:b%c\\d/e?.f.")), "a:b%c\\d/e?.f.");
}

} // namespace
} // namespace tovimar::platform::access
