#include "text/TextPane.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

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
    EXPECT_EQ(New(Item().Integer("FSRID", 30))->GetTextWidth(), zero->GetTextWidth());
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
