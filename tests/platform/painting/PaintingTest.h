#pragma once

#include "platform/access/ExportReader.h"
#include "platform/access/OpenObject.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"

#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace tovimar::test {

/// An application of a few designs written as exports.
class DesignApplication : public platform::access::ApplicationSource {
public:
    const platform::access::Design& Add(platform::access::ObjectKind kind, const std::string& name,
                                        const std::string& text) {
        auto& place = Of(kind)[text::FoldCase(name)];
        place = platform::access::ReadDesign(text, kind, name, name + ".txt");
        return *place;
    }
    const platform::access::Design& AddForm(const std::string& name, const std::string& text) {
        return Add(platform::access::ObjectKind::Form, name, text);
    }

    const platform::access::Design* FindDesign(platform::access::ObjectKind kind,
                                               const std::string& name) override {
        const auto found = Of(kind).find(text::FoldCase(name));
        return found == Of(kind).end() ? nullptr : found->second.get();
    }
    const platform::access::Records* FindRecords(const std::string& recordSource, int) override {
        const auto found = records.find(recordSource);
        return found == records.end() ? nullptr : &found->second;
    }
    std::string FindPicture(const std::string& name) override { return pictures[name]; }
    const std::vector<std::uint32_t>& ThemeColors() override { return theme; }

    std::map<std::string, platform::access::Records> records;
    std::map<std::string, std::string> pictures;
    std::vector<std::uint32_t> theme;

private:
    using Designs = std::map<std::string, std::unique_ptr<platform::access::Design>>;
    Designs& Of(platform::access::ObjectKind kind) {
        return kind == platform::access::ObjectKind::Form ? forms_ : reports_;
    }
    Designs forms_, reports_;
};

/// An open object with its window in a window system, pictures of it, and the places that the hot spots use.
class OpenedWindow {
public:
    OpenedWindow(const platform::access::Design& design, platform::access::ApplicationSource* application,
                 platform::access::View view) {
        object.design = &design;
        object.application = application;
        object.view = view;
        platform::access::SetInitialSize(object, windows.Metrics());
        object.window = windows.Open(platform::access::MakeObjectWindow(object, windows.Metrics()));
    }

    platform::Bitmap Picture() {
        const auto area = windows.Find(object.window)->rectangle;
        return *windows.Capture(object.window, false, 0, 0, area.Width(), area.Height());
    }
    std::uint32_t Pixel(int x, int y) {
        return windows.Capture(object.window, false, x, y, 1, 1)->pixels.at(0);
    }
    /// A control's rectangle within the picture.
    platform::Rectangle PlaceOf(const std::string& controlName) const {
        for (const auto& section : object.design->Sections())
            if (const auto* control = Find(*section.object, controlName))
                return PlaceOf(*control, section.number);
        ADD_FAILURE() << "no control " << controlName;
        return {};
    }
    platform::Rectangle PlaceOf(const platform::access::DesignObject& control, int section) const {
        const auto frame = platform::access::ComputeFrame(windows.Metrics(), object.FrameSettings());
        auto heights = object.Sections(windows.Metrics());
        heights.printed = object.PrintedSections(windows.Metrics(), false);
        const int offset = platform::access::SectionOffsetY(heights, frame.sectionBarHeight, section);
        const int right = platform::access::SectionOffsetX(heights, section);
        auto place = platform::access::ControlRectangle(windows.Metrics(), frame, offset,
                                                        control.Integer("Left"), control.Integer("Top"),
                                                        control.Integer("Width"), control.Integer("Height"));
        place.left += frame.ClientOffsetX() + right;
        place.right += frame.ClientOffsetX() + right;
        place.top += frame.ClientOffsetY();
        place.bottom += frame.ClientOffsetY();
        return place;
    }

    static const platform::access::DesignObject* Find(const platform::access::DesignObject& parent,
                                                      const std::string& name) {
        for (const auto& child : parent.children) {
            if (child->name == name)
                return child.get();
            if (const auto* below = Find(*child, name))
                return below;
        }
        return nullptr;
    }

    platform::WindowSystem windows;
    platform::access::OpenObject object;
};

} // namespace tovimar::test
