#pragma once

#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/CXmlCommand.h"
#include "support/FakeEnvironment.h"

#include <map>
#include <string>
#include <vector>

namespace tovimar::test {

/// A connected server whose host answers from a table, a catalogue, and a current project "Shop" in the fresh
/// folder `help\`.
class GenerationTest : public EnvironmentTest {
protected:
    GenerationTest() {
        answers = {{"CurrentSourceProjectLocation", "D:\\Apps\\"},
                   {"CurrentSourceProjectName", "Shop"},
                   {"CurrentSourceProjectFullPath", Path("Shop.accdb")},
                   {"CurrentSourceProjectTypeName", "MS ACCESS"},
                   {"GetSourceProjectsList", "Shop"}};
        server.Connect();
        server.TovimarClientCallBack = [this](const std::string& text) { return Answer(text); };
        Session::SetProjects(&projects);
        projects.Init(Path("projects.xml"));
        auto made = std::make_unique<CAddInProject>();
        made->Name = made->FileName = "Shop";
        made->Folder = Path("help\\");
        made->SourceProjectFullPath = Path("Shop.accdb");
        project = &projects.SetCurrentProject(std::move(made));
        environment->files->MakeFolders(project->Folder);
        Parameters().SetFolderForGeneratedHelp(project->Folder);
        Parameters().SetHelpProjectName("Shop");
        Generator().HelpProjectTree();
    }

    /// The installation's settings and messages; catalogue, project and folder stay those of the test.
    void LoadSettings() {
        server.ServerData()->LoadSettings();
        Session::SetProjects(&projects);
        Parameters().SetFolderForGeneratedHelp(project->Folder);
    }
    CTovimar& Generator() { return server.ServerData()->Generator(); }
    CTovimarParameters& Parameters() { return Generator().Parameters(); }
    std::string HelpFile(const std::string& name) { return ReadFile(project->Folder + name); }
    bool HelpFileExists(const std::string& name) {
        return environment->files->FileExists(project->Folder + name);
    }
    /// As a message box shows a path.
    std::string Native(const std::string& path) { return environment->files->ToNative(path); }
    long Sent(const std::string& command) const { return std::count(sent.begin(), sent.end(), command); }

    /// `RetValue` by command name; a command without an entry gets none.
    std::map<std::string, std::string> answers;
    /// Names of the commands, those of meter and pointer left out.
    std::vector<std::string> sent;
    CTovimarServer server;
    CAddInProjects projects;
    CAddInProject* project = nullptr;

private:
    std::string Answer(const std::string& text) {
        CXmlCommand command;
        command.Deserialize(text);
        const std::string& name = command.Name();
        if (name.find("Meter") == std::string::npos && name.find("Hourglass") == std::string::npos)
            sent.push_back(name);
        command.AddParamValue("RetValue", answers.count(name) != 0 ? answers[name] : "");
        return command.Serialize();
    }
};

} // namespace tovimar::test
