#pragma once

#include "platform/access/AccessApplication.h"
#include "platform/access/ApplicationModel.h"
#include "platform/access/LateBound.h"

#include <memory>
#include <string>
#include <vector>

namespace tovimar::platform::access {

class WindowObject;

/// What the objects of one running application share: its model, its windows and what is open. Objects that
/// are handed out hold it weakly, so a reference that outlives the application raises 2467.
class AccessSession : public std::enable_shared_from_this<AccessSession> {
public:
    explicit AccessSession(std::unique_ptr<ApplicationModel> model);
    ~AccessSession();
    AccessSession(const AccessSession&) = delete;
    AccessSession& operator=(const AccessSession&) = delete;

    ApplicationModel& Model() { return *model_; }
    WindowHandle MainWindowHandle() const { return mainWindow_; }

    /// Opens a form or report; one that is open in another view is closed first.
    /// Raises 2102 and 2103 for an unknown name, 0x80040001 for a design that can't be read.
    void Open(ObjectKind kind, const std::string& name, View view, bool hidden);
    /// Nothing happens for an object that isn't open. Saving hands changed properties over to the saver.
    enum class Saving { No, Yes };
    void Close(ObjectKind kind, const std::string& name, Saving saving = Saving::No);
    std::shared_ptr<WindowObject> FindOpen(ObjectKind kind, const std::string& name) const;
    /// In the order in which they were opened.
    std::vector<std::shared_ptr<WindowObject>> OpenObjects(ObjectKind kind) const;
    /// The window that last got the focus, null for none.
    std::shared_ptr<WindowObject> Active(ObjectKind kind) const;
    void Activate(const std::shared_ptr<WindowObject>& object);

    void OpenRelationships();

    std::weak_ptr<AutomationObject> application;
    std::string currentObjectName;
    std::int32_t currentObjectType = -1;
    std::string meterMessage;
    ObjectSaver saver; ///< none: what is saved lasts as long as the application

private:
    std::string BaseTitle() const;
    void OpenWindows(OpenObject& opened);

    std::unique_ptr<ApplicationModel> model_;
    WindowHandle mainWindow_ = 0;
    std::vector<std::shared_ptr<WindowObject>> open_;
    std::weak_ptr<WindowObject> active_[2]; ///< form, report
};

using SessionRef = std::weak_ptr<AccessSession>;
/// Raises 2467 when the application is gone.
std::shared_ptr<AccessSession> Live(const SessionRef& session);

} // namespace tovimar::platform::access
