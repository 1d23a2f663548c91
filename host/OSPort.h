#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
class OSPath;

class OSPort {
public:
    virtual ~OSPort() {}
    static OSPort &Current();
    static OSPort *GetCurrent();

    virtual void FrameRect(OS::RectBase<OS::RectTag> const &) = 0;

    virtual void FrameRoundRect(OS::RectBase<OS::RectTag> const &, OS::Size const &corner) = 0;
    virtual void PaintRoundRect(OS::RectBase<OS::RectTag> const &, OS::Size const &corner) = 0;
    virtual void PaintOval(OS::RectBase<OS::RectTag> const &) = 0;
    virtual void StrokePath(OSPath const &) = 0;
    virtual void SetForeColor(OS::RGBAColor const &) = 0;
    void SetForeColor(RGBColor const &);
    virtual void SetLineWidth(double) = 0;
    virtual void NarrowClip(OS::RectBase<OS::RectTag> const &) = 0;
    virtual void NarrowClipPath(OSPath const &) = 0;
    virtual void PenNormal() = 0;

    virtual void ScrollRect(OS::RectBase<OS::RectTag> const &, OS::Size const &) = 0;
};

Rect GetLocalPortRect(OSPort *);
