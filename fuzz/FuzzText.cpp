// Any text, shaped and drawn.
#include "desktop/resources/Utf.h"
#include "fuzz/support/Entry.h"
#include "fuzz/support/Require.h"
#include "host/TextLayout.h"
#include "tests/drawing/Canvas.h"
#include <string>
#include <vector>

namespace {

int const kCanvasWidth = 200, kCanvasHeight = 60;
int const kFonts = 10;

// How the text is drawn, from the first bytes of the input.
struct Manner {
    static constexpr std::size_t kBytes = 5;

    explicit Manner(std::uint8_t const *bytes)
        : font(bytes[0] % kFonts)
        , alignment(static_cast<TextSettings::Alignment>(bytes[1] % 4 - 1))
        , truncation(static_cast<TextSettings::TruncateCode>(bytes[1] / 4 % 3))
        , wrap(bytes[1] / 16 % 2)
        , verticalAlignment(bytes[1] / 32 % 2)
        , spacing(static_cast<float>(bytes[2] - 128) / 8)
        , scale(static_cast<float>(bytes[3]) / 64)
        , box{10, 20, static_cast<short>(10 + bytes[4] / 8), static_cast<short>(20 + bytes[4])} {}

    void Draw(OS::TextLayout &layout, UString const &text) const {
        DrawTextLayoutInRect(layout, text, box, font, alignment, truncation, verticalAlignment, wrap, 0, 0,
                             spacing, scale, 0.0f);
    }

    int font;
    TextSettings::Alignment alignment;
    TextSettings::TruncateCode truncation;
    int wrap, verticalAlignment;
    float spacing, scale;
    Rect box;
};

// The pixels that the text gives with the layout.
std::vector<std::uint32_t> Drawn(Canvas &canvas, Manner const &manner, OS::TextLayout &layout,
                                 UString const &text) {
    canvas.Wipe(Canvas::kWhite);
    manner.Draw(layout, text);
    return canvas.Pixels();
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    if (size < Manner::kBytes)
        return 0;
    Manner const manner(data);
    UString const text = Utf::FromUtf8(
        std::string_view(reinterpret_cast<char const *>(data) + Manner::kBytes, size - Manner::kBytes));
    Canvas canvas(kCanvasWidth, kCanvasHeight);
    OS::TextLayout kept, fresh;
    std::vector<std::uint32_t> const first = Drawn(canvas, manner, kept, text);
    Require(Drawn(canvas, manner, kept, text) == first, "a kept layout draws the same again");
    Require(Drawn(canvas, manner, fresh, text) == first, "a new layout draws as a kept one");
    Require(kept.GetWidth() >= 0 && kept.GetWidth() == fresh.GetWidth(), "equal texts are equally wide");
    return 0;
}
