// Draws one line of static text in a box that it sizes from the text and its font.
//
// A label takes no clicks and sends no messages. Outside a layout it owns its box; in a layout the layout
// owns the box, and the label only places the text inside. Coordinates are 16 bits wide and wrap.
#pragma once
#include "host/GlogPane.h"
#include "host/OSFont.h"
#include "host/RGBColor.h"
#include "host/TextSettings.h"
#include "host/UString.h"

struct glogRec;

class LabelPaneImplementation : public GlogPane {
public:
    // Attaches the pane to the glog under the number and sets the text and the box; null when it cannot be
    // attached.
    LabelPaneImplementation *LabelPaneImplementationInit(glogRec *, short id, const UString &text);

    // Sets the text and the box, but repaints nothing.
    void SetText(const UString &);
    // The string shown.
    const UString &GetText() const { return text; }
    // Sets the text and the box and invalidates both the former box, unless it was empty of text, and the new
    // one. Without effect for the text that it has.
    void SetTextWithInval(const UString &);
    // Set the face (0 plain) or the size of the font, and the box, but repaint nothing.
    void SetFace(short);
    void SetSize(short);
    // How a text that is wider than a forced string width is cut. Stored only.
    void SetTruncation(TextSettings::TruncateCode);
    // Pixels that the box is wider or higher than the text, half of them on either side. Stored only: they
    // take effect at the next CalcBox.
    void SetExtraWidth(short);
    void SetExtraHeight(short);
    short GetExtraWidth() const { return extraWidth; }
    short GetExtraHeight() const { return extraHeight; }
    // Colours of the text and, with EraseUnderneath, of the ground. The colours stay the caller's and have to
    // live until the pane is gone or has no such colour any more. Stored only.
    void SetPaneForegroundColor(const RGBColor *);
    void SetPaneBackgroundColor(const RGBColor *);
    void SetNoForegroundColor();
    void SetNoBackgroundColor();
    // Shows a text without foreground colour of its own in the colour of inactive dialog text. Invalidates
    // the pane when it changes.
    void SetGrayTextMode(bool);
    // Whether the box is erased before the text is drawn. Stored only.
    void EraseUnderneath(bool);
    // A width in pixels, 0 or more, that replaces the measured one; a negative one measures again. Stored
    // only.
    void ForceStringWidth(short);
    void ForgetForcedStringWidth();
    // Metrics in pixels that replace those of the font. They count only if their widMax is not 0: that member
    // is the mark of forced metrics, and the one that ForgetForcedFontInfo clears. Stored only.
    void ForceFontInfo(TarnQuickDrawText::FontInfo);
    void ForgetForcedFontInfo();

    // Moves the box to the rectangle's top left corner; its size comes from the text.
    void SetBox(Rect *) override;
    // Sizes the box to the text and the extra pixels, keeping its top left corner, and places the text in it.
    void CalcBox() override;

protected:
    LabelPaneImplementation();

    // Sets family, face and size, and the box if one of them has changed.
    void SetFont(fontSaveRec);
    // Give the current port the font, as far as it has another, and the colours, as far as the pane has any.
    void SetPortStyle();
    void SetPortColors();
    // Pen start of the text: v is the baseline, h the left edge. Stored only.
    void SetTextOrigin(Point);
    Point GetTextOrigin() const { return textOrigin; }
    // Metrics and width of the text, in pixels: the forced ones, or those of the font in the current port,
    // which gets the font. The underscores belong to the names. NOLINTBEGIN(bugprone-reserved-identifier)
    void _GetFontInfoMethod(TarnQuickDrawText::FontInfo *);
    short _StringWidthMethod();
    // NOLINTEND(bugprone-reserved-identifier)

    // Always 0: a click goes through.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    // Empty in a class that may be created; keeps this one from being created by itself.
    virtual void DontMakeConcrete() = 0;

    void EraseBox();
    Point DrawingOrigin();

    Point textOrigin;
    UString text;
    OS::Font::FamilyID family;
    short face;
    short size;
    short forcedStringWidth;                    // pixels; negative: measure
    TarnQuickDrawText::FontInfo forcedFontInfo; // pixels; widMax 0: measure
    const RGBColor *foregroundColor;            // borrowed; valid while useForeground
    const RGBColor *backgroundColor;            // borrowed; valid while useBackground
    bool useForeground;
    bool useBackground;
    bool eraseUnderneath;
    bool grayTextMode;
    short extraWidth;  // pixels
    short extraHeight; // pixels
    TextSettings::TruncateCode truncation;
};
