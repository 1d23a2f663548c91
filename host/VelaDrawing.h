#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
#include "host/OSFont.h"
class OSPort;
class OSRgn;

struct PenState { Point location; Point size; short mode; short pattern; };

namespace VelaDrawing {

void GetPort(OSPort **);

void InsetRect(Rect *, short dh, short dv);
void OffsetRect(Rect *, short dh, short dv);
bool SectRect(Rect const *, Rect const *, Rect *out);
bool EmptyRect(Rect const *);
bool PtInRect(Point, Rect const *);
void Pt2Rect(Point, Point, Rect *);

void PtToAngle(Rect const *, Point, short *);
void AddPt(Point, Point *);
void GlobalToLocal(Point *);
void LocalToGlobal(Point *);

void MoveTo(short h, short v);
void Move(short dh, short dv);
void LineTo(short h, short v);
void FrameRect(Rect const *);
void PaintRect(Rect const *);
void EraseRect(Rect const *);
void PenNormal();
void GetPen(Point *);
void GetPenState(PenState *);
void SetPenState(PenState const *);

void ClipRect(Rect const *);
void GetClip(OSRgn *);
void SetClip(OSRgn *);
void NarrowClip(OSRgn *);
void NarrowClipToRect(Rect const *);
void InvalRect(Rect const *);
void InvalRgn(OSRgn *);

OSRgn *NewRgn();
void DisposeRgn(OSRgn *);
void RectRgn(OSRgn *, Rect const *);
void UnionRgn(OSRgn *, OSRgn *, OSRgn *result);
void DiffRgn(OSRgn *, OSRgn *, OSRgn *result);

bool RectInRgn(Rect const *, OSRgn *);

void RGBForeColor(RGBColor const &);
void RGBBackColor(RGBColor const &);
void GetForeColor(RGBColor *);
void GetBackColor(RGBColor *);

void TextFont(OS::Font::FamilyID);
void TextSize(short);
void TextFace(short);
OS::Font::FamilyID GetPortTextFont(OSPort *);
short GetPortTextSize(OSPort *);
int GetPortTextFace(OSPort *);
void GetFontInfo(TarnQuickDrawText::FontInfo *);

}

void SetForegroundColor(RGBColor const &);
void SetForegroundColor(OS::RGBAColor const &);
void SetBackgroundColor(RGBColor const &);
void SetBackgroundColor(OS::RGBAColor const &);

void GrayForeColor(short);
void GrayBackColor(short);
void GetHiliteColor(RGBColor *);
void SetUserHiliteColorAsForeColor();

void Frame3DRect(Rect const *, short, short);
void DrawShadowLine(Point, Point);
void FrameTextWell(Rect const &);
