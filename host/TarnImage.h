// Pictures, and the notice that the theme has changed.
#pragma once
#include "frame/Provider.h"
#include "host/Geometry.h"

namespace tarn {

// Something that draws itself into a rectangle.
class image {
public:
    virtual ~image() {}
    // Draws on the current port, stretched to the rectangle.
    virtual void Draw(Rect const &) = 0;
    // The picture's own size, as a rectangle whose top left is (0, 0).
    virtual Rect GetFrameRect() const = 0;
};

} // namespace tarn

// Hears that the theme has changed.
class ThemeChangeNotificationProvider_Listener : public Dependent<ThemeChangeNotificationProvider_Listener> {
public:
    // Named colours and artwork are those of the new theme by now; windows are redrawn afterwards.
    virtual void ThemeChanged() = 0;
};

// Sends ThemeChanged.
class ThemeChangeNotificationProvider : public Provider<ThemeChangeNotificationProvider_Listener> {
public:
    static ThemeChangeNotificationProvider &Instance(); // one for the process
    // For the host: sends ThemeChanged to everybody.
    void NotifyThemeChanged();
};

// A picture by resource number. Follows changes of the theme by itself.
class PngImage : public tarn::image, public ThemeChangeNotificationProvider_Listener {
public:
    // A number without a picture gives an empty image that draws nothing.
    explicit PngImage(short id);
    virtual ~PngImage();
    virtual void Draw(Rect const &);
    virtual Rect GetFrameRect() const;
    // The next use looks for the theme's picture. A file that was read once is not read again.
    virtual void ThemeChanged();

private:
    PngImage(PngImage const &);
    PngImage &operator=(PngImage const &);

    struct Rep;
    Rep *rep;
};
