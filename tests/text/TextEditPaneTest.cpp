#include "text/TextEditPane.h"
#include "host/PaneWatch.h"
#include "tests/PaneTest.h"
#include "tests/text/ClosingWindow.h"
#include <limits>

namespace {

typedef OS::RectBase<OS::RectTag> PlaneRect;

class PaneEar : public TextEditPane_Listener {
public:
    void TextEditPane_TextChanged(TextEditPane &) override { ++changes; }
    void TextEditPane_Autoscrolled(TextEditPane &) override { ++scrolls; }
    int changes = 0, scrolls = 0;
};

class TextEditPaneTest : public PaneTest {
protected:
    TextEditPaneTest() {
        Rect box = {20, 20, 60, 120};
        pane->SetBox(&box);
        ear.DependUpon(pane);
        Show();
        desktop.Play("");
    }
    void SetText(char const *text) { pane->GetTextEdit().SetText(Text(text)); }

    TextEditPane *pane = new TextEditPane(glog, 7, 0);
    PaneEar ear;
};

bool Same(PlaneRect const &a, PlaneRect const &b) {
    return a.origin.x == b.origin.x && a.origin.y == b.origin.y && a.size.width == b.size.width &&
           a.size.height == b.size.height;
}

TEST_F(TextEditPaneTest, IsAttachedUnderItsNumber) {
    EXPECT_EQ(pane->GetID(), 7);
    EXPECT_EQ(pane->GetGlog(), glog);
}

TEST_F(TextEditPaneTest, WithoutAGlogItHasAnEngineAllTheSame) {
    TextEditPane loose(nullptr, 1, 2);
    loose.GetTextEdit().SetText(Text("a"));
    loose.SetFractionalOffset(OS::Point(0.5, 0.5), OS::Size(1, 1));
    EXPECT_EQ(loose.GetTextEdit().GetText(), Text("a"));
}

TEST_F(TextEditPaneTest, KeysGoToItsEngineWhileItIsEditing) {
    pane->BeginEditing();
    desktop.Play("type \"ab\"");
    EXPECT_EQ(pane->GetTextEdit().GetText(), Text("ab"));
    EXPECT_EQ(ear.changes, 2);
    pane->EndEditing();
    desktop.Play("type \"c\"");
    EXPECT_EQ(ear.changes, 2);
}

TEST_F(TextEditPaneTest, TellsThatItsTextHasScrolledByItself) {
    pane->BeginEditing();
    desktop.Play("type \"a text that is wider than the pane\"");
    int const scrolls = ear.scrolls;
    EXPECT_GT(scrolls, 0);
    desktop.Play("key Left");
    EXPECT_EQ(ear.scrolls, scrolls) << "nothing had to be scrolled";
    desktop.Play("key Home");
    EXPECT_EQ(ear.scrolls, scrolls + 1);
    desktop.Play("key End");
    EXPECT_EQ(ear.scrolls, scrolls + 2);
}

TEST_F(TextEditPaneTest, ItsFractionIsWhatIsLeftOfWholePixels) {
    pane->SetFractionalBounds(PlaneRect(10.25, 20, 5.5, 8));
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 28, 16}));
    EXPECT_EQ(pane->GetFractionalOffset().first.x, 0.25);
    EXPECT_EQ(pane->GetFractionalOffset().second.width, -0.5);
    EXPECT_TRUE(Same(pane->GetFractionalBounds(), PlaneRect(10.25, 20, 5.5, 8)));
    EXPECT_TRUE(Same(pane->GetTextEdit().GetBounds(), PlaneRect(10.25, 20, 5.5, 8)));
}

TEST_F(TextEditPaneTest, ANegativeSizeLiesOnTheOtherSide) {
    pane->SetFractionalBounds(PlaneRect(10, 20, -2.5, 8));
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 7, 28, 10}));
    EXPECT_EQ(pane->GetFractionalOffset().first.x, 3.0);
    EXPECT_EQ(pane->GetFractionalOffset().second.width, -5.5);
    EXPECT_TRUE(Same(pane->GetFractionalBounds(), PlaneRect(10, 20, -2.5, 8)));
}

TEST_F(TextEditPaneTest, SettingTheBoundsRepaintsTheOldAndTheNewBox) {
    Repainted();
    pane->SetFractionalBounds(PlaneRect(200, 100, 40, 20));
    std::vector<Rect> const rects = Repainted();
    ASSERT_EQ(rects.size(), 2u);
    EXPECT_EQ(rects[0], (Rect{20, 20, 60, 120}));
    EXPECT_EQ(rects[1], (Rect{100, 200, 120, 240}));
}

TEST_F(TextEditPaneTest, TheOffsetMovesTheEngine) {
    pane->SetFractionalOffset(OS::Point(0.5, 1.5), OS::Size(-1, -2));
    EXPECT_TRUE(Same(pane->GetTextEdit().GetBounds(), PlaneRect(20.5, 21.5, 99, 38)));
}

TEST_F(TextEditPaneTest, CommandsNeverCount) {
    SetText("Bass");
    bool commits = true;
    pane->SelectAll();
    pane->Cut(commits);
    EXPECT_FALSE(commits);
    EXPECT_EQ(pane->GetTextEdit().GetText(), UString());
    commits = true;
    pane->Paste(commits);
    EXPECT_FALSE(commits);
    EXPECT_EQ(pane->GetTextEdit().GetText(), Text("Bass"));
    commits = true;
    EXPECT_FALSE(pane->Clear(commits));
    EXPECT_TRUE(commits);
    pane->SelectAll();
    EXPECT_TRUE(pane->Clear(commits));
    EXPECT_FALSE(commits);
}

TEST_F(TextEditPaneTest, KnowsTheFiveCommands) {
    for (short id = 0; id < 20; ++id)
        EXPECT_EQ(pane->CanDoOp(CommandSpecifier(0, id)), id == 1 || (id >= 11 && id <= 13) || id == 15)
            << id;
}

TEST_F(TextEditPaneTest, DrawsItsEngine) {
    SetText("Bass");
    EXPECT_EQ(Only("DrawTextEdit", DrawingOf(*pane)).size(), 1u);
}

TEST_F(TextEditPaneTest, GoesWithItsWindowAlthoughItLeavesIt) {
    PaneWatch const watch(pane);
    DisposeGlog(glog);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(TextEditPaneTest, AListenerMayDeleteIt) {
    class Deleting : public TextEditPane_Listener {
    public:
        void TextEditPane_TextChanged(TextEditPane &pane) override { delete &pane; }
    };
    Deleting deleting;
    deleting.DependUpon(pane);
    PaneWatch const watch(pane);
    pane->BeginEditing();
    desktop.Play("type \"ab\"");
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(TextEditPaneTest, ANegativeHeightLiesAboveAndBothOnTheOtherCorner) {
    pane->SetFractionalBounds(PlaneRect(10, 20, 8, -2.5));
    EXPECT_EQ(BoxOf(*pane), (Rect{17, 10, 20, 18}));
    EXPECT_EQ(pane->GetFractionalOffset().first.y, 3.0);
    EXPECT_EQ(pane->GetFractionalOffset().second.height, -5.5);
    EXPECT_TRUE(Same(pane->GetFractionalBounds(), PlaneRect(10, 20, 8, -2.5)));
    pane->SetFractionalBounds(PlaneRect(10.5, 20.25, -4, -6.5));
    EXPECT_EQ(BoxOf(*pane), (Rect{13, 6, 21, 11}));
    EXPECT_TRUE(Same(pane->GetFractionalBounds(), PlaneRect(10.5, 20.25, -4, -6.5)));
}

TEST_F(TextEditPaneTest, BoundsThatAreNoneAreHarmless) {
    double const nan = std::numeric_limits<double>::quiet_NaN(),
                 far = std::numeric_limits<double>::infinity();
    for (double const odd : {nan, far, -far, 1e300, -1e300}) {
        pane->SetFractionalBounds(PlaneRect(odd, odd, odd, odd));
        pane->SetFractionalBounds(PlaneRect(10, 10, odd, 20));
        pane->SetFractionalBounds(PlaneRect(odd, 10, 20, 20));
        UpdateGlog(glog);
    }
    pane->SetFractionalBounds(PlaneRect(10, 20, 30, 40));
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 60, 40}));
    EXPECT_TRUE(Same(pane->GetTextEdit().GetBounds(), PlaneRect(10, 20, 30, 40)));
}

TEST_F(TextEditPaneTest, AListenerMayDeleteItWhenItHasScrolled) {
    class Deleting : public TextEditPane_Listener {
    public:
        void TextEditPane_Autoscrolled(TextEditPane &pane) override { delete &pane; }
    };
    Deleting deleting;
    deleting.DependUpon(pane);
    PaneWatch const watch(pane);
    pane->BeginEditing();
    desktop.Play("type \"a text that is wider than the pane\"");
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(TextEditPaneTest, LeavesAWindowThatClosesAndComesBackWithTheOneThatOpens) {
    glogRec *const late = desktop.NewGlog(GlogOptions().Size(200, 100));
    TextEditPane *const other = new TextEditPane(late, 8, 0);
    Rect box = {10, 10, 30, 110};
    other->SetBox(&box);
    late->BroadcastChange(ClosingWindow(*late), nullptr);
    EXPECT_EQ(other->GetGlog(), nullptr);
    ShowGlog(late, kShowGlog);
    EXPECT_EQ(other->GetGlog(), late);
    UpdateGlog(late);
    desktop.TakePresented(late);
    other->GetTextEdit().SetText(Text("a"));
    UpdateGlog(late);
    EXPECT_FALSE(desktop.TakePresented(late).empty()) << "its engine has no window";
}

TEST_F(TextEditPaneTest, WithoutItsWindowItsEngineRepaintsNothing) {
    SetText("Bass");
    EXPECT_FALSE(Repainted().empty());
    glog->BroadcastChange(ClosingWindow(*glog), nullptr);
    Repainted();
    SetText("Drums");
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(TextEditPaneTest, InAWindowThatShowsAlreadyItsEngineIsShownAtOnce) {
    TextEditPane *const late = new TextEditPane(glog, 8, 0);
    Rect box = {80, 20, 100, 120};
    late->SetBox(&box);
    Repainted();
    late->GetTextEdit().SetText(Text("a"));
    EXPECT_EQ(Repainted(), std::vector<Rect>{box});
}

TEST_F(TextEditPaneTest, ItsFlagsGoToTheEngineAsTheyAre) {
    unsigned int const kSeveralLines = 2, kReadOnly = 4, kNoAutoScroll = 8;
    auto const typedInto = [&](unsigned int flags) {
        TextEditPane *const made = new TextEditPane(glog, 8, flags);
        Rect box = {80, 20, 100, 120};
        made->SetBox(&box);
        ear.scrolls = 0;
        ear.DependUpon(made);
        made->BeginEditing();
        desktop.Play("type \"a text that is wider than the pane\"\nkey Return\ntype \"b\"");
        UString const text = made->GetTextEdit().GetText();
        delete made;
        return text;
    };
    EXPECT_EQ(typedInto(0), Text("a text that is wider than the paneb"));
    EXPECT_GT(ear.scrolls, 0);
    EXPECT_EQ(typedInto(kNoAutoScroll), Text("a text that is wider than the paneb"));
    EXPECT_EQ(ear.scrolls, 0);
    EXPECT_EQ(typedInto(kSeveralLines), Text("a text that is wider than the pane\nb"));
    EXPECT_EQ(typedInto(kReadOnly), UString());
}

// Notes its invalidations, and knows how often its place has changed.
class CountingEdit : public TextEditPane {
public:
    using TextEditPane::TextEditPane;
    void Inval() override {
        Rect box;
        GetBox(&box);
        invalidated.push_back(box);
        TextEditPane::Inval();
    }
    void PanePositionChanged() override {
        ++moves;
        TextEditPane::PanePositionChanged();
    }
    std::vector<Rect> invalidated;
    int moves = 0;
};

TEST_F(TextEditPaneTest, AnotherOffsetRepaintsNothing) {
    CountingEdit *const edit = new CountingEdit(glog, 8, 0);
    int const moves = edit->moves;
    edit->SetFractionalOffset(OS::Point(0.5, 1.5), OS::Size(-1, -2));
    EXPECT_EQ(edit->moves, moves + 1);
    EXPECT_TRUE(edit->invalidated.empty());
}

TEST_F(TextEditPaneTest, InvalidatesTheBoxBeforeAndAfterItsBoundsAreSet) {
    CountingEdit *const edit = new CountingEdit(glog, 8, 0);
    edit->SetFractionalBounds(PlaneRect(10.25, 20, 5.5, 8));
    EXPECT_EQ(edit->invalidated, (std::vector<Rect>{{0, 0, 0, 0}, {20, 10, 28, 16}}));
}

TEST_F(TextEditPaneTest, AnotherFractionInTheSamePixelsMovesTheEngine) {
    pane->SetFractionalBounds(PlaneRect(10.25, 20, 5.5, 8));
    pane->SetFractionalBounds(PlaneRect(10.5, 20.5, 5, 7.25));
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 28, 16}));
    EXPECT_TRUE(Same(pane->GetTextEdit().GetBounds(), PlaneRect(10.5, 20.5, 5, 7.25)));
}

TEST_F(TextEditPaneTest, TheEngineLiesInTheWindowWhereverTheContainerIs) {
    CompoundPane *const container = new CompoundPane;
    container->CompoundPaneInit(glog, 0);
    Rect all = {0, 0, 200, 300};
    container->SetBox(&all);
    container->Add(pane, -1);
    container->Offset({50, 30});
    EXPECT_TRUE(Same(pane->GetTextEdit().GetBounds(), PlaneRect(20 + 30, 20 + 50, 100, 40)));
    pane->SetFractionalBounds(PlaneRect(10.25, 20, 5.5, 8));
    EXPECT_TRUE(Same(pane->GetTextEdit().GetBounds(), PlaneRect(10.25 + 30, 20 + 50, 5.5, 8)));
}

TEST_F(TextEditPaneTest, ItsSubpanesHearThatItsPlaceHasChanged) {
    class Hearing : public GlogPane {
    public:
        void DrawGuts(OSRgn *) override {}
        void PanePositionChanged() override { ++moves; }
        int moves = 0;
    };
    Hearing *const hearing = new Hearing;
    hearing->GlogPaneInit(glog, 0);
    pane->Add(hearing, -1);
    hearing->moves = 0;
    pane->SetFractionalOffset(OS::Point(0.5, 0.5), OS::Size(0, 0));
    EXPECT_EQ(hearing->moves, 1);
}

} // namespace
