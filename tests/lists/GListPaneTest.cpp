// How a list is made, its bar, and what it does when the window changes.
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "tests/VirtualPlace.h"
#include "tests/frame/Allocations.h"
#include "tests/lists/ListTest.h"
#include <cstddef>
#include <limits>

namespace {

class GListPaneTest : public ListTest {
protected:
    ScrollBarPane *NewBar() {
        ScrollBarPane *const bar = new ScrollBarPane(glog, 0, 0, 0);
        Rect box = {20, 230, 120, 246};
        bar->SetBox(&box);
        return bar;
    }
    // Lets chores run.
    void Idle() { desktop.Play("wait 0.01"); }
};

int const kNowhere = std::numeric_limits<int>::min();

} // namespace

TEST_F(GListPaneTest, HasItsNewOperationsInTheirOrder) {
    ExpectInOrder(kAfterDestructor, &GListPane::SetNumItems, &GListPane::AddItem, &GListPane::DelItem,
                  &GListPane::CheckSel, &GListPane::SetScrollPosition, &GListPane::ClickSelectFilter,
                  &GListPane::DoDrawListLine, &GListPane::SetupColors,
                  &GListPane::InvalInactiveSelectionDisplay, &GListPane::DrawInactiveSelection,
                  &GListPane::HiliteColumnRect, &GListPane::ClickBelowLastItem, &GListPane::ModifyScrollRect);
}

TEST_F(GListPaneTest, HasItsBasesInTheirOrder) {
    GListPane *const list = NewList(Record());
    char const *const at = reinterpret_cast<char const *>(list);
    auto const offset = [at](void const *base) { return static_cast<char const *>(base) - at; };
    std::ptrdiff_t const provider = offset(static_cast<Provider<GListPane_SelectionListener> *>(list));
    std::ptrdiff_t const pane = offset(static_cast<GlogPane *>(list));
    std::ptrdiff_t const client = offset(static_cast<ScrollBarClient *>(list));
    std::ptrdiff_t const chore = offset(static_cast<CIdleChore *>(list));
    EXPECT_EQ(provider, 0);
    EXPECT_LT(provider, pane);
    EXPECT_LT(pane, client);
    EXPECT_LT(client, chore);
}

TEST(glistResRecTest, LiesInBinaryResourcesAsItStands) {
    EXPECT_EQ(sizeof(glistResRec), 36u);
    EXPECT_EQ(offsetof(glistResRec, bounds), 2u);
    EXPECT_EQ(offsetof(glistResRec, scrollItem), 10u);
    EXPECT_EQ(offsetof(glistResRec, selMode), 12u);
    EXPECT_EQ(offsetof(glistResRec, lineHeight), 16u);
    EXPECT_EQ(offsetof(glistResRec, firstLineOffset), 18u);
    EXPECT_EQ(offsetof(glistResRec, edgeH), 20u);
    EXPECT_EQ(offsetof(glistResRec, edgeV), 22u);
    EXPECT_EQ(offsetof(glistResRec, selKeyMask), 24u);
    EXPECT_EQ(offsetof(glistResRec, selReturn), 26u);
    EXPECT_EQ(offsetof(glistResRec, autoEdge), 28u);
    EXPECT_EQ(offsetof(glistResRec, style), 32u);
}

// Making

TEST_F(GListPaneTest, IsEmptyWhereItsRecordSays) {
    GListPane *const list = NewList(Record());
    EXPECT_EQ(list->GetGlog(), glog);
    EXPECT_EQ(list->GetID(), 0);
    EXPECT_EQ(BoxOf(*list), ListBox());
    EXPECT_EQ(list->GetNumItems(), 0);
    EXPECT_EQ(list->GetScrollPos(), 0);
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(list->GetFirstSelectedItem(), -1);
    EXPECT_EQ(list->GetColumnList(), nullptr);
    EXPECT_EQ(list->GetLineDrawer(), nullptr);
    EXPECT_EQ(list->GetScrollBar(), nullptr);
    EXPECT_FALSE(list->GetInhibitScrolling());
    EXPECT_FALSE(list->CanDrawSelection());
    int line = 0, column = 0;
    list->GetClickParameters(line, column);
    EXPECT_EQ(line, kNowhere);
    EXPECT_EQ(column, kNowhere);
}

TEST_F(GListPaneTest, KeepsAWholeCopyOfItsRecord) {
    glistResRec record = {4, ListBox(), 7, kListSelectToggle, 16, 3, 11, 12, 0x0900, true, 0, 1};
    GListPane *const list = GListPane::NewGListPane(glog, &record);
    record.lineHeight = 99;
    glistResRec const kept = list->GetResInfo();
    EXPECT_EQ(kept.type, 4);
    EXPECT_EQ(kept.bounds, ListBox());
    EXPECT_EQ(kept.scrollItem, 7);
    EXPECT_EQ(kept.selMode, kListSelectToggle);
    EXPECT_EQ(kept.lineHeight, 16);
    EXPECT_EQ(kept.firstLineOffset, 3);
    EXPECT_EQ(kept.edgeH, 11);
    EXPECT_EQ(kept.edgeV, 12);
    EXPECT_EQ(kept.selKeyMask, 0x0900);
    EXPECT_TRUE(kept.selReturn);
    EXPECT_EQ(kept.style, 1);
}

TEST_F(GListPaneTest, ARecordOfModeOneMakesAListForSeveralRows) {
    GListPane *const list = NewList(Record(kListSelectNothing));
    EXPECT_EQ(list->GetResInfo().selMode, kListSelectSeveral);
    EXPECT_TRUE(list->SelModeDiscontig());
}

TEST_F(GListPaneTest, WithoutAGlogThereIsNone) {
    glistResRec record = Record();
    EXPECT_EQ(GListPane::NewGListPane(nullptr, &record), nullptr);
    EXPECT_EQ(GListPane::NewGListPane(nullptr, TestItem().Container()), nullptr);
}

TEST_F(GListPaneTest, WithoutMemoryThereIsNone) {
    glistResRec record = Record();
    Allocations::FailAfter const fail(0);
    EXPECT_EQ(GListPane::NewGListPane(glog, &record), nullptr);
    EXPECT_TRUE(fail.HasFailed());
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(GListPaneTest, ReadsEveryKeyOfItsItem) {
    TestItem item;
    item.Box("BoundsRect", ListBox())
        .Integer("ScrollItem", 2)
        .Integer("SelMode", 3)
        .Integer("LineHeight", 15)
        .Integer("FirstLineOffset", 4)
        .Integer("EdgeH", 5)
        .Integer("EdgeV", 6)
        .Integer("SelKeyMask", 0x100)
        .Integer("SelReturn", 1)
        .Integer("AutoEdge", 3)
        .Integer("Style", 1);
    glistResRec record;
    GListPane::ListResRecFromXMLRes(item.Container(), record);
    EXPECT_EQ(record.type, 4);
    EXPECT_EQ(record.bounds, ListBox());
    EXPECT_EQ(record.scrollItem, 2);
    EXPECT_EQ(record.selMode, kListSelectToggle);
    EXPECT_EQ(record.lineHeight, 15);
    EXPECT_EQ(record.firstLineOffset, 4);
    EXPECT_EQ(record.edgeH, 5);
    EXPECT_EQ(record.edgeV, 6);
    EXPECT_EQ(record.selKeyMask, 0x100);
    EXPECT_TRUE(record.selReturn);
    EXPECT_EQ(record.autoEdge, 3);
    EXPECT_EQ(record.style, 1);
}

TEST_F(GListPaneTest, KeysThatAreAbsentAreZero) {
    glistResRec record;
    GListPane::ListResRecFromXMLRes(TestItem().Container(), record);
    EXPECT_EQ(record.type, 4);
    EXPECT_EQ(record.bounds, (Rect{0, 0, 0, 0}));
    EXPECT_EQ(record.scrollItem, 0);
    EXPECT_EQ(record.selMode, kListSelectOne);
    EXPECT_EQ(record.lineHeight, 0);
    EXPECT_FALSE(record.selReturn);
    EXPECT_EQ(record.autoEdge, 0);
    EXPECT_EQ(record.style, 0);
}

TEST_F(GListPaneTest, NumbersAreCutToTheirFields) {
    TestItem item;
    item.Integer("LineHeight", 65536 + 16).Integer("SelMode", (1LL << 32) + 2).Integer("EdgeH", -40000);
    glistResRec record;
    GListPane::ListResRecFromXMLRes(item.Container(), record);
    EXPECT_EQ(record.lineHeight, 16);
    EXPECT_EQ(record.selMode, kListSelectSeveral);
    EXPECT_EQ(record.edgeH, 65536 - 40000);
}

TEST_F(GListPaneTest, WithoutAnItemTheAssertionOfItsPointerFails) {
    EXPECT_THROW(GListPane::NewGListPane(glog, boost::shared_ptr<XMLLib::ContainerItem>()), BrokenInvariant);
}

TEST_F(GListPaneTest, IsMadeFromAnItem) {
    TestItem item;
    item.Box("BoundsRect", ListBox()).Integer("LineHeight", 16);
    GListPane *const list = GListPane::NewGListPane(glog, item.Container());
    EXPECT_EQ(BoxOf(*list), ListBox());
    EXPECT_EQ(list->GetNumDisplayed(), 7);
}

TEST_F(GListPaneTest, MakingASmallListLeavesThePortsColorsAlone) {
    glistResRec record = Record();
    record.style = glistResRec::kSmallStyle;
    SaveColorRec before, after;
    GetColors(&before);
    NewList(record);
    GetColors(&after);
    EXPECT_EQ(before, after);
}

// The bar

TEST_F(GListPaneTest, TakesTheBarOfItsRecordAtTheFirstIdleTime) {
    glistResRec record = Record();
    record.scrollItem = 2;
    GListPane *const list = NewList(record);
    EXPECT_EQ(list->GetScrollBar(), nullptr);
    ScrollBarPane *const bar = NewBar();
    EXPECT_EQ(list->GetScrollBar(), bar) << "the second pane of the glog";
    EXPECT_EQ(bar->GetClient(), nullptr);
    Show();
    Idle();
    EXPECT_EQ(bar->GetClient(), list);
}

TEST_F(GListPaneTest, LooksForItsBarOnce) {
    glistResRec record = Record();
    record.scrollItem = 2;
    NewList(record);
    Show();
    Idle();
    ScrollBarPane *const late = NewBar();
    Idle();
    EXPECT_EQ(late->GetClient(), nullptr);
}

TEST_F(GListPaneTest, WithoutAnItemItTakesNoBar) {
    ScrollBarPane *const bar = NewBar();
    for (short item : {short(0), short(-1), short(9)}) {
        glistResRec record = Record();
        record.scrollItem = item;
        EXPECT_EQ(NewList(record)->GetScrollBar(), nullptr) << item;
    }
    Show();
    Idle();
    EXPECT_EQ(bar->GetClient(), nullptr);
}

TEST_F(GListPaneTest, AnItemThatIsNoBarIsNone) {
    glistResRec record = Record();
    record.scrollItem = 1; // the list itself
    EXPECT_EQ(NewList(record)->GetScrollBar(), nullptr);
}

TEST_F(GListPaneTest, ABarThatIsGivenBeatsTheOneOfTheRecord) {
    glistResRec record = Record();
    record.scrollItem = 2;
    GListPane *const list = NewList(record);
    ScrollBarPane *const named = NewBar(), *const given = NewBar();
    list->SetScrollBar(given);
    Show();
    Idle();
    EXPECT_EQ(list->GetScrollBar(), given);
    EXPECT_EQ(given->GetClient(), list);
    EXPECT_EQ(named->GetClient(), nullptr);
}

TEST_F(GListPaneTest, AnotherBarLeavesTheFormerOneWithoutAClient) {
    GListPane *const list = NewList(Record());
    ScrollBarPane *const first = NewBar(), *const second = NewBar();
    list->SetScrollBar(first);
    list->SetScrollBar(second);
    EXPECT_EQ(first->GetClient(), nullptr);
    EXPECT_EQ(second->GetClient(), list);
    list->SetScrollBar(nullptr);
    EXPECT_EQ(second->GetClient(), nullptr);
    EXPECT_EQ(list->GetScrollBar(), nullptr);
}

TEST_F(GListPaneTest, ABarThatIsGoneIsForgotten) {
    GListPane *const list = Filled(100);
    ScrollBarPane *const bar = NewBar();
    list->SetScrollBar(bar);
    delete bar;
    EXPECT_EQ(list->GetScrollBar(), nullptr);
    list->SetScrollPosition(5);
    list->SetScrollBar(nullptr);
    EXPECT_EQ(list->GetScrollPos(), 5);
}

TEST_F(GListPaneTest, TheBarOfTheRecordHasNoClientOnceTheListIsGone) {
    ScrollBarPane *const bar = NewBar();
    glistResRec record = Record();
    record.scrollItem = 1;
    GListPane *const list = NewList(record);
    Show();
    Idle();
    ASSERT_EQ(bar->GetClient(), list);
    delete list;
    EXPECT_EQ(bar->GetClient(), nullptr);
}

// Kept: only the bar of the record is let go.
TEST_F(GListPaneTest, ABarThatWasGivenKeepsItsClientWhenTheListGoes) {
    ScrollBarPane *const bar = NewBar();
    GListPane *const list = NewList(Record());
    ScrollBarClient *const client = list;
    list->SetScrollBar(bar);
    delete list;
    EXPECT_EQ(bar->GetClient(), client);
    bar->SetClient(nullptr);
}

TEST_F(GListPaneTest, AListThatGoesBeforeTheFirstIdleTimeTakesNoBar) {
    glistResRec record = Record();
    record.scrollItem = 1;
    ScrollBarPane *const bar = NewBar();
    delete NewList(record);
    Show();
    Idle();
    EXPECT_EQ(bar->GetClient(), nullptr);
}

TEST_F(GListPaneTest, AWindowWithAListAndItsBarCloses) {
    for (bool barFirst : {true, false}) {
        glogRec *const other = desktop.NewGlog(GlogOptions().Size(300, 200));
        CompoundPane *const group = new CompoundPane;
        group->CompoundPaneInit(other, 0);
        glistResRec record = Record();
        record.scrollItem = 5;
        GListPane *const list = GListPane::NewGListPane(other, &record);
        ScrollBarPane *const bar = new ScrollBarPane(other, 0, 0, 0);
        bar->SetID(5);
        new ScrollBarPane(other, 0, 0, 0);
        new ScrollBarPane(other, 0, 0, 0);
        new ScrollBarPane(other, 0, 0, 0);
        group->Add(barFirst ? static_cast<GlogPane *>(bar) : list, -1);
        group->Add(barFirst ? static_cast<GlogPane *>(list) : bar, -1);
        desktop.FinishGlog(other);
        ShowGlog(other, kShowGlog);
        Idle();
        DisposeGlog(other);
        Idle();
    }
}

// The drawer

TEST_F(GListPaneTest, DeletesADrawerThatIsItsOwn) {
    bool gone = false;
    GListPane *const list = NewList(Record());
    list->SetLineDrawer(new NotingDrawer(&gone), true);
    EXPECT_FALSE(gone);
    delete list;
    EXPECT_TRUE(gone);
}

TEST_F(GListPaneTest, LeavesADrawerThatIsNotItsOwn) {
    bool gone = false;
    NotingDrawer foreign(&gone);
    GListPane *const list = NewList(Record());
    list->SetLineDrawer(&foreign, false);
    EXPECT_EQ(list->GetLineDrawer(), &foreign);
    delete list;
    EXPECT_FALSE(gone);
}

TEST_F(GListPaneTest, ADrawerOfItsOwnGoesWhenAnotherComes) {
    bool gone = false;
    GListPane *const list = NewList(Record());
    NotingDrawer *const own = new NotingDrawer(&gone);
    list->SetLineDrawer(own, true);
    list->SetLineDrawer(own, true);
    EXPECT_FALSE(gone);
    list->SetLineDrawer(nullptr, false);
    EXPECT_TRUE(gone);
}

TEST_F(GListPaneTest, ADrawerCanBeGivenAway) {
    bool gone = false;
    GListPane *const list = NewList(Record());
    NotingDrawer *const own = new NotingDrawer(&gone);
    list->SetLineDrawer(own, true);
    list->SetLineDrawer(own, false);
    list->SetLineDrawer(nullptr, false);
    EXPECT_FALSE(gone);
    delete own;
}

// Changes of size

TEST_F(GListPaneTest, FollowsTheWindowsEdgesAsItsRecordSays) {
    struct {
        int autoEdge;
        Rect box;
    } const cases[] = {{glistResRec::kNoEdge, {20, 30, 120, 230}},
                       {glistResRec::kBottomFollows, {20, 30, 190, 230}},
                       {glistResRec::kRightFollows, {20, 30, 120, 308}},
                       {glistResRec::kBothFollow, {20, 30, 190, 308}},
                       {9, {20, 30, 120, 230}}};
    for (auto const &c : cases) {
        glistResRec record = Record();
        record.autoEdge = c.autoEdge;
        record.edgeH = 12;
        record.edgeV = 10;
        EXPECT_EQ(BoxOf(*NewList(record)), c.box) << c.autoEdge;
    }
}

TEST_F(GListPaneTest, FollowsAWindowThatGrows) {
    glistResRec record = Record();
    record.autoEdge = glistResRec::kBothFollow;
    record.edgeH = 12;
    record.edgeV = 10;
    GListPane *const list = NewList(record);
    Show();
    desktop.Play("resize 400 300");
    EXPECT_EQ(BoxOf(*list), (Rect{20, 30, 290, 388}));
    EXPECT_EQ(list->NumFullyDisplayedLines(), 16);
}

TEST_F(GListPaneTest, InALayoutItFollowsTheLayout) {
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 0);
    group->SetUseLayout(true);
    glistResRec record = Record();
    record.autoEdge = glistResRec::kBothFollow;
    GListPane *const list = NewList(record);
    group->Add(list, -1);
    Rect const before = BoxOf(*list);
    list->Resize({0, 0});
    EXPECT_EQ(BoxOf(*list), before);
}

TEST_F(GListPaneTest, InALayoutAResizeStillComesBackIntoRange) {
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 0);
    group->SetUseLayout(true);
    GListPane *const list = Filled(100);
    group->Add(list, -1);
    list->ScrollToPage(20);
    list->Resize({0, 0});
    EXPECT_EQ(list->GetScrollPos(), 100 - list->NumFullyDisplayedLines());
}

TEST_F(GListPaneTest, ALayoutThatItIsInBeforeItIsMadeHasTheSayOverItsBox) {
    class List : public GListPane {
    public:
        void Make(glogRec *owner, CompoundPane *group, glistResRec record) {
            GlogPaneInit(owner, 0);
            group->Add(this, -1);
            InitGListPane(owner, &record, 0);
        }
    };
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 0);
    group->SetUseLayout(true);
    List *const list = new List;
    list->Make(glog, group, Record());
    EXPECT_FALSE(BoxOf(*list) == ListBox());
    EXPECT_EQ(list->GetResInfo().bounds, ListBox());
}

TEST_F(GListPaneTest, AListOfDialogStyleThatFollowsItsEdgesIsDrawnAnewAndASmallOneWhereItChanged) {
    struct {
        int style;
        Rect before;
        std::vector<Rect> drawn;
    } const cases[] = {
        {glistResRec::kDialogStyle, {20, 30, 120, 230}, {{20, 30, 190, 308}}},
        {glistResRec::kSmallStyle, {20, 30, 120, 230}, {{20, 230, 120, 308}, {120, 30, 190, 308}}},
        {glistResRec::kSmallStyle, {20, 30, 195, 308}, {{190, 30, 195, 308}}},
        {glistResRec::kDialogStyle, {20, 30, 195, 308}, {{20, 30, 195, 308}}},
        {glistResRec::kSmallStyle, {20, 30, 190, 308}, {}},
        {glistResRec::kDialogStyle, {20, 30, 190, 308}, {{20, 30, 190, 308}}},
    };
    for (auto const &c : cases) {
        glistResRec record = Record();
        record.style = c.style;
        record.autoEdge = glistResRec::kBothFollow;
        record.edgeH = 12;
        record.edgeV = 10;
        GListPane *const list = NewList(record);
        Show();
        Rect box = c.before;
        list->SetBox(&box);
        EXPECT_EQ(InvalidatedBy([&] { list->Resize({0, 0}); }), c.drawn) << c.style << " " << c.before;
        delete list;
    }
}

TEST_F(GListPaneTest, WithoutAWindowItFollowsNoEdges) {
    glistResRec record = Record();
    record.autoEdge = glistResRec::kBothFollow;
    GListPane *const list = NewList(record);
    Rect box = ListBox();
    list->SetBox(&box);
    list->SetGlog(nullptr);
    list->Resize({0, 0});
    EXPECT_EQ(BoxOf(*list), ListBox());
    delete list;
}

TEST_F(GListPaneTest, AnEdgeBeyondSixteenBitsIsTheNearestOne) {
    glistResRec record = Record();
    record.autoEdge = glistResRec::kBothFollow;
    record.edgeH = record.edgeV = -32768;
    GListPane *const list = NewList(record);
    EXPECT_EQ(BoxOf(*list).right, 32767);
    EXPECT_EQ(BoxOf(*list).bottom, 32767);
}

TEST_F(GListPaneTest, AResizeByRulesComesBackIntoRange) {
    GListPane *const list = Filled(100);
    list->ScrollToPage(20);
    ASSERT_EQ(list->GetScrollPos(), 133);
    list->AutoResize(0, 0);
    EXPECT_EQ(list->GetScrollPos(), 94);
}

TEST_F(GListPaneTest, WithEdgesAResizeByRulesChangesNothing) {
    glistResRec record = Record();
    record.autoEdge = glistResRec::kBottomFollows;
    record.edgeV = 80;
    GListPane *const list = Equipped(NewList(record), 100);
    list->ScrollToPage(20);
    int const place = list->GetScrollPos();
    list->AutoResize(10, 10);
    EXPECT_EQ(list->GetScrollPos(), place);
}

// Activation

TEST_F(GListPaneTest, SelectedRowsAreDrawnAnewWithTheWindowsActivation) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    Show();
    list->SelectItem(1);
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play("activate off"); }), (Log{"1"}));
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play("activate on"); }), (Log{"1*"}));
}

TEST_F(GListPaneTest, TheOneSelectedRowIsDrawnAnewWithTheWindowsActivation) {
    GListPane *const list = Filled(5);
    list->SetSelRange(2, 2);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play("activate off"); }), (Log{"2"}));
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play("activate on"); }), (Log{"2*"}));
}

TEST_F(GListPaneTest, AHiddenListIsActivatedWithoutBeingDrawn) {
    GListPane *const list = Filled(5);
    list->SetSelRange(2, 2);
    Show();
    list->Hide();
    EXPECT_TRUE(Only("InvalRect", Traced(*list, [&] { list->Deactivate(); })).empty());
    EXPECT_FALSE(list->IsActive());
    EXPECT_TRUE(Only("InvalRect", Traced(*list, [&] { list->Activate(); })).empty());
    EXPECT_TRUE(list->IsActive());
}

namespace {

// Notes what becomes of its inactive selection, and whether the list counts as active then.
class InactiveList : public GListPane {
public:
    InactiveList(glogRec *owner, glistResRec *record) { InitGListPane(owner, record, 0); }
    void InvalInactiveSelectionDisplay() override {
        log.push_back(IsActive() ? "invalidate active" : "invalidate");
        Prepare();
        VelaDrawing::InvalRect(&kInactiveMark);
    }
    void DrawInactiveSelection() override { log.push_back("draw"); }

    static Rect const kInactiveMark;
    Log log;
};

Rect const InactiveList::kInactiveMark = {21, 200, 25, 210};

} // namespace

TEST_F(GListPaneTest, TheInactiveDisplayIsInvalidatedBeforeTheRowsOnTheWayInAndAfterThemOnTheWayOut) {
    glistResRec record = Record();
    InactiveList *const list = new InactiveList(glog, &record);
    Equipped(list, 5);
    list->SetSelRange(2, 2);
    Show();
    Rect const row = RowBox(*list, 2);
    Lines const rowThenMark = Traced(*list, [&] {
        VelaDrawing::InvalRect(&row);
        VelaDrawing::InvalRect(&InactiveList::kInactiveMark);
    });
    EXPECT_EQ(Only("InvalRect", Traced(*list, [&] { list->Deactivate(); })), rowThenMark);
    EXPECT_EQ(Only("InvalRect", Traced(*list, [&] { list->Activate(); })),
              Lines(rowThenMark.rbegin(), rowThenMark.rend()));
}

TEST_F(GListPaneTest, TellsOfTheInactiveDisplayBetweenTheTwoStates) {
    glistResRec record = Record();
    InactiveList *const list = new InactiveList(glog, &record);
    Show();
    list->log.clear();
    desktop.Play("activate off");
    EXPECT_EQ(list->log, (Log{"invalidate active", "draw"}));
    list->Deactivate();
    EXPECT_EQ(list->log.size(), 2u) << "it is not active any more";
    desktop.Play("activate on");
    EXPECT_EQ(list->log, (Log{"invalidate active", "draw", "invalidate"}));
    list->Hide();
    list->Deactivate();
    list->Activate();
    EXPECT_EQ(list->log.size(), 3u) << "it is hidden";
}

TEST_F(GListPaneTest, CanDrawItsSelectionWhileActiveOrForGood) {
    GListPane *const list = Filled(5);
    Show();
    EXPECT_TRUE(list->CanDrawSelection());
    desktop.Play("activate off");
    EXPECT_FALSE(list->CanDrawSelection());
    list->DrawSelectionWhenInactive();
    EXPECT_TRUE(list->CanDrawSelection());
}
