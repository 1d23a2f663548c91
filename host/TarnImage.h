#pragma once
#include "host/Geometry.h"
#include "frame/Provider.h"

namespace tarn {

class image {
public:
    virtual ~image() {}
    virtual void Draw(Rect const &) = 0;
    virtual Rect GetFrameRect() const = 0;
};
}

class ThemeChangeNotificationProvider_Listener : public Dependent<ThemeChangeNotificationProvider_Listener> {
public:
    virtual void ThemeChanged() = 0;
};

class ThemeChangeNotificationProvider : public Provider<ThemeChangeNotificationProvider_Listener> {
public:
    static ThemeChangeNotificationProvider &Instance();
};

class PngImage : public tarn::image, public ThemeChangeNotificationProvider_Listener {
public:
    explicit PngImage(short id);
    virtual ~PngImage();
    virtual void Draw(Rect const &);
    virtual Rect GetFrameRect() const;
    virtual void ThemeChanged();
private:
    PngImage(PngImage const &);
    PngImage &operator=(PngImage const &);
    struct Rep;
    Rep *rep;
};
