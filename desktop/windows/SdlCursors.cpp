#include "desktop/windows/SdlCursors.h"
#include "desktop/drawing/IconPixels.h"
#include "desktop/resources/CursorTable.h"
#include "desktop/resources/Resources.h"
#include "desktop/windows/WindowSystem.h"
#include <SDL.h>
#include <algorithm>

static int const kBitsPerPixel = 32, kBytesPerPixel = 4;

SdlCursors::~SdlCursors() { FreeAll(); }

// SDL goes back to its own arrow when the cursor that is shown is freed.
void SdlCursors::FreeAll() {
    shown = nullptr;
    for (auto const &[key, cursor] : cursors)
        SDL_FreeCursor(cursor);
    cursors.clear();
}

void SdlCursors::FollowResources() {
    Resources &resources = Resources::Instance();
    if (generation == resources.Generation() && theme == resources.Theme())
        return;
    FreeAll();
    generation = resources.Generation();
    theme = resources.Theme();
}

static SDL_Cursor *MakeSystemCursor(int number) {
    switch (number) {
    case Cursors::kText:
        return SDL_CreateSystemCursor(SDL_SYSTEM_CURSOR_IBEAM);
    case Cursors::kHand:
        return SDL_CreateSystemCursor(SDL_SYSTEM_CURSOR_HAND);
    default:
        return SDL_CreateSystemCursor(SDL_SYSTEM_CURSOR_ARROW);
    }
}

static bool IsSystemCursor(int number) {
    return number == Cursors::kArrow || number == Cursors::kText || number == Cursors::kHand;
}

// Null when there is no such picture. SDL hands the pixels to the X server as they are, which wants them
// premultiplied, as icons are.
static SDL_Cursor *MakePicture(int number, DeviceScale scale) {
    CursorEntry const *entry = CursorTable::Present().Find(number);
    if (entry == nullptr)
        return nullptr;
    IconPixels icon = CopyIconPixels(entry->family, entry->icon, scale);
    if (icon.pixels.empty())
        return nullptr;
    SDL_Surface *surface =
        SDL_CreateRGBSurfaceWithFormatFrom(icon.pixels.data(), icon.width, icon.height, kBitsPerPixel,
                                           icon.width * kBytesPerPixel, SDL_PIXELFORMAT_ARGB8888);
    if (surface == nullptr)
        return nullptr;
    SDL_Cursor *cursor = SDL_CreateColorCursor(surface, std::min(scale.Edge(entry->hotH), icon.width - 1),
                                               std::min(scale.Edge(entry->hotV), icon.height - 1));
    SDL_FreeSurface(surface);
    return cursor;
}

SDL_Cursor *SdlCursors::Demand(int number, DeviceScale scale) {
    std::pair<int, int> const key(number, scale.Thousandths());
    auto const found = cursors.find(key);
    if (found != cursors.end())
        return found->second;
    SDL_Cursor *cursor = IsSystemCursor(number) ? MakeSystemCursor(number) : MakePicture(number, scale);
    if (cursor == nullptr && number != Cursors::kArrow)
        return Demand(Cursors::kArrow, scale);
    cursors[key] = cursor;
    return cursor;
}

void SdlCursors::Show(int number, DeviceScale scale) {
    FollowResources();
    SDL_Cursor *cursor = Demand(number, scale);
    if (cursor == shown || cursor == nullptr)
        return;
    SDL_SetCursor(cursor);
    shown = cursor;
}
