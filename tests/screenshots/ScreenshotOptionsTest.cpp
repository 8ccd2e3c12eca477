#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/CXmlCommand.h"
#include "screenshots/clsScreenshotOptions.h"
#include "screenshots/frmScreenshotOK.h"
#include "screenshots/frmScreenshotOptions.h"
#include "support/FakeEnvironment.h"

namespace tovimar::test {
namespace {

using Options = clsScreenshotOptions;

/// A project in `help\` and a host whose active object is the form "Orders".
class ScreenshotOptionsTest : public EnvironmentTest {
protected:
    ScreenshotOptionsTest() {
        server.Connect();
        server.TovimarClientCallBack = [this](const std::string& text) { return Answer(text); };
        server.ServerData()->LoadSettings();
        WriteFile("help\\images\\a.jpg", "");
        auto project = std::make_unique<CAddInProject>();
        project->Folder = Path("help");
        project->PicsSubfolderName = "images";
        Session::SetProjects(&catalogue);
        catalogue.SetCurrentProject(std::move(project));
        Session::SetSettings(&settings);
    }
    ~ScreenshotOptionsTest() override {
        Options::ShowDialog = nullptr;
        frmScreenshotOK::ShowDialog = nullptr;
        Session::SetSettings(nullptr);
        Session::SetProjects(nullptr);
        server.Disconnect();
    }

    std::string Answer(const std::string& text) {
        CXmlCommand command;
        command.Deserialize(text);
        if (command.Name() == "TakeScreenshot" || command.Name() == "ShowToolbar")
            sent.push_back(text);
        const std::string& name = command.Name();
        command.AddParamValue("RetValue", name == "ActiveObjectName"    ? active
                                          : name == "CurrentObjectType" ? "2"
                                                                        : "True");
        return command.Serialize();
    }
    frmScreenshotOptions Opened(std::uint8_t mode = Options::kTakeScreenshot) {
        options.OpenMode = mode;
        frmScreenshotOptions form(options);
        form.SetLoadTimeValues();
        return form;
    }
    std::string NewFolder(const std::string& name) {
        environment->files->MakeFolders(Path(name));
        return Path(name);
    }

    CTovimarServer server;
    CAddInProjects catalogue;
    CAddInSettingsXmlFile settings;
    Options options;
    std::string active = "Orders";
    std::vector<std::string> sent;
};

TEST_F(ScreenshotOptionsTest, PlacesAreTheProjectsUntilTheUserHasHisOwn) {
    EXPECT_EQ(options.DirToSaveImages(), Path("help\\images\\"));
    EXPECT_EQ(options.DirToSaveHTML(), Path("help"));
    options.SetDirToSaveImages(Path("own"));
    options.SetDirToSaveHTML(Path("other"));
    EXPECT_EQ(options.DirToSaveImages(), Path("help\\images\\"));
    options.UserControlledScreenshotLocation = true;
    EXPECT_EQ(options.DirToSaveImages(), Path("own"));
    EXPECT_EQ(options.DirToSaveHTML(), Path("own"));
    EXPECT_TRUE(environment->files->FolderExists(Path("own")));

    const std::pair<std::string, std::string> cases[] = {{"HELP", "HELP\\Screenshots"},
                                                         {"help\\", "help\\Screenshots"},
                                                         {"help\\Images", "help\\Images"},
                                                         {"help\\notimages", "help\\notimages"}};
    for (const auto& [given, kept] : cases) {
        options.SetDirToSaveImages(Path(given));
        EXPECT_EQ(options.DirToSaveImages(), Path(kept));
    }
    catalogue.CurrentProject()->Folder = NewFolder("work\\screenshots");
    options.SetDirToSaveImages(Path("work\\Screenshots"));
    EXPECT_EQ(options.DirToSaveImages(), Path("work\\Screenshots")) << "it is one already";
}

TEST_F(ScreenshotOptionsTest, TheProjectsPicturesDecideTheType) {
    EXPECT_EQ(options.ActiveProjectImageType(), Options::kJpeg);
    WriteFile("help\\images\\b.bmp", "");
    EXPECT_EQ(options.ActiveProjectImageType(), Options::kJpeg) << "as many of either";
    WriteFile("help\\images\\c.BMP", "");
    EXPECT_EQ(options.ActiveProjectImageType(), Options::kBitmap);
    EXPECT_EQ(options.CapturedImageFileName(), options.DefaultFileName() + ".bmp");
    EXPECT_EQ(options.HTMLFileName(), options.DefaultFileName() + ".htm");
    active.clear();
    EXPECT_EQ(options.CapturedImageFileName(), "");
    EXPECT_EQ(options.HTMLFileName(), "");
    options.SetDefaultFileNames(Options::kJpeg, "Shop");
    EXPECT_EQ(options.CapturedImageFileName() + " " + options.HTMLFileName(), "Shop.jpg Shop.htm");
    Session::Parameters()->ImagesFormat = 1;
    options.SetDefaultFileNames(Options::kRunFormat, "Shop");
    EXPECT_EQ(options.CapturedImageFileName(), "Shop.bmp");
    catalogue.SetCurrentProject(nullptr);
    EXPECT_EQ(options.ActiveProjectImageType(), Options::kBitmap);
}

TEST_F(ScreenshotOptionsTest, TheDialogOffersWhatCanBeSet) {
    options.GenerateHTML = true;
    auto form = Opened(Options::kOptionsOnly);
    EXPECT_EQ(form.cmdOK.caption, "OK");
    EXPECT_EQ(form.txtImagesFolder.text, Path("help\\images\\"));
    EXPECT_EQ(form.txtHTMLFolder.text, Path("help"));
    EXPECT_TRUE(form.optJpeg.chosen);
    for (const dialog::Control* control :
         {static_cast<dialog::Control*>(&form.txtImagesFolder),
          static_cast<dialog::Control*>(&form.txtHTMLFolder),
          static_cast<dialog::Control*>(&form.cmdBrowseImages),
          static_cast<dialog::Control*>(&form.cmdBrowseHTML), static_cast<dialog::Control*>(&form.optBitmap),
          static_cast<dialog::Control*>(&form.txtImageFileName),
          static_cast<dialog::Control*>(&form.txtHTMLFileName)})
        EXPECT_FALSE(control->enabled) << control->caption;
    EXPECT_FALSE(form.cmdBrowseImages.visible);
    EXPECT_TRUE(form.txtImagesFolder.widened);

    form.UserLocationClick(true);
    EXPECT_TRUE(form.cmdBrowseHTML.enabled && form.cmdBrowseHTML.visible && form.optBitmap.enabled);
    EXPECT_FALSE(form.txtHTMLFolder.widened);
    EXPECT_EQ(form.txtImagesFolder.text, Path("help\\images\\")) << "kept";
    form.txtImagesFolder.text = "elsewhere";
    form.PictureTypeClick(Options::kBitmap);
    form.UserLocationClick(false);
    EXPECT_EQ(form.txtImagesFolder.text, Path("help\\images\\"));
    EXPECT_TRUE(form.optJpeg.chosen);

    form.GenerateHTMLClick(false);
    EXPECT_EQ(form.txtHTMLFolder.text + form.txtHTMLFileName.text, "");
    EXPECT_EQ(Opened().cmdOK.caption, "Take screenshot");

    options.ScreenshotOptionsDefined = options.UserControlledScreenshotLocation = true;
    options.SetDefaultFileNames(Options::kBitmap, "Mine");
    options.SetHTMLFileName("Page.htm");
    auto own = Opened();
    EXPECT_EQ(own.txtImageFileName.text + " " + own.txtHTMLFileName.text, "Mine.bmp Page.htm");
    EXPECT_TRUE(own.optBitmap.chosen);
}

TEST_F(ScreenshotOptionsTest, NamesFollowEachOther) {
    options.GenerateHTML = true;
    auto form = Opened();
    form.UserLocationClick(true);
    form.ImageFileNameChange("Shop.x");
    EXPECT_EQ(form.txtImageFileName.text + " " + form.txtHTMLFileName.text, "Shop.jpg Shop.htm");
    form.PictureTypeClick(Options::kBitmap);
    EXPECT_EQ(form.txtImageFileName.text + " " + form.txtHTMLFileName.text, "Shop.bmp Shop.htm");
    form.ImageFileNameChange("");
    EXPECT_EQ(form.txtImageFileName.text + form.txtHTMLFileName.text, "");
    auto optionsOnly = Opened(Options::kOptionsOnly);
    optionsOnly.ImageFileNameChange("Shop.x");
    EXPECT_EQ(optionsOnly.txtImageFileName.text, "Shop.x");
}

TEST_F(ScreenshotOptionsTest, WhatIsWrongIsToldAtOnce) {
    options.GenerateHTML = true;
    auto form = Opened();
    form.UserLocationClick(true);
    form.txtImagesFolder.text.clear();
    form.txtHTMLFolder.text = Path("nowhere");
    form.ImageFileNameChange("");
    form.OKClick();
    EXPECT_FALSE(form.Closed());
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].title, "Tovimar Add-In");
    EXPECT_EQ(boxes->shown[0].text, "Undefined directory for saved images.\r\n\r\n"
                                    "Nonexistent directory for generated HTML.\r\n\r\n"
                                    "Undefined filename for screenshot image.\r\n\r\n"
                                    "Undefined filename for generated HTML.");
    form.txtImagesFolder.text = Path("HELP\\images");
    form.txtHTMLFolder.text = NewFolder("own");
    form.ApplyClick();
    ASSERT_EQ(boxes->shown.size(), 2U);
    EXPECT_EQ(boxes->shown[1].text,
              "The folder for screenshot images \r\ncan't be the same as the folders \r\n"
              "for generated HTML and/or images.");
    EXPECT_FALSE(options.UserControlledScreenshotLocation) << "nothing was taken over";
}

TEST_F(ScreenshotOptionsTest, ValuesAreStoredAndComeBack) {
    SetInstallation(NewFolder("install") + "\\");
    NewFolder("install\\Settings");
    NewFolder("own");
    std::string asked;
    Options::ShowDialog = [&](frmScreenshotOptions& form) {
        form.UserLocationClick(true);
        form.BrowseForFolder = [&](const std::string& title, const std::string&) {
            asked += title + "\n";
            return Path("own");
        };
        form.BrowseImagesClick();
        form.BrowseHTMLClick();
        form.chkShowScreenshotSucceededDlg.checked = false;
        form.PictureTypeClick(Options::kBitmap);
        form.ApplyClick();
        EXPECT_FALSE(form.Closed());
        form.OKClick();
        EXPECT_TRUE(form.Closed());
    };
    ASSERT_TRUE(options.GetOptions(Options::kOptionsOnly)) << boxes->shown.size();
    EXPECT_EQ(asked, "Select folder for screenshot images\nSelect folder for generated HTML files\n");
    EXPECT_TRUE(options.ScreenshotOptionsDefined);
    EXPECT_EQ(Session::Parameters()->ImagesFormat, 1);

    CAddInSettingsXmlFile stored;
    ASSERT_EQ(stored.Load(UserSettingsFile(), false), kSuccess);
    Options loaded;
    loaded.Load(stored);
    EXPECT_TRUE(loaded.UserControlledScreenshotLocation);
    EXPECT_FALSE(loaded.ShowScreenshotSucceededDlg);
    EXPECT_EQ(loaded.DirToSaveImages(), Path("own"));
    EXPECT_EQ(loaded.PictureSaveType, Options::kBitmap);

    Options::ShowDialog = [](frmScreenshotOptions& form) { form.CancelClick(); };
    EXPECT_FALSE(options.GetOptions(Options::kOptionsOnly));
    Options::ShowDialog = nullptr;
    EXPECT_FALSE(options.GetOptions(Options::kOptionsOnly)) << "nobody pressed OK";
}

TEST_F(ScreenshotOptionsTest, TheActionTakesTheActiveObjectAndKeepsItsTopic) {
    CTovimarActions actions;
    auto& chosen = actions.ScreenshotOptions();
    chosen.GenerateHTML = true;
    const std::string topic = chosen.DefaultFileName() + ".htm";
    WriteFile("help\\" + topic, "old");
    std::string shown;
    frmScreenshotOK::ShowDialog = [&](frmScreenshotOK& form) {
        shown = form.URL();
        EXPECT_TRUE(form.RecompileButtonVisible() && form.lblRecompile.visible);
        processes->canOpen = false;
        form.URLClick();
        form.RecompileClick();
        EXPECT_TRUE(form.OK() && form.Closed());
    };
    ASSERT_TRUE(actions.TakeScreenshotAction());
    ASSERT_EQ(sent.size(), 2U);
    EXPECT_NE(sent[0].find("<cmd name=\"TakeScreenshot\"><params ObjType=\"2\" ObjName=\"Orders\""),
              std::string::npos);
    EXPECT_NE(sent[1].find("ToolbarName=\"Vasmora Screenshot\""), std::string::npos);
    EXPECT_EQ(shown, Path("help\\" + topic));
    EXPECT_EQ(ReadFile(Path("help\\" + chosen.DefaultFileName() + "_20260102.htm")), "old");
    ASSERT_FALSE(boxes->shown.empty());
    EXPECT_EQ(boxes->shown.front().text,
              "Please open your browser to :\r\n" + environment->files->ToNative(shown));
    EXPECT_EQ(boxes->shown.back().text, "HTML help workshop is not installed.");

    active.clear();
    EXPECT_FALSE(actions.TakeScreenshotAction());
    EXPECT_EQ(boxes->shown.back().text, "There is no active object.\r\n"
                                        "(Your form may have Popup property set to True, set it to False.)");
    catalogue.SetCurrentProject(nullptr);
    EXPECT_FALSE(actions.TakeScreenshot(2, "Orders"));
    EXPECT_EQ(boxes->shown.back().text,
              "HTML Help project was not yet generated, compiled or opened in HTML Editor.");
}

} // namespace
} // namespace tovimar::test
