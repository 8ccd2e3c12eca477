#include "platform/windowing/WindowSystem.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <utility>
#include <vector>

namespace tovimar::platform {

namespace {

/// A rectangle of a picture; what lies outside is black.
Bitmap Cut(const Bitmap& source, int left, int top, int width, int height) {
    auto result = BlackBitmap(width, height);
    if (result.Empty())
        return {};
    const int from = std::max(0, -left);
    const int to = std::min(result.width, source.width - left);
    for (int y = std::max(0, -top); y < std::min(result.height, source.height - top) && from < to; ++y) {
        const auto sourceRow = static_cast<std::size_t>(top + y) * static_cast<std::size_t>(source.width);
        const auto targetRow = static_cast<std::size_t>(y) * static_cast<std::size_t>(result.width);
        std::memcpy(result.pixels.data() + targetRow + static_cast<std::size_t>(from),
                    source.pixels.data() + sourceRow + static_cast<std::size_t>(left + from),
                    static_cast<std::size_t>(to - from) * sizeof(std::uint32_t));
    }
    return result;
}

double FittingScale(const Rectangle& window, double scale) {
    constexpr double kMostPixels = 48e6;
    const double pixels = static_cast<double>(window.Width()) * window.Height();
    return pixels <= 0 ? 1 : std::max(1.0, std::min(scale, std::sqrt(kMostPixels / pixels)));
}

bool Matches(const std::string& asked, const std::string& have) {
    return asked.empty() || text::EqualsIgnoringCase(asked, have);
}

} // namespace

WindowSystem::WindowSystem() = default;
WindowSystem::~WindowSystem() = default;

WindowHandle WindowSystem::Open(std::unique_ptr<Window> window) {
    const WindowHandle handle = next_++;
    window->handle = handle;
    windows_.emplace(handle, std::move(window));
    return handle;
}

void WindowSystem::Close(WindowHandle handle) {
    if (windows_.find(handle) == windows_.end())
        return;
    // Closing from a list: a window may lie below its own child by mistake of whoever opened it.
    std::vector<WindowHandle> closing{handle};
    for (std::size_t i = 0; i < closing.size(); ++i) {
        for (const auto& [child, window] : windows_)
            if (window->parent == closing[i] && child != handle)
                closing.push_back(child);
        windows_.erase(closing[i]);
        Invalidate(closing[i]);
    }
}

Window* WindowSystem::Find(WindowHandle handle) {
    const auto found = windows_.find(handle);
    if (found == windows_.end())
        return nullptr;
    if (found->second->Refresh())
        Invalidate(handle);
    return found->second.get();
}

WindowHandle WindowSystem::FirstChild(WindowHandle parent) {
    for (const auto& [handle, window] : windows_)
        if (window->parent == parent && parent != 0)
            return handle;
    return 0;
}

WindowHandle WindowSystem::NextSibling(WindowHandle handle) {
    const auto found = windows_.find(handle);
    if (found == windows_.end())
        return 0;
    for (auto next = std::next(found); next != windows_.end(); ++next)
        if (next->second->parent == found->second->parent)
            return next->first;
    return 0;
}

WindowHandle WindowSystem::FindTopLevel(const std::string& className, const std::string& caption) {
    for (const auto& [handle, window] : windows_)
        if (window->parent == 0 && Matches(className, window->className) && Matches(caption, window->caption))
            return handle;
    return 0;
}

std::shared_ptr<const Bitmap> WindowSystem::Capture(WindowHandle handle, bool client, int left, int top,
                                                    int width, int height, double scale) {
    Window* window = Find(handle);
    if (window == nullptr)
        return nullptr;
    scale = FittingScale(window->rectangle, scale);
    if (painted_.handle != handle || painted_.scale != scale) {
        painted_.bitmap = std::make_shared<const Bitmap>(window->Paint(scale));
        painted_.handle = handle;
        painted_.scale = scale;
    }
    if (client) {
        left += window->client.left;
        top += window->client.top;
    }
    const auto device = [scale](int value) { return static_cast<int>(std::lround(value * scale)); };
    const Rectangle cut{device(left), device(top), device(left + width), device(top + height)};
    if (cut == Rectangle{0, 0, painted_.bitmap->width, painted_.bitmap->height})
        return painted_.bitmap;
    return std::make_shared<const Bitmap>(
        Cut(*painted_.bitmap, cut.left, cut.top, cut.Width(), cut.Height()));
}

void WindowSystem::Invalidate(WindowHandle handle) {
    if (painted_.handle != handle)
        return;
    painted_.handle = 0;
    painted_.bitmap = nullptr;
}

} // namespace tovimar::platform
