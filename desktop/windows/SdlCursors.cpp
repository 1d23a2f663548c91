#include "desktop/windows/SdlCursors.h"
#include <SDL.h>
#include "desktop/windows/WindowSystem.h"

SdlCursors::~SdlCursors() { Forget(); }
SDL_Cursor *SdlCursors::Find(int number, double) { 
    SDL_Cursor *&c = cursors[number];
    if(!c) c= SDL_CreateSystemCursor(number==1?SDL_SYSTEM_CURSOR_IBEAM:number==2?SDL_SYSTEM_CURSOR_HAND:SDL_SYSTEM_CURSOR_ARROW);
    return c;
}
void SdlCursors::Show(int number, double scale) {
    if (number == shown)
        return;
    SDL_SetCursor(Find(number, scale));
    shown = number;
}
void SdlCursors::Forget() {
    for (auto &[number, cursor] : cursors)
        SDL_FreeCursor(cursor);
    cursors.clear();
    shown = -1;
}
