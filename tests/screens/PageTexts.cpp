#include "tests/screens/PageTexts.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "desktop/resources/Utf.h"
#include "desktop/type/FontFamilies.h"
#include "desktop/type/ShapedTextCache.h"
#include "dialogs/Utf8.h"
#include "host/Icons.h"
#include "tests/screens/GalleryPages.h"
#include "tools/gallery/Gallery.h"
#include <algorithm>
#include <boost/property_tree/json_parser.hpp>
#include <cmath>
#include <map>
#include <sstream>

namespace {

typedef boost::property_tree::ptree Json;

int const kAbove = 2,
          kBelow = 2; // pixels of a line without letters: at its top, and below those without tails
char const kTails[] = "gjpqyQ,;()";
int const kSpare = 3;    // pixels beside a text that is centred
int const kOnePart = 50; // a colour that covers less than one part of so many is no ground

Json Parsed(std::string const &line) {
    Json json;
    std::istringstream in(line);
    boost::property_tree::read_json(in, json);
    return json;
}

std::vector<int> Numbers(Json const &json, char const *key) {
    std::vector<int> numbers;
    for (Json::value_type const &number : json.get_child(key))
        numbers.push_back(number.second.get_value<int>());
    return numbers;
}

Rect MakeRect(int top, int left, int bottom, int right) {
    return {static_cast<short>(top), static_cast<short>(left), static_cast<short>(bottom),
            static_cast<short>(right)};
}

bool IsEmpty(Rect const &r) { return r.left >= r.right || r.top >= r.bottom; }

Rect Common(Rect const &a, Rect const &b) {
    return {std::max(a.top, b.top), std::max(a.left, b.left), std::min(a.bottom, b.bottom),
            std::min(a.right, b.right)};
}

Rect Letters(Rect const &r) { return MakeRect(r.top + kAbove, r.left, r.bottom, r.right); }

// Without what a frame or a line along the edge of a control may cover.
Rect Middle(Rect const &r) { return MakeRect(r.top + 2 * kAbove, r.left, r.bottom - 2 * kBelow, r.right); }

// A component from 0 to 1.
double Linear(double c) { return c <= 0.03928 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4); }

double Luminance(double red, double green, double blue) {
    return 0.2126 * Linear(red) + 0.7152 * Linear(green) + 0.0722 * Linear(blue);
}

double LuminanceOf(RGBColor const &color) {
    double const kMost = 65535;
    return Luminance(color.red / kMost, color.green / kMost, color.blue / kMost);
}

double LuminanceOf(std::uint32_t pixel) {
    double const kMost = 255;
    return Luminance((pixel >> 16 & 0xFF) / kMost, (pixel >> 8 & 0xFF) / kMost, (pixel & 0xFF) / kMost);
}

double Contrast(double a, double b) { return (std::max(a, b) + 0.05) / (std::min(a, b) + 0.05); }

// Hears what is drawn while it is drawn: the current port is that of the pane.
class Listener {
public:
    void Hear(std::string const &line) {
        Json const json = Parsed(line);
        if (json.count("text") && json.count("size"))
            HearText(json);
        else
            HearShape(json);
    }

    std::vector<PageText> texts;

private:
    static DrawingPort &Port() { return *DrawingPort::CurrentPort(); }

    static TextShape ShapeOf(Json const &json) {
        TextShape shape;
        shape.font = FontSpec::Make(FontFamilies::Named(json.get<std::string>("family")).GetOrderedFontID(),
                                    json.get<int>("face"), json.get<int>("size"));
        return shape;
    }

    void HearText(Json const &json) {
        PageText text = {};
        text.text = json.get<std::string>("text");
        if (text.text.find_first_not_of(' ') == std::string::npos)
            return;
        std::vector<int> const fore = Numbers(json, "fore");
        text.color = {static_cast<unsigned short>(fore[0]), static_cast<unsigned short>(fore[1]),
                      static_cast<unsigned short>(fore[2])};
        text.wraps = json.get("wrap", 0) != 0;
        text.isInRect = json.count("rect") != 0;
        if (text.isInRect)
            PlaceInRect(text, json);
        else
            PlaceAtPoint(text, json);
        text.box = Port().LocalToWindow(text.box);
        text.room = Port().LocalToWindow(text.room);
        OSRgn clip = Port().Clip();
        text.clip = CarbonUtils::GetRgnBounds(&clip);
        Rect const shown = Common(text.box, text.clip);
        if (IsEmpty(Middle(shown)))
            return;
        Port().FinishGround(); // which waits for somebody to draw on it
        text.contrast = WorstContrast(text.color, Middle(shown));
        texts.push_back(text);
    }

    static void PlaceAtPoint(PageText &text, Json const &json) {
        std::vector<int> const at = Numbers(json, "at");
        UString const units = Utf8::ToUString(text.text);
        ShapedText const &shaped = ShapedTextCache::Get(Utf::View(units), ShapeOf(json));
        int const top = at[0] - shaped.Ascent(), limit = json.get("maxWidth", -1);
        text.box = MakeRect(top, at[1], top + shaped.Height(), at[1] + shaped.Width());
        text.room = text.box;
        if (limit >= 0)
            text.room.right = static_cast<short>(at[1] + limit);
    }

    static void PlaceInRect(PageText &text, Json const &json) {
        std::vector<int> const rect = Numbers(json, "rect");
        text.room = MakeRect(rect[0], rect[1], rect[2], rect[3]);
        int const roomWidth = rect[3] - rect[1], roomHeight = rect[2] - rect[0];
        TextShape shape = ShapeOf(json);
        shape.wraps = text.wraps;
        if (text.wraps)
            shape.width = roomWidth;
        UString const units = Utf8::ToUString(text.text);
        ShapedText const &shaped = ShapedTextCache::Get(Utf::View(units), shape);
        text.isCentred = json.get<std::string>("alignment") == "center" && !text.wraps;
        std::string const side = json.get<std::string>("alignment");
        int const left = rect[1] + ShapedText::LineStart(shaped.Width(), roomWidth,
                                                         side == "right"    ? TextSettings::kAlignRight
                                                         : side == "center" ? TextSettings::kAlignCenter
                                                                            : TextSettings::kAlignLeft,
                                                         shaped.IsRightToLeft());
        int const down = json.get<int>("verticalAlignment") == 1 ? (roomHeight - shaped.Height()) / 2 : 0;
        text.box = MakeRect(rect[0] + down, left, rect[0] + down + shaped.Height(), left + shaped.Width());
    }

    // With the colours that cover a part of the box worth speaking of.
    static double WorstContrast(RGBColor const &color, Rect const &shown) {
        DeviceRect const box = Port().Scale().ToDevice(shown.left, shown.top, shown.right, shown.bottom);
        std::map<std::uint32_t, int> counts;
        for (int v = box.top; v < box.bottom; ++v)
            for (int h = box.left; h < box.right; ++h)
                ++counts[Port().GetSurface()->Row(v)[h]];
        double worst = 21;
        for (auto const &[pixel, count] : counts)
            if (count * kOnePart >= box.Width() * box.Height())
                worst = std::min(worst, Contrast(LuminanceOf(color), LuminanceOf(pixel)));
        return worst;
    }

    // Shapes in a rectangle, and icons, cover what lies below them.
    void HearShape(Json const &json) {
        std::string const operation = json.get<std::string>("op");
        if (operation == "Draw1Icon" && json.count("h"))
            Cover(IconBox(json));
        else if (json.count("rect") && operation.compare(0, 6, "Narrow") != 0 &&
                 operation.compare(0, 4, "With") != 0 && operation != "DrawTextEdit")
            Cover(Numbers(json, "rect"));
    }

    static std::vector<int> IconBox(Json const &json) {
        Rect const size = GetIconBounds(static_cast<short>(json.get<int>("family")));
        int const h = json.get<int>("h"), v = json.get<int>("v");
        return {v, h, v + size.bottom, h + size.right};
    }

    void Cover(std::vector<int> const &rect) {
        OSRgn clip = Port().Clip();
        Rect const shape = Common(Port().LocalToWindow(MakeRect(rect[0], rect[1], rect[2], rect[3])),
                                  CarbonUtils::GetRgnBounds(&clip));
        for (PageText &text : texts)
            text.isCovered = text.isCovered || !IsEmpty(Common(Letters(Common(text.box, text.clip)), shape));
    }
};

} // namespace

bool PageText::HasRoom() const {
    int const spare = isCentred ? kSpare : 0;
    int const left = std::max(room.left, clip.left), right = std::min(room.right, clip.right);
    return box.left - spare >= left && box.right + spare <= right;
}

bool PageText::IsWholeUpAndDown() const {
    int const bottom = wraps ? std::min(room.bottom, clip.bottom) : clip.bottom;
    bool const hasTails = text.find_first_of(kTails) != std::string::npos;
    return Letters(box).top >= clip.top && box.bottom - (hasTails ? 0 : kBelow) <= bottom;
}

bool PageText::Touches(PageText const &other) const {
    return !IsEmpty(Common(Letters(Common(box, clip)), Letters(Common(other.box, other.clip))));
}

std::ostream &operator<<(std::ostream &out, PageText const &text) {
    auto const write = [&](Rect const &r) {
        out << r.left << ',' << r.top << '-' << r.right << ',' << r.bottom;
    };
    out << '"' << text.text << "\" at ";
    write(text.box);
    out << ", room ";
    write(text.room);
    out << ", clip ";
    write(text.clip);
    return out << ", contrast " << text.contrast;
}

std::vector<PageText> PageTexts::Of(PageFile const &page, DesktopOptions const &options) {
    SimulatedDesktop desktop(options);
    Gallery gallery(desktop, GalleryFiles(), options.scale);
    gallery.ShowPage(GalleryFiles().Find(page.name));
    Glog &glog = Glog::From(gallery.Window());
    glog.Update();
    Listener listener;
    desktop.WatchDrawing([&](std::string const &line) { listener.Hear(line); });
    glog.DamageAll();
    glog.Update();
    desktop.WatchDrawing(nullptr);
    return listener.texts;
}
