#include "uimodel/HotSpots.h"

#include "foundation/Session.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"
#include "uimodel/CXmlControl.h"
#include "uimodel/SaturatedSum.h"

namespace tovimar {

namespace {

constexpr std::int32_t kFirstCorrectedVersion = 6;

FrameCorrection CurrentCorrection() {
    const std::int32_t version = platform::Env().windows->WindowsMajorVersion();
    if (version < kFirstCorrectedVersion || Session::ServerAgent() == nullptr)
        return {};
    return CorrectionOfFrames(version, Session::ServerAgent()->CurrentSourceProjectTypeName());
}

} // namespace

FrameCorrection CorrectionOfFrames(std::int32_t windowsMajorVersion,
                                   const std::string& sourceProjectTypeName) {
    if (windowsMajorVersion < kFirstCorrectedVersion)
        return {};
    if (text::EqualsIgnoringCase(sourceProjectTypeName, "MS ACCESS"))
        return {-26, -11};
    for (const char* kind : {"VB6", "VS.NET", "VB.NET", "C#", "J#", "C++"})
        if (text::EqualsIgnoringCase(sourceProjectTypeName, kind))
            return {-11, -11};
    return {};
}

std::int32_t CXmlControl::HotSpotLeft(bool vfNoClientAreaOffset) const {
    return SaturatedSum(Left,
                        std::int64_t{vfNoClientAreaOffset ? 0 : ClientAreaOffsetX()} + CurrentCorrection().x);
}

std::int32_t CXmlControl::HotSpotTop(bool vfNoClientAreaOffset) const {
    return SaturatedSum(Top,
                        std::int64_t{vfNoClientAreaOffset ? 0 : ClientAreaOffsetY()} + CurrentCorrection().y);
}

std::int32_t CXmlControl::HotSpotRight(bool vfNoClientAreaOffset) const {
    return SaturatedSum(HotSpotLeft(vfNoClientAreaOffset), Width);
}

std::int32_t CXmlControl::HotSpotBottom(bool vfNoClientAreaOffset) const {
    return SaturatedSum(HotSpotTop(vfNoClientAreaOffset), Height);
}

std::int32_t CXmlControl::TabHotSpotLeft() const {
    return SaturatedSum(TabLeft, ClientAreaOffsetX());
}
std::int32_t CXmlControl::TabHotSpotTop() const {
    return SaturatedSum(TabTop, ClientAreaOffsetY());
}
std::int32_t CXmlControl::TabHotSpotRight() const {
    return SaturatedSum(TabHotSpotLeft(), TabWidth);
}
std::int32_t CXmlControl::TabHotSpotBottom() const {
    return SaturatedSum(TabHotSpotTop(), TabHeight);
}

} // namespace tovimar
