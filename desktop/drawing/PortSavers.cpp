#include "host/PortSavers.h"
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include <algorithm>

namespace {

constexpr int kMostDarkening = 100;

// A port and the clip that it had.
class KeptClip {
public:
    explicit KeptClip(DrawingPort *port_)
        : port(port_) {
        if (port_)
            clip = port_->GetClipState();
    }
    DrawingPort *Port() const { return port.Get(); }
    void PutBack() const {
        if (DrawingPort *alive = port.Get())
            alive->SetClipState(clip);
    }

private:
    PortRef port;
    ClipState clip;
};

} // namespace

WithPort::WithPort()
    : saved(OSPort::GetCurrent()) {}

WithPort::WithPort(OSPort &port)
    : WithPort() {
    DrawingPort::MakeCurrent(static_cast<DrawingPort *>(&port));
}

WithPort::~WithPort() { DrawingPort::MakeCurrent(DrawingPort::Alive(saved)); }

struct SavePortAndClip::Rep {
    explicit Rep(DrawingPort *port_)
        : port(port_) {
        if (port_)
            place = port_->GetPlace();
    }
    PortRef port;
    PortPlace place;
};

SavePortAndClip::SavePortAndClip()
    : rep(new Rep(DrawingPort::CurrentPort())) {}

SavePortAndClip::~SavePortAndClip() {
    DrawingPort *port = rep->port.Get();
    DrawingPort::MakeCurrent(port);
    if (port)
        port->SetPlace(rep->place);
    delete rep;
}

SaveColors::SaveColors() { GetColors(&saved); }

SaveColors::~SaveColors() {
    if (DrawingPort *port = DrawingPort::CurrentPort()) {
        port->State().SetFore(ToRGBA(saved.fore));
        port->State().back = ToRGBA(saved.back);
    }
}

struct SaveTextState::Rep {
    explicit Rep(DrawingPort *port_)
        : port(port_) {
        if (port_) {
            family = port_->State().textFamily;
            face = port_->State().textFace;
            size = port_->State().textSize;
        }
    }
    PortRef port;
    OS::Font::FamilyID family;
    int face = 0;
    short size = 0;
};

SaveTextState::SaveTextState()
    : rep(new Rep(DrawingPort::CurrentPort())) {}

SaveTextState::~SaveTextState() {
    if (DrawingPort *port = rep->port.Get()) {
        port->State().textFamily = rep->family;
        port->State().textFace = rep->face;
        port->State().textSize = rep->size;
    }
    delete rep;
}

struct WithSaveGraphicsState::Rep {
    explicit Rep(DrawingPort &port)
        : clip(&port)
        , state(port.State()) {}
    KeptClip clip;
    GraphicsState state;
};

WithSaveGraphicsState::WithSaveGraphicsState(OSPort &port, unsigned int)
    : rep(new Rep(static_cast<DrawingPort &>(port))) {}

WithSaveGraphicsState::~WithSaveGraphicsState() {
    if (DrawingPort *port = rep->clip.Port()) {
        port->State() = rep->state;
        rep->clip.PutBack();
    }
    delete rep;
}

struct WithClipRect::Rep {
    KeptClip clip;
};

WithClipRect::WithClipRect(OS::RectBase<OS::RectTag> const &r)
    : rep(new Rep{KeptClip(DrawingPort::CurrentPort())}) {
    Rect const whole = WholeRect(r);
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("WithClipRect").Box("rect", whole));
    if (DrawingPort *port = rep->clip.Port())
        port->NarrowClipTo(port->LocalToWindow(whole));
}

WithClipRect::~WithClipRect() {
    rep->clip.PutBack();
    delete rep;
}

struct WithDarkenDrawMode::Rep {
    PortRef port;
    int darken;
};

// Whatever is drawn multiplies what is beneath by what the strength leaves of 100 percent; the colour of the
// drawing does not count.
WithDarkenDrawMode::WithDarkenDrawMode(int strength, GlogStyleSheet *, Mode mode)
    : rep(new Rep{PortRef(DrawingPort::CurrentPort()), 0}) {
    if (DrawingTrace::On())
        DrawingTrace::Write(
            DrawingTrace::Call("WithDarkenDrawMode").Integer("strength", strength).Integer("mode", mode));
    if (DrawingPort *port = rep->port.Get()) {
        rep->darken = port->State().darken;
        port->State().darken = std::clamp(strength, 0, kMostDarkening);
    }
}

WithDarkenDrawMode::~WithDarkenDrawMode() {
    if (DrawingPort *port = rep->port.Get())
        port->State().darken = rep->darken;
    delete rep;
}

int WithCursorDispatchingDisabled::fgCount = 0;
