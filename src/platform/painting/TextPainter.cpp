#include "platform/painting/TextPainter.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <cairo.h>
#include <memory>
#include <pango/pangocairo.h>
#include <tuple>
#include <unordered_map>

namespace tovimar::platform::painting {

namespace {

constexpr std::size_t kLongestText = 4000;
constexpr int kSmallestSize = 1, kLargestSize = 200;

struct Substitute {
    std::string_view prefix; ///< of the folded family
    const char* family;
};
/// Free families by their widths. What isn't named is set in the sans serif.
constexpr std::array<Substitute, 26> kSubstitutes{{{"arial narrow", "Liberation Sans Narrow"},
                                                   {"agency", "Liberation Sans Narrow"},
                                                   {"impact", "Liberation Sans Narrow"},
                                                   {"tahoma", "DejaVu Sans Condensed"},
                                                   {"verdana", "DejaVu Sans"},
                                                   {"lucida sans", "DejaVu Sans"},
                                                   {"calibri", "Carlito"},
                                                   {"corbel", "Carlito"},
                                                   {"candara", "Carlito"},
                                                   {"times", "Liberation Serif"},
                                                   {"georgia", "Liberation Serif"},
                                                   {"cambria", "Caladea"},
                                                   {"garamond", "Liberation Serif"},
                                                   {"book antiqua", "Liberation Serif"},
                                                   {"bookman", "Liberation Serif"},
                                                   {"century schoolbook", "Liberation Serif"},
                                                   {"palatino", "Liberation Serif"},
                                                   {"constantia", "Liberation Serif"},
                                                   {"ms serif", "Liberation Serif"},
                                                   {"roman", "Liberation Serif"},
                                                   {"courier", "Liberation Mono"},
                                                   {"consolas", "Liberation Mono"},
                                                   {"lucida console", "Liberation Mono"},
                                                   {"fixedsys", "Liberation Mono"},
                                                   {"terminal", "Liberation Mono"},
                                                   {"liberation mono", "Liberation Mono"}}};

const char* FamilyFor(const std::string& family) {
    const auto folded = text::FoldCase(family);
    for (const auto& substitute : kSubstitutes)
        if (folded.starts_with(substitute.prefix))
            return substitute.family;
    return "Liberation Sans";
}

std::string KeyOf(const TextStyle& style) {
    return style.family + '\n' + std::to_string(std::clamp(style.size, kSmallestSize, kLargestSize)) +
           (style.weight >= 600 ? "b" : "") + (style.italic ? "i" : "");
}

struct Unref {
    void operator()(void* object) const { g_object_unref(object); }
};
struct FreeFont {
    void operator()(PangoFontDescription* font) const { pango_font_description_free(font); }
};
using Font = std::unique_ptr<PangoFontDescription, FreeFont>;

/// The context and the fonts of the process: making them costs far more than using them.
class Fonts {
public:
    static Fonts& Get() {
        static Fonts fonts;
        return fonts;
    }

    /// A layout of its own in that style, to be set and given back.
    PangoLayout* MakeLayout(const TextStyle& style) {
        auto* layout = pango_layout_new(context_.get());
        pango_layout_set_wrap(layout, PANGO_WRAP_WORD_CHAR);
        pango_layout_set_auto_dir(layout, TRUE);
        pango_layout_set_font_description(layout, Find(style));
        return layout;
    }

private:
    Fonts() : map_(pango_cairo_font_map_new()), context_(pango_font_map_create_context(map_.get())) {
        pango_cairo_context_set_resolution(context_.get(), 96);
        auto* options = cairo_font_options_create();
        cairo_font_options_set_antialias(options, CAIRO_ANTIALIAS_GRAY);
        cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_FULL);
        cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_ON);
        pango_cairo_context_set_font_options(context_.get(), options);
        cairo_font_options_destroy(options);
        pango_context_set_language(context_.get(), pango_language_from_string("en"));
    }

    const PangoFontDescription* Find(const TextStyle& style) {
        const int size = std::clamp(style.size, kSmallestSize, kLargestSize);
        const bool bold = style.weight >= 600;
        const auto key = KeyOf(style);
        const auto found = fonts_.find(key);
        if (found != fonts_.end())
            return found->second.get();
        // Sizes and families of a hostile design must not fill the memory.
        if (fonts_.size() >= 512)
            fonts_.clear();
        Font font(pango_font_description_new());
        pango_font_description_set_family_static(font.get(), FamilyFor(style.family));
        pango_font_description_set_size(font.get(), size * PANGO_SCALE);
        pango_font_description_set_weight(font.get(), bold ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
        pango_font_description_set_style(font.get(), style.italic ? PANGO_STYLE_ITALIC : PANGO_STYLE_NORMAL);
        return fonts_.emplace(key, std::move(font)).first->second.get();
    }

    std::unique_ptr<PangoFontMap, Unref> map_;
    std::unique_ptr<PangoContext, Unref> context_;
    std::unordered_map<std::string, Font> fonts_;
};

/// A caption without its marks, and the bytes that are underlined.
struct Caption {
    std::string text;
    std::size_t from = 0, to = 0;
};

Caption TakeAccelerator(std::string_view text) {
    Caption result;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '&') {
            if (++i >= text.size())
                break;
            if (text[i] != '&') {
                result.from = result.text.size();
                result.to = result.from + 1;
                while (i + (result.to - result.from) < text.size() &&
                       (static_cast<unsigned char>(text[i + (result.to - result.from)]) & 0xC0U) == 0x80U)
                    ++result.to;
            }
        }
        result.text += text[i];
    }
    return result;
}

std::string Drawable(std::string_view text) {
    auto result = text::IsValidUtf8(text) ? std::string(text) : text::MakeValidUtf8(text);
    if (result.size() > kLongestText)
        result = text::Left(result, kLongestText);
    result.erase(std::remove(result.begin(), result.end(), '\r'), result.end());
    std::replace(result.begin(), result.end(), '\0', ' ');
    return result;
}

void Underline(PangoLayout* layout, const TextStyle& style, const Caption& caption) {
    if (!style.underline && caption.from == caption.to)
        return;
    auto* attributes = pango_attr_list_new();
    auto* underline = pango_attr_underline_new(PANGO_UNDERLINE_SINGLE);
    if (!style.underline) {
        underline->start_index = static_cast<guint>(caption.from);
        underline->end_index = static_cast<guint>(caption.to);
    }
    pango_attr_list_insert(attributes, underline);
    pango_layout_set_attributes(layout, attributes);
    pango_attr_list_unref(attributes);
}

PangoAlignment Alignment(Align align) {
    return align == Align::Center  ? PANGO_ALIGN_CENTER
           : align == Align::Right ? PANGO_ALIGN_RIGHT
                                   : PANGO_ALIGN_LEFT;
}

/// Left edge of a layout that isn't wrapped; a wrapped one aligns itself.
int LeftOf(const TextPlace& place, int width) {
    switch (place.align) {
    case Align::Center:
        return place.area.left + (place.area.Width() - width) / 2;
    case Align::Right:
        return place.area.right - width;
    case Align::Left:
        break;
    }
    return place.area.left;
}

} // namespace

namespace {

/// Labels were made to fit their text in the family that the substitute stands for. So text that is a little
/// too broad, or that would take a line too many, is drawn narrower by up to this factor.
constexpr double kNarrowest = 0.85;

/// A text broken into lines and glyphs.
struct LaidText {
    std::unique_ptr<PangoLayout, Unref> layout;
    int width = 0, height = 0;
    double scale = 1; ///< horizontally, to fit where it was laid
};

void Measure(LaidText& text) {
    pango_layout_get_pixel_size(text.layout.get(), &text.width, &text.height);
}

/// Wraps the text to the room, a little narrower when that saves a line.
void Wrap(LaidText& text, int room, int height) {
    pango_layout_set_width(text.layout.get(), room * PANGO_SCALE);
    Measure(text);
    if (text.height <= height + 1)
        return;
    const int plain = text.height;
    pango_layout_set_width(text.layout.get(), static_cast<int>(room / kNarrowest) * PANGO_SCALE);
    Measure(text);
    if (text.height < plain) {
        text.scale = kNarrowest;
        return;
    }
    pango_layout_set_width(text.layout.get(), room * PANGO_SCALE);
    Measure(text);
}

/// How far a line of that width is narrowed to fit the room.
double ScaleToFit(int width, int room) {
    // Each scale has glyphs of its own to be drawn: few steps keep them shared.
    for (const double scale : {0.95, 0.9, kNarrowest})
        if (width > room && width * scale <= room)
            return scale;
    return 1;
}

/// Breaking a text into glyphs costs several times what drawing them does, and captions and values come
/// again: in the rows of a list, on the pages of a tab control, from form to form. The last ones are kept.
class LaidTexts {
public:
    static LaidTexts& Get() {
        static LaidTexts texts;
        return texts;
    }

    /// On one line, at its own size.
    LaidText& Line(const Caption& caption, const TextStyle& style) {
        auto [text, fresh] = Find("", caption, style);
        if (fresh) {
            pango_layout_set_single_paragraph_mode(text.layout.get(), TRUE);
            Measure(text);
        }
        return text;
    }

    LaidText& Lines(const Caption& caption, const TextStyle& style, const TextPlace& place) {
        const int room = place.area.Width(), height = place.area.Height();
        auto [text, fresh] = Find(std::to_string(room) + ',' + std::to_string(height) + ',' +
                                      std::to_string(static_cast<int>(place.align)),
                                  caption, style);
        if (fresh) {
            pango_layout_set_alignment(text.layout.get(), Alignment(place.align));
            Wrap(text, room, height);
        }
        return text;
    }

private:
    static constexpr std::size_t kMostTexts = 512;
    static constexpr std::size_t kLongestKept = 200;

    std::pair<LaidText&, bool> Find(std::string key, const Caption& caption, const TextStyle& style) {
        key += '\n' + KeyOf(style) + (style.underline ? "u" : "") + std::to_string(caption.from) + ',' +
               std::to_string(caption.to) + '\n' + caption.text;
        if (const auto found = texts_.find(key); found != texts_.end())
            return {found->second, false};
        if (texts_.size() >= kMostTexts) {
            former_ = std::move(texts_);
            texts_.clear();
        }
        if (auto found = former_.extract(key))
            return {texts_.insert(std::move(found)).position->second, false};
        LaidText& text = caption.text.size() <= kLongestKept ? texts_[key] : long_;
        text = {std::unique_ptr<PangoLayout, Unref>(Fonts::Get().MakeLayout(style))};
        pango_layout_set_text(text.layout.get(), caption.text.data(), static_cast<int>(caption.text.size()));
        Underline(text.layout.get(), style, caption);
        return {text, true};
    }

    std::unordered_map<std::string, LaidText> texts_;
    std::unordered_map<std::string, LaidText> former_; ///< asked for before the present ones
    LaidText long_;                                    ///< the last long one
};

void Show(Canvas& canvas, PangoLayout* layout, Color color, int left, int top, double scale) {
    auto* context = canvas.Context();
    const auto part = [&](unsigned shift) { return static_cast<double>((color >> shift) & 0xFFU) / 255.0; };
    cairo_set_source_rgb(context, part(16), part(8), part(0));
    cairo_save(context);
    cairo_translate(context, left, top);
    cairo_scale(context, scale, 1);
    cairo_move_to(context, 0, 0);
    pango_cairo_show_layout(context, layout);
    cairo_restore(context);
}

} // namespace

void DrawText(Canvas& canvas, std::string_view text, const TextStyle& style, const TextPlace& place) {
    if (text.empty() || !canvas.Visible(place.area))
        return;
    Caption caption = place.accelerator ? TakeAccelerator(text) : Caption{std::string(text)};
    caption.text = Drawable(caption.text);
    LaidText& laid =
        place.wrap ? LaidTexts::Get().Lines(caption, style, place) : LaidTexts::Get().Line(caption, style);
    const double scale = place.wrap ? laid.scale : ScaleToFit(laid.width, place.area.Width());
    const int shown = static_cast<int>(laid.width * scale + 0.5);
    const int left = place.wrap ? place.area.left : LeftOf(place, shown);
    const int top = place.vertical == VerticalAlign::Top
                        ? place.area.top
                        : place.area.top + std::max(0, (place.area.Height() - laid.height) / 2);
    const ClipTo clip(canvas, place.area);
    Show(canvas, laid.layout.get(), style.color, left, top, scale);
}

TextSize MeasureText(std::string_view text, const TextStyle& style) {
    const LaidText& laid = LaidTexts::Get().Line(Caption{Drawable(text)}, style);
    return {laid.width, laid.height};
}

} // namespace tovimar::platform::painting
