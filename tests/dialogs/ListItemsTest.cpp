#include "host/TextLayout.h"
#include "lists/GListPane.h"
#include "lists/ListTextDrawer.h"
#include "scrolling/ScrollBarPane.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/resources/TemporaryDirectory.h"
#include <boost/make_shared.hpp>
#include <vector>

namespace {

std::string const kPlace =
    "<BoundsRect top=\"10\" left=\"20\" bottom=\"112\" right=\"220\"/><LineHeight>20</LineHeight>";
std::string const kColumns = "<Columns><Column><Name>Track</Name><Width>120</Width></Column>"
                             "<Column><Name>Level</Name><Width>60</Width><Align>1</Align><Margin>7</Margin>"
                             "</Column></Columns>";

std::string Rows(int count) {
    std::string rows = "<Rows>";
    for (int i = 0; i < count; ++i)
        rows +=
            "<Row><Cell>Track " + std::to_string(i) + "</Cell><Cell>" + std::to_string(-i) + "</Cell></Row>";
    return rows + "</Rows>";
}

typedef std::vector<std::string> Texts;

class ListItems : public DialogTest {
protected:
    GListPane *LoadList(std::string const &keys) { return LoadOne<GListPane>("List", kPlace + keys); }

    // What is shown when the window is drawn: each text with its rectangle.
    Texts Shown(glogRec *glog) {
        desktop.TakeDrawing();
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        return TextsIn(desktop.TakeDrawing());
    }
    static Texts TextsIn(Texts const &drawing) {
        Texts texts;
        for (std::string const &line : drawing) {
            std::string const mark = "\"text\":\"";
            std::size_t const at = line.find(mark);
            if (at != std::string::npos)
                texts.push_back(
                    line.substr(at + mark.size(), line.find('"', at + mark.size()) - at - mark.size()));
        }
        return texts;
    }
    Texts MessagesOf(std::string const &script) {
        desktop.TakeMessages();
        desktop.Play(script);
        Texts found;
        for (std::string const &line : desktop.TakeMessages()) {
            std::size_t const at = line.find("\"message\"");
            if (!Holds(line, "HandleClick") && at != std::string::npos)
                found.push_back(line.substr(at));
        }
        return found;
    }
};

} // namespace

TEST_F(ListItems, AListHasItsColumnsSideBySide) {
    GListPane *const list = LoadList(kColumns);
    EXPECT_EQ(BoxOf(list), (Rect{10, 20, 112, 220}));
    EXPECT_EQ(list->GetLineHeight(), 20);
    ColumnList columns(*list->GetColumnList());
    ASSERT_EQ(columns.GetNumColumns(), 2);
    EXPECT_EQ(columns.GetLeftEdge(0), 0);
    EXPECT_EQ(columns.GetRightEdge(0), 120);
    EXPECT_EQ(columns.GetLeftEdge(1), 120);
    EXPECT_EQ(columns.GetRightEdge(1), 180);
    EXPECT_EQ(Utf8::FromUString(columns.GetName(1)), "Level");
    EXPECT_EQ(columns.GetAlignment(0), TextSettings::kAlignLeft);
    EXPECT_EQ(columns.GetAlignment(1), TextSettings::kAlignRight);
    EXPECT_EQ(columns.GetColumnMargin(0), 4);
    EXPECT_EQ(columns.GetColumnMargin(1), 7);
}

TEST_F(ListItems, WithoutColumnsThereIsOneAsWideAsTheList) {
    GListPane *const list = LoadList("");
    ASSERT_EQ(list->GetColumnList()->GetNumColumns(), 1);
    EXPECT_EQ(list->GetColumnList()->GetWidth(0), 200);
}

TEST_F(ListItems, TheColumnOfAListWithoutColumnsGrowsWithIt) {
    GListPane *const list =
        LoadList("<AutoEdge>3</AutoEdge><EdgeH>15</EdgeH><EdgeV>10</EdgeV><Style>1</Style>"
                 "<Rows><Row><Cell>Track 0</Cell></Row></Rows>");
    EXPECT_EQ(list->GetColumnList()->GetWidth(0), 285) << "also where it has grown while it was made";
    ShowGlog(list->GetGlog(), kShowGlog);
    desktop.Play("wait 1\nresize 400 300");
    EXPECT_EQ(list->GetColumnList()->GetLeftEdge(0), 0);
    EXPECT_EQ(list->GetColumnList()->GetRightEdge(0), 365);
    int line = -1, column = -1;
    EXPECT_TRUE(list->CheckHit({20, 380}, &line, &column));
    UpdateGlog(list->GetGlog());
    desktop.TakeDrawing();
    Rect narrow = {10, 20, 112, 25}, upsideDown = {10, 20, 112, 15}, box = {10, 20, 112, 220};
    list->SetBox(&box);
    UpdateGlog(list->GetGlog());
    EXPECT_EQ(TextsIn(desktop.TakeDrawing()), (Texts{"Track 0"})) << "where its end may be another one";
    list->SetBox(&narrow);
    EXPECT_EQ(list->GetColumnList()->GetWidth(0), 5);
    list->SetBox(&upsideDown);
    EXPECT_EQ(list->GetColumnList()->GetWidth(0), 0);
}

TEST_F(ListItems, TheColumnOfAListInALayoutGrowsWithIt) {
    glogRec *const glog =
        Load(Dialog("<Item type=\"Group\"><BoundsRect top=\"0\" left=\"0\" bottom=\"200\" right=\"320\"/>"
                    "<Layout><GrowWidth>1</GrowWidth></Layout><Items>" +
                    Item("List", kPlace + "<Layout><GrowWidth>1</GrowWidth></Layout>") + "</Items></Item>"));
    GListPane *const list = dynamic_cast<GListPane *>(GetGlogItem(glog, 1));
    ShowGlog(glog, kShowGlog);
    desktop.Play("wait 1\nresize 500 300");
    EXPECT_EQ(list->GetColumnList()->GetWidth(0), BoxOf(list).right - BoxOf(list).left);
    EXPECT_GT(list->GetColumnList()->GetWidth(0), 400);
}

TEST_F(ListItems, ColumnsThatAreGivenStayAsTheyAreWhenTheListGrows) {
    GListPane *list = LoadList(kColumns + "<AutoEdge>3</AutoEdge>");
    Rect box = {10, 20, 112, 320};
    list->SetBox(&box);
    EXPECT_EQ(list->GetColumnList()->GetRightEdge(1), 180);
    list = LoadList("<AutoEdge>3</AutoEdge>");
    boost::shared_ptr<ColumnList> const own = boost::make_shared<ColumnList>(static_cast<short>(1));
    list->SetColumnList(own);
    list->SetBox(&box);
    EXPECT_EQ(own->GetWidth(0), 0) << "also those that the program gives";
}

TEST_F(ListItems, ColumnsMayBeNone) {
    EXPECT_EQ(LoadList("<Columns/>")->GetColumnList()->GetNumColumns(), 0);
}

TEST_F(ListItems, ShowsTheTextsOfItsRows) {
    glogRec *const glog = Load(Dialog(Item("List", kPlace + kColumns + Rows(3))));
    EXPECT_EQ(Shown(glog), (Texts{"Track 0", "0", "Track 1", "-1", "Track 2", "-2"}));
}

TEST_F(ListItems, RowsMayHaveFewerCellsAndIcons) {
    glogRec *const glog =
        Load(Dialog(Item("List", kPlace + kColumns +
                                     "<Rows><Row/><Row><IconFamily>1821</IconFamily><Icon>2</Icon>"
                                     "<Cell>with a note</Cell></Row></Rows>")));
    desktop.TakeDrawing();
    EXPECT_EQ(Shown(glog), (Texts{"with a note"}));
    desktop.TakeDrawing();
    GetGlogItem(glog, 1)->Inval();
    UpdateGlog(glog);
    int icons = 0;
    for (std::string const &line : desktop.TakeDrawing())
        icons += Holds(line, "\"family\":1821") && Holds(line, "\"icon\":2");
    EXPECT_EQ(icons, 1);
}

TEST_F(ListItems, TextsMayComeFromAStringList) {
    glogRec *const glog =
        Load(Dialog(Item("List", kPlace + "<Rows><Row><Cell list=\"4325\" index=\"22\"/></Row></Rows>")));
    EXPECT_EQ(Shown(glog), (Texts{"Page"}));
}

TEST_F(ListItems, TakesAllThatTheKeysSay) {
    GListPane *const list =
        LoadList("<SelMode>3</SelMode><FirstLineOffset>5</FirstLineOffset><EdgeH>6</EdgeH>"
                 "<EdgeV>7</EdgeV><SelKeyMask>256</SelKeyMask><SelReturn>1</SelReturn>"
                 "<Style>1</Style><InhibitScrolling>1</InhibitScrolling>"
                 "<DrawSelectionWhenInactive>1</DrawSelectionWhenInactive>");
    glistResRec const record = list->GetResInfo();
    EXPECT_EQ(record.selMode, kListSelectToggle);
    EXPECT_EQ(record.firstLineOffset, 5);
    EXPECT_EQ(record.edgeH, 6);
    EXPECT_EQ(record.edgeV, 7);
    EXPECT_EQ(record.selKeyMask, 256);
    EXPECT_TRUE(record.selReturn);
    EXPECT_EQ(record.style, 1);
    EXPECT_TRUE(list->GetInhibitScrolling());
    EXPECT_TRUE(list->CanDrawSelection());
}

TEST_F(ListItems, FollowsTheWindowsEdges) {
    GListPane *const list = LoadList("<AutoEdge>3</AutoEdge><EdgeH>15</EdgeH><EdgeV>10</EdgeV>");
    EXPECT_EQ(BoxOf(list), (Rect{10, 20, 190, 305}));
}

TEST_F(ListItems, ScrollsWithoutABarWhenTold) {
    GListPane *list = LoadList(kColumns + Rows(50));
    list->SetScrollPosition(10);
    EXPECT_EQ(list->GetScrollPos(), 0);
    list = LoadList(kColumns + Rows(50) + "<ScrollWithNoBar>1</ScrollWithNoBar>");
    list->SetScrollPosition(10);
    EXPECT_EQ(list->GetScrollPos(), 10);
}

TEST_F(ListItems, RowsMayBeChosenFromTheStart) {
    std::string const rows = "<Rows><Row/><Row><Chosen>1</Chosen></Row><Row><Chosen>1</Chosen></Row></Rows>";
    GListPane *list = LoadList(rows);
    EXPECT_FALSE(list->CheckSel(1)) << "the last one counts";
    EXPECT_TRUE(list->CheckSel(2));
    list = LoadList("<SelMode>2</SelMode>" + rows);
    EXPECT_FALSE(list->CheckSel(0));
    EXPECT_TRUE(list->CheckSel(1));
    EXPECT_TRUE(list->CheckSel(2));
}

TEST_F(ListItems, AreScrolledByTheBarsThatTheyName) {
    std::string const bar = "<Item type=\"ScrollBar\" id=\"7\"/>",
                      list = Item("List", kPlace + "<ScrollItem>7</ScrollItem>" + kColumns + Rows(50));
    for (std::string const &items :
         {bar + list, list + bar, "<Item type=\"Group\"><Items>" + bar + list + "</Items></Item>",
          "<Item type=\"Group\"><Items>" + list + "</Items></Item>" + bar}) {
        glogRec *const glog = Load(Dialog(items));
        GListPane *const loaded = dynamic_cast<GListPane *>(GetGlogItem(glog, 1));
        ScrollBarPane *const found = dynamic_cast<ScrollBarPane *>(GetGlogItem(glog, 7));
        ASSERT_NE(loaded, nullptr);
        EXPECT_EQ(loaded->GetScrollBar(), found);
        EXPECT_EQ(found->GetRange(), 45);
        found->ScrollOneUnit(true);
        EXPECT_EQ(loaded->GetScrollPos(), 1);
        delete loaded;
        EXPECT_EQ(found->GetClient(), nullptr);
        DisposeGlog(glog);
    }
}

TEST_F(ListItems, ABarMayGoBeforeItsList) {
    glogRec *const glog = Load(
        Dialog(Item("List", kPlace + "<ScrollItem>7</ScrollItem>") + "<Item type=\"ScrollBar\" id=\"7\"/>"));
    delete GetGlogItem(glog, 7);
    DisposeGlog(glog);
    EXPECT_EQ(Glogs(), 0u);
}

// Messages

TEST_F(ListItems, TellWatchersWhatIsSelectedAndClicked) {
    glogRec *const glog = Load(Dialog(Item("List", kPlace + kColumns + "<SelMode>3</SelMode>" + Rows(2))));
    ShowGlog(glog, kShowGlog);
    desktop.Play("wait 1");
    EXPECT_EQ(MessagesOf("click 40 20"),
              (Texts{"\"message\":\"SelectOccured\",\"line\":0,\"selected\":true,\"tracking\":false}",
                     "\"message\":\"SelectionDone\",\"selected\":1}"}));
    EXPECT_EQ(MessagesOf("doubleclick 150 40"),
              (Texts{"\"message\":\"ClickOccured\",\"column\":1,\"line\":1,\"doubleClick\":false}",
                     "\"message\":\"ClickOccured\",\"column\":1,\"line\":1,\"doubleClick\":true}"}));
}

TEST_F(ListItems, TellNobodyElseOnceTheProgramListens) {
    glogRec *const glog = Load(Dialog(Item("List", kPlace + kColumns + Rows(2))));
    dynamic_cast<GListPane *>(GetGlogItem(glog, 1))->SetSelectionListener(nullptr);
    ShowGlog(glog, kShowGlog);
    desktop.Play("wait 1");
    EXPECT_TRUE(MessagesOf("click 40 20").empty());
}

TEST_F(ListItems, TheDumpTellsWhatAListShows) {
    glogRec *const glog = Load(Dialog(
        Item("List", kPlace + "<ScrollWithNoBar>1</ScrollWithNoBar><Rows><Row/><Row/><Row/><Row/><Row/><Row/>"
                              "<Row><Chosen>1</Chosen></Row></Rows>")));
    dynamic_cast<GListPane *>(GetGlogItem(glog, 1))->SetScrollPosition(2);
    EXPECT_TRUE(Holds(Dump(glog), "\"rows\":7,\"top\":2,\"selectedRows\":1,\"firstSelected\":6"))
        << Dump(glog);
}

// What is wrong

TEST_F(ListItems, NeedABoxAndALineHeight) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("List", "<LineHeight>16</LineHeight>"),
                      "<BoundsRect top=\"\" left=\"\" bottom=\"\" right=\"\"> is missing"));
    EXPECT_TRUE(
        Holds(ComplaintAboutItem("List", "<BoundsRect top=\"1\" left=\"1\" bottom=\"9\" right=\"9\"/>"),
              "<LineHeight> is missing"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("List", "<BoundsRect top=\"1\" left=\"1\" bottom=\"9\" right=\"9\"/>"
                                                 "<LineHeight>0</LineHeight>"),
                      "LineHeight"));
}

TEST_F(ListItems, ABarThatIsNotThereIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("List", kPlace + "<ScrollItem>9</ScrollItem>"),
                      "item 1 (List): key ScrollItem: there is no item 9"));
}

TEST_F(ListItems, AnItemThatIsNoBarIsAnErrorInItsPlace) {
    EXPECT_EQ(ComplaintAbout("<Glog width=\"99\" height=\"99\"><Items><Item type=\"Group\"><Items>\n"
                             "  <Item type=\"Spacer\" id=\"9\"/>\n  <Item type=\"List\" id=\"1\">" +
                             kPlace +
                             "\n    <ScrollItem>9</ScrollItem></Item></Items></Item></Items></Glog>"),
              "test.xml:4:5: item 1 (List): key ScrollItem: item 9 is no scroll bar");
}

TEST_F(ListItems, NumbersOutOfRangeAreErrors) {
    for (std::string const keys :
         {"<SelMode>5</SelMode>", "<AutoEdge>4</AutoEdge>", "<Style>2</Style>", "<SelColumn>1001</SelColumn>",
          "<Columns><Column><Width>16001</Width></Column></Columns>", "<Columns><Column/></Columns>",
          "<Columns><Column><Width>10</Width><Align>3</Align></Column></Columns>",
          "<Truncate>Start</Truncate>"})
        EXPECT_NE(ComplaintAboutItem("List", kPlace + keys), "no complaint") << keys;
}

TEST_F(ListItems, ARowWithMoreCellsThanColumnsIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("List", kPlace + kColumns +
                                                     "<Rows><Row/><Row><Cell>a</Cell><Cell>b</Cell>"
                                                     "<Cell>c</Cell></Row></Rows>"),
                      "row 2 has 3 cells: there are 2 columns"));
}

TEST_F(ListItems, ColumnsBeyondTheCoordinatesAreAnError) {
    std::string columns;
    for (int i = 0; i < 3; ++i)
        columns += "<Column><Width>16000</Width></Column>";
    EXPECT_TRUE(Holds(ComplaintAboutItem("List", kPlace + "<Columns>" + columns + "</Columns>"),
                      "wider than 32767 pixels"));
}

// Records

namespace {

// Bytes of a record, low byte first.
class Record {
public:
    Record &Short(int value) { return Byte(value).Byte(value >> 8); }
    Record &Long(int value) { return Short(value).Short(value >> 16); }
    Record &Byte(int value) {
        bytes += static_cast<char>(value & 0xFF);
        return *this;
    }
    // A binary dialog of this record and a scroll bar.
    std::string Dialog() const {
        Record bar;
        bar.Short(2).Short(0).Short(10).Short(220).Short(112).Short(236).Short(0).Short(0);
        Record dialog;
        dialog.bytes = "GLOGREC1";
        dialog.Short(320).Short(200).Short(2);
        dialog.Short(static_cast<int>(bytes.size())).bytes += bytes;
        dialog.Short(static_cast<int>(bar.bytes.size())).bytes += bar.bytes;
        return dialog.bytes;
    }
    static Record List(int selMode, int lineHeight, int autoEdge, int style) {
        Record record;
        record.Short(4).Short(10).Short(20).Short(112).Short(220).Short(2).Long(selMode);
        record.Short(lineHeight).Short(3).Short(5).Short(6).Short(0x100).Byte(1).Byte(77);
        return record.Long(autoEdge).Long(style);
    }
    std::size_t Size() const { return bytes.size(); }

private:
    std::string bytes;
};

} // namespace

class ListRecords : public DialogTest {
protected:
    glogRec *LoadRecord(Record const &record) {
        return LoadGlog(directory.Write("list.glog", record.Dialog()));
    }
    TemporaryDirectory directory;
};

TEST_F(ListRecords, AListIsMadeFromItsBytes) {
    Record const record = Record::List(2, 20, 0, 1);
    ASSERT_EQ(record.Size(), 36u) << "as it lies in memory";
    glogRec *const glog = LoadRecord(record);
    GListPane *const list = dynamic_cast<GListPane *>(GetGlogItem(glog, 1));
    ASSERT_NE(list, nullptr);
    glistResRec const made = list->GetResInfo();
    EXPECT_EQ(made.bounds, (Rect{10, 20, 112, 220}));
    EXPECT_EQ(made.scrollItem, 2);
    EXPECT_EQ(made.selMode, kListSelectSeveral);
    EXPECT_EQ(made.lineHeight, 20);
    EXPECT_EQ(made.firstLineOffset, 3);
    EXPECT_EQ(made.edgeH, 5);
    EXPECT_EQ(made.edgeV, 6);
    EXPECT_EQ(made.selKeyMask, 0x100);
    EXPECT_TRUE(made.selReturn);
    EXPECT_EQ(made.style, 1);
    ShowGlog(glog, kShowGlog);
    desktop.Play("wait 0.1");
    EXPECT_EQ(dynamic_cast<ScrollBarPane *>(GetGlogItem(glog, 2))->GetClient(), list);
}

TEST_F(ListRecords, NumbersOutOfRangeAreErrors) {
    struct {
        Record record;
        char const *key;
    } const cases[] = {{Record::List(5, 20, 0, 0), "SelMode"},
                       {Record::List(2, 0, 0, 0), "LineHeight"},
                       {Record::List(2, 20, 4, 0), "AutoEdge"},
                       {Record::List(2, 20, 0, 2), "Style"}};
    for (auto const &c : cases)
        EXPECT_TRUE(Holds(Complaint([&] { LoadRecord(c.record); }), c.key)) << c.key;
}
