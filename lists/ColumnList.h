// The columns of a list.
#pragma once
#include "host/HelpTagHelper.h"
#include "host/LocalizedStrings.h"
#include "host/TextSettings.h"
#include "host/UString.h"
#include <vector>

// An ordered table of columns, numbered from 0. Edges are pixels in the list's own horizontal coordinates.
// The columns of a list lie side by side, but only ResizeColumn takes it for granted.
//
// No operation checks a column's number: one that does not exist is the caller's error. Only the edges of the
// whole table may be asked for when there are no columns.
class ColumnList {
public:
    // One column.
    struct Data {
        short leftEdge = 0, rightEdge = 0;
        UString name; // the title
        TextSettings::Alignment alignment = TextSettings::Alignment(0);
        int columnMargin = 1;                               // pixels to keep free at either side of a text
        LocalizedStrings::HelpTag const *helpTag = nullptr; // not owned
        OS::Help::Placement helpTagPlacement = OS::Help::Placement(3);
        double helpTagLocation = 0.5;
    };

    // So many columns, as Data makes them; copies of so many records. Below 1 there are none.
    explicit ColumnList(short count);
    ColumnList(short count, Data const *);
    virtual ~ColumnList();

    int GetNumColumns() const;          // how many there are
    int GetLeftEdge(int column) const;  // of one column
    int GetRightEdge(int column) const; // of one column
    int GetWidth(int column) const;     // the right edge less the left one
    // Write both edges of a column.
    void GetBothEdges(int column, int &left, int &right) const;
    void GetBothEdges(int column, short &left, short &right) const; // the same
    // The smallest left and the largest right edge of all columns; without columns the greatest and the least
    // integer.
    int GetColumnListLeftEdge() const;
    int GetColumnListRightEdge() const;

    UString const &GetName(int column) const;               // the title
    void SetName(int column, UString const &);              // leaves the edges alone
    TextSettings::Alignment GetAlignment(int column);       // of the texts
    void SetAlignment(int column, TextSettings::Alignment); // only stores
    int GetColumnMargin(int column) const;                  // pixels at either side of a text
    void SetColumnMargin(int column, int pixels);           // only stores
    // The tag stays the caller's; null is none.
    LocalizedStrings::HelpTag const *GetHelpTag(int column) const;
    void SetHelpTag(int column, LocalizedStrings::HelpTag const *);
    // At which side of the column its tag is shown, and where along it, from 0 to 1.
    void GetHelpTagLoc(int column, OS::Help::Placement &, double &location) const;
    void SetHelpTagLoc(int column, OS::Help::Placement, double location);

    // A column does not become narrower than its name in the font of list headers and 2 pixels; only two
    // equal edges stay as they are. Edges are cut to 16 bits. Other columns stay where they are.
    void SetBothEdges(int column, int left, int right);
    // Gives the column another width and moves those to its right along. The right edge of the last column is
    // a wall: it stays, and what would lie beyond it ends there. The last column itself does not get the
    // width: made wider, it loses as much at its left edge; made narrower, it moves to the left as it is.
    void ResizeColumn(int column, int newWidth);

private:
    Data &At(int column) { return columns[static_cast<std::size_t>(column)]; }
    Data const &At(int column) const { return columns[static_cast<std::size_t>(column)]; }

    std::vector<Data> columns;
};
