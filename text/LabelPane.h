// A line of static text at an anchor point.
//
// It takes neither the mouse nor the keyboard. The box follows from the anchor, the alignment and the text. A
// label in a layout keeps the layout's box and reports its natural size as the width and height attributes of
// its layout item.
#pragma once
#include "text/LabelPaneImplementation.h"
#include "text/gStringResRec.h"

class GlogStyleSheet;

class LabelPane : public LabelPaneImplementation {
public:
    // Horizontal options: what stands at the anchor. Any other value counts as kTextStartsAtAnchor.
    enum { kTextEndsAtAnchor = -1, kTextStartsAtAnchor = 0, kTextCentredOnAnchor = 1 };
    // Vertical options. Any other value counts as kBaselineAtAnchor.
    enum { kBaselineAtAnchor = 0, kTopAtAnchor = 1, kBottomAtAnchor = 2 };

    LabelPane();

    // Make a label and attach it to a glog, which owns it from then on. Null when memory or glog is wanting,
    // except for the second form, which calls FailMemFullError then.
    //
    // Without text, from a record, which is only read:
    static LabelPane *NewLabelPane(glogRec *, gStringResRec *);
    // Under the number, in font 0, with the baseline on the rectangle's bottom, at its left or right end:
    static LabelPane *NewLabelPane(glogRec *, int id, Rect *, bool rightAligned, const UString &);
    // From the keys "Origin" ((0, 0) when absent), "FSRID", "Align", "Text" and "LineSpacing" of the sheet; a
    // sheet without an item fails the assertion of its pointer:
    static LabelPane *NewLabelPane(glogRec *, GlogStyleSheet *);

    // Attaches the pane to the glog under the number and sets the text; null when it cannot be attached.
    LabelPane *LabelPaneInit(glogRec *, short id, const UString &text);
    // Attaches the pane under the number 0, without text, and takes anchor, alignment and font from the
    // record. The anchor is at the baseline from then on, unlike that of a label made in code. Null when it
    // cannot be attached.
    LabelPane *LabelPaneResInit(glogRec *, gStringResRec *);

    // The font, as an index in the application's font table; -1 while none was set. Sets the box if the font
    // differs, and repaints nothing.
    void SetFontFSRID(short);
    short GetFontFSRID() const { return fontFSRID; }
    // Set what lies at the anchor, and where it is, and the box; repaint nothing.
    void SetHOption(short);
    void SetVOption(short);
    void SetOrigin(Point);
    Point GetOrigin() const { return origin; }
    // The height of the line in a layout, in pixels; becomes the height attribute of the layout item, also
    // when it is 0. From then on the item follows the height of the text only if it is 0.
    void SetLineSpacing(int);

    // Outside a layout: moves box and anchor by as much as the rectangle's top left corner is away from that
    // of the box; the size is ignored. In a layout: takes the rectangle as it is and centres the text in its
    // height.
    void SetBox(Rect *) override;
    // Moves box and anchor. The text is drawn at its new place from the next CalcBox on.
    void Offset(Point delta) override;
    // Derives the box from the anchor. In a layout the box stays. Either way a width or height that differs
    // from that of the present box is given to the layout item.
    void CalcBox() override;

private:
    void DontMakeConcrete() override;
    short MeasureTextInGlog();
    short Baseline(TarnQuickDrawText::FontInfo const &) const;
    short TextLeft(short width) const;
    void ReportNaturalSize(Rect const &oldBox, Rect const &newBox);

    int lineSpacing; // pixels; 0: the layout follows the font
    short hOption;
    short vOption;
    Point origin; // the anchor
    short fontFSRID;
};
