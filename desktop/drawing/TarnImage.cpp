#include "host/TarnImage.h"
#include "desktop/drawing/AreaScale.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/Surface.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Resources.h"
#include <algorithm>
#include <cstdio>
#include <memory>
#include <string>

namespace {

constexpr char kPlainTheme[] = "light";
// No window shows more, and a stretched copy of a picture should not eat the memory.
constexpr int kLongestScaledSide = 8192;

class ThemeChangedMsg : public DependentCastMessenger<ThemeChangeNotificationProvider_Listener> {
public:
    void BroadcastChange(ThemeChangeNotificationProvider_Listener *listener) override {
        listener->ThemeChanged();
    }
};

// pictures/0042-dark.png in the dark theme, if there is one, else pictures/0042.png. Empty for neither.
std::string PicturePath(short id) {
    Resources &resources = Resources::Instance();
    char number[8];
    std::snprintf(number, sizeof number, "%04d", static_cast<int>(id));
    std::string const start = std::string("pictures/") + number;
    std::string path;
    if (resources.Theme() != kPlainTheme)
        path = resources.Find(start + '-' + resources.Theme() + ".png");
    return path.empty() ? resources.Find(start + ".png") : path;
}

} // namespace

ThemeChangeNotificationProvider &ThemeChangeNotificationProvider::Instance() {
    static ThemeChangeNotificationProvider provider;
    return provider;
}

void ThemeChangeNotificationProvider::NotifyThemeChanged() {
    if (HasDependents())
        BroadcastChange(ThemeChangedMsg(), nullptr);
}

struct PngImage::Rep {
    explicit Rep(short id_)
        : id(id_) {}

    // Null when there is no such picture, or it is broken.
    Surface const *Picture() {
        if (!known) {
            known = true;
            try {
                std::string const path = PicturePath(id);
                std::string reason; // a broken picture is as good as none
                if (!path.empty())
                    picture = Surface::ReadPng(path, reason);
            } catch (ResourceError const &) {
                picture.reset(); // there is no artwork at all
            }
            opaque = picture && picture->IsOpaque();
        }
        return picture.get();
    }

    // The picture in that many device pixels. Kept, since a picture is nearly always drawn in the same size.
    PixelImage Sized(int width, int height) {
        width = std::min(width, kLongestScaledSide);
        height = std::min(height, kLongestScaledSide);
        Surface *shown = picture.get();
        if (picture->Width() != width || picture->Height() != height) {
            if (!scaled || scaled->Width() != width || scaled->Height() != height) {
                scaled.reset(new Surface(width, height));
                ScalePixels(picture->Pixels(), picture->Width(), picture->Height(), scaled->Pixels(), width,
                            height);
            }
            shown = scaled.get();
        }
        return {shown->PixmanImage(), width, height, opaque, false};
    }

    void Forget() {
        known = false;
        picture.reset();
        scaled.reset();
    }

    short const id;
    bool known = false; // whether the file has been looked for
    bool opaque = false;
    std::unique_ptr<Surface> picture, scaled;
};

PngImage::PngImage(short id)
    : rep(new Rep(id)) {
    DependUpon(&ThemeChangeNotificationProvider::Instance());
}

PngImage::~PngImage() { delete rep; }

void PngImage::Draw(Rect const &r) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("PngImage::Draw").Integer("picture", rep->id).Box("rect", r));
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port || !rep->Picture())
        return;
    PixelScope pixels(*port);
    if (!pixels.CanDraw())
        return;
    DeviceRect const box = pixels.ToDevice(r);
    if (!box.Empty() && pixels.Meets(box))
        pixels.DrawImage(rep->Sized(box.Width(), box.Height()), box.left, box.top, box, false);
}

Rect PngImage::GetFrameRect() const {
    Surface const *picture = rep->Picture();
    if (!picture)
        return {0, 0, 0, 0};
    return {0, 0, SaturatedPixel(picture->Height()), SaturatedPixel(picture->Width())};
}

void PngImage::ThemeChanged() { rep->Forget(); }
