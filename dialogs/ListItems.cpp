// Lists with columns and rows in dialogs.
#include "buttons/NaturalSize.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/BarName.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "dialogs/TruncateWord.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "lists/GListPane.h"
#include "lists/ListTextDrawer.h"
#include "scrolling/ScrollBarPane.h"
#include "scrolling/Truncation.h"
#include "text/FontIndex.h"
#include <algorithm>
#include <boost/make_shared.hpp>
#include <limits>
#include <memory>
#include <new>
#include <string>
#include <vector>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

short const kNoNumber = 0; // the loader numbers what it makes
long long const kLargest = std::numeric_limits<short>::max();
int const kLargestHeight = 1000;       // pixels of a row
long long const kLargestWidth = 16000; // pixels of a column
long long const kLargestMargin = 1000; // pixels
long long const kLargestByte = 255;
int const kUsualMargin = 4; // pixels

// Messages

class SelectionReporter : public MessageReporter<GListPane_SelectionListener> {
public:
    using MessageReporter::MessageReporter;
    void SelectionDone(GListPane *list) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*list)
                                    .Text("message", std::string("SelectionDone"))
                                    .Integer("selected", list->NumSelected()));
    }
    void ClickOccured(GListPane *list, int column, int line, bool doubleClick) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*list)
                                    .Text("message", std::string("ClickOccured"))
                                    .Integer("column", column)
                                    .Integer("line", line)
                                    .Flag("doubleClick", doubleClick));
    }
    void SelectOccured(GListPane *list, int line, bool selected, bool tracking) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*list)
                                    .Text("message", std::string("SelectOccured"))
                                    .Integer("line", line)
                                    .Flag("selected", selected)
                                    .Flag("tracking", tracking));
    }
};

// The list's one listener, until the program sets its own.
void ReportSelection(GlogPane *pane) {
    if (GListPane *const list = dynamic_cast<GListPane *>(pane))
        list->SetSelectionListener(new SelectionReporter(list));
}

bool DescribeList(GlogPane &pane, JsonLine &line) {
    GListPane *const list = dynamic_cast<GListPane *>(&pane);
    if (!list)
        return false;
    line.Integer("rows", list->GetNumItems())
        .Integer("top", list->GetScrollPos())
        .Integer("selectedRows", list->NumSelected());
    int first = 0;
    if (list->GetFirstSelectedItem(first))
        line.Integer("firstSelected", first);
    return true;
}

// Columns

int Number(Container const &item, char const *key) {
    return static_cast<int>(item->GetSIntItemValue(ResourceKey(key)));
}

bool Has(Container const &item, char const *key) { return bool(item->GetSInt32Item(ResourceKey(key))); }

TextSettings::Alignment AlignmentOf(int align) {
    static TextSettings::Alignment const kAlignments[] = {TextSettings::kAlignLeft, TextSettings::kAlignRight,
                                                          TextSettings::kAlignCenter};
    return kAlignments[align];
}

// Calls the function with each container in the one under the key.
template <class Action> void ForEachIn(Container const &item, char const *key, Action const &action) {
    Container const all = item->GetContainerItem(ResourceKey(key));
    for (std::size_t i = 0; all && i < all->GetNumItems(); ++i)
        action(XMLLib::ContainerFromItem(all->GetNthItem(i)));
}

// Side by side from the list's left.
boost::shared_ptr<ColumnList> ColumnsOf(Container const &item) {
    std::vector<ColumnList::Data> columns;
    long long edge = 0;
    ForEachIn(item, "Columns", [&](Container const &described) {
        ColumnList::Data column;
        column.leftEdge = static_cast<short>(edge);
        edge += Number(described, "Width");
        if (edge > kLargest || columns.size() >= static_cast<std::size_t>(kLargest))
            throw KeyFault("Columns", "all columns together are wider than " + std::to_string(kLargest) +
                                          " pixels, or there are more of them");
        column.rightEdge = static_cast<short>(edge);
        column.name = described->GetUStringItemValue(ResourceKey("Name"));
        column.alignment = AlignmentOf(Number(described, "Align"));
        column.columnMargin = Has(described, "Margin") ? Number(described, "Margin") : kUsualMargin;
        columns.push_back(column);
    });
    return boost::make_shared<ColumnList>(static_cast<short>(columns.size()), columns.data());
}

// Without a width yet.
boost::shared_ptr<ColumnList> OneColumn() {
    ColumnList::Data column;
    column.alignment = TextSettings::kAlignLeft;
    column.columnMargin = kUsualMargin;
    return boost::make_shared<ColumnList>(static_cast<short>(1), &column);
}

// Rows

struct ListRow {
    std::vector<UString> cells;
    short iconFamily = 0, icon = 0; // in the first column; 0: none
    bool isChosen = false, isActive = true;
};
typedef std::vector<ListRow> ListRows;

ListRow RowOf(Container const &item) {
    ListRow row;
    for (std::size_t i = 0; i < item->GetNumItems(); ++i) {
        if (boost::shared_ptr<XMLLib::UStringItem> const cell = XMLLib::UStringFromItem(item->GetNthItem(i)))
            row.cells.push_back(cell->Get());
    }
    row.iconFamily = static_cast<short>(Number(item, "IconFamily"));
    row.icon = static_cast<short>(Number(item, "Icon"));
    row.isChosen = Number(item, "Chosen") != 0;
    row.isActive = !Has(item, "Enabled") || Number(item, "Enabled") != 0;
    return row;
}

ListRows RowsOf(Container const &item, std::size_t columnCount) {
    ListRows rows;
    ForEachIn(item, "Rows", [&](Container const &described) {
        rows.push_back(RowOf(described));
        if (rows.back().cells.size() > columnCount)
            throw KeyFault("Rows", "row " + std::to_string(rows.size()) + " has " +
                                       std::to_string(rows.back().cells.size()) + " cells: there are " +
                                       std::to_string(columnCount) + " columns");
    });
    return rows;
}

void FillCell(ListRows const &rows, int line, int column, ListCell &cell) {
    if (static_cast<std::size_t>(line) >= rows.size())
        return;
    ListRow const &row = rows[static_cast<std::size_t>(line)];
    if (static_cast<std::size_t>(column) < row.cells.size())
        cell.text = row.cells[static_cast<std::size_t>(column)];
    cell.isActive = row.isActive;
    if (column == 0) {
        cell.iconFamily = row.iconFamily;
        cell.icon = row.icon;
    }
}

// The list

// Takes its bar by its number, once the dialog stands.
class DialogList : public GListPane {
public:
    explicit DialogList(GlogStyleSheet *sheet)
        : bar(sheet, "ScrollItem") {}
    ~DialogList() override {
        if (GetScrollBar())
            SetScrollBar(nullptr);
    }

    bool Init(glogRec *owner, GlogStyleSheet *sheet) {
        Container const item = sheet->GetItemRes();
        glistResRec record;
        ListResRecFromXMLRes(item, record);
        record.scrollItem = 0;
        if (!InitGListPane(owner, &record, kNoNumber))
            return false;
        SetNaturalSize(*this, record.bounds.right - record.bounds.left,
                       record.bounds.bottom - record.bounds.top);
        TakeColumns(item);
        SetUp(item);
        TakeRows(item, sheet);
        return true;
    }

    void SetBox(Rect *box) override {
        GListPane::SetBox(box);
        WidenOneColumn();
    }

    void GlogItemInit() override {
        GListPane::GlogItemInit();
        if (ScrollBarPane *const found = bar.FindFor(*this))
            SetScrollBar(found);
        SetScrollPosition(GetScrollPos());
    }

private:
    void TakeColumns(Container const &item) {
        if (item->GetContainerItem(ResourceKey("Columns"))) {
            SetColumnList(ColumnsOf(item));
            return;
        }
        oneColumn = OneColumn();
        SetColumnList(oneColumn);
        WidenOneColumn();
    }

    // The column of a list that was given none is as wide as the list.
    void WidenOneColumn() {
        if (!oneColumn)
            return;
        int const width = Pixel16(std::max(GetBounds().right - GetBounds().left, 0));
        if (width == oneColumn->GetWidth(0))
            return;
        oneColumn->SetBothEdges(0, 0, width);
        Inval();
    }

    void SetUp(Container const &item) {
        SetSelColumn(Number(item, "SelColumn"));
        SetScrollWithNoBar(Number(item, "ScrollWithNoBar") != 0);
        SetInhibitScrolling(Number(item, "InhibitScrolling") != 0);
        if (Number(item, "DrawSelectionWhenInactive") != 0)
            DrawSelectionWhenInactive();
    }

    void TakeRows(Container const &item, GlogStyleSheet *sheet) {
        boost::shared_ptr<ListRows const> const rows = boost::make_shared<ListRows>(
            RowsOf(item, static_cast<std::size_t>(GetColumnList()->GetNumColumns())));
        std::unique_ptr<ListTextDrawer> drawer(new ListTextDrawer(
            this, [rows](int line, int column, ListCell &cell) { FillCell(*rows, line, column, cell); }));
        drawer->SetFont(FontIndexFromFSRID(Number(item, "FSRID")));
        drawer->SetTruncation(TruncateWord::Of(sheet, TextSettings::kTruncateEnd));
        SetLineDrawer(drawer.release(), true);
        SetNumItems(static_cast<int>(rows->size()));
        Choose(*rows);
    }

    void Choose(ListRows const &rows) {
        for (std::size_t i = 0; i < rows.size(); ++i) {
            int const row = static_cast<int>(i);
            if (rows[i].isChosen && SelModeDiscontig())
                SelectItem(row);
            else if (rows[i].isChosen)
                SetSelRange(row, row);
        }
    }

    BarName bar;
    boost::shared_ptr<ColumnList> oneColumn; // null where the dialog says which columns there are
};

GlogPane *MakeList(glogRec *glog, GlogStyleSheet *sheet) {
    std::unique_ptr<DialogList> list(new (std::nothrow) DialogList(sheet));
    return list && list->Init(glog, sheet) ? list.release() : nullptr;
}

GlogPane *MakeListFromRecord(glogRec *glog, RecordBytes &bytes) {
    glistResRec record;
    record.type = bytes.Short();
    record.bounds = bytes.ReadRect();
    record.scrollItem = bytes.Short();
    record.selMode =
        static_cast<GListSelectionMode>(bytes.Long("SelMode", kListSelectOne, kListSelectByCode));
    record.lineHeight = bytes.Short("LineHeight", 1, kLargestHeight);
    record.firstLineOffset = bytes.Short();
    record.edgeH = bytes.Short();
    record.edgeV = bytes.Short();
    record.selKeyMask = bytes.Short();
    record.selReturn = bytes.Byte() != 0;
    bytes.Byte(); // the record's fields lie at even places
    record.autoEdge = bytes.Long("AutoEdge", glistResRec::kNoEdge, glistResRec::kBothFollow);
    record.style = bytes.Long("Style", glistResRec::kDialogStyle, glistResRec::kSmallStyle);
    return GListPane::NewGListPane(glog, &record);
}

KeyList ColumnKeys() {
    return KeyList()
        .String("Name")
        .Integer("Width", 0, kLargestWidth)
        .Required()
        .Integer("Align", 0, TextSettings::kAlignLeft)
        .Integer("Margin", 0, kLargestMargin);
}

KeyList RowKeys() {
    return KeyList()
        .String("Cell")
        .Repeated()
        .Integer("IconFamily", 0, kLargest)
        .Integer("Icon", 0, kLargest)
        .Flag("Chosen")
        .Flag("Enabled");
}

KeyList ListKeys() {
    return KeyList()
        .Rect("BoundsRect")
        .Required()
        .Integer("ScrollItem", 1, kLargest)
        .Integer("SelMode", kListSelectOne, kListSelectByCode)
        .Integer("LineHeight", 1, kLargestHeight)
        .Required()
        .Integer("FirstLineOffset", 0, kLargestHeight)
        .Integer("EdgeH")
        .Integer("EdgeV")
        .Integer("SelKeyMask", 0, kLargest)
        .Flag("SelReturn")
        .Integer("AutoEdge", glistResRec::kNoEdge, glistResRec::kBothFollow)
        .Integer("Style", glistResRec::kDialogStyle, glistResRec::kSmallStyle)
        .Integer("SelColumn", 0, GListPane::kAnyColumn)
        .Flag("ScrollWithNoBar")
        .Flag("InhibitScrolling")
        .Flag("DrawSelectionWhenInactive")
        .Integer("FSRID", 0, kLargestByte)
        .Word("Truncate", {"None", "End", "Middle"})
        .Container("Columns", KeyList().Container("Column", ColumnKeys()).Repeated())
        .Container("Rows", KeyList().Container("Row", RowKeys()).Repeated());
}

} // namespace

void AddListItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeList);
    registry.Add(ItemType("List")
                     .Keys(ListKeys())
                     .MadeBy(MakeList)
                     .ReportedBy(ReportSelection)
                     .FromRecord(glistResRec::kType, ItemType::kWholeKind, MakeListFromRecord));
}
