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
                                                   {"cambria", "Liberation Serif"},
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

struct Unref {
    void operator()(void* object) const { g_object_unref(object); }
};
struct FreeFont {
    void operator()(PangoFontDescription* font) const { pango_font_description_free(font); }
};
using Font = std::unique_ptr<PangoFontDescription, FreeFont>;

/// One context, one layout and the fonts of the process: making them costs far more than using them.
class Fonts {
public:
    static Fonts& Get() {
        static Fonts fonts;
        return fonts;
    }

    PangoLayout* Layout(const TextStyle& style) {
        const auto* font = Find(style);
        if (font != current_)
            pango_layout_set_font_description(layout_.get(), font);
        current_ = font;
        return layout_.get();
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
        layout_.reset(pango_layout_new(context_.get()));
        pango_layout_set_wrap(layout_.get(), PANGO_WRAP_WORD_CHAR);
        pango_layout_set_auto_dir(layout_.get(), TRUE);
    }

    const PangoFontDescription* Find(const TextStyle& style) {
        const int size = std::clamp(style.size, kSmallestSize, kLargestSize);
        const bool bold = style.weight >= 600;
        const auto key =
            style.family + '\n' + std::to_string(size) + (bold ? "b" : "") + (style.italic ? "i" : "");
        const auto found = fonts_.find(key);
        if (found != fonts_.end())
            return found->second.get();
        // Sizes and families of a hostile design must not fill the memory.
        if (fonts_.size() >= 512) {
            fonts_.clear();
            current_ = nullptr;
        }
        Font font(pango_font_description_new());
        pango_font_description_set_family_static(font.get(), FamilyFor(style.family));
        pango_font_description_set_size(font.get(), size * PANGO_SCALE);
        pango_font_description_set_weight(font.get(), bold ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
        pango_font_description_set_style(font.get(), style.italic ? PANGO_STYLE_ITALIC : PANGO_STYLE_NORMAL);
        return fonts_.emplace(key, std::move(font)).first->second.get();
    }

    std::unique_ptr<PangoFontMap, Unref> map_;
    std::unique_ptr<PangoContext, Unref> context_;
    std::unique_ptr<PangoLayout, Unref> layout_;
    std::unordered_map<std::string, Font> fonts_;
    const PangoFontDescription* current_ = nullptr;
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

struct Fitted {
    int width = 0, height = 0; ///< as laid out
    double scale = 1;          ///< horizontally
};

Fitted Fit(PangoLayout* layout, const TextPlace& place) {
    Fitted fitted;
    pango_layout_get_pixel_size(layout, &fitted.width, &fitted.height);
    const int room = place.area.Width();
    if (!place.wrap) {
        // Each scale has glyphs of its own to be drawn: few steps keep them shared.
        for (const double scale : {0.95, 0.9, kNarrowest})
            if (fitted.width > room && fitted.width * scale <= room) {
                fitted.scale = scale;
                break;
            }
        return fitted;
    }
    if (fitted.height <= place.area.Height() + 1)
        return fitted;
    const int height = fitted.height;
    pango_layout_set_width(layout, static_cast<int>(room / kNarrowest) * PANGO_SCALE);
    pango_layout_get_pixel_size(layout, &fitted.width, &fitted.height);
    if (fitted.height < height) {
        fitted.scale = kNarrowest;
        return fitted;
    }
    pango_layout_set_width(layout, room * PANGO_SCALE);
    pango_layout_get_pixel_size(layout, &fitted.width, &fitted.height);
    return fitted;
}

} // namespace

void DrawText(Canvas& canvas, std::string_view text, const TextStyle& style, const TextPlace& place) {
    if (text.empty() || !canvas.Visible(place.area))
        return;
    auto* layout = Fonts::Get().Layout(style);
    Caption caption = place.accelerator ? TakeAccelerator(text) : Caption{std::string(text)};
    caption.text = Drawable(caption.text);
    pango_layout_set_text(layout, caption.text.data(), static_cast<int>(caption.text.size()));
    pango_layout_set_width(layout, place.wrap ? place.area.Width() * PANGO_SCALE : -1);
    pango_layout_set_single_paragraph_mode(layout, place.wrap ? FALSE : TRUE);
    pango_layout_set_alignment(layout, place.wrap ? Alignment(place.align) : PANGO_ALIGN_LEFT);
    Underline(layout, style, caption);

    const auto fitted = Fit(layout, place);
    const int shown = static_cast<int>(fitted.width * fitted.scale + 0.5);
    const int left = place.wrap ? place.area.left : LeftOf(place, shown);
    const int top = place.vertical == VerticalAlign::Top
                        ? place.area.top
                        : place.area.top + std::max(0, (place.area.Height() - fitted.height) / 2);
    {
        const ClipTo clip(canvas, place.area);
        auto* context = canvas.Context();
        const auto part = [&](unsigned shift) {
            return static_cast<double>((style.color >> shift) & 0xFFU) / 255.0;
        };
        cairo_set_source_rgb(context, part(16), part(8), part(0));
        cairo_save(context);
        cairo_translate(context, left, top);
        cairo_scale(context, fitted.scale, 1);
        cairo_move_to(context, 0, 0);
        pango_cairo_show_layout(context, layout);
        cairo_restore(context);
    }
    pango_layout_set_attributes(layout, nullptr);
}

TextSize MeasureText(std::string_view text, const TextStyle& style) {
    auto* layout = Fonts::Get().Layout(style);
    const auto drawable = Drawable(text);
    pango_layout_set_text(layout, drawable.data(), static_cast<int>(drawable.size()));
    pango_layout_set_width(layout, -1);
    pango_layout_set_single_paragraph_mode(layout, TRUE);
    TextSize size;
    pango_layout_get_pixel_size(layout, &size.width, &size.height);
    return size;
}

} // namespace tovimar::platform::painting
