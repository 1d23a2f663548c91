#include "host/TarnImage.h"
#include "desktop/drawing/AreaScale.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/Surface.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Resources.h"
#include <algorithm>
#include <memory>
#include <string>

namespace {

constexpr char kPlainTheme[] = "light";
constexpr char kPlainSuffix[] = ".png", kDetailedSuffix[] = "@2x.png";
// No window shows more, and a stretched copy of a picture should not eat the memory.
constexpr int kLongestScaledSide = 8192;

class ThemeChangedMsg : public DependentCastMessenger<ThemeChangeNotificationProvider_Listener> {
public:
    void BroadcastChange(ThemeChangeNotificationProvider_Listener *listener) override {
        listener->ThemeChanged();
    }
};

std::string PathIn(char const *theme, short id, char const *suffix) {
    return Resources::Instance().Find("pictures/" + std::string(theme) + '/' + std::to_string(id) + suffix);
}

// pictures/THEME/42.png, or that of the light theme; with the suffix, pictures/THEME/42@2x.png. Empty when
// there is neither.
std::string PicturePath(short id, char const *suffix) {
    std::string const path = PathIn(Resources::Instance().Theme().c_str(), id, suffix);
    return path.empty() ? PathIn(kPlainTheme, id, suffix) : path;
}

// Null when there is no such picture, or it is broken.
std::unique_ptr<Surface> ReadPicture(short id, char const *suffix) {
    try {
        std::string const path = PicturePath(id, suffix);
        std::string reason; // a broken picture is as good as none
        return path.empty() ? nullptr : Surface::ReadPng(path, reason);
    } catch (ResourceError const &) {
        return nullptr; // there is no artwork at all
    }
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

    // In its own size; null when there is no such picture, or it is broken.
    Surface const *Picture() {
        if (!known) {
            known = true;
            picture = ReadPicture(id, kPlainSuffix);
            opaque = picture && picture->IsOpaque();
        }
        return picture.get();
    }

    // The one with more pixels, which most windows do not need; null when there is none.
    Surface *Detailed() {
        if (!detailedKnown) {
            detailedKnown = true;
            detailed = ReadPicture(id, kDetailedSuffix);
            opaque = opaque && (!detailed || detailed->IsOpaque());
        }
        return detailed.get();
    }

    // The picture in that many device pixels. Kept, since a picture is nearly always drawn in the same size.
    PixelImage Sized(int width, int height) {
        width = std::min(width, kLongestScaledSide);
        height = std::min(height, kLongestScaledSide);
        Surface *shown = width > picture->Width() && Detailed() ? detailed.get() : picture.get();
        if (shown->Width() != width || shown->Height() != height) {
            if (!scaled || scaled->Width() != width || scaled->Height() != height) {
                scaled.reset(new Surface(width, height));
                ScalePixels(shown->Pixels(), shown->Width(), shown->Height(), scaled->Pixels(), width,
                            height);
            }
            shown = scaled.get();
        }
        return {shown->PixmanImage(), width, height, opaque, false};
    }

    void Forget() {
        known = detailedKnown = false;
        picture.reset();
        detailed.reset();
        scaled.reset();
    }

    short const id;
    bool known = false, detailedKnown = false; // whether the files have been looked for
    bool opaque = false;
    std::unique_ptr<Surface> picture;  // in its own size
    std::unique_ptr<Surface> detailed; // with twice as many pixels each way, for larger sizes; or null
    std::unique_ptr<Surface> scaled;   // as it was drawn last, if that was in another size
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
