// Text that is only read, in lines that may break.
//
// The pane takes neither the mouse nor the keyboard, and sends no messages.
#pragma once
#include "host/GlogPane.h"
#include "host/RGBColor.h"
#include "host/TextLayout.h"
#include "host/TextSettings.h"
#include "host/UString.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

struct glogRec;

class TextPane : public GlogPane {
public:
    // Both attach the pane to the glog under the number 0 and make the width of its text, or of its
    // rectangle, the width attribute of its layout item. The height is the layout's. Without a glog the pane
    // is not attached.
    TextPane(glogRec *, const UString &text, TextSettings::Alignment, bool forPrinting);
    // From the keys "FSRID" (font 0 when absent), "Text", "WrapText", "SizeToText", "Align" (0 left, 1 right,
    // 2 centre; left for any other), "Truncate" ("None", "Middle" or "End"; none for any other) and
    // "BoundsRect", which becomes the box. An empty pointer fails its assertion.
    TextPane(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>, bool forPrinting);
    ~TextPane() override;

    UString GetText() const { return text; } // a copy
    // Invalidates the pane; where it is sized to its text, the layout item gets the new width. Without effect
    // for the text that it has.
    void SetText(const UString &);
    // The width of the whole text in pixels; of text that wraps, that of the longest line between its own
    // line breaks.
    int GetTextWidth() const;

    // Where lines stand in the box. Setting it repaints nothing.
    TextSettings::Alignment GetAlignment() const { return alignment; }
    void SetAlignment(TextSettings::Alignment newAlignment) { alignment = newAlignment; }
    // Which of the two colours the text has. Invalidates the pane if it changes.
    bool GetEnable() const { return enable; }
    void SetEnable(bool);
    // Whether the width attribute follows the text; from the next SetText on.
    bool GetSizeToText() const { return sizeToText; }
    void SetSizeToText(bool sizes) { sizeToText = sizes; }
    // The font, as an index in the application's font table. Repaints nothing.
    void SetFont(int index) { font = index; }
    // Stored only; for programs that print a dialog.
    void SetForPrinting(bool printing) { forPrinting = printing; }
    // Of enabled and of disabled text. The colours stay the caller's and have to outlive the pane. Repaints
    // nothing.
    void SetColors(RGBColor &active, RGBColor &inactive);
    // Where text that is too wide is shortened. Invalidates the pane if it changes.
    void SetTruncation(TextSettings::TruncateCode);

protected:
    void DrawGuts(OSRgn *) override;
    // Sets the port's colour for the text. The font is no matter of the port here.
    virtual void SetupFont() const;

private:
    void SetItemWidth(int pixels);
    int VerticalAlignment() const;
    int Wrapping() const { return wrapText ? 1 : 0; }

    UString text;
    bool enable;
    int font;
    bool wrapText;
    bool sizeToText;
    TextSettings::Alignment alignment;
    TextSettings::TruncateCode truncation;
    RGBColor const *inactiveColor; // not the pane's
    RGBColor const *activeColor;   // not the pane's
    bool forPrinting;
    mutable OS::TextLayout layout;
};
