#include "text/StringGroupPane.h"
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/PaneAccess.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

short const kSpacing = 21;

class StringGroupTest : public PaneTest {
protected:
    struct Line {
        char const *text;
        bool placed;
        Point origin;
    };

    StringGroupTest()
        : list(XMLLib::CreateContainer(Text("TextList"))) {}

    StringGroupTest &Add(Line const &line) {
        TestItem item;
        item.String("Text", line.text);
        if (line.placed)
            item.Spot("TextOrigin", line.origin);
        list->AddItem(Text("Line"), item.Container());
        return *this;
    }
    StringGroupPane *New(int fsrid = 0) {
        item.Integer("FSRID", fsrid).Integer("LineSpacing", kSpacing);
        item.Container()->AddItem(Text("TextList"), list);
        return StringGroupPane::NewStringGroupPane(glog, 5, item.Sheet());
    }
    // Two lines, 40 pixels apart.
    StringGroupPane *NewPair() {
        Add({"Attack", true, {30, 20}});
        Add({"Release", true, {70, 24}});
        return New();
    }
    static short AscentOf(int font) {
        SaveTextState const state;
        SetFontData(GetIndVelaFont(font));
        TarnQuickDrawText::FontInfo info;
        tarn::GetFontInfo(info);
        return info.ascent;
    }
    static int WidthOf(char const *text, int font = 0) {
        SaveTextState const state;
        SetFontData(GetIndVelaFont(font));
        return LooseStringWidth(Text(text), 0.0f, 1.0f);
    }
    // Where the text of a box starts.
    static Point StartIn(Rect const &box) {
        return {static_cast<short>(box.top + AscentOf(0) / 2 + (box.bottom - box.top) / 2), box.left};
    }
    Lines DrawnAt(GlogPane &pane, std::vector<std::pair<char const *, Point>> const &texts) {
        return Traced(pane, [&] {
            SaveTextState const textState;
            SaveColors const colors;
            SetFontData(GetIndVelaFont(0));
            VelaDrawing::RGBForeColor(kDialogActiveTextColor);
            for (auto const &text : texts)
                DrawStringAtPoint(Text(text.first), text.second, -1, TextSettings::kTruncateNone);
        });
    }

    boost::shared_ptr<XMLLib::ContainerItem> list;
    TestItem item;
};

} // namespace

TEST_F(StringGroupTest, HasABoxRoundAllOfItsStrings) {
    StringGroupPane *const pane = NewPair();
    short const ascent = AscentOf(0);
    EXPECT_EQ(BoxOf(*pane),
              (Rect{static_cast<short>(30 - ascent), 20, static_cast<short>(70 - ascent + kSpacing),
                    static_cast<short>(std::max(20 + WidthOf("Attack"), 24 + WidthOf("Release")))}));
    EXPECT_EQ(pane->GetID(), 5);
    ASSERT_EQ(pane->CountStrings(), 2U);
    EXPECT_EQ(pane->StringAt(1), Text("Release"));
}

TEST_F(StringGroupTest, AStringWithoutOriginHangsAboveTheCorner) {
    Add({"Attack", false, {}});
    short const ascent = AscentOf(0);
    EXPECT_EQ(BoxOf(*New()), (Rect{static_cast<short>(-ascent), 0, static_cast<short>(kSpacing - ascent),
                                   static_cast<short>(WidthOf("Attack"))}));
}

TEST_F(StringGroupTest, WithoutStringsHasTheBoxThatContainsNothing) {
    StringGroupPane *const pane = New();
    EXPECT_EQ(BoxOf(*pane), (Rect{10000, 10000, -10000, -10000}));
    Rect anywhere = {1, 2, 3, 4};
    pane->SetBox(&anywhere);
    EXPECT_EQ(BoxOf(*pane), (Rect{10000, 10000, -10000, -10000}));
    EXPECT_EQ(Only("DrawStringAtPoint", DrawingOf(*pane)), Lines());
    Show();
}

TEST_F(StringGroupTest, WithoutAListFailsTheAssertionOfItsPointer) {
    TestItem empty;
    EXPECT_THROW(StringGroupPane::NewStringGroupPane(glog, 5, empty.Sheet()), BrokenInvariant);
}

TEST_F(StringGroupTest, DrawsEachTextInTheMiddleOfItsBox) {
    StringGroupPane *const pane = NewPair();
    short const ascent = AscentOf(0);
    Rect const first = {static_cast<short>(30 - ascent), 20, static_cast<short>(30 - ascent + kSpacing), 0};
    Rect const second = {static_cast<short>(70 - ascent), 24, static_cast<short>(70 - ascent + kSpacing), 0};
    EXPECT_EQ(Only("DrawStringAtPoint", DrawingOf(*pane)),
              Only("DrawStringAtPoint",
                   DrawnAt(*pane, {{"Attack", StartIn(first)}, {"Release", StartIn(second)}})));
    EXPECT_TRUE(KeepsColors(*pane));
}

TEST_F(StringGroupTest, MovesItsStringsByTheCornerAlone) {
    StringGroupPane *const pane = NewPair();
    Rect const before = BoxOf(*pane);
    Rect wanted = {static_cast<short>(before.top + 7), static_cast<short>(before.left - 3), 500, 600};
    pane->SetBox(&wanted);
    EXPECT_EQ(BoxOf(*pane), (Rect{wanted.top, wanted.left, static_cast<short>(before.bottom + 7),
                                  static_cast<short>(before.right - 3)}));
}

TEST_F(StringGroupTest, TakesItsFontFromTheItem) {
    Add({"Attack", true, {30, 20}});
    EXPECT_EQ(BoxOf(*New(7)).right, 20 + WidthOf("Attack", 7));
    EXPECT_NE(WidthOf("Attack", 7), WidthOf("Attack", 0));
}

TEST_F(StringGroupTest, LeavesItsFontInThePort) {
    SetPortToGlog(glog);
    SetFontData(GetIndVelaFont(0));
    Add({"Attack", true, {30, 20}});
    New(7);
    EXPECT_EQ(LooseStringWidth(Text("Attack"), 0.0f, 1.0f), WidthOf("Attack", 7));
}

TEST_F(StringGroupTest, AnswersNothingToAClick) {
    StringGroupPane *const pane = NewPair();
    Show();
    Rect const box = BoxOf(*pane);
    EXPECT_EQ(ResultOfClick("click " + std::to_string(box.left + 2) + " " + std::to_string(box.top + 5)), 0);
    EXPECT_EQ(ResultOfClick("click " + std::to_string(box.left + 2) + " " + std::to_string(box.bottom - 2)),
              0);
}

TEST_F(StringGroupTest, InALayoutDrawsEachTextInTheItemOfItsOwn) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect all = {0, 0, 200, 300};
    column->SetBox(&all);
    column->SetUseLayout(true);
    StringGroupPane *const pane = NewPair();
    column->Add(pane, -1);
    Show();
    ASSERT_TRUE(pane->IsInLayout());
    Rect given = {40, 50, 140, 250};
    pane->SetBox(&given);
    EXPECT_EQ(BoxOf(*pane), given);
    std::vector<std::pair<char const *, Point>> places;
    char const *const texts[] = {"Attack", "Release"};
    for (std::size_t i = 0; i < 2; ++i) {
        RCPtr<GlogLayoutRectItem> const part = PaneAccess::Rep(*pane).subItems[i];
        places.emplace_back(texts[i], StartIn(part->GetBorderRect()));
    }
    EXPECT_FALSE(places[0].second == places[1].second);
    EXPECT_EQ(Only("DrawStringAtPoint", DrawingOf(*pane)), Only("DrawStringAtPoint", DrawnAt(*pane, places)));
}

TEST_F(StringGroupTest, EachStringIsAPartOfItsOwnUnderThePanesName) {
    StringGroupPane *const pane = NewPair();
    ASSERT_EQ(pane->NumLayoutSubItems(), 2);
    EXPECT_TRUE(PaneAccess::Rep(*pane).subItemMode);
    short const ascent = AscentOf(0);
    struct {
        Point origin;
        char const *text;
    } const strings[] = {{{30, 20}, "Attack"}, {{70, 24}, "Release"}};
    for (int i = 0; i < 2; ++i) {
        GlogLayoutRectItem &part = *PaneAccess::Rep(*pane).subItems[static_cast<std::size_t>(i)];
        EXPECT_EQ(LayoutEngine::Rep(part).index, i);
        EXPECT_EQ(LayoutEngine::Rep(part).Rest().id, -1);
        EXPECT_EQ(std::string(part.GetName()), pane->GetLayoutRect()->GetName());
        short const top = static_cast<short>(strings[i].origin.v - ascent), left = strings[i].origin.h;
        EXPECT_EQ(part.GetBorderRect(), (Rect{top, left, static_cast<short>(top + kSpacing),
                                              static_cast<short>(left + WidthOf(strings[i].text))}));
    }
}

TEST_F(StringGroupTest, ItsPartsHaveTheNameThatItsOwnItemHas) {
    StringGroupPane *const pane = NewPair();
    PaneAccess::Rep(*pane).layoutItem = GlogLayout::MakeRectItem({0, 0, 0, 0}, 5, 0, "Labels");
    pane->GetFromXML(item.Sheet());
    ASSERT_EQ(PaneAccess::Rep(*pane).subItems.size(), 4U);
    EXPECT_EQ(std::string(PaneAccess::Rep(*pane).subItems[1]->GetName()), "");
    EXPECT_EQ(std::string(PaneAccess::Rep(*pane).subItems[2]->GetName()), "Labels");
}

TEST_F(StringGroupTest, AnEmptyListHasNoParts) { EXPECT_EQ(New()->NumLayoutSubItems(), 0); }

TEST_F(StringGroupTest, ALineSpacingBeyondSixteenBitsEndsThere) {
    Add({"Attack", true, {30, 20}});
    for (int const spacing : {2147483647, -2147483647 - 1}) {
        TestItem odd;
        odd.Integer("LineSpacing", spacing);
        odd.Container()->AddItem(Text("TextList"), list);
        Rect const box = BoxOf(*StringGroupPane::NewStringGroupPane(glog, 5, odd.Sheet()));
        EXPECT_EQ(box.bottom, spacing > 0 ? 32767 : -10000) << "what uniting begins with";
    }
}

TEST_F(StringGroupTest, DrawsItsStringsWhereTheyWereMoved) {
    StringGroupPane *const pane = NewPair();
    Rect const before = BoxOf(*pane);
    Rect wanted = {static_cast<short>(before.top + 7), static_cast<short>(before.left - 3), 500, 600};
    pane->SetBox(&wanted);
    EXPECT_EQ(pane->GetBounds(), wanted) << "the size is ignored by the strings alone";
    short const top = wanted.top, bottom = static_cast<short>(top + kSpacing);
    Rect const first = {top, wanted.left, bottom, 0};
    Rect const second = {static_cast<short>(top + 40), static_cast<short>(24 - 3),
                         static_cast<short>(bottom + 40), 0};
    EXPECT_EQ(Only("DrawStringAtPoint", DrawingOf(*pane)),
              Only("DrawStringAtPoint",
                   DrawnAt(*pane, {{"Attack", StartIn(first)}, {"Release", StartIn(second)}})));
}

TEST_F(StringGroupTest, HalvesAscentAndHeightOneByOne) {
    int odd = -1;
    for (int font = 0; font <= 9 && odd < 0; ++font)
        if (AscentOf(font) % 2 != 0)
            odd = font;
    ASSERT_GE(odd, 0) << "no font has an odd ascent";
    static_assert(kSpacing % 2 != 0, "the height has to be odd too");
    short const ascent = AscentOf(odd);
    Add({"Attack", true, {30, 20}});
    StringGroupPane *const pane = New(odd);
    Point const start = {static_cast<short>(30 - ascent + ascent / 2 + kSpacing / 2), 20};
    Lines const drawn = DrawingOf(*pane);
    Lines const expected = Traced(*pane, [&] {
        SaveTextState const textState;
        SaveColors const colors;
        SetFontData(GetIndVelaFont(odd));
        VelaDrawing::RGBForeColor(kDialogActiveTextColor);
        DrawStringAtPoint(Text("Attack"), start, -1, TextSettings::kTruncateNone);
    });
    EXPECT_EQ(Only("DrawStringAtPoint", drawn), Only("DrawStringAtPoint", expected));
}

TEST_F(StringGroupTest, WithoutStringsLeavesThePortsFont) {
    SetPortToGlog(glog);
    SetFontData(GetIndVelaFont(0));
    StringGroupPane *const pane = New(7);
    EXPECT_EQ(LooseStringWidth(Text("Attack"), 0.0f, 1.0f), WidthOf("Attack", 0));
    EXPECT_EQ(pane->CountStrings(), 0U);
}

TEST_F(StringGroupTest, DrawingLeavesThePortsFont) {
    Add({"Attack", true, {30, 20}});
    StringGroupPane *const pane = New(7);
    pane->Prepare();
    SetFontData(GetIndVelaFont(0));
    (pane->*&Opened<StringGroupPane>::DrawGuts)(nullptr);
    EXPECT_EQ(LooseStringWidth(Text("Attack"), 0.0f, 1.0f), WidthOf("Attack", 0));
}

TEST_F(StringGroupTest, ItsFontFollowsTheRuleOfItsKey) {
    Add({"Attack", true, {0, 0}});
    struct {
        int id, font;
    } const cases[] = {{9, 9}, {30, 0}, {31, 1}, {12, 0}, {0x107, 7}};
    for (auto const &c : cases) {
        TestItem odd;
        odd.Integer("FSRID", c.id);
        odd.Container()->AddItem(Text("TextList"), list);
        EXPECT_EQ(BoxOf(*StringGroupPane::NewStringGroupPane(glog, 5, odd.Sheet())).right,
                  WidthOf("Attack", c.font))
            << c.id;
    }
}
