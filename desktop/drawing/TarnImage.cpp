#include "host/TarnImage.h"
#include "desktop/drawing/AreaScale.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/Surface.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Resources.h"
#include <algorithm>
#include <map>
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

// pictures/THEME/42.png, or that of the light theme; with the suffix, pictures/THEME/42@2x.png of the same
// theme. Empty when there is none.
std::string PicturePath(short id, char const *suffix) {
    std::string const theme = Resources::Instance().Theme();
    bool const hasOwn = !PathIn(theme.c_str(), id, kPlainSuffix).empty();
    return PathIn(hasOwn ? theme.c_str() : kPlainTheme, id, suffix);
}

// Pictures from files, each of which is decoded once.
class PictureFiles {
public:
    // Null when there is no such picture, or it is broken.
    Surface *Read(short id, char const *suffix) {
        try {
            std::string const path = PicturePath(id, suffix);
            return path.empty() ? nullptr : Decoded(path);
        } catch (ResourceError const &) {
            return nullptr; // there is no artwork at all
        }
    }

private:
    Surface *Decoded(std::string const &path) {
        auto const known = pictures.find(path);
        if (known != pictures.end())
            return known->second.get();
        std::string reason; // a broken picture is as good as none
        return (pictures[path] = Surface::ReadPng(path, reason)).get();
    }

    std::map<std::string, std::unique_ptr<Surface>> pictures; // by path; null for a broken one
};

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
            picture = files.Read(id, kPlainSuffix);
            opaque = picture && picture->IsOpaque();
        }
        return picture;
    }

    // The one with more pixels, which most windows do not need; null when there is none.
    Surface *Detailed() {
        if (!detailedKnown) {
            detailedKnown = true;
            detailed = files.Read(id, kDetailedSuffix);
            opaque = opaque && (!detailed || detailed->IsOpaque());
        }
        return detailed;
    }

    // The picture in that many device pixels. Kept, since a picture is nearly always drawn in the same size.
    PixelImage Sized(int width, int height) {
        width = std::min(width, kLongestScaledSide);
        height = std::min(height, kLongestScaledSide);
        Surface *shown = width > picture->Width() && Detailed() ? detailed : picture;
        if (shown->Width() != width || shown->Height() != height) {
            if (!scaled || scaled->Width() != width || scaled->Height() != height) {
                scaled.reset(new Surface(width, height));
                ScalePixels(shown->Pixels(), shown->Width(), shown->Height(), scaled->Pixels(), width,
                            height);
            }
            shown = scaled.get();
        }
        return {shown->PixmanImage(), width, height, opaque, false, {0, 0, 0, 0}};
    }

    // Which pictures are shown has to be found out again; what was decoded stays, for when they come back.
    void Forget() {
        known = detailedKnown = false;
        picture = detailed = nullptr;
        scaled.reset();
    }

    short const id;
    bool known = false, detailedKnown = false; // whether the files have been looked for
    bool opaque = false;
    Surface *picture = nullptr;      // in its own size
    Surface *detailed = nullptr;     // with twice as many pixels each way, for larger sizes; or null
    std::unique_ptr<Surface> scaled; // as it was drawn last, if that was in another size
    PictureFiles files;
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
