// The headings of a list's columns.
//
// The edge between two columns is dragged to resize them.
#pragma once
#include "host/GlogPane.h"
#include "lists/ColumnList.h"
#include <boost/shared_ptr.hpp>
#include <functional>

class ListHeaderPane : public GlogPane {
public:
    static short const kHeight = 20; // pixels

    // Makes a pane and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. `resized` is told after each change of the columns.
    static ListHeaderPane *NewListHeaderPane(glogRec *, boost::shared_ptr<ColumnList> columns,
                                             std::function<void()> resized);

protected:
    char AdjustCursorAndDisplayHelp(Point) override;
    int HandleClick(EventRecordAdapter *) override; // -1 for an edge, else 0
    void DrawGuts(OSRgn *) override;

private:
    ListHeaderPane(boost::shared_ptr<ColumnList> columns, std::function<void()> resized);
    int ColumnEndingAt(Point) const;
    void Resize(int column, Point start);
    using GlogPane::Resize;

    boost::shared_ptr<ColumnList> columns;
    std::function<void()> resized;
};
