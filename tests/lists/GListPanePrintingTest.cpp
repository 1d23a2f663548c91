// A list on paper.
#include "host/LocalizedStrings.h"
#include "host/OSFont.h"
#include "host/PageFormat.h"
#include "host/TextLayout.h"
#include "lists/ListTextDrawer.h"
#include "tests/lists/ListTest.h"
#include "tests/printing/PdfReading.h"
#include <limits>

namespace {

int const kRowsOfAPage = 60; // of A4, upright

class GListPanePrintingTest : public ListTest {
protected:
    static UString Numbered(char const *word, int number) {
        UString text(word, UString::kByteEncoding1), digits;
        tarn::NumToUString(number, tarn::kPlainNumber, digits);
        text += digits;
        return text;
    }
    // A list whose rows say which they are.
    GListPane *Printable(int rows, glistResRec record = Record()) {
        GListPane *const list = Equipped(NewList(record), rows);
        drawer.onDraw = [](int line, Rect const &row) {
            VelaDrawing::MoveTo(row.left, static_cast<short>(row.bottom - 2));
            DrawString(Numbered("Row", line));
        };
        Show();
        return list;
    }
    static PrintMessageRec Message(int kind, int page) {
        PrintMessageRec message;
        message.kind = kind;
        message.page = page;
        return message;
    }
    static bool Printed(GListPane &list, int kind, int page) {
        PrintMessageRec message = Message(kind, page);
        return list.Print(&message);
    }
    static Rect PageBox() {
        Rect const page = PageFormat::GetCurrentFormat(true)->GetPageRect();
        return {39, 4, static_cast<short>(page.bottom - 4), static_cast<short>(page.right - 4)};
    }

    TemporaryDirectory directory;
    std::string const file = directory.Path() + "/list.pdf";
};

enum Kinds { kBegin = 2, kPage = 3, kEnd = 4 };

bool Has(std::string const &text, std::string const &words) { return text.find(words) != std::string::npos; }

} // namespace

// Files

TEST_F(GListPanePrintingTest, EveryRowIsOnAPage) {
    Printable(150);
    EXPECT_EQ(desktop.Print(glog, file), 3);
    EXPECT_EQ(PdfReading::Pages(file), 3);
    std::string const first = PdfReading::Text(file, 1), second = PdfReading::Text(file, 2),
                      third = PdfReading::Text(file, 3);
    EXPECT_TRUE(Has(first, "Row0\n")) << first;
    EXPECT_TRUE(Has(first, "Row59\n"));
    EXPECT_FALSE(Has(first, "Row60"));
    EXPECT_FALSE(Has(second, "Row59"));
    EXPECT_TRUE(Has(second, "Row60\n")) << second;
    EXPECT_TRUE(Has(second, "Row119\n"));
    EXPECT_TRUE(Has(third, "Row120\n")) << third;
    EXPECT_TRUE(Has(third, "Row149\n"));
}

TEST_F(GListPanePrintingTest, EachPageSaysWhichItIs) {
    Printable(150);
    desktop.Print(glog, file);
    EXPECT_TRUE(Has(PdfReading::Text(file, 1), "Page 1\n"));
    EXPECT_TRUE(Has(PdfReading::Text(file, 2), "Page 2\n"));
    EXPECT_TRUE(Has(PdfReading::Text(file, 3), "Page 3\n"));
}

TEST_F(GListPanePrintingTest, TheHeaderIsOnEveryPage) {
    Printable(70);
    PrintOptions options;
    options.Header("Session", "Take 4", "Second line");
    desktop.Print(glog, file, options);
    for (int page : {1, 2}) {
        std::string const text = PdfReading::Text(file, page);
        EXPECT_TRUE(Has(text, "Session")) << text;
        EXPECT_TRUE(Has(text, "Take 4"));
        EXPECT_TRUE(Has(text, "Second line"));
    }
}

TEST_F(GListPanePrintingTest, AScriptPrints) {
    Printable(70);
    desktop.Play("print " + file);
    EXPECT_EQ(PdfReading::Pages(file), 2);
}

TEST_F(GListPanePrintingTest, RowsThatJustFillAPageNeedNoFurtherOne) {
    Printable(kRowsOfAPage);
    EXPECT_EQ(desktop.Print(glog, file), 1);
    GListPane *const other = Printable(kRowsOfAPage + 1);
    other->SetID(9);
    EXPECT_EQ(desktop.Print(glog, file), 3) << "both lists";
}

TEST_F(GListPanePrintingTest, AListWithoutRowsHasNothingToPrint) {
    Printable(0);
    EXPECT_EQ(desktop.Print(glog, file), 0);
}

TEST_F(GListPanePrintingTest, AListThatStartsInTheMiddlePrintsFromItsFirstRow) {
    GListPane *const list = Printable(100);
    list->SetScrollPosition(50);
    desktop.Print(glog, file);
    EXPECT_TRUE(Has(PdfReading::Text(file, 1), "Row0\n"));
}

TEST_F(GListPanePrintingTest, InTheDarkThemeThePaperIsReadableToo) {
    Printable(3);
    desktop.SetTheme("dark");
    desktop.Print(glog, file);
    std::unique_ptr<Surface> const picture = PdfReading::Picture(file, 1);
    ASSERT_NE(picture, nullptr);
    int dark = 0, header = 0;
    for (int y = 0; y < 100; ++y)
        for (int x = 0; x < picture->Width(); ++x) {
            std::uint32_t const pixel = picture->Pixels()[y * picture->Width() + x];
            bool const isDark = (pixel & 0xFF) < 100;
            dark += isDark;
            header += isDark && y < 36 + 39; // above the rows
        }
    EXPECT_GT(header, 10) << "the page's number";
    EXPECT_GT(dark, header + 30) << "the rows";
}

TEST_F(GListPanePrintingTest, DisabledTextsAreReadableOnPaperInEveryTheme) {
    GListPane *const list = Printable(3);
    list->SetLineDrawer(new ListTextDrawer(list,
                                           [](int, int, ListCell &cell) {
                                               cell.text = Text("disabled");
                                               cell.isActive = false;
                                           }),
                        true);
    std::vector<std::unique_ptr<Surface>> pictures;
    for (char const *theme : {"light", "dark"}) {
        desktop.SetTheme(theme);
        desktop.Print(glog, file);
        pictures.push_back(PdfReading::Picture(file, 3));
        ASSERT_NE(pictures.back(), nullptr);
    }
    int readable = 0, different = 0;
    for (int y = 3 * (36 + 39); y < 3 * (36 + 39 + 36); ++y) // the rows
        for (int x = 0; x < pictures[0]->Width(); ++x) {
            std::uint32_t const light = pictures[0]->Row(y)[x], dark = pictures[1]->Row(y)[x];
            readable += (dark & 0xFF) < 0x78; // a contrast of 4.5 to 1
            different += light != dark;
        }
    EXPECT_GT(readable, 300);
    EXPECT_EQ(different, 0);
}

// Afterwards

TEST_F(GListPanePrintingTest, AfterwardsTheListIsAsItWas) {
    GListPane *const list = Printable(100);
    ScrollBarPane *const bar = new ScrollBarPane(glog, 0, 0, 0);
    list->SetScrollBar(bar);
    list->SetScrollPosition(50);
    Show();
    desktop.Print(glog, file);
    EXPECT_EQ(BoxOf(*list), ListBox());
    EXPECT_EQ(list->GetLineHeight(), 16);
    EXPECT_EQ(list->GetScrollPos(), 50);
    EXPECT_EQ(list->GetNumDisplayed(), 7);
    EXPECT_EQ(list->NumFullyDisplayedLines(), 6);
    EXPECT_EQ(bar->GetPosition(), 50);
    EXPECT_EQ(bar->GetRange(), 94);
    EXPECT_EQ(RowsDrawnBy([&] { list->Inval(); }).front(), "50");
    EXPECT_FALSE(Only("EraseRect", DrawingOf(*list)).empty()) << "grounds are drawn again";
}

// Steps

TEST_F(GListPanePrintingTest, BeginningTakesTheShapeOfThePage) {
    GListPane *const list = Printable(100);
    EXPECT_TRUE(Printed(*list, kBegin, 1));
    EXPECT_EQ(BoxOf(*list), PageBox());
    EXPECT_EQ(list->GetLineHeight(), 12);
    EXPECT_EQ(list->GetNumDisplayed(), kRowsOfAPage) << "only whole rows";
    EXPECT_EQ(list->GetScrollPos(), 0);
    EXPECT_FALSE(Printed(*list, kEnd, 1));
}

// Also a place that scrolling would not come to.
TEST_F(GListPanePrintingTest, TheEndBringsBackThePlaceAsItWas) {
    GListPane *const list = Printable(100);
    list->ScrollToPage(20);
    Printed(*list, kBegin, 1);
    Printed(*list, kEnd, 1);
    EXPECT_EQ(list->GetScrollPos(), 133);
}

TEST_F(GListPanePrintingTest, BeginningAtAPageSaysWhetherItHasRows) {
    GListPane *const list = Printable(100);
    EXPECT_TRUE(Printed(*list, kBegin, 2));
    EXPECT_EQ(list->GetScrollPos(), 60);
    Printed(*list, kEnd, 0);
    EXPECT_FALSE(Printed(*list, kBegin, 3));
    EXPECT_EQ(list->GetScrollPos(), 120);
    EXPECT_TRUE(list->ScrolledToEnd());
    Printed(*list, kEnd, 0);
    EXPECT_EQ(list->GetScrollPos(), 0);
    EXPECT_FALSE(list->ScrolledToEnd());
}

TEST_F(GListPanePrintingTest, OtherStepsAreNone) {
    GListPane *const list = Printable(100);
    for (int kind : {0, 1, 5, -1, std::numeric_limits<int>::max()})
        EXPECT_FALSE(Printed(*list, kind, 1));
    EXPECT_EQ(BoxOf(*list), ListBox());
}

TEST_F(GListPanePrintingTest, APageIsItsHeaderAndItsRows) {
    GListPane *const list = Printable(3);
    PrintMessageRec message = Message(kPage, 12);
    message.header[0] = Text("first");
    message.header[1] = Text("right of it");
    message.header[2] = Text("below");
    Printed(*list, kBegin, 1);
    Rect const b = PageBox();
    Lines const drawn = Only("DrawString", Traced(*list, [&] { EXPECT_FALSE(list->PrintPage(&message)); }));
    Lines const expected =
        Only("DrawString", Traced(*list, [&] {
                 UString page = LocalizedStrings::GetString(4325, 22);
                 page += Text(" 12");
                 SetFontData(GetIndVelaFont(4));
                 VelaDrawing::MoveTo(b.left, static_cast<short>(b.top - 20));
                 DrawString(Text("first"));
                 VelaDrawing::Move(40, 0);
                 DrawString(Text("right of it"));
                 VelaDrawing::MoveTo(b.left, static_cast<short>(b.top - 5));
                 DrawString(Text("below"));
                 int const width = LooseStringWidth(page, 0.0f, 1.0f);
                 VelaDrawing::MoveTo(static_cast<short>(b.right - width), static_cast<short>(b.top - 20));
                 DrawString(page);
             }));
    ASSERT_EQ(drawn.size(), expected.size() + 3) << "and three rows";
    EXPECT_EQ(Lines(drawn.begin(), drawn.begin() + 4), expected);
    Printed(*list, kEnd, 1);
}

TEST_F(GListPanePrintingTest, EachPageSaysWhetherThereIsAnother) {
    GListPane *const list = Printable(130);
    Printed(*list, kBegin, 1);
    EXPECT_TRUE(Printed(*list, kPage, 1));
    EXPECT_TRUE(Printed(*list, kPage, 2));
    EXPECT_FALSE(Printed(*list, kPage, 3));
    EXPECT_EQ(list->GetScrollPos(), 180);
    Printed(*list, kEnd, 3);
}

TEST_F(GListPanePrintingTest, PaperHasNeitherGroundsNorHighlightNorShadow) {
    GListPane *const list = Printable(10);
    list->SetSelRange(2, 2);
    Printed(*list, kBegin, 1);
    PrintMessageRec message = Message(kPage, 1);
    drawer.TakeRows();
    Lines const drawn = Traced(*list, [&] { list->PrintPage(&message); });
    for (char const *operation : {"EraseRect", "PaintRect", "DrawShadowLine", "Draw1Icon", "InvalRect"})
        EXPECT_TRUE(Only(operation, drawn).empty()) << operation;
    EXPECT_EQ(drawer.TakeRows()[2], "2*") << "the drawer hears of the selection all the same";
    Printed(*list, kEnd, 1);
}

TEST_F(GListPanePrintingTest, TheColorsOfPaperAreBlackOnWhite) {
    GListPane *const list = Printable(10);
    list->SaveSetup();
    list->Prepare();
    list->SetupColors();
    SaveColorRec colors;
    GetColors(&colors);
    EXPECT_EQ(colors, (SaveColorRec{{0, 0, 0}, {0xFFFF, 0xFFFF, 0xFFFF}}));
    list->RestoreSetup();
}

TEST_F(GListPanePrintingTest, AProtectedRowIsLeftOut) {
    GListPane *const list = Printable(5);
    list->Protect(1);
    Printed(*list, kBegin, 1);
    drawer.TakeRows();
    PrintMessageRec message = Message(kPage, 1);
    Lines const drawn = Traced(*list, [&] { list->PrintPage(&message); });
    EXPECT_EQ(drawer.TakeRows(), (Log{"0", "2", "3", "4"}));
    EXPECT_TRUE(Only("InvalRect", drawn).empty());
    Printed(*list, kEnd, 1);
}

TEST(GListPaneWithoutADesktop, HasNoPageFormatAndPrintsNothing) {
    GListPane list;
    list.SetLineHeight(16);
    list.SetNumItems(100);
    Rect box = {20, 30, 120, 230};
    list.SetBox(&box);
    PrintMessageRec message = {kPage, 1, {}};
    EXPECT_FALSE(list.Print(&message));
    EXPECT_EQ(list.GetScrollPos(), 0) << "nor is there a next page";
    message.kind = kBegin;
    message.page = 2;
    int const rows = list.GetNumDisplayed();
    EXPECT_TRUE(list.Print(&message));
    EXPECT_EQ(list.GetScrollPos(), rows);
    EXPECT_EQ(list.GetBounds(), box);
    EXPECT_EQ(list.GetLineHeight(), 16);
    EXPECT_EQ(list.GetNumDisplayed(), rows);
    message.kind = kEnd;
    EXPECT_FALSE(list.Print(&message));
    EXPECT_EQ(list.GetScrollPos(), 0);
    EXPECT_EQ(list.GetBounds(), box);
    EXPECT_EQ(list.GetLineHeight(), 16);
    EXPECT_EQ(list.GetNumDisplayed(), rows);
}

// Kept: lists look as on paper from the beginning on, also where there is none.
TEST(GListPaneWithoutADesktop, DrawsAsOnPaperUntilTheEnd) {
    GListPane list;
    list.SaveSetup();
    SimulatedDesktop desktop;
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(320, 200));
    glistResRec record = {
        glistResRec::kType, {20, 30, 120, 230}, 0, kListSelectOne, 16, 0, 0, 0, 0, false, 0, 0};
    GListPane *const other = GListPane::NewGListPane(glog, &record);
    SaveColorRec const paper = {{0, 0, 0}, {0xFFFF, 0xFFFF, 0xFFFF}};
    SaveColorRec colors;
    other->Prepare();
    other->SetupColors();
    GetColors(&colors);
    EXPECT_EQ(colors, paper);
    list.RestoreSetup();
    other->SetupColors();
    GetColors(&colors);
    EXPECT_FALSE(colors == paper);
}

// Misuse

TEST_F(GListPanePrintingTest, AnEndWithoutABeginChangesNothing) {
    GListPane *const list = Printable(100);
    list->SetScrollPosition(10);
    EXPECT_FALSE(Printed(*list, kEnd, 1));
    EXPECT_EQ(BoxOf(*list), ListBox());
    EXPECT_EQ(list->GetScrollPos(), 10);
    EXPECT_EQ(list->GetLineHeight(), 16);
}

TEST_F(GListPanePrintingTest, ASecondBeginKeepsWhatTheFirstOneKept) {
    GListPane *const list = Printable(100);
    list->SetScrollPosition(10);
    Printed(*list, kBegin, 1);
    Printed(*list, kBegin, 2);
    Printed(*list, kEnd, 1);
    EXPECT_EQ(BoxOf(*list), ListBox());
    EXPECT_EQ(list->GetScrollPos(), 10);
}

TEST_F(GListPanePrintingTest, AnotherListThatBeginsEndsTheFormerOne) {
    GListPane *const first = Printable(100), *const second = Printable(100);
    Printed(*first, kBegin, 1);
    Printed(*second, kBegin, 1);
    EXPECT_EQ(BoxOf(*first), ListBox());
    Printed(*first, kEnd, 1);
    EXPECT_EQ(BoxOf(*second), PageBox());
    Printed(*second, kEnd, 1);
    EXPECT_EQ(BoxOf(*second), ListBox());
}

TEST_F(GListPanePrintingTest, AListThatGoesWhileItPrintsLeavesOthersOnTheScreen) {
    GListPane *const first = Printable(100);
    GListPane *const second = Printable(100);
    Printed(*first, kBegin, 1);
    delete first;
    EXPECT_FALSE(Only("EraseRect", DrawingOf(*second)).empty());
}

TEST_F(GListPanePrintingTest, AnOffsetThatLeavesNoRoomForRowsIsOneEmptyPage) {
    glistResRec record = Record();
    record.firstLineOffset = 2000;
    GListPane *const list = Printable(100, record);
    Printed(*list, kBegin, 1);
    EXPECT_FALSE(Printed(*list, kPage, 1));
    Printed(*list, kEnd, 1);
    EXPECT_EQ(desktop.Print(glog, file), 1);
}

TEST_F(GListPanePrintingTest, PagesOutOfRangeHaveNoRowsOfTheList) {
    GListPane *const list = Printable(100);
    EXPECT_FALSE(list->ScrollToPage(std::numeric_limits<int>::max()));
    EXPECT_TRUE(list->ScrollToPage(std::numeric_limits<int>::min()));
    drawer.TakeRows();
    PrintMessageRec message = Message(kPage, 0);
    list->PrintPage(&message);
    EXPECT_EQ(drawer.TakeRows(), Log());
}
