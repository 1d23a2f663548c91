// The labels of a dialog as one pane: strings that stay as they are, each at a place of its own.
//
// The pane takes no clicks and sends no messages. In a layout every string is an item of its own; outside of
// one the pane's box is what the boxes of the strings cover together, and cannot be sized.
#pragma once
#include "host/GlogLayout.h"
#include "host/GlogPane.h"
#include "host/OSFont.h"
#include "host/RCPtr.h"
#include "host/UString.h"
#include <vector>

class GlogStyleSheet;
struct glogRec;

class StringGroupPane : public GlogPane {
public:
    // Makes a pane, attaches it to the glog, which owns it from then on, and reads the sheet. The glog must
    // not be null.
    static StringGroupPane *NewStringGroupPane(glogRec *, int id, GlogStyleSheet *);
    ~StringGroupPane() override;

    // Appends the strings of the sheet, from the keys "FSRID", "LineSpacing" (the height of a line, in
    // pixels) and "TextList" with a container for each string: "TextOrigin", the start of its baseline, (0,
    // 0) when absent, and "Text". Changes the font of the port. A sheet without "TextList" fails the
    // assertion of its pointer.
    void GetFromXML(GlogStyleSheet *);

    // GlogPane. Without strings, and outside a layout, the box is the one that contains nothing: its top and
    // left are 10000, its bottom and right -10000.
    void GetBox(Rect *) override;
    // Outside a layout, moves the strings by as much as the rectangle's top left corner is away from that of
    // the box; the size is ignored.
    void SetBox(Rect *) override;

    // Of the strings, in order; for tools that show what a dialog holds.
    std::size_t CountStrings() const { return strings.size(); }
    UString const &StringAt(std::size_t index) const { return strings[index].text; }

protected:
    int HandleClick(EventRecordAdapter *) override; // 0
    void DrawGuts(OSRgn *) override;

private:
    struct StringInfo {
        UString text;
        RCPtr<GlogLayoutRectItem> item;
        Rect box; // outside of a layout
    };

    StringGroupPane();
    void SetTextBox(StringInfo &, int index, Point origin, TarnQuickDrawText::FontInfo const &);
    TarnQuickDrawText::FontInfo UseFont() const;

    int font;        // index in the application's font table
    int lineSpacing; // pixels
    std::vector<StringInfo> strings;
};
