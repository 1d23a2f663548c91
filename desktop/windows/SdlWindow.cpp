#include "desktop/windows/SdlWindow.h"
#include "desktop/drawing/Surface.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/windows/SdlPicture.h"
#include "desktop/windows/SdlScreen.h"
#include "desktop/windows/SdlTimeOfUse.h"
#include "desktop/windows/SdlWindowSystem.h"
#include <SDL.h>
#include <algorithm>
#include <stdexcept>

// Our pixels are opaque where they reach the screen, so their alpha need not be looked at.
static std::uint32_t const kSurfaceFormat = SDL_PIXELFORMAT_RGB888;
static int const kSurfacePixelBytes = 4;
// The largest size that X windows can have, which stands for "no limit".
static int const kGreatestWindowSize = 32767;

static std::uint32_t WindowFlags(WindowSpec const &spec) {
    std::uint32_t flags = SDL_WINDOW_HIDDEN;
    if (spec.popup)
        flags |= SDL_WINDOW_POPUP_MENU | SDL_WINDOW_SKIP_TASKBAR | SDL_WINDOW_ALWAYS_ON_TOP |
                 SDL_WINDOW_BORDERLESS;
    else if (spec.resizable)
        flags |= SDL_WINDOW_RESIZABLE;
    return flags;
}

static SDL_Window *MakeWindow(WindowSpec const &spec, DeviceScale scale) {
    int x = spec.placed ? scale.Edge(spec.h) : static_cast<int>(SDL_WINDOWPOS_UNDEFINED);
    int y = spec.placed ? scale.Edge(spec.v) : static_cast<int>(SDL_WINDOWPOS_UNDEFINED);
    SDL_Window *window = SDL_CreateWindow(spec.title.c_str(), x, y, std::max(scale.Edge(spec.width), 1),
                                          std::max(scale.Edge(spec.height), 1), WindowFlags(spec));
    if (window == nullptr)
        throw std::runtime_error("cannot open the window \"" + spec.title + "\": " + SDL_GetError());
    SdlScreen::LimitEvents(window);
    SdlTimeOfUse::Follow(window);
    return window;
}

SdlWindow::SdlWindow(SdlWindowSystem &system_, WindowSpec const &spec, DeviceScale scale_)
    : system(system_)
    , window(MakeWindow(spec, scale_))
    , id(SDL_GetWindowID(window))
    , scale(scale_)
    , width(std::max(spec.width, 1))
    , height(std::max(spec.height, 1))
    , limits()
    , placePending(spec.placed)
    , placeH(spec.h)
    , placeV(spec.v) {
    system.Add(this);
}

SdlWindow::~SdlWindow() {
    system.Remove(this);
    picture.reset();
    SdlTimeOfUse::Leave(window);
    SDL_DestroyWindow(window);
}

int SdlWindow::Display() const { return std::max(SDL_GetWindowDisplayIndex(window), 0); }

bool SdlWindow::IsAtEdge(int x, int y) const {
    int deviceWidth = 0, deviceHeight = 0;
    SDL_GetWindowSize(window, &deviceWidth, &deviceHeight);
    return x == 0 || y == 0 || x == deviceWidth - 1 || y == deviceHeight - 1;
}

int SdlWindow::ScreenX() const {
    int x = 0;
    SDL_GetWindowPosition(window, &x, nullptr);
    return x;
}

int SdlWindow::ScreenY() const {
    int y = 0;
    SDL_GetWindowPosition(window, nullptr, &y);
    return y;
}

// Every device pixel counts, so the last logical pixel may be cut. The current size stays where it gives the
// same device size: below scale 1 several do.
int SdlWindow::WholeLogicalPixels(DeviceScale scale, int device, int current) {
    return scale.Edge(current) == device ? current : std::max(scale.ToLogical(device - 1) + 1, 1);
}

bool SdlWindow::TakeSize() {
    int deviceWidth = 0, deviceHeight = 0;
    SDL_GetWindowSize(window, &deviceWidth, &deviceHeight);
    int newWidth = WholeLogicalPixels(scale, deviceWidth, width);
    int newHeight = WholeLogicalPixels(scale, deviceHeight, height);
    if (newWidth == width && newHeight == height)
        return false;
    width = newWidth;
    height = newHeight;
    return true;
}

void SdlWindow::SetScale(DeviceScale newScale) {
    scale = newScale;
    if (!(limits == SizeLimits()))
        ApplySizeLimits();
    SetContentSize(width, height);
}

void SdlWindow::CorrectPlace() {
    if (!placePending)
        return;
    placePending = false;
    if (ScreenX() != scale.Edge(placeH) || ScreenY() != scale.Edge(placeV))
        SetPlace(placeH, placeV);
}

// The pixels go out at once: they would otherwise wait for the exposure, and so for all events before it. SDL
// refuses a picture that has not the window's size.
void SdlWindow::Show() {
    SDL_ShowWindow(window);
    if (!keptHidden)
        return;
    keptHidden = false;
    if (picture)
        picture->ShowAll();
    else
        SDL_UpdateWindowSurface(window);
}

void SdlWindow::Hide() { SDL_HideWindow(window); }

void SdlWindow::Raise() { SDL_RaiseWindow(window); }

void SdlWindow::SetTitle(std::string const &utf8) { SDL_SetWindowTitle(window, utf8.c_str()); }

void SdlWindow::SetPlace(int h, int v) {
    placePending = (SDL_GetWindowFlags(window) & SDL_WINDOW_HIDDEN) != 0;
    placeH = h;
    placeV = v;
    SDL_SetWindowPosition(window, scale.Edge(h), scale.Edge(v));
}

void SdlWindow::SetContentSize(int newWidth, int newHeight) {
    SDL_SetWindowSize(window, std::max(scale.Edge(newWidth), 1), std::max(scale.Edge(newHeight), 1));
}

void SdlWindow::SetSizeLimits(int minWidth, int minHeight, int maxWidth, int maxHeight) {
    SizeLimits newLimits = {minWidth, minHeight, maxWidth, maxHeight};
    if (newLimits == limits)
        return;
    limits = newLimits;
    ApplySizeLimits();
}

void SdlWindow::ApplySizeLimits() {
    auto least = [this](int limit) { return std::max(scale.Edge(limit), 1); };
    auto greatest = [this](int limit) { return limit > 0 ? scale.Edge(limit) : kGreatestWindowSize; };
    // SDL refuses a minimum beyond the maximum that holds so far.
    SDL_SetWindowMaximumSize(window, kGreatestWindowSize, kGreatestWindowSize);
    SDL_SetWindowMinimumSize(window, least(limits.minWidth), least(limits.minHeight));
    SDL_SetWindowMaximumSize(window, greatest(limits.maxWidth), greatest(limits.maxHeight));
}

Point SdlWindow::ScreenPlace() const {
    return {SaturatedPixel(scale.ToLogical(ScreenY())), SaturatedPixel(scale.ToLogical(ScreenX()))};
}

static void CopyPixels(Surface const &from, DeviceRect const &rect, SDL_Surface &to) {
    std::uint8_t *target = static_cast<std::uint8_t *>(to.pixels) +
                           static_cast<std::ptrdiff_t>(rect.top) * to.pitch +
                           static_cast<std::ptrdiff_t>(rect.left) * to.format->BytesPerPixel;
    SDL_ConvertPixels(rect.Width(), rect.Height(), kSurfaceFormat, from.Row(rect.top) + rect.left,
                      from.Width() * kSurfacePixelBytes, to.format->format, target, to.pitch);
}

// Another one for a surface of another size. A server that refused once is not asked again.
bool SdlWindow::HasPictureFor(Surface const &surface) {
    if (picture && (picture->Width() != surface.Width() || picture->Height() != surface.Height()))
        picture.reset();
    if (!picture && sharesMemory) {
        picture = SdlPicture::New(window, surface.Width(), surface.Height());
        sharesMemory = picture != nullptr;
    }
    return picture != nullptr;
}

// A rectangle that lies wholly outside the window would be refused by the X server, which ends the program:
// nothing but what both have goes there. They differ between a resize and the surface that answers it.
void SdlWindow::PresentBySdl(Surface const &surface) {
    SDL_Surface *const screen = SDL_GetWindowSurface(window);
    if (screen == nullptr)
        return; // the server is out of memory for pictures: the next exposure tries again
    DeviceRect const common = {0, 0, screen->w, screen->h};
    std::vector<SDL_Rect> copied;
    for (DeviceRect const &wanted : updated) {
        DeviceRect const rect = common.Intersected(wanted);
        if (rect.Empty())
            continue;
        CopyPixels(surface, rect, *screen);
        copied.push_back({rect.left, rect.top, rect.Width(), rect.Height()});
    }
    if (!copied.empty() && !keptHidden)
        SDL_UpdateWindowSurfaceRects(window, copied.data(), static_cast<int>(copied.size()));
}

void SdlWindow::Present(Surface const &surface, DeviceRect const *rects, std::size_t count) {
    DeviceRect const all = {0, 0, surface.Width(), surface.Height()};
    updated.clear();
    for (DeviceRect const *rect = rects; rect != rects + count; ++rect) {
        DeviceRect const part = rect->Intersected(all);
        if (!part.Empty())
            updated.push_back(part);
    }
    keptHidden = (SDL_GetWindowFlags(window) & SDL_WINDOW_HIDDEN) != 0;
    if (updated.empty())
        return;
    if (!HasPictureFor(surface))
        PresentBySdl(surface);
    else if (keptHidden)
        picture->Keep(surface, updated.data(), updated.size());
    else
        picture->Show(surface, updated.data(), updated.size());
}

void SdlWindow::Lost() {
    if (picture)
        picture->Forget();
}

// Between a resize and the surface that answers it, a part of the picture is not on the screen.
bool SdlWindow::Move(PixelMove const &move) {
    int deviceWidth = 0, deviceHeight = 0;
    SDL_GetWindowSize(window, &deviceWidth, &deviceHeight);
    return picture && !keptHidden && picture->Width() == deviceWidth && picture->Height() == deviceHeight &&
           (SDL_GetWindowFlags(window) & SDL_WINDOW_HIDDEN) == 0 && picture->Move(move);
}

void SdlWindow::Finish() {
    if (picture)
        picture->Finish();
}

void SdlWindow::StartTextInput(Rect const &caret) {
    DeviceRect place = scale.ToDevice(caret.left, caret.top, caret.right, caret.bottom);
    SDL_Rect rect = {place.left, place.top, place.Width(), place.Height()};
    SDL_SetTextInputRect(&rect);
    system.StartTextInput(this);
}

void SdlWindow::StopTextInput() { system.StopTextInput(this); }
