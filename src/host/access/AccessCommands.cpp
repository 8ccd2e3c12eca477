#include "host/access/AccessCommands.h"

#include "host/access/AccessCatalogue.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/access/clsScreenShotToolbar.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CXmlCommand.h"
#include "platform/Error.h"
#include "platform/text/Text.h"

#include <unordered_map>

namespace tovimar {
namespace {

using Handler = void (*)(CN_IDEAccContext& context, CXmlCommand& command);

std::string Text(const CXmlCommand& command, const char* name) {
    return command.GetParamValue(name);
}

std::int32_t Number(const CXmlCommand& command, const char* name) {
    const std::string value = text::TrimWhitespace(command.GetParamValue(name));
    return value.empty() ? 0 : Value(value).AsInteger();
}

bool Flag(const CXmlCommand& command, const char* name) {
    const std::string value = text::TrimWhitespace(command.GetParamValue(name));
    return !value.empty() && Value(value).AsBoolean();
}

void Answer(CXmlCommand& command, const std::string& value) {
    command.AddParamValue("RetValue", value);
}
void Answer(CXmlCommand& command, bool value) {
    Answer(command, std::string(value ? "True" : "False"));
}
void Answer(CXmlCommand& command, std::int32_t value) {
    Answer(command, std::to_string(value));
}

template <auto Question> void Ask(CN_IDEAccContext& context, CXmlCommand& command) {
    Answer(command, (context.*Question)());
}

template <auto Operation> void Do(CN_IDEAccContext& context, CXmlCommand&) {
    (context.*Operation)();
}

void DoNothing(CN_IDEAccContext&, CXmlCommand&) {}
void AnswerFalse(CN_IDEAccContext&, CXmlCommand& command) {
    Answer(command, false);
}

template <access_catalogue::Catalogue Kind> void AskList(CN_IDEAccContext& context, CXmlCommand& command) {
    Answer(command, access_catalogue::NamesList(context.IDE(), Kind));
}

template <auto Description> void AskDescription(CN_IDEAccContext& context, CXmlCommand& command) {
    Answer(command, Description(context.IDE(), Text(command, "CompName")));
}

void AskSourceProjects(CN_IDEAccContext& context, CXmlCommand& command) {
    Answer(command, CXmlCommand::EncodeValue(context.SourceProjectsList()));
}

void ProcessComponent(CN_IDEAccContext& context, CXmlCommand& command) {
    command.Text = context.ProcessComponent(command);
    Answer(command, std::string("0"));
}

const std::unordered_map<std::string, Handler>& Handlers() {
    using Context = CN_IDEAccContext;
    using access_catalogue::Catalogue;
    static const std::unordered_map<std::string, Handler> handlers{
        // The project.
        {"idedisplaymodelismdi", Ask<&Context::IDEDisplayModelIsMDI>},
        {"getsourceprojectslist", AskSourceProjects},
        {"setcurrentsourceproject",
         [](Context& c, CXmlCommand& cmd) { c.SetCurrentSourceProject(Text(cmd, "ProjectName")); }},
        {"currentsourceprojectisdirty", Ask<&Context::CurrentSourceProjectIsDirty>},
        {"currentsourceprojectismdeorade", Ask<&Context::CurrentSourceProjectIsMDEorADE>},
        {"currentsourceprojectisadporade", Ask<&Context::CurrentSourceProjectIsADPorADE>},
        {"currentsourceprojectisnewunsaved", AnswerFalse},
        {"currentsourceprojectcodeisdisabled", AnswerFalse},
        {"arethereanysourceprojectsopened", Ask<&Context::AreThereAnySourceProjectsOpened>},
        {"currentsourceprojectfullpath", Ask<&Context::CurrentSourceProjectFullPath>},
        {"currentsourceprojecttypename", Ask<&Context::CurrentSourceProjectTypeName>},
        {"currentsourceprojectname", Ask<&Context::CurrentSourceProjectName>},
        {"currentsourceprojectlocation", Ask<&Context::CurrentSourceProjectLocation>},
        {"setuseprojectgroupassourceflag", DoNothing},
        {"sethelpfileforcurrentsourceproject",
         [](Context& c, CXmlCommand& cmd) {
             c.SetHelpFileForCurrentSourceProject(Text(cmd, "HelpFileFullPath"));
         }},
        {"parsesourceproject", DoNothing},
        {"savemakerun",
         [](Context& c, CXmlCommand& cmd) {
             c.SaveMakeRun(Flag(cmd, "SaveAppChanges"), Flag(cmd, "MakeApp"), Flag(cmd, "RunApp"));
         }},
        // Lists and descriptions of objects.
        {"getsourceformslist", AskList<Catalogue::Forms>},
        {"getsourcereportslist", AskList<Catalogue::Reports>},
        {"getsourcetableslist", AskList<Catalogue::Tables>},
        {"getsourcequerieslist", AskList<Catalogue::Queries>},
        {"getsourcemacroslist", AskList<Catalogue::Macros>},
        {"getcomponentdescription", AskDescription<access_catalogue::TableDescription>},
        {"getquerydescription", AskDescription<access_catalogue::QueryDescription>},
        {"getmacrodescription", AskDescription<access_catalogue::MacroDescription>},
        {"getqueryxmlstr",
         [](Context& c, CXmlCommand& cmd) {
             Answer(cmd, c.GetQueryXmlDescription(c.IDE(), Text(cmd, "QueryName")));
         }},
        // Objects.
        {"activeobjectname", Ask<&Context::ActiveObjectName>},
        {"currentobjectname", Ask<&Context::CurrentObjectName>},
        {"currentobjecttype", Ask<&Context::CurrentObjectType>},
        {"saveastext",
         [](Context& c, CXmlCommand& cmd) {
             c.SaveAsText(Number(cmd, "ObjType"), Text(cmd, "ObjName"), Text(cmd, "FullPath"));
         }},
        {"componentexiststest",
         [](Context& c, CXmlCommand& cmd) {
             Answer(cmd, c.ComponentExists(Number(cmd, "CompType"), Text(cmd, "CompName")));
         }},
        {"processcomponent", ProcessComponent},
        {"formnameprefix", Ask<&Context::FormNamePrefix>},
        {"reportnameprefix", Ask<&Context::ReportNamePrefix>},
        {"tablenameprefix", Ask<&Context::TableNamePrefix>},
        {"querynameprefix", Ask<&Context::QueryNamePrefix>},
        {"macronameprefix", Ask<&Context::MacroNamePrefix>},
        {"setcomponenthelpcontextid",
         [](Context& c, CXmlCommand& cmd) {
             c.SetComponentHelp(Number(cmd, "ObjType"), Text(cmd, "ObjName"), Number(cmd, "HelpContextId"));
         }},
        {"activatecomponent",
         [](Context& c, CXmlCommand& cmd) {
             Answer(cmd,
                    c.ActivateComponent(Number(cmd, "ObjType"), Text(cmd, "ObjName"),
                                        Flag(cmd, "ForceOpenInDesignView"), Flag(cmd, "ForceOpenAsHidden")));
         }},
        {"closecomponent",
         [](Context& c, CXmlCommand& cmd) {
             c.CloseComponent(Number(cmd, "ObjType"), Text(cmd, "ObjName"), Flag(cmd, "SaveComponentFlag"));
         }},
        {"activatecontrol",
         [](Context& c, CXmlCommand& cmd) {
             Answer(cmd, c.ActivateControl(Text(cmd, "ControlFullPath"), Flag(cmd, "RuntimeFlag"),
                                           Flag(cmd, "SetFocusFlag")));
         }},
        {"correctinsidewidthandheigh",
         [](Context& c, CXmlCommand& cmd) {
             c.CorrectInsideWidthAndHeight(Number(cmd, "ObjType"), Text(cmd, "ObjName"),
                                           Flag(cmd, "DesignViewFlag"));
         }},
        {"resetinsidewidthandheigh",
         [](Context& c, CXmlCommand& cmd) {
             c.ResetInsideWidthAndHeight(Number(cmd, "ObjType"), Text(cmd, "ObjName"),
                                         Flag(cmd, "DesignViewFlag"));
         }},
        {"takescreenshot",
         [](Context& c, CXmlCommand& cmd) {
             Answer(cmd, true);
             c.TakeScreenshot(Number(cmd, "ObjType"), Text(cmd, "ObjName"), Text(cmd, "PicFullPath"),
                              Text(cmd, "HTMLFullPath"));
         }},
        {"screenshotdatamodelwindow", Ask<&Context::ScreenshotDatamodelWindow>},
        // The host's windows.
        {"hostappmainwindowhwnd", Ask<&Context::HostAppMainWindowHWnd>},
        {"hideidewindows", Do<&Context::HideIDEWindows>},
        {"resetidewindows", Do<&Context::ResetIDEWindows>},
        {"showtoolbar",
         [](Context& c, CXmlCommand&) { clsScreenShotToolbar().Show(c.IDE(), clsScreenShotToolbar::kName); }},
        {"deletetoolbar",
         [](Context& c, CXmlCommand&) {
             clsScreenShotToolbar().Delete(c.IDE(), clsScreenShotToolbar::kName);
         }},
        {"unhidedbwindow", Do<&Context::UnhideDbWindow>},
        {"progressmeterinit",
         [](Context& c, CXmlCommand& cmd) {
             c.ProgressMeterInit(Text(cmd, "Message"), Number(cmd, "MaxVal"));
         }},
        {"progressmetertoggle",
         [](Context& c, CXmlCommand& cmd) { c.ProgressMeterToggle(Flag(cmd, "OnFlag")); }},
        {"progressmeterupdate",
         [](Context& c, CXmlCommand& cmd) { c.ProgressMeterUpdate(Number(cmd, "CurrentValue")); }},
        {"progressmeterremove", Do<&Context::ProgressMeterRemove>},
        {"hourglasson", Do<&Context::HourglassOn>},
        {"hourglassoff", Do<&Context::HourglassOff>},
        {"hourglassofffinal", Do<&Context::HourglassOffFinal>},
        {"doevents", Do<&Context::myDoevents>},
    };
    return handlers;
}

} // namespace

void RunAccessCommand(CN_IDEAccContext& context, CXmlCommand& command) {
    const auto handler = Handlers().find(text::ToLower(command.Name()));
    if (handler == Handlers().end())
        throw RaisedError(kFailure1, "Undefined callback command [" + command.Name() + "]",
                          "CN_IDEAccContext");
    handler->second(context, command);
}

} // namespace tovimar
