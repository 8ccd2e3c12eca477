#include "platform/access/OpenObject.h"
#include "platform/painting/ObjectPainter.h"
#include "platform/painting/Parts.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr int kLargestWidth = 8000;
constexpr int kLargestHeight = 20000;
constexpr std::int64_t kMostPixels = 48'000'000;

/// What the last picture showed.
struct Shown {
    const Design* design = nullptr;
    View view = View::Form;
    int width = 0, height = 0;
    std::map<const DesignObject*, int> pages;
    friend bool operator==(const Shown&, const Shown&) = default;
};

class ObjectWindow final : public Window {
public:
    ObjectWindow(const OpenObject& object, const SystemMetrics& metrics, bool framed)
        : object_(object), metrics_(metrics), framed_(framed) {
        const bool report = object.design->kind == ObjectKind::Report;
        className = !framed ? "OPrtPrevPage" : report ? "OReport" : "OForm";
        Refresh();
    }

    bool Refresh() override {
        Place();
        return painted_.design != nullptr && painted_ != Now();
    }

    Bitmap Paint(double scale) override {
        Place();
        painted_ = Now();
        auto bitmap = painting::UnpaintedPicture(rectangle, scale);
        if (bitmap.Empty())
            return bitmap;
        painting::Canvas canvas(bitmap, scale);
        if (object_.design->root)
            PaintClient(canvas);
        if (framed_)
            painting::PaintWindowFrame(canvas, {0, 0, rectangle.Width(), rectangle.Height()}, Look());
        return bitmap;
    }

private:
    Shown Now() const {
        return {object_.design, object_.view, object_.insideWidth, object_.insideHeight,
                object_.currentPages};
    }

    void Place() {
        const auto& root = object_.design->root;
        frame_ = ComputeFrame(metrics_, object_.FrameSettings());
        const int width = std::clamp(object_.insideWidth, 1, kLargestWidth);
        const int height = std::clamp(object_.insideHeight, 1,
                                      std::min(kLargestHeight, static_cast<int>(kMostPixels / width)));
        const int left = framed_ ? frame_.ClientOffsetX() : 0, top = framed_ ? frame_.ClientOffsetY() : 0;
        client = {left, top, left + width, top + height};
        rectangle.right = rectangle.left + client.right + left;
        rectangle.bottom = rectangle.top + client.bottom + left;
        caption = root ? root->Text("Caption") : std::string();
        if (caption.empty() || object_.view == View::Design)
            caption = object_.design->name + (object_.view != View::Design                 ? ""
                                              : object_.design->kind == ObjectKind::Report ? " : Report"
                                                                                           : " : Form");
    }

    void PaintClient(painting::Canvas& canvas) const {
        const painting::PaintContext context{
            canvas, metrics_, *object_.design, object_.application, object_.view, &object_.currentPages,
            {},     {}};
        painting::ObjectPainter(context).Paint(client);
    }

    painting::WindowFrame Look() const {
        painting::WindowFrame look;
        look.frame = frame_;
        look.caption = caption;
        if (object_.view != View::Form || !object_.design->root)
            return look;
        const auto& root = *object_.design->root;
        look.controlBox = root.Flag("ControlBox");
        look.closeButton = root.Flag("CloseButton");
        // A dialog has neither, whatever its design says.
        const bool dialog = root.Integer("BorderStyle", 2) == 3;
        look.minButton = !dialog && root.Flag("MinButton");
        look.maxButton = !dialog && root.Flag("MaxButton");
        return look;
    }

    const OpenObject& object_;
    const SystemMetrics metrics_;
    const bool framed_;
    Frame frame_;
    Shown painted_;
};

} // namespace

std::unique_ptr<Window> MakeObjectWindow(const OpenObject& object, const SystemMetrics& metrics) {
    return std::make_unique<ObjectWindow>(object, metrics, true);
}

std::unique_ptr<Window> MakePreviewPageWindow(const OpenObject& object, const SystemMetrics& metrics) {
    return std::make_unique<ObjectWindow>(object, metrics, false);
}

} // namespace tovimar::platform::access
