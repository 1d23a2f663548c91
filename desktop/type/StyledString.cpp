#include "host/StyledString.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <memory>
#include <optional>
#include <vector>

namespace {

class StyledText : public StyledStringItem {
public:
    StyledText(UString const &text_, fontSaveRec const &font_, RGBColor const *color_)
        : text(text_)
        , font(font_) {
        if (color_)
            color = *color_;
    }
    int Width() const {
        WithFont const with(font);
        return LooseStringWidth(text, 0.0f, 1.0f);
    }
    short Ascent() const {
        WithFont const with(font);
        TarnQuickDrawText::FontInfo info;
        tarn::GetFontInfo(info);
        return info.ascent;
    }
    void Draw() const {
        WithFont const with(font);
        SaveColors const colors;
        if (color)
            VelaDrawing::RGBForeColor(*color);
        DrawString(text);
    }

private:
    struct WithFont {
        explicit WithFont(fontSaveRec const &font) { SetFontData(&font); }
        SaveTextState const saved;
    };
    UString const text;
    fontSaveRec const font;
    std::optional<RGBColor> color;
};

} // namespace

AutoPtr<StyledStringItem> NewStyledText(UString const &text, fontSaveRec const &font, RGBColor const *color) {
    return AutoPtr<StyledStringItem>(new StyledText(text, font, color));
}

struct StyledString::Rep {
    // Calls for every part that can be drawn.
    template <class Action> void ForEach(Action action) const {
        for (std::unique_ptr<StyledStringItem> const &part : parts)
            if (StyledText const *const text = dynamic_cast<StyledText const *>(part.get()))
                action(*text);
    }
    std::vector<std::unique_ptr<StyledStringItem>> parts;
};

StyledString::StyledString()
    : rep(new Rep) {}

StyledString::~StyledString() { delete rep; }

void StyledString::Add(AutoPtr<StyledStringItem> part) {
    if (part.get())
        rep->parts.emplace_back(part.release());
}

int StyledString::GetWidth() const {
    int width = 0;
    rep->ForEach([&](StyledText const &text) { width += text.Width(); });
    return width;
}

short StyledString::GetAscent() const {
    short ascent = 0;
    rep->ForEach([&](StyledText const &text) { ascent = std::max(ascent, text.Ascent()); });
    return ascent;
}

void StyledString::Draw() {
    rep->ForEach([](StyledText const &text) { text.Draw(); });
}
