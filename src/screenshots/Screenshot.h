#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace tovimar {

class CAddInProject;
class CAddInProjects;
class CHelpPrjTreeNode;
class CTovimarClient;
class CXmlControl;
class CXmlForm;

/// Takes the picture of one object, those of its compound controls and, on request, its topic. Inside the
/// host it works on the open help project; a running application loads the project by itself and finds an
/// object's files by the name of its form.
///
/// Every public operation gives 0 or the number of its failure, which the Last properties keep.
class Screenshot {
public:
    Screenshot();
    ~Screenshot();
    Screenshot(const Screenshot&) = delete;
    Screenshot& operator=(const Screenshot&) = delete;

    /// Makes the project of a project file the current one and takes its objects' file names from their
    /// definitions; a definition that doesn't load leaves "Error " and its number as the text. A project
    /// that is loaded already is not read again.
    ResultCode LoadProject(const std::string& tvpFileFullPath);
    /// Value of the option "SnapshotFormat"; "Bitmap" without a project.
    const std::string& LoadedProjectSnapshotFormat() const { return loadedProjectSnapshotFormat_; }
    const std::string& LoadedProjectHtmlFolder() const { return loadedProjectHtmlFolder_; }
    const std::string& LoadedProjectPicsFolder() const { return loadedProjectPicsFolder_; }

    /// Of a form of a running application. `picType` is 1 (bitmap), 2 (JPEG), or -1 for the files that the
    /// loaded project has for the form. "{{FormName}}" in a file name stands for the form's name. The topic
    /// is only written with `GenerateHTML`.
    ResultCode TakeVB6FormScreenshot(const HostObject& frm, std::int32_t picType,
                                     const std::string& targetFolder, const std::string& picFileNameExt,
                                     const std::string& htmlFileNameExt, const std::string& picsFolder,
                                     bool GenerateHTML);
    /// The same of a window, whose form the host names.
    ResultCode TakeWinFormScreenshot(std::int32_t vlngHwnd, std::int32_t picType,
                                     const std::string& targetFolder, const std::string& picFileNameExt,
                                     const std::string& htmlFileNameExt, const std::string& picsFolder,
                                     bool GenerateHTML);
    /// One window with its frame; type 1 bitmap, 2 JPEG.
    ResultCode TakeWindowScreenshot(std::int32_t vlngHwnd, std::int32_t picType,
                                    const std::string& targetFolder, const std::string& picFileNameExt);

    /// Pictures and, with a path for it, the topic of an object of the source project. An existing topic is
    /// backed up first; one that can't be is left as it is. Controls' pictures go to `picsFolder`, or, when
    /// it is empty, beside the object's. An object of another kind of application needs no host entry.
    ResultCode TakeScreenshot(std::int32_t objectType, const std::string& objectName,
                              const std::string& picFullPath, const std::string& htmlFullPath, bool vfIsVSNet,
                              const std::string& picsFolder = {});
    /// From the object's definition text. `vstrPicType` is "bmp" or "jpg". A picture folder given moves the
    /// pictures there, else they go where the definition says. 0, or the number of a reported failure;
    /// one while reading the definition carries the parser's code.
    ResultCode LocateObjectsAndTakeScreenshots(const std::string& vstrPicType, std::int32_t vlngHwnd,
                                               const std::string& vstrXml,
                                               const std::string& vstrPicsFolder = {});

    /// The same from a definition that is at hand: its paths become those of the pictures taken.
    ResultCode LocateObjectsAndTakeScreenshots(const std::string& vstrPicType, std::int32_t vlngHwnd,
                                               CXmlForm& form, const std::string& vstrPicsFolder = {});

    /// What one shot of an object is told.
    struct Shot {
        std::int32_t objectType = 0;
        std::string objectName;
        std::string picFullPath; ///< its extension follows the run's format
        std::string htmlFullPath;
        std::string picsFolder = {}; ///< empty: that of the object's picture
        std::int32_t window = 0;     ///< 0: the one that the host opens
        bool designView = false;
    };
    /// Takes the pictures and gives the definition that they were taken by; null after a failure.
    std::unique_ptr<CXmlForm> TakePictures(const Shot& shot);
    /// Writes the topic of a definition, its pictures by their path; nothing for an empty path.
    static ResultCode WriteTopic(CXmlForm& form, const Shot& shot, bool zoomed);

    const std::string& TakenImageFullPath() const { return takenImageFullPath_; }
    std::int32_t LastErrNum() const { return lastErrNum_; }
    const std::string& LastErrDscr() const { return lastErrDscr_; }
    /// Number, " - " and text; empty without a failure.
    std::string LastErrStr() const;

private:
    struct Request;
    struct FormRecord;
    struct Target;
    struct Place;

    void TakeAll(const std::string& vstrPicType, std::int32_t vlngHwnd, CXmlForm& form,
                 const std::string& vstrPicsFolder);
    void TakeForm(const Request& request, CXmlForm& form);
    void TakeControl(const Request& request, CXmlControl& control, const std::string& parentPath);
    void TakeControlPicture(const Request& request, CXmlControl& control);

    void EnsureServer();
    void ReadProject(const std::string& path);
    static CAddInProject& ProjectOf(CAddInProjects& catalogue, const std::string& path);
    void ReadRecord(CHelpPrjTreeNode& node, CAddInProject& project);

    ResultCode CheckPlace(std::int32_t picType, const std::string& targetFolder,
                          const std::string& picFileNameExt);
    ResultCode FindPlace(const std::string& formName, Place& place);
    ResultCode TakeAtRuntime(const Target& target, Place place, bool generateHtml);
    ResultCode TakeOfConnection(const Target& target, const Place& place);

    ResultCode Fail(ResultCode number, const std::string& text);
    ResultCode Guarded(const char* operation, const std::function<void()>& steps);

    std::string takenImageFullPath_;
    std::int32_t lastErrNum_ = 0;
    std::string lastErrDscr_;
    std::string loadedProject_;
    std::string loadedProjectHtmlFolder_;
    std::string loadedProjectPicsFolder_;
    std::string loadedProjectSnapshotFormat_ = "Bitmap";
    std::vector<FormRecord> records_;
    bool ownServer_ = false;
};

} // namespace tovimar
