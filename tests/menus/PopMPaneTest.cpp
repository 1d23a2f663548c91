#include "desktop/menus/MenuRows.h"
#include "desktop/panes/Glog.h"
#include "host/CompoundPane.h"
#include "menus/ScrollBarPopupMenuPane.h"
#include "tests/VirtualPlace.h"
#include "tests/menus/MenuTest.h"
#include <dlfcn.h>

namespace {

class PopMPaneTest : public MenuTest {
protected:
    PopMPane *Make(Rect box = {10, 20, 30, 140}) {
        PopMPane *const pane = PopMPane::NewPopMPane(glog, 7, 0, &box, 137);
        Add(*pane, {"one", "two", "three"});
        return pane;
    }
    // The drawing call of the pane, as a closed pop-up of these looks would make it.
    Lines Popup(GlogPane &pane, UString const &name, short icon, bool enabled, short face,
                PopupMenuBackColor back, PopupMenuPulldown pulldown, TextSettings::TruncateCode truncation) {
        return Traced(pane, [&] {
            SaveColors const colors;
            GrayBackColor(100);
            OS::TextLayout layout;
            DrawPopupMenuWithTextLayout(layout, pane.GetDrawRectangle(), name, icon, enabled, face, nullptr,
                                        back, pulldown, truncation, TextSettings::kAlignLeft, 0, 0, 2);
        });
    }
};

// Notes what it hears.
class MenuEar : public PopUpMenuListener {
public:
    explicit MenuEar(PopMPane &pane) { Dependent<PopUpMenuListener>::DependUpon(&pane); }
    void ListenToMenuChange(PopUpMenu *menu, short item) override {
        heard += "change " + std::to_string(item) + "; ";
        sender = menu;
    }
    void ListenToItemSelected(PopUpMenu *menu, OSMenuHandle &submenu, UString const &name,
                              short item) override {
        heard += "selected " + std::to_string(item) + (submenu.IsValid() ? " below" : "") +
                 (name.empty() ? "" : " named") + "; ";
        sender = menu;
    }
    std::string heard;
    PopUpMenu *sender = nullptr;
};

class ActivityEar : public AutoSetActivityListener {
public:
    explicit ActivityEar(PopMPane &pane) { Dependent<AutoSetActivityListener>::DependUpon(&pane); }
    void ListenToActivity(Provider<AutoSetActivityListener> *source_) override {
        source = source_;
        ++count;
    }
    Provider<AutoSetActivityListener> *source = nullptr;
    int count = 0;
};

// Takes over what it is told to.
class TestAgent : public PopMPane::Agent {
public:
    bool takes = true;
    int drawn = 0, clicked = 0, named = 0, informed = 0;
    bool startedUnhandled = true;

private:
    void DrawGuts(PopMPane *, OSRgn *, bool &handled) override {
        startedUnhandled = startedUnhandled && !handled;
        ++drawn;
        handled = takes;
    }
    int HandleClick(PopMPane *, EventRecordAdapter *, bool &handled) override {
        startedUnhandled = startedUnhandled && !handled;
        ++clicked;
        handled = takes;
        return 42;
    }
    void GetCurItemName(PopMPane *, bool &handled, UString &name) override {
        startedUnhandled = startedUnhandled && !handled;
        ++named;
        handled = takes;
        name = UString("agent's", UString::kByteEncoding1);
    }
    void GetCurItemMenuInfo(PopMPane *, bool &enabled, short &icon, bool &handled) override {
        startedUnhandled = startedUnhandled && !handled;
        ++informed;
        handled = takes;
        enabled = false;
        icon = 3;
    }
};

class PlainAgent : public PopMPane::Agent {};

} // namespace

// Creation

TEST_F(PopMPaneTest, HasItsBasesInOrder) {
    PopMPane *const pane = Make();
    char const *const start = reinterpret_cast<char const *>(pane);
    auto const place = [start](void const *base) { return static_cast<char const *>(base) - start; };
    EXPECT_EQ(place(static_cast<Provider<PopUpMenuListener> *>(pane)), 0);
    EXPECT_LT(0, place(static_cast<Provider<AutoSetActivityListener> *>(pane)));
    EXPECT_LT(place(static_cast<Provider<AutoSetActivityListener> *>(pane)),
              place(static_cast<GlogPane *>(pane)));
    EXPECT_LT(place(static_cast<GlogPane *>(pane)), place(static_cast<PopUpMenu *>(pane)));
}

TEST_F(PopMPaneTest, ItsNewOperationsStandBehindThoseOfItsFirstBase) {
    EXPECT_EQ(PlaceOf(&PopMPane::GetMenuBackgroundColor), PlaceOf(&PopMPane::ResizeToCurSel) + 1);
}

TEST_F(PopMPaneTest, IsMadeFromArguments) {
    PopMPane *const pane = Make();
    EXPECT_EQ(pane->GetID(), 7);
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 30, 140}));
    EXPECT_EQ(pane->GetMenuID(), 137);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
    EXPECT_EQ(pane->GetMenuBackgroundColor(), kPopupBackDefault);
    EXPECT_EQ(pane->GetAgent(), nullptr);
}

TEST_F(PopMPaneTest, IsMadeFromARecordAndFromASheet) {
    Store("<menu id='500'><item text='a'/></menu>");
    popMMResRec record = {popMMResRec::kKind, 2, {1, 2, 21, 82}, 500};
    PopMPane *const old = PopMPane::NewResPopMPane(glog, &record);
    TestItem item;
    item.Integer("Flags", 0x102).Integer("MenuID", 500).Box("BoundsRect", {1, 2, 21, 82});
    PopMPane *const now = PopMPane::NewResPopMPane(glog, item.Sheet());
    for (PopMPane *pane : {old, now}) {
        ASSERT_NE(pane, nullptr);
        EXPECT_EQ(pane->GetID(), 0);
        EXPECT_EQ(pane->GetFlags(), 2);
        EXPECT_EQ(BoxOf(*pane), (Rect{1, 2, 21, 82}));
        EXPECT_EQ(pane->CountItems(), 1);
    }
    TestItem bare;
    bare.Integer("MenuID", 500);
    EXPECT_EQ(BoxOf(*PopMPane::NewResPopMPane(glog, bare.Sheet())), (Rect{0, 0, 0, 0}));
}

TEST_F(PopMPaneTest, HasFieldsOfItsRecordWithoutGaps) {
    EXPECT_EQ(sizeof(popMMResRec), 14u);
    EXPECT_EQ(offsetof(popMMResRec, bounds), 4u);
    EXPECT_EQ(offsetof(popMMResRec, menuID), 12u);
    EXPECT_EQ(int(popMMResRec::kKind), 43);
}

TEST_F(PopMPaneTest, NeedsAGlogAndAMenu) {
    Rect box{0, 0, 20, 80};
    EXPECT_EQ(PopMPane::NewPopMPane(nullptr, 1, 0, &box, 137), nullptr);
    short const before = CountGlogItems(glog);
    for (short missing : {0, -1, 138, 32767, -32768})
        EXPECT_EQ(PopMPane::NewPopMPane(glog, 1, 0, &box, missing), nullptr) << missing;
    EXPECT_EQ(CountGlogItems(glog), before) << "a half-made pane is left";
}

TEST_F(PopMPaneTest, TheConstructorTellsOfNoFailure) {
    PopMPane *const pane = new PopMPane(glog, 3, 0, 999, false);
    EXPECT_EQ(pane->GetID(), 3);
    EXPECT_FALSE(pane->GetMenuHandle().IsValid());
    EXPECT_EQ(BoxOf(*pane), (Rect{0, 0, 0, 0}));
    std::unique_ptr<PopMPane> const loose(new PopMPane(nullptr, 3, 0, 137, true));
    EXPECT_EQ(loose->GetGlog(), nullptr);
}

TEST_F(PopMPaneTest, IsFoundFromItsPane) {
    PopMPane *const pane = Make();
    EXPECT_EQ(CheckedStaticCastToPopMPane(static_cast<GlogPane *>(pane)), pane);
    EXPECT_EQ(CheckedStaticCastToPopMPane(nullptr), nullptr);
}

TEST_F(PopMPaneTest, ItsMenuIsACopyOfItsOwn) {
    Store("<menu id='500'><item text='a'/></menu>");
    Rect box{0, 0, 20, 80};
    PopMPane *const first = PopMPane::NewPopMPane(glog, 1, 0, &box, 500);
    PopMPane *const second = PopMPane::NewPopMPane(glog, 2, 0, &box, 500);
    first->AddItem(Text("b"), PopUpMenu::kDashIsText);
    EXPECT_EQ(second->CountItems(), 1);
}

// Drawing

TEST_F(PopMPaneTest, DrawsTheCurrentItem) {
    PopMPane *const pane = Make();
    pane->SelectItem(2);
    pane->SetItemIcon(2, 4);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("two"), 4, true, 0, kPopupBackDefault, kPulldownNormal,
                                      TextSettings::kTruncateMiddle));
}

TEST_F(PopMPaneTest, DrawsAsItWasTold) {
    PopMPane *const pane = Make();
    pane->SetTextFace(1);
    pane->SetTruncation(TextSettings::kTruncateEnd);
    pane->SetPulldownLocation(kPulldown0);
    pane->SetMenuBackgroundColor(kPopupBackScrollBar);
    pane->SetEnableItem(1, 0);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, false, 1, kPopupBackScrollBar, kPulldown0,
                                      TextSettings::kTruncateEnd));
}

TEST_F(PopMPaneTest, UnderTwentyFivePixelsTheArrowIsNarrowAndTheSettingStays) {
    Show();
    for (short width : {24, 25}) {
        PopMPane *const pane = Make({10, 20, 30, static_cast<short>(20 + width)});
        PopupMenuPulldown const expected = width < 25 ? kPulldownNarrow : kPulldownNormal;
        EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, true, 0, kPopupBackDefault, expected,
                                          TextSettings::kTruncateMiddle))
            << width;
        Rect wide{10, 20, 30, 140};
        pane->SetBox(&wide);
        EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, true, 0, kPopupBackDefault, kPulldownNormal,
                                          TextSettings::kTruncateMiddle))
            << "the setting has changed";
    }
}

TEST_F(PopMPaneTest, AnotherArrowIsNotMadeNarrow) {
    PopMPane *const pane = Make({10, 20, 30, 40});
    pane->SetPulldownLocation(kPulldownNoText);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, true, 0, kPopupBackDefault, kPulldownNoText,
                                      TextSettings::kTruncateMiddle));
}

TEST_F(PopMPaneTest, DrawsAnIconAlone) {
    PopMPane *const pane = Make();
    pane->DisplayIconOnly(true);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, UString(), 0, true, 0, kPopupBackDefault, kPulldownNormal,
                                      TextSettings::kTruncateMiddle));
}

TEST_F(PopMPaneTest, WithoutAMenuDrawsNothing) {
    PopMPane *const pane = new PopMPane(glog, 3, 0, 999, true);
    Show();
    EXPECT_TRUE(DrawingOf(*pane).empty());
}

TEST_F(PopMPaneTest, KeepsThePortsColours) {
    PopMPane *const pane = Make();
    Show();
    EXPECT_TRUE(KeepsColors(*pane));
}

TEST_F(PopMPaneTest, WithoutItemInfoTheMenuAloneDecidesOnTheLook) {
    PopMPane *const pane = new PopMPane(glog, 3, 0, 137, false);
    Rect box{10, 20, 30, 140};
    pane->SetBox(&box);
    Add(*pane, {"one"});
    pane->SetItemIcon(1, 4);
    pane->SetEnableItem(1, 0);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, true, 0, kPopupBackDefault, kPulldownNormal,
                                      TextSettings::kTruncateMiddle));
}

TEST_F(PopMPaneTest, SettingsOnlyStore) {
    PopMPane *const pane = Make();
    Show();
    pane->DisplayIconOnly(true);
    pane->SetTextFace(1);
    pane->SetTruncation(TextSettings::kTruncateEnd);
    pane->SetPulldownLocation(kPulldown0);
    pane->SetMenuBackgroundColor(kPopupBackScrollBar);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(PopMPaneTest, ASelectionRepaintsIt) {
    PopMPane *const pane = Make();
    Show();
    pane->SelectItem(2);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{10, 20, 30, 140}}));
    pane->SelectItem(2);
    EXPECT_TRUE(Repainted().empty());
}

// Size

TEST_F(PopMPaneTest, FitsItselfToItsItem) {
    PopMPane *const pane = Make();
    Show();
    SetFontData(GetIndVelaFont(0));
    int const width = LooseStringWidth(Text("one"), 0.0f, 1.0f) + 32;
    pane->ResizeToCurSel();
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 30, static_cast<short>(20 + width)}));
    pane->SetTextFace(1);
    pane->ResizeToCurSel();
    EXPECT_EQ(BoxOf(*pane).right, 20 + width) << "its face counts";
    EXPECT_EQ(Repainted().front(), (Rect{10, 20, 30, 140})) << "where it has been is not repainted";
}

TEST_F(PopMPaneTest, WithoutANameTheArrowStandsAlone) {
    PopMPane *const pane = Make();
    pane->DeleteAllItems();
    pane->ResizeToCurSel();
    EXPECT_EQ(BoxOf(*pane).right, 20 + 32);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, UString(), 0, true, 0, kPopupBackDefault, kPulldownNoText,
                                      TextSettings::kTruncateMiddle));
    pane->AddItem(Text("one"), PopUpMenu::kDashIsText);
    pane->ResizeToCurSel();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, true, 0, kPopupBackDefault, kPulldownNormal,
                                      TextSettings::kTruncateMiddle));
}

TEST_F(PopMPaneTest, FittingLeavesAPopUpWithoutArrowAtThat) {
    PopMPane *const pane = Make();
    pane->SetPulldownLocation(kPulldown0);
    pane->ResizeToCurSel();
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("one"), 0, true, 0, kPopupBackDefault, kPulldown0,
                                      TextSettings::kTruncateMiddle));
}

TEST_F(PopMPaneTest, FitsNamesOfAnyLength) {
    PopMPane *const pane = Make();
    pane->SetItemName(1, Text(std::string(20000, 'w').c_str()));
    pane->ResizeToCurSel();
    EXPECT_EQ(BoxOf(*pane).right, 32767);
}

TEST_F(PopMPaneTest, InALayoutItsWidthIsThatOfItsItem) {
    CompoundPane *const row = new CompoundPane;
    row->CompoundPaneInit(glog, 5);
    row->SetUseLayout(true);
    row->SetSizeToLayout(true);
    PopMPane *const pane = Make();
    row->Add(pane, -1);
    ASSERT_TRUE(pane->IsInLayout());
    Show();
    SetFontData(GetIndVelaFont(0));
    int const width = LooseStringWidth(Text("one"), 0.0f, 1.0f) + 32;
    pane->ResizeToCurSel();
    Rect const place = pane->GetDrawRectangle();
    EXPECT_EQ(place.right - place.left, width);
    EXPECT_EQ(place.bottom - place.top, 20);
}

TEST_F(PopMPaneTest, FitsItselfWithoutAGlogToo) {
    std::unique_ptr<PopMPane> const loose(new PopMPane(nullptr, 3, 0, 137, true));
    loose->SetMenu(OSMenuHandle::CopyPrototypeMenu(137), true);
    Add(*loose, {"one"});
    SetPortToGlog(glog);
    loose->ResizeToCurSel();
    EXPECT_GT(BoxOf(*loose).right, 32);
}

// Clicks

TEST_F(PopMPaneTest, AClickGivesTheChosenItem) {
    PopMPane *const pane = Make();
    MenuEar ear(*pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 3"), 3);
    EXPECT_EQ(pane->GetSelectedItem(), 3);
    EXPECT_EQ(ear.heard, "change 3; selected 3; ");
    EXPECT_EQ(ear.sender, static_cast<PopUpMenu *>(pane));
}

TEST_F(PopMPaneTest, ADismissedMenuGivesMinusOne) {
    PopMPane *const pane = Make();
    MenuEar ear(*pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 0"), -1);
    EXPECT_EQ(ear.heard, "");
}

TEST_F(PopMPaneTest, TheMouseChoosesFromIt) {
    PopMPane *const pane = Make();
    Show();
    EXPECT_EQ(ResultOfClick("press 60 20\nwait 0.1\nmove 60 61\nwait 0.1\nrelease"), 3);
    EXPECT_EQ(ResultOfClick("click 60 20\nwait 1\nclick 60 -19"), 1);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(PopMPaneTest, AChoiceFromASubmenuTellsItsName) {
    PopMPane *const pane = Make();
    OSMenuHandle submenu = pane->AppendNewEmptyHierarchicalMenu(Text("more"));
    submenu.AppendItem(Text("x"));
    MenuEar ear(*pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 4/1"), 4);
    EXPECT_EQ(ear.heard, "change 4; selected 1 below named; ");
}

TEST_F(PopMPaneTest, TellsThatItIsUsedBeforeItOpens) {
    PopMPane *const pane = Make();
    ActivityEar ear(*pane);
    Show();
    ResultOfClick("click 60 20\nmenu 0");
    EXPECT_EQ(ear.count, 1);
    EXPECT_EQ(ear.source, static_cast<Provider<AutoSetActivityListener> *>(pane));
    pane->EnableMenu(false);
    ResultOfClick("click 60 20");
    EXPECT_EQ(ear.count, 1) << "a disabled menu is not used";
}

TEST_F(PopMPaneTest, ItsMenuOpensAPixelInwards) {
    PopMPane *const pane = Make();
    Show();
    ScreenRect box;
    Later const look(0.1, [&] { box = MenuTracker::Open()->Panels()[0]->Box(); });
    ResultOfClick("click 60 20\nwait 0.5\nmenu 0");
    MenuRows const rows(*MenuAccess::Of(pane->GetMenuHandle()));
    int const windowTop = Glog::From(glog).Window()->ScreenPlace().v;
    EXPECT_EQ(box.top + rows.Middle(1) - windowTop, (11 + 30) / 2);
}

// Agents

TEST_F(PopMPaneTest, AnAgentDrawsInItsPlace) {
    PopMPane *const pane = Make();
    TestAgent agent;
    pane->SetAgent(&agent);
    Show();
    int const before = agent.drawn;
    EXPECT_TRUE(DrawingOf(*pane).empty());
    EXPECT_EQ(agent.drawn, before + 1);
    EXPECT_TRUE(agent.startedUnhandled);
    EXPECT_EQ(pane->GetAgent(), &agent);
    pane->SetAgent(nullptr);
}

TEST_F(PopMPaneTest, AnAgentTakesTheClick) {
    PopMPane *const pane = Make();
    TestAgent agent;
    pane->SetAgent(&agent);
    Show();
    EXPECT_EQ(ResultOfClick("click 60 20"), 42);
    EXPECT_EQ(pane->GetLastPopupResult(), -1) << "the menu has opened";
    pane->SetAgent(nullptr);
}

TEST_F(PopMPaneTest, AClickThatAnAgentTakesLeavesThePortAsItIs) {
    PopMPane *const pane = Make();
    TestAgent agent;
    pane->SetAgent(&agent);
    pane->EnableMenu(false); // so that it does not open
    Show();
    EventRecordAdapter event;
    LeaveForAnotherPort();
    EXPECT_EQ((pane->*&Opened<PopMPane>::HandleClick)(&event), 42);
    EXPECT_FALSE(IsInItsPort());
    agent.takes = false;
    EXPECT_EQ((pane->*&Opened<PopMPane>::HandleClick)(&event), -1);
    EXPECT_TRUE(IsInItsPort());
    pane->SetAgent(nullptr);
}

TEST_F(PopMPaneTest, AnAgentNamesTheItemAndDecidesOnItsLook) {
    PopMPane *const pane = Make();
    class Naming : public TestAgent {
        void DrawGuts(PopMPane *, OSRgn *, bool &handled) override { handled = false; }
    } agent;
    pane->SetAgent(&agent);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("agent's"), 3, false, 0, kPopupBackDefault, kPulldownNormal,
                                      TextSettings::kTruncateMiddle));
    int const named = agent.named;
    pane->DisplayIconOnly(true);
    DrawingOf(*pane);
    EXPECT_EQ(agent.named, named) << "a name is asked for that does not show";
    pane->SetAgent(nullptr);
}

TEST_F(PopMPaneTest, WhatAnAgentLeavesIsThePanes) {
    PopMPane *const pane = Make();
    Show();
    Lines const own = DrawingOf(*pane);
    TestAgent agent;
    agent.takes = false;
    PlainAgent plain;
    for (PopMPane::Agent *leaving :
         {static_cast<PopMPane::Agent *>(&agent), static_cast<PopMPane::Agent *>(&plain)}) {
        pane->SetAgent(leaving);
        EXPECT_EQ(DrawingOf(*pane), own);
        EXPECT_EQ(ResultOfClick("click 60 20\nmenu 1"), 1);
    }
    EXPECT_GT(agent.informed, 0);
    pane->SetAgent(nullptr);
}

// Procedures

TEST_F(PopMPaneTest, ItsProceduresReachTheMenu) {
    PopMPane *const pane = Make();
    PMSelectItem(pane, 3);
    EXPECT_EQ(PMGetSelItem(pane), 3);
    EXPECT_EQ(PMCountMItems(pane), 3);
    PMSelectItem(pane, 65536 + 2);
    EXPECT_EQ(PMGetSelItem(pane), 2) << "the number is narrowed";
    EXPECT_TRUE(PMItemIsEnabled(pane, 2));
    PMMenuEnable(pane, false);
    EXPECT_FALSE(PMItemIsEnabled(pane, 2));
    PMDeleteMenuItem(pane, 1);
    EXPECT_EQ(PMCountMItems(pane), 2);
    EXPECT_EQ(PMGetSelItem(pane), 1);
    PMDeleteAllItems(pane);
    EXPECT_EQ(PMCountMItems(pane), 0);
    EXPECT_EQ(PMGetSelItem(pane), 0);
}

TEST_F(PopMPaneTest, ItsProceduresAreFoundByTheirNames) {
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMSelectItem"), static_cast<void *>(&PMSelectItem));
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMGetSelItem"), static_cast<void *>(&PMGetSelItem));
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMCountMItems"), static_cast<void *>(&PMCountMItems));
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMItemIsEnabled"), static_cast<void *>(&PMItemIsEnabled));
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMMenuEnable"), static_cast<void *>(&PMMenuEnable));
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMDeleteMenuItem"), static_cast<void *>(&PMDeleteMenuItem));
    EXPECT_EQ(dlsym(RTLD_DEFAULT, "PMDeleteAllItems"), static_cast<void *>(&PMDeleteAllItems));
}

TEST_F(PopMPaneTest, ItsProceduresCanBeReplaced) {
    PopMPane *const pane = Make();
    auto const former = PMGetSelItem;
    PMGetSelItem = [](PopMPane *) -> short { return 77; };
    EXPECT_EQ(PMGetSelItem(pane), 77);
    PMGetSelItem = former;
}

// In a scroll bar

TEST_F(PopMPaneTest, OneForAScrollBarHasItsHeightAndGround) {
    ScrollBarPopupMenuPane *const pane = new ScrollBarPopupMenuPane(glog, 137);
    Rect box{10, 20, 26, 100};
    pane->SetBox(&box);
    Add(*pane, {"100 %"});
    EXPECT_EQ(pane->GetMenuBackgroundColor(), kPopupBackScrollBar);
    EXPECT_EQ(pane->GetID(), 0);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Popup(*pane, Text("100 %"), 0, true, 0, kPopupBackScrollBar, kPulldownNormal,
                                      TextSettings::kTruncateMiddle));
    EXPECT_EQ(ResultOfClick("click 60 18\nmenu 1"), 1);
}

TEST_F(PopMPaneTest, OneForAScrollBarWithoutAGlogIsNotAttached) {
    std::unique_ptr<ScrollBarPopupMenuPane> const pane(new ScrollBarPopupMenuPane(nullptr, 137));
    EXPECT_EQ(pane->GetGlog(), nullptr);
}
