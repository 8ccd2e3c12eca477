#include "platform/access/OpenObject.h"
#include "platform/painting/Parts.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cmath>
#include <unordered_map>

namespace tovimar::platform::access {

namespace {

using painting::Align;
using painting::Canvas;
using painting::TextStyle;
using painting::VerticalAlign;
namespace SystemColor = painting::SystemColor;

constexpr std::size_t kMostTables = 400;
constexpr std::size_t kMostFields = 30;
constexpr int kRow = 15, kTitle = 19, kGapX = 56, kGapY = 28, kMargin = 24, kNarrowest = 90, kBroadest = 220;

struct Box {
    const RelationshipTable* table = nullptr;
    Rectangle place;
    std::size_t fields = 0; ///< shown
};

TextStyle Style(int weight = 400) {
    TextStyle style;
    style.family = "Tahoma";
    style.weight = weight;
    return style;
}

/// The database's tables as boxes in columns that come out about as high as broad, joined by lines.
class RelationshipsWindow final : public Window {
public:
    RelationshipsWindow(std::vector<RelationshipTable> tables, std::vector<RelationshipLine> lines,
                        const SystemMetrics& metrics)
        : tables_(std::move(tables)), lines_(std::move(lines)) {
        className = "OSysRel";
        caption = "Relationships";
        if (tables_.size() > kMostTables)
            tables_.resize(kMostTables);
        frame_ = ComputeFrame(metrics, FrameInput{});
        Arrange();
        const int left = frame_.ClientOffsetX(), top = frame_.ClientOffsetY();
        client = {left, top, left + width_, top + height_};
        rectangle = {0, 0, client.right + left, client.bottom + left};
    }

    Bitmap Paint(double scale) override {
        auto bitmap = painting::UnpaintedPicture(rectangle, scale);
        Canvas canvas(bitmap, scale);
        canvas.Fill(client, 0xF4F6F8);
        {
            const painting::ClipTo clip(canvas, client);
            for (const auto& line : lines_)
                PaintLine(canvas, line);
            for (const auto& box : boxes_)
                PaintBox(canvas, box);
        }
        painting::WindowFrame look;
        look.frame = frame_;
        look.caption = caption;
        painting::PaintWindowFrame(canvas, {0, 0, rectangle.Width(), rectangle.Height()}, look);
        return bitmap;
    }

private:
    static int WidthOf(const RelationshipTable& table) {
        int width = painting::MeasureText(table.name, Style(700)).width + 16;
        for (std::size_t i = 0; i < table.fields.size() && i < kMostFields; ++i)
            width = std::max(width, painting::MeasureText(table.fields[i], Style(700)).width + 28);
        return std::clamp(width, kNarrowest, kBroadest);
    }

    /// Boxes go into columns; joined tables that follow each other come to stand side by side.
    void Arrange() {
        int total = 0;
        for (const auto& table : tables_) {
            boxes_.push_back({&table, {}, std::min(table.fields.size(), kMostFields)});
            total += kTitle + kRow * static_cast<int>(boxes_.back().fields) + kGapY;
        }
        const int columns = std::clamp(static_cast<int>(std::lround(std::sqrt(total / 190.0))), 1, 40);
        const int wanted = total / columns;
        int left = kMargin, top = kMargin, broadest = 0;
        for (auto& box : boxes_) {
            const int height = kTitle + kRow * static_cast<int>(box.fields) + 4;
            if (top > kMargin && top + height / 2 > wanted + kMargin) {
                left += broadest + kGapX;
                top = kMargin;
                broadest = 0;
            }
            const int width = WidthOf(*box.table);
            box.place = {left, top, left + width, top + height};
            broadest = std::max(broadest, width);
            top += height + kGapY;
            width_ = std::max(width_, left + width + kMargin);
            height_ = std::max(height_, top - kGapY + kMargin);
        }
        for (auto& box : boxes_) {
            box.place = painting::Moved(box.place, frame_.ClientOffsetX(), frame_.ClientOffsetY());
            byName_.emplace(text::FoldCase(box.table->name), &box);
        }
    }

    void PaintBox(Canvas& canvas, const Box& box) const {
        canvas.Fill(box.place, SystemColor::kWindow);
        const Rectangle title{box.place.left, box.place.top, box.place.right, box.place.top + kTitle};
        canvas.FillGradient(title, SystemColor::kTitleTop, SystemColor::kTitleBottom);
        canvas.Border(box.place, SystemColor::kFrameLine);
        DrawText(
            canvas, box.table->name, Style(700),
            {{title.left + 6, title.top, title.right - 4, title.bottom}, Align::Left, VerticalAlign::Middle});
        for (std::size_t i = 0; i < box.fields; ++i) {
            const int top = title.bottom + 1 + kRow * static_cast<int>(i);
            const bool key = i < box.table->inPrimaryKey.size() && box.table->inPrimaryKey[i];
            if (key)
                PaintKey(canvas, box.place.left + 5, top + 4);
            DrawText(canvas, box.table->fields[i], Style(),
                     {{box.place.left + 20, top, box.place.right - 3, top + kRow},
                      Align::Left,
                      VerticalAlign::Middle});
        }
    }

    static void PaintKey(Canvas& canvas, int left, int top) {
        canvas.Ring(left + 3, top + 3, 2.5, 0xB8860B);
        canvas.Fill({left + 6, top + 3, left + 12, top + 4}, 0xB8860B);
        canvas.Fill({left + 10, top + 4, left + 11, top + 6}, 0xB8860B);
    }

    static int HeightOfField(const Box& box, const std::string& field) {
        for (std::size_t i = 0; i < box.fields; ++i)
            if (text::EqualsIgnoringCase(box.table->fields[i], field))
                return box.place.top + kTitle + 1 + kRow * static_cast<int>(i) + kRow / 2;
        return box.place.top + kTitle / 2;
    }

    void PaintLine(Canvas& canvas, const RelationshipLine& line) const {
        const auto from = byName_.find(text::FoldCase(line.table)),
                   to = byName_.find(text::FoldCase(line.foreignTable));
        if (from == byName_.end() || to == byName_.end())
            return;
        const auto &one = *from->second, &many = *to->second;
        const int y1 = HeightOfField(one, line.field), y2 = HeightOfField(many, line.foreignField);
        constexpr int kStub = 16;
        // Boxes above each other are joined round their right side.
        const bool same = one.place.left < many.place.right && many.place.left < one.place.right;
        const bool forward = one.place.left <= many.place.left;
        const int x1 = same || forward ? one.place.right : one.place.left;
        const int x2 = same ? many.place.right : forward ? many.place.left : many.place.right;
        const int out1 = same || forward ? x1 + kStub : x1 - kStub;
        const int out2 = same ? x2 + kStub : forward ? x2 - kStub : x2 + kStub;
        constexpr painting::Color kColor = 0x55606B;
        canvas.Line(x1, y1 + 0.5, out1, y1 + 0.5, kColor);
        canvas.Line(out1, y1 + 0.5, out2, y2 + 0.5, kColor);
        canvas.Line(out2, y2 + 0.5, x2, y2 + 0.5, kColor);
        Mark(canvas, "1", std::min(x1, out1), y1);
        Mark(canvas, line.oneToOne ? "1" : "\xE2\x88\x9E", std::min(x2, out2), y2);
    }

    static void Mark(Canvas& canvas, const char* mark, int left, int y) {
        DrawText(canvas, mark, Style(700), {{left + 2, y - 15, left + 16, y}, Align::Center});
    }

    std::vector<RelationshipTable> tables_;
    std::vector<RelationshipLine> lines_;
    std::vector<Box> boxes_;
    std::unordered_map<std::string, const Box*> byName_;
    Frame frame_;
    int width_ = 200;
    int height_ = 120;
};

} // namespace

std::unique_ptr<Window> MakeRelationshipsWindow(const std::vector<RelationshipTable>& tables,
                                                const std::vector<RelationshipLine>& lines,
                                                const SystemMetrics& metrics) {
    return std::make_unique<RelationshipsWindow>(tables, lines, metrics);
}

} // namespace tovimar::platform::access
