#include "desktop/windows/SdlPicture.h"
#include "desktop/drawing/FreshMemory.h"
#include "desktop/drawing/PixelMove.h"
#include "desktop/drawing/Surface.h"
#include "desktop/windows/SdlNativeWindow.h"
#include "desktop/windows/ShownPixels.h"
#include <X11/Xutil.h>
#include <X11/extensions/XShm.h>
#include <algorithm>
#include <sys/ipc.h>
#include <sys/shm.h>
#include <vector>

static unsigned long const kRedMask = 0xFF0000, kGreenMask = 0xFF00, kBlueMask = 0xFF;
static int const kPixelBits = 32, kPixelBytes = 4;
static int const kOwnerOnly = 0600;
static long long const kMostSentPixels = 8192; // 32 KB: a label, a strip that scrolls into view

struct SdlPicture::Shared {
    Display *display = nullptr; // SDL's
    ::Window window = 0;
    GC context = nullptr;
    XImage *image = nullptr;
    XShmSegmentInfo segment = {};
    bool attached = false;
    std::unique_ptr<ShownPixels> pixels;
    bool lost = true;                // the window does not show all that was taken
    std::vector<DeviceRect> changed; // of one call; kept for its memory
    unsigned long read = 0;          // number of the last request for which the server reads our memory

    ~Shared();
    bool FindWindow(SDL_Window *);
    bool MakeImage(int width, int height);
    bool MakeMemory();
    bool Attach();
    void Put(DeviceRect const &); // the server reads our memory when it gets to it
    bool IsBeingRead() const;
    void AwaitReading();
    void Send(DeviceRect const &); // the pixels go along
};

SdlPicture::Shared::~Shared() {
    if (attached) {
        XShmDetach(display, &segment);
        XSync(display, False); // it may still be reading
    }
    if (context != nullptr)
        XFreeGC(display, context);
    if (image != nullptr) {
        image->data = nullptr;
        XDestroyImage(image);
    }
    if (segment.shmaddr != nullptr)
        shmdt(segment.shmaddr);
}

bool SdlPicture::Shared::FindWindow(SDL_Window *of) {
    SdlNativeWindow const native = SdlNativeWindow::Of(of);
    display = native.display;
    window = native.window;
    return window != None && XShmQueryExtension(display) == True;
}

static bool HasOurPixels(XImage const &image, int width) {
    int const probe = 1;
    int const ourOrder = *reinterpret_cast<char const *>(&probe) != 0 ? LSBFirst : MSBFirst;
    return image.bits_per_pixel == kPixelBits && image.bytes_per_line == width * kPixelBytes &&
           image.byte_order == ourOrder && image.red_mask == kRedMask && image.green_mask == kGreenMask &&
           image.blue_mask == kBlueMask;
}

bool SdlPicture::Shared::MakeImage(int width, int height) {
    XWindowAttributes attributes;
    if (!XGetWindowAttributes(display, window, &attributes))
        return false;
    image = XShmCreateImage(display, attributes.visual, static_cast<unsigned int>(attributes.depth), ZPixmap,
                            nullptr, &segment, static_cast<unsigned int>(width),
                            static_cast<unsigned int>(height));
    return image != nullptr && HasOurPixels(*image, width);
}

// The system frees it when nobody has it any more, however the program ends.
bool SdlPicture::Shared::MakeMemory() {
    std::size_t const bytes =
        static_cast<std::size_t>(image->bytes_per_line) * static_cast<std::size_t>(image->height);
    segment.shmid = shmget(IPC_PRIVATE, bytes, IPC_CREAT | kOwnerOnly);
    if (segment.shmid < 0)
        return false;
    void *const place = shmat(segment.shmid, nullptr, 0);
    bool const mapped = place != reinterpret_cast<void *>(-1);
    if (mapped) {
        segment.shmaddr = image->data = static_cast<char *>(place);
        FreshMemory::GetPages(place, bytes);
    }
    return mapped;
}

static bool theServerRefused = false;

static int NoteRefusal(Display *, XErrorEvent *) {
    theServerRefused = true;
    return 0;
}

// A server on another machine refuses.
bool SdlPicture::Shared::Attach() {
    XSync(display, False);
    theServerRefused = false;
    XErrorHandler const before = XSetErrorHandler(NoteRefusal);
    XShmAttach(display, &segment);
    XSync(display, False);
    XSetErrorHandler(before);
    attached = !theServerRefused;
    return attached;
}

std::unique_ptr<SdlPicture> SdlPicture::New(SDL_Window *window, int width, int height) {
    std::unique_ptr<Shared> shared(new Shared);
    if (!shared->FindWindow(window) || !shared->MakeImage(width, height))
        return nullptr;
    bool const usable = shared->MakeMemory() && shared->Attach();
    if (shared->segment.shmid >= 0)
        shmctl(shared->segment.shmid, IPC_RMID, nullptr);
    if (!usable)
        return nullptr;
    shared->context = XCreateGC(shared->display, shared->window, 0, nullptr);
    shared->pixels.reset(
        new ShownPixels(reinterpret_cast<std::uint32_t *>(shared->segment.shmaddr), width, height));
    return std::unique_ptr<SdlPicture>(new SdlPicture(std::move(shared)));
}

SdlPicture::SdlPicture(std::unique_ptr<Shared> shared_)
    : shared(std::move(shared_)) {}

SdlPicture::~SdlPicture() {}

int SdlPicture::Width() const { return shared->image->width; }

int SdlPicture::Height() const { return shared->image->height; }

// Every event and answer of the server tells how far it has come.
static bool IsBehind(Display *display, unsigned long request) {
    return LastKnownRequestProcessed(display) < request;
}

void SdlPicture::Shared::Put(DeviceRect const &rect) {
    XShmPutImage(display, window, context, image, rect.left, rect.top, rect.left, rect.top,
                 static_cast<unsigned int>(rect.Width()), static_cast<unsigned int>(rect.Height()), False);
    read = NextRequest(display) - 1;
}

bool SdlPicture::Shared::IsBeingRead() const { return IsBehind(display, read); }

void SdlPicture::Shared::AwaitReading() {
    if (IsBeingRead())
        XSync(display, False);
}

void SdlPicture::Shared::Send(DeviceRect const &rect) {
    XPutImage(display, window, context, image, rect.left, rect.top, rect.left, rect.top,
              static_cast<unsigned int>(rect.Width()), static_cast<unsigned int>(rect.Height()));
}

// Whether the pixels had better go with the request: then nobody waits for the server to have read them.
static bool AreFew(std::vector<DeviceRect> const &rects) {
    long long pixels = 0;
    for (DeviceRect const &rect : rects)
        pixels += 1LL * rect.Width() * rect.Height();
    return pixels <= kMostSentPixels;
}

static bool Covers(DeviceRect const *rects, std::size_t count, DeviceRect const &all) {
    return std::any_of(rects, rects + count, [&](DeviceRect const &rect) { return rect.Contains(all); });
}

void SdlPicture::Keep(Surface const &surface, DeviceRect const *rects, std::size_t count) {
    shared->changed.clear();
    for (DeviceRect const *rect = rects; rect != rects + count; ++rect)
        shared->pixels->Take(surface, *rect, shared->changed);
    if (shared->lost && Covers(rects, count, {0, 0, Width(), Height()}))
        shared->lost = false;
}

void SdlPicture::Show(Surface const &surface, DeviceRect const *rects, std::size_t count) {
    Keep(surface, rects, count);
    if (shared->changed.empty())
        return;
    Display *const display = shared->display;
    if (AreFew(shared->changed)) {
        for (DeviceRect const &rect : shared->changed)
            shared->Send(rect);
        XFlush(display);
        return;
    }
    bool const behind = shared->IsBeingRead();
    for (DeviceRect const &rect : shared->changed)
        shared->Put(rect);
    if (behind)
        XSync(display, False);
    else
        XFlush(display);
}

void SdlPicture::ShowAll() {
    shared->Put({0, 0, Width(), Height()});
    XFlush(shared->display);
}

// The server reads our memory when it gets to it: were it behind, a move might take along what came later.
bool SdlPicture::Move(PixelMove const &move) {
    if (shared->lost)
        return false;
    shared->AwaitReading();
    DeviceRect const from = move.From(), &to = move.to;
    XCopyArea(shared->display, shared->window, shared->window, shared->context, from.left, from.top,
              static_cast<unsigned int>(to.Width()), static_cast<unsigned int>(to.Height()), to.left, to.top);
    shared->pixels->Forget(to);
    return true; // the request goes along with that for what is new
}

void SdlPicture::Forget() {
    shared->pixels->ForgetAll();
    shared->lost = true;
}

void SdlPicture::Finish() {
    if (IsBehind(shared->display, NextRequest(shared->display) - 1))
        XSync(shared->display, False);
}
