#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
class OSPort;
class GlogStyleSheet;

struct SaveColorRec { RGBColor fore, back; };
void GetColors(SaveColorRec *);
void SetColors(SaveColorRec const *);
void ClearColors();

class WithPort {
public:
    WithPort();
    explicit WithPort(OSPort &);
    ~WithPort();
private:
    WithPort(WithPort const &);
    WithPort &operator=(WithPort const &);
    OSPort *saved;
};

class SavePortAndClip {
public:
    SavePortAndClip();
    ~SavePortAndClip();
private:
    SavePortAndClip(SavePortAndClip const &);
    SavePortAndClip &operator=(SavePortAndClip const &);
    struct Rep;
    Rep *rep;
};

class SaveColors {
public:
    SaveColors();
    ~SaveColors();
private:
    SaveColors(SaveColors const &);
    SaveColors &operator=(SaveColors const &);
    SaveColorRec saved;
};

class SaveTextState {
public:
    SaveTextState();
    ~SaveTextState();
private:
    SaveTextState(SaveTextState const &);
    SaveTextState &operator=(SaveTextState const &);
    struct Rep;
    Rep *rep;
};

class WithSaveGraphicsState {
public:
    WithSaveGraphicsState(OSPort &, unsigned int);
    ~WithSaveGraphicsState();
private:
    WithSaveGraphicsState(WithSaveGraphicsState const &);
    WithSaveGraphicsState &operator=(WithSaveGraphicsState const &);
    struct Rep;
    Rep *rep;
};

class WithClipRect {
public:
    explicit WithClipRect(OS::RectBase<OS::RectTag> const &);
    ~WithClipRect();
private:
    WithClipRect(WithClipRect const &);
    WithClipRect &operator=(WithClipRect const &);
    struct Rep;
    Rep *rep;
};

class WithDarkenDrawMode {
public:
    enum Mode { kMode1 = 1 };
    WithDarkenDrawMode(int, GlogStyleSheet *, Mode);
    ~WithDarkenDrawMode();
private:
    WithDarkenDrawMode(WithDarkenDrawMode const &);
    WithDarkenDrawMode &operator=(WithDarkenDrawMode const &);
    struct Rep;
    Rep *rep;
};

class WithCursorDispatchingDisabled {
public:
    WithCursorDispatchingDisabled() { ++fgCount; }
    ~WithCursorDispatchingDisabled() { --fgCount; }
    static int fgCount;
private:
    WithCursorDispatchingDisabled(WithCursorDispatchingDisabled const &);
    WithCursorDispatchingDisabled &operator=(WithCursorDispatchingDisabled const &);
};
