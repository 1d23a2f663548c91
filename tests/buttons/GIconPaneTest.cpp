#include "buttons/GIconPane.h"
#include "desktop/layout/LayoutEngine.h"
#include "host/CompoundPane.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

short const kFamily = 2000;
short const kShapedFamily = 1821; // its icons leave parts of their rectangle transparent
short const kIcon = 3;

GIconResRec RecordOf(short family) {
    GIconResRec record = {};
    record.kind = GIconResRec::kKind;
    record.top = 40;
    record.left = 30;
    record.width = 20;
    record.height = 16;
    record.family = family;
    record.icon = kIcon;
    record.numStates = 3;
    record.canDisable = 1;
    return record;
}

struct Decal {
    glogRec *glog;
    Rect box;
    bool enabled, pressed;
    GIconPane *pane;
};
std::vector<Decal> theDecals;

void DrawDecal(glogRec *glog, Rect box, bool enabled, bool pressed, GIconPane *pane) {
    theDecals.push_back({glog, box, enabled, pressed, pane});
    VelaDrawing::PaintRect(&box);
}

class IconPane : public PaneTest {
protected:
    IconPane() { theDecals.clear(); }

    GIconPane *New(short family = kFamily) {
        GIconResRec record = RecordOf(family);
        return GIconPane::NewGIconPane(glog, &record);
    }
    Lines IconAt(GIconPane &pane, short icon) {
        return Traced(pane, [icon] { Draw1Icon(kFamily, icon, 30, 40); });
    }
    // A place of the icon's rectangle that is, or is not, part of its shape.
    static Point PlaceInShape(short family, short icon, bool inside) {
        Rect const bounds = GetIconBounds(family);
        OSRgn const &shape = GetIconRegion(family, icon);
        for (short v = 0; v < bounds.bottom; ++v)
            for (short h = 0; h < bounds.right; ++h)
                if (shape.Contains(Point{v, h}) == inside)
                    return Point{v, h};
        ADD_FAILURE() << "icon " << icon << " has no such place";
        return Point{0, 0};
    }
    int ResultOfClickAt(Point place) {
        return ResultOfClick("click " + std::to_string(place.h) + " " + std::to_string(place.v));
    }
};

} // namespace

TEST_F(IconPane, ItsRecordHasEighteenBytes) { EXPECT_EQ(sizeof(GIconResRec), 18u); }

TEST_F(IconPane, TakesBoxAndIconsFromItsRecord) {
    GIconPane *const pane = New();
    EXPECT_EQ(BoxOf(*pane), (Rect{40, 30, 56, 50}));
    EXPECT_EQ(pane->GetFamilyID(), kFamily);
    EXPECT_EQ(pane->GetIconNum(), kIcon);
    EXPECT_EQ(pane->GetNumStates(), 3);
    EXPECT_TRUE(pane->CanDisable());
}

TEST_F(IconPane, ItsBoxWrapsAtSixteenBits) {
    GIconResRec record = RecordOf(kFamily);
    record.top = record.left = 32760;
    EXPECT_EQ(BoxOf(*GIconPane::NewGIconPane(glog, &record)), (Rect{32760, 32760, -32760, -32756}));
}

TEST_F(IconPane, ItsSizeIsItsNaturalSize) {
    GlogLayoutItem::Rep const &rep = LayoutEngine::Rep(*New()->GetLayoutRect());
    EXPECT_EQ(rep.width, 20);
    EXPECT_EQ(rep.height, 16);
}

TEST_F(IconPane, TakesItsBoxByItsVirtualOperation) {
    class Subclass : public GIconPane {
    public:
        explicit Subclass(glogRec *owner) {
            GIconResRec record = RecordOf(kFamily);
            InitGIconPane(owner, record);
        }
        void SetBox(Rect *box) override {
            given = *box;
            GIconPane::SetBox(box);
        }
        Rect given = {0, 0, 0, 0};
    };
    EXPECT_EQ((new Subclass(glog))->given, (Rect{40, 30, 56, 50}));
}

TEST_F(IconPane, StartsInStateZeroEnabledWithoutDecalUnderNumberZero) {
    GIconPane *const pane = New();
    EXPECT_EQ(pane->GetCurState(), 0);
    EXPECT_TRUE(pane->GetEnabled());
    EXPECT_EQ(pane->GetDecalProc(), nullptr);
    EXPECT_EQ(pane->GetID(), 0);
}

TEST_F(IconPane, WhatASubclassHasSetBeforehandIsAsAtTheStart) {
    class Early : public GIconPane {
    public:
        using GIconPane::InitGIconPane;
    };
    Early *const pane = new Early;
    pane->SetCurState(2);
    pane->SetEnabled(0);
    pane->SetDecalProc(DrawDecal);
    GIconResRec record = RecordOf(kFamily);
    pane->InitGIconPane(glog, record);
    EXPECT_EQ(pane->GetCurState(), 0);
    EXPECT_TRUE(pane->GetEnabled());
    EXPECT_EQ(pane->GetDecalProc(), nullptr);
}

TEST_F(IconPane, IsNotMadeWithoutAGlog) {
    GIconResRec record = RecordOf(kFamily);
    EXPECT_EQ(GIconPane::NewGIconPane(nullptr, &record), nullptr);
    EXPECT_EQ(GIconPane::NewGIconPane(nullptr, TestItem().Container()), nullptr);
}

TEST_F(IconPane, NoItemFailsAnAssertion) {
    EXPECT_THROW(GIconPane::NewGIconPane(glog, boost::shared_ptr<XMLLib::ContainerItem>()), BrokenInvariant);
}

TEST_F(IconPane, ShowsTheIconOfItsState) {
    GIconPane *const pane = New();
    EXPECT_EQ(DrawingOf(*pane), IconAt(*pane, kIcon));
    pane->SetCurState(2);
    EXPECT_EQ(DrawingOf(*pane), IconAt(*pane, kIcon + 2));
}

TEST_F(IconPane, ShowsAStateBeyondTheLastAtItsDistance) {
    GIconPane *const pane = New();
    pane->SetCurState(5);
    EXPECT_EQ(DrawingOf(*pane), IconAt(*pane, kIcon + 5));
}

TEST_F(IconPane, DisabledShowsTheIconAfterTheLastStateInAnyState) {
    GIconPane *const pane = New();
    pane->SetCurState(5);
    pane->SetEnabled(0);
    EXPECT_EQ(DrawingOf(*pane), IconAt(*pane, kIcon + 3));
}

TEST_F(IconPane, DisabledShowsThatIconAlsoWhenItCannotBeDisabled) {
    GIconResRec record = RecordOf(kFamily);
    record.canDisable = 0;
    GIconPane *const pane = GIconPane::NewGIconPane(glog, &record);
    EXPECT_FALSE(pane->CanDisable());
    pane->SetEnabled(0);
    EXPECT_EQ(DrawingOf(*pane), IconAt(*pane, kIcon + 3));
}

TEST_F(IconPane, DrawsItsDecalOverTheIcon) {
    GIconPane *const pane = New();
    pane->SetDecalProc(DrawDecal);
    pane->SetEnabled(0);
    EXPECT_EQ(DrawingOf(*pane), Traced(*pane, [] {
                  Draw1Icon(kFamily, kIcon + 3, 30, 40);
                  Rect const box = {40, 30, 56, 50};
                  VelaDrawing::PaintRect(&box);
              }));
    ASSERT_EQ(theDecals.size(), 1u);
    EXPECT_EQ(theDecals[0].glog, glog);
    EXPECT_EQ(theDecals[0].box, BoxOf(*pane));
    EXPECT_FALSE(theDecals[0].enabled);
    EXPECT_FALSE(theDecals[0].pressed);
    EXPECT_EQ(theDecals[0].pane, pane);
}

TEST_F(IconPane, ItsSettersStoreAndDoNotRepaint) {
    GIconPane *const pane = New();
    Show();
    pane->SetFamilyID(kShapedFamily);
    pane->SetIconNum(7);
    pane->SetNumStates(2);
    pane->SetCurState(1);
    pane->SetEnabled(200);
    pane->SetDecalProc(DrawDecal);
    EXPECT_TRUE(Repainted().empty());
    EXPECT_EQ(pane->GetFamilyID(), kShapedFamily);
    EXPECT_EQ(pane->GetIconNum(), 7);
    EXPECT_EQ(pane->GetNumStates(), 2);
    EXPECT_EQ(pane->GetCurState(), 1);
    EXPECT_TRUE(pane->GetEnabled());
    EXPECT_EQ(pane->GetDecalProc(), DrawDecal);
}

TEST_F(IconPane, AClickInTheShapeGivesOne) {
    New(kShapedFamily);
    Show();
    Point const place = PlaceInShape(kShapedFamily, kIcon, true);
    EXPECT_EQ(ResultOfClickAt(Point{static_cast<short>(place.v + 40), static_cast<short>(place.h + 30)}), 1);
}

TEST_F(IconPane, AClickInTheBoxButOutsideTheShapeFallsThrough) {
    New(kShapedFamily);
    Show();
    Point const place = PlaceInShape(kShapedFamily, kIcon, false);
    EXPECT_EQ(ResultOfClickAt(Point{static_cast<short>(place.v + 40), static_cast<short>(place.h + 30)}), 0);
}

TEST_F(IconPane, TheShapeIsThatOfTheIconShown) {
    // An icon, and a place in its shape that the next icon has not.
    short icon = -1;
    Point place = {0, 0};
    Rect const bounds = GetIconBounds(kShapedFamily);
    for (short i = 0; i < 20 && icon < 0; ++i) {
        OSRgn const shape = GetIconRegion(kShapedFamily, i);
        OSRgn const next = GetIconRegion(kShapedFamily, static_cast<short>(i + 1));
        for (short v = 0; v < bounds.bottom; ++v)
            for (short h = 0; h < std::min<short>(bounds.right, 20); ++h)
                if (shape.Contains(Point{v, h}) && !next.Contains(Point{v, h})) {
                    icon = i;
                    place = {static_cast<short>(v + 40), static_cast<short>(h + 30)};
                }
    }
    ASSERT_GE(icon, 0) << "all icons have the same shape";
    GIconPane *const pane = New(kShapedFamily);
    pane->SetIconNum(icon);
    Show();
    EXPECT_EQ(ResultOfClickAt(place), 1);
    pane->SetCurState(1);
    EXPECT_EQ(ResultOfClickAt(place), 0);
}

TEST_F(IconPane, InALayoutTheShapeLiesWhereThePaneDoes) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 0);
    Rect box = {0, 0, 200, 300};
    column->SetBox(&box);
    column->GetLayout()->SetAttribute(GlogLayoutItem::kInsetTop, 100, GlogLayoutItem::kPixels, UString());
    column->Add(New(kShapedFamily), -1);
    column->SetUseLayout(true);
    Show();
    Point const inside = PlaceInShape(kShapedFamily, kIcon, true);
    Point const outside = PlaceInShape(kShapedFamily, kIcon, false);
    EXPECT_EQ(ResultOfClickAt(Point{static_cast<short>(inside.v + 100), inside.h}), 1);
    EXPECT_EQ(ResultOfClickAt(Point{static_cast<short>(outside.v + 100), outside.h}), 0);
}

TEST_F(IconPane, AClickOnADisabledPaneFallsThrough) {
    GIconPane *const pane = New(kShapedFamily);
    pane->SetEnabled(0);
    Show();
    Point const place = PlaceInShape(kShapedFamily, kIcon + 3, true);
    EXPECT_EQ(ResultOfClickAt(Point{static_cast<short>(place.v + 40), static_cast<short>(place.h + 30)}), 0);
}

TEST_F(IconPane, AHitLeavesTheHostsShapeWhereItIs) {
    New(kShapedFamily);
    Show();
    Point const before = PlaceInShape(kShapedFamily, kIcon, true);
    ResultOfClick("click 35 45");
    EXPECT_EQ(PlaceInShape(kShapedFamily, kIcon, true), before);
}

TEST_F(IconPane, IsMadeFromAnItem) {
    TestItem item;
    item.Box("BoundsRect", {10, 20, 26, 50}).String("FamilyID", "kTransportIcons").Integer("Num", 4);
    item.Integer("NumStates", 2).Integer("CanDisable", 1);
    GIconPane *const pane = GIconPane::NewGIconPane(glog, item.Container());
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 26, 50}));
    EXPECT_EQ(pane->GetFamilyID(), kFamily);
    EXPECT_EQ(pane->GetIconNum(), 4);
    EXPECT_EQ(pane->GetNumStates(), 2);
    EXPECT_TRUE(pane->CanDisable());
}

TEST_F(IconPane, AnItemSaysThatItCanBeDisabledByExactlyOne) {
    TestItem item;
    item.Integer("CanDisable", 2);
    EXPECT_FALSE(GIconPane::NewGIconPane(glog, item.Container())->CanDisable());
}

TEST_F(IconPane, IsMadeFromAnEmptyItemWithZeroForEverything) {
    GIconPane *const pane = GIconPane::NewGIconPane(glog, TestItem().Container());
    EXPECT_EQ(BoxOf(*pane), (Rect{0, 0, 0, 0}));
    EXPECT_EQ(pane->GetFamilyID(), 0);
    EXPECT_FALSE(pane->CanDisable());
}

TEST_F(IconPane, ItsProcedureVariablesReadAndStore) {
    GIconPane *const pane = New();
    gcIconSetIconNum(pane, 9);
    EXPECT_EQ(gcIconGetIconNum(pane), 9);
    gcStateIconSetNumStates(pane, 6);
    EXPECT_EQ(gcStateIconGetNumStates(pane), 6);
    pane->SetCurState(4);
    EXPECT_EQ(gcStateIconGetCurState(pane), 4);
    gcIconSetDecalProc(pane, DrawDecal);
    EXPECT_EQ(pane->GetDecalProc(), DrawDecal);
    pane->SetEnabled(0);
    EXPECT_FALSE(gcStateIconGetEnable(pane));
}

TEST_F(IconPane, TheVariableForTheStateClampsIt) {
    GIconPane *const pane = New();
    gcStateIconSetCurState(pane, -1);
    EXPECT_EQ(pane->GetCurState(), 0);
    gcStateIconSetCurState(pane, 2);
    EXPECT_EQ(pane->GetCurState(), 2);
    gcStateIconSetCurState(pane, 3);
    EXPECT_EQ(pane->GetCurState(), 2);
    gcStateIconSetCurState(pane, 65536);
    EXPECT_EQ(pane->GetCurState(), 2);
}

TEST_F(IconPane, WithoutStatesTheVariableForTheStateGoesBelowZero) {
    GIconPane *const pane = New();
    gcStateIconSetNumStates(pane, 0);
    gcStateIconSetCurState(pane, 0);
    EXPECT_EQ(pane->GetCurState(), -1);
}

TEST_F(IconPane, TheVariablesNarrowToSixteenBits) {
    GIconPane *const pane = New();
    gcIconSetIconNum(pane, 65536 + 9);
    gcStateIconSetNumStates(pane, 65536 + 6);
    EXPECT_EQ(gcIconGetIconNum(pane), 9);
    EXPECT_EQ(gcStateIconGetNumStates(pane), 6);
}

TEST_F(IconPane, OnlyTheVariableForEnablingRepaints) {
    GIconPane *const pane = New();
    Show();
    gcIconSetIconNum(pane, 9);
    gcStateIconSetCurState(pane, 1);
    gcStateIconSetNumStates(pane, 5);
    gcIconSetDecalProc(pane, DrawDecal);
    EXPECT_TRUE(Repainted().empty());
    gcStateIconSetEnable(pane, false);
    EXPECT_FALSE(pane->GetEnabled());
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{40, 30, 56, 50}}));
}
