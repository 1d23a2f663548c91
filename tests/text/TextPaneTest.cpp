#include "text/TextPane.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/text/WatchedItem.h"

namespace {

class TextPaneTest : public PaneTest {
protected:
    TextPane *New(char const *text) {
        return new TextPane(glog, Text(text), TextSettings::kAlignLeft, false);
    }
    TextPane *New(TestItem const &item) { return new TextPane(glog, item.Container(), false); }

    static TestItem Item() {
        TestItem item;
        item.String("Text", "Take 1").Box("BoundsRect", kBox);
        return item;
    }
    // The one drawing call with text.
    std::string Drawn(TextPane &pane) {
        Lines const calls = Only("DrawTextLayoutInRect", DrawingOf(pane));
        return calls.size() == 1 ? calls.front() : std::to_string(calls.size()) + " calls";
    }
    static bool Says(std::string const &line, std::string const &part) {
        return line.find(part) != std::string::npos;
    }

    static constexpr Rect kBox = {10, 20, 60, 120};
};

constexpr Rect TextPaneTest::kBox;

// A pane that notes its invalidations.
class CountingText : public TextPane {
public:
    using TextPane::TextPane;
    void Inval() override {
        ++invalidations;
        TextPane::Inval();
    }
    int invalidations = 0;
};

} // namespace

TEST_F(TextPaneTest, IsEnabledInFontZeroAndNotSizedToItsText) {
    TextPane *const pane = New("Take 1");
    EXPECT_TRUE(pane->GetEnable());
    EXPECT_FALSE(pane->GetSizeToText());
    EXPECT_EQ(pane->GetAlignment(), TextSettings::kAlignLeft);
    EXPECT_EQ(pane->GetText(), Text("Take 1"));
    EXPECT_EQ(pane->GetID(), 0);
}

TEST_F(TextPaneTest, WithoutAGlogIsNotAttached) {
    TextPane pane(nullptr, Text("Take 1"), TextSettings::kAlignLeft, false);
    EXPECT_EQ(pane.GetGlog(), nullptr);
    EXPECT_GT(pane.GetTextWidth(), 0);
}

TEST_F(TextPaneTest, HasNoBoxOfItsOwn) { EXPECT_EQ(BoxOf(*New("Take 1")), (Rect{0, 0, 0, 0})); }

TEST_F(TextPaneTest, TakesItsBoxFromTheItem) {
    TextPane *const pane = New(Item());
    EXPECT_EQ(BoxOf(*pane), kBox);
    EXPECT_EQ(pane->GetText(), Text("Take 1"));
}

TEST_F(TextPaneTest, WithAnEmptyItemFailsTheAssertionOfItsPointer) {
    EXPECT_THROW(TextPane(glog, boost::shared_ptr<XMLLib::ContainerItem>(), false), BrokenInvariant);
}

TEST_F(TextPaneTest, IsAlignedAsTheItemSays) {
    TextSettings::Alignment const expected[] = {TextSettings::kAlignLeft, TextSettings::kAlignRight,
                                                TextSettings::kAlignCenter, TextSettings::kAlignLeft};
    for (int align = 0; align < 4; ++align)
        EXPECT_EQ(New(Item().Integer("Align", align))->GetAlignment(), expected[align]) << align;
    EXPECT_EQ(New(Item())->GetAlignment(), TextSettings::kAlignLeft);
    EXPECT_EQ(New(Item().Integer("Align", 0x10001))->GetAlignment(), TextSettings::kAlignRight); // 16 bits
}

TEST_F(TextPaneTest, IsShortenedWhereTheItemSays) {
    EXPECT_TRUE(Says(Drawn(*New(Item().String("Truncate", "Middle"))), "\"truncation\":\"middle\""));
    EXPECT_TRUE(Says(Drawn(*New(Item().String("Truncate", "End"))), "\"truncation\":\"end\""));
    for (char const *word : {"None", "middle", "Start", ""})
        EXPECT_TRUE(Says(Drawn(*New(Item().String("Truncate", word))), "\"truncation\":\"none\"")) << word;
}

TEST_F(TextPaneTest, WithWrappedTextBeginsAtTheTop) {
    std::string const wrapped = Drawn(*New(Item().Integer("WrapText", 5)));
    EXPECT_TRUE(Says(wrapped, "\"verticalAlignment\":0")) << wrapped;
    EXPECT_TRUE(Says(wrapped, "\"wrap\":1")) << wrapped;
    std::string const oneLine = Drawn(*New(Item()));
    EXPECT_TRUE(Says(oneLine, "\"verticalAlignment\":1")) << oneLine;
    EXPECT_TRUE(Says(oneLine, "\"wrap\":0")) << oneLine;
}

TEST_F(TextPaneTest, TakesItsFontFromTheItem) {
    TextPane *const zero = New(Item()), *const seven = New(Item().Integer("FSRID", 7));
    EXPECT_NE(zero->GetTextWidth(), seven->GetTextWidth());
    TextPane *const one = New(Item().Integer("FSRID", 1));
    EXPECT_NE(one->GetTextWidth(), zero->GetTextWidth());
    EXPECT_EQ(New(Item().Integer("FSRID", 30))->GetTextWidth(), zero->GetTextWidth());
    EXPECT_EQ(New(Item().Integer("FSRID", 31))->GetTextWidth(), one->GetTextWidth());
    EXPECT_EQ(New(Item().Integer("FSRID", 0x107))->GetTextWidth(), seven->GetTextWidth());
    zero->SetFont(7);
    EXPECT_EQ(zero->GetTextWidth(), seven->GetTextWidth());
}

TEST_F(TextPaneTest, WidthGrowsWithTheText) {
    TextPane *const pane = New("Take 1");
    int const narrow = pane->GetTextWidth();
    pane->SetText(Text("Take 1, the long version"));
    EXPECT_GT(pane->GetTextWidth(), narrow);
    pane->SetText(UString());
    EXPECT_EQ(pane->GetTextWidth(), 0);
}

TEST_F(TextPaneTest, InvalidatesOnceForAnotherTextAndTwiceWhenSizedToIt) {
    CountingText *const pane = new CountingText(glog, Text("A"), TextSettings::kAlignLeft, false);
    pane->SetText(Text("B"));
    EXPECT_EQ(pane->invalidations, 1);
    pane->SetSizeToText(true);
    pane->SetText(Text("C"));
    EXPECT_EQ(pane->invalidations, 3);
}

TEST_F(TextPaneTest, IgnoresTheTextThatItHas) {
    CountingText *const pane = new CountingText(glog, Text("A"), TextSettings::kAlignLeft, false);
    pane->SetText(Text("A"));
    pane->SetSizeToText(true);
    pane->SetText(Text("A"));
    EXPECT_EQ(pane->invalidations, 0);
}

TEST_F(TextPaneTest, InvalidatesForAnotherStateOrTruncationOnly) {
    CountingText *const pane = new CountingText(glog, Text("A"), TextSettings::kAlignLeft, false);
    pane->SetEnable(true);
    pane->SetTruncation(TextSettings::kTruncateNone);
    EXPECT_EQ(pane->invalidations, 0);
    pane->SetEnable(false);
    pane->SetTruncation(TextSettings::kTruncateEnd);
    EXPECT_EQ(pane->invalidations, 2);
    pane->SetAlignment(TextSettings::kAlignRight);
    pane->SetFont(3);
    pane->SetForPrinting(true);
    EXPECT_EQ(pane->invalidations, 2);
    EXPECT_EQ(pane->GetAlignment(), TextSettings::kAlignRight);
}

TEST_F(TextPaneTest, HasTheColoursOfDialogText) {
    TextPane *const pane = New(Item());
    Lines const active = Only("RGBForeColor", DrawingOf(*pane));
    pane->SetEnable(false);
    Lines const inactive = Only("RGBForeColor", DrawingOf(*pane));
    EXPECT_EQ(active, Traced(*pane, [] { VelaDrawing::RGBForeColor(kDialogActiveTextColor); }));
    EXPECT_EQ(inactive, Traced(*pane, [] { VelaDrawing::RGBForeColor(kDialogInactiveTextColor); }));
}

TEST_F(TextPaneTest, HasTheColoursThatItIsGiven) {
    TextPane *const pane = New(Item());
    RGBColor red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    EXPECT_EQ(Only("RGBForeColor", DrawingOf(*pane)), Traced(*pane, [&] { VelaDrawing::RGBForeColor(red); }));
    pane->SetEnable(false);
    EXPECT_EQ(Only("RGBForeColor", DrawingOf(*pane)),
              Traced(*pane, [&] { VelaDrawing::RGBForeColor(blue); }));
}

TEST_F(TextPaneTest, LeavesThePortsColours) { EXPECT_TRUE(KeepsColors(*New(Item()))); }

TEST_F(TextPaneTest, TakesNoClicks) {
    New(Item());
    Show();
    EXPECT_NE(ResultOfClick("click 30 30"), 1);
}

TEST_F(TextPaneTest, RepaintsItsBoxAlone) {
    TextPane *const pane = New(Item());
    Show();
    pane->SetText(Text("Take 2"));
    EXPECT_EQ(Repainted(), std::vector<Rect>{kBox});
    pane->SetText(Text("Take 2"));
    EXPECT_EQ(Repainted(), std::vector<Rect>());
}

TEST_F(TextPaneTest, InALayoutIsAsWideAsItsTextOrItsRectangle) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect all = {0, 0, 200, 300};
    column->SetBox(&all);
    column->SetUseLayout(true);
    TextPane *const text = New("Take 1"), *const box = New(Item());
    column->Add(text, -1);
    column->Add(box, -1);
    Show();
    EXPECT_EQ(text->GetLayoutRect()->GetItemRect().right, text->GetTextWidth());
    EXPECT_EQ(box->GetLayoutRect()->GetItemRect().right, kBox.right - kBox.left);
    text->SetText(Text("Another text"));
    UpdateGlog(glog);
    EXPECT_NE(text->GetLayoutRect()->GetItemRect().right, text->GetTextWidth());
    text->SetSizeToText(true);
    text->SetText(Text("One more"));
    UpdateGlog(glog);
    EXPECT_EQ(text->GetLayoutRect()->GetItemRect().right, text->GetTextWidth());
}

TEST_F(TextPaneTest, FromAnItemHasTheNumberZero) { EXPECT_EQ(New(Item())->GetID(), 0); }

TEST_F(TextPaneTest, AnyNumberButZeroWrapsAndSizes) {
    for (int value : {1, 2, -1}) {
        EXPECT_TRUE(Says(Drawn(*New(Item().Integer("WrapText", value))), "\"wrap\":1")) << value;
        EXPECT_TRUE(New(Item().Integer("SizeToText", value))->GetSizeToText()) << value;
    }
    EXPECT_FALSE(New(Item().Integer("SizeToText", 0))->GetSizeToText());
}

TEST_F(TextPaneTest, TellsItsLayoutItemTheNewWidthBetweenTwoInvalidations) {
    class Watched : public TextPane {
    public:
        using TextPane::TextPane;
        void Inval() override { toldByThen.push_back(item ? item->told.size() : 0); }
        WatchedItem *item = nullptr;
        std::vector<std::size_t> toldByThen;
    };
    Watched *const pane = new Watched(glog, Text("A"), TextSettings::kAlignLeft, false);
    pane->item = &WatchedItem::PutInto(*pane);
    pane->SetText(Text("Take 1"));
    EXPECT_TRUE(pane->item->told.empty());
    pane->SetSizeToText(true);
    pane->toldByThen.clear();
    pane->SetText(Text("Take 2, longer"));
    EXPECT_EQ(pane->item->told, (WatchedItem::Tolds{{kNaturalWidth, pane->GetTextWidth(), kInPixels, true}}));
    EXPECT_EQ(pane->toldByThen, (std::vector<std::size_t>{0, 1}));
}

TEST_F(TextPaneTest, InALayoutKeepsTheWidthOfItsItem) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect all = {0, 0, 200, 300}, wide = {0, 0, 20, 250};
    column->SetBox(&all);
    column->SetUseLayout(true);
    TextPane *const boxed = New(Item()), *const free = New(TestItem().String("Text", "Take 1"));
    for (TextPane *pane : {boxed, free}) {
        pane->SetBox(&wide);
        column->Add(pane, -1);
    }
    EXPECT_EQ(boxed->GetLayoutRect()->GetItemRect().right, kBox.right - kBox.left);
    EXPECT_EQ(free->GetLayoutRect()->GetItemRect().right, free->GetTextWidth());
}

TEST_F(TextPaneTest, OfTextThatWrapsTheLongestOfItsLinesCounts) {
    TextPane *const oneLine = New("Take 1, the long version");
    TextPane *const lines =
        New(TestItem().String("Text", "Take 1, the long version\nand another").Integer("WrapText", 1));
    EXPECT_EQ(lines->GetTextWidth(), oneLine->GetTextWidth());
    EXPECT_NE(New("Take 1, the long version\nand another")->GetTextWidth(), oneLine->GetTextWidth());
}

TEST_F(TextPaneTest, DrawsInItsOwnPort) {
    TextPane *const pane = New(Item());
    LeaveForAnotherPort();
    (pane->*&Opened<TextPane>::DrawGuts)(nullptr);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(TextPaneTest, ADerivedPaneMaySayWhereAndInWhichColourItIsDrawn) {
    class Elsewhere : public TextPane {
    public:
        using TextPane::DrawGuts;
        using TextPane::TextPane;
        Rect GetDrawRectangle() override { return {1, 2, 31, 42}; }
        void SetupFont() const override { VelaDrawing::RGBForeColor({0xFFFF, 0, 0}); }
    };
    Elsewhere *const pane = new Elsewhere(glog, Item().Container(), false);
    Lines const drawn = Traced(*pane, [&] { pane->DrawGuts(nullptr); });
    Lines const texts = Only("DrawTextLayoutInRect", drawn);
    ASSERT_EQ(texts.size(), 1u);
    EXPECT_TRUE(Says(texts[0], "[1,2,31,42]")) << texts[0];
    EXPECT_EQ(Only("RGBForeColor", drawn), Traced(*pane, [] { VelaDrawing::RGBForeColor({0xFFFF, 0, 0}); }));
}
