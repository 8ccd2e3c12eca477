#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <string>

namespace tovimar {

class CXmlControl;
class CXmlForm;

/// Takes the pictures of one object: the whole window and the controls that have a picture of their own.
class Screenshot {
public:
    /// From the object's definition text. `vstrPicType` is "bmp" or "jpg". A picture folder given moves the
    /// pictures there, else they go where the definition says. 0, or the number of a reported failure;
    /// one while reading the definition carries the parser's code.
    ResultCode LocateObjectsAndTakeScreenshots(const std::string& vstrPicType, std::int32_t vlngHwnd,
                                               const std::string& vstrXml,
                                               const std::string& vstrPicsFolder = {});
    /// One window with its frame; type 1 bitmap, 2 JPEG. 0 or the number of the failure.
    ResultCode TakeWindowScreenshot(std::int32_t vlngHwnd, std::int32_t picType,
                                    const std::string& targetFolder, const std::string& picFileNameExt);

    const std::string& TakenImageFullPath() const { return takenImageFullPath_; }
    std::int32_t LastErrNum() const { return lastErrNum_; }
    const std::string& LastErrDscr() const { return lastErrDscr_; }
    /// Number, " - " and text; empty without a failure.
    std::string LastErrStr() const;

private:
    struct Request;
    void TakeAll(const std::string& vstrPicType, std::int32_t vlngHwnd, const std::string& vstrXml,
                 const std::string& vstrPicsFolder);
    void TakeForm(const Request& request, CXmlForm& form);
    void TakeControl(const Request& request, CXmlControl& control, const std::string& parentPath);
    void TakeControlPicture(const Request& request, CXmlControl& control);
    ResultCode Fail(ResultCode number, const std::string& text);

    std::string takenImageFullPath_;
    std::int32_t lastErrNum_ = 0;
    std::string lastErrDscr_;
};

} // namespace tovimar
