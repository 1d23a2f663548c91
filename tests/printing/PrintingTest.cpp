#include "desktop/drawing/IconPixels.h"
#include "desktop/resources/Utf.h"
#include "host/CompoundPane.h"
#include "host/Icons.h"
#include "host/OSPath.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/TextLayout.h"
#include "tests/PaneTest.h"
#include "tests/printing/PdfReading.h"
#include "tests/printing/PrintProbe.h"
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

namespace {

typedef std::vector<std::string> Notes;

int const kMargin = 36;                                        // points
Rect const kA4 = {0, 0, 842 - 2 * kMargin, 595 - 2 * kMargin}; // what can be printed on

Notes &FreshNotes() {
    static Notes notes;
    notes.clear();
    return notes;
}

std::string ContentOf(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    std::stringstream text;
    text << file.rdbuf();
    return text.str();
}

void WriteOn(short v, char const *text) {
    VelaDrawing::MoveTo(20, v);
    DrawString(UString(text, UString::kByteEncoding1));
}

class PrintingTest : public PaneTest {
protected:
    PrintingTest() { Show(); }

    Notes &notes = FreshNotes();
    TemporaryDirectory directory;
    std::string const file = directory.Path() + "/list.pdf";

    PrintProbe *Probe(int pages) { return new PrintProbe(glog, pages, notes); }
    std::size_t Files() const {
        std::filesystem::directory_iterator const all(directory.Path());
        return static_cast<std::size_t>(std::distance(begin(all), end(all)));
    }
    std::string ErrorOf(std::string const &path) {
        try {
            desktop.Print(glog, path);
        } catch (std::runtime_error const &error) {
            return error.what();
        }
        return "";
    }
};

// Pages

TEST_F(PrintingTest, APaneIsStartedPrintedPageByPageAndEnded) {
    Probe(3);
    EXPECT_EQ(desktop.Print(glog, file), 3);
    EXPECT_EQ(notes, (Notes{"start 1", "page 1", "page 2", "page 3", "end 3"}));
    EXPECT_EQ(PdfReading::Pages(file), 3);
}

TEST_F(PrintingTest, TextOnThePagesCanBeRead) {
    Probe(2)->onPage = [](int page) { WriteOn(100, page == 1 ? "the first page" : "and the second"); };
    desktop.Print(glog, file);
    EXPECT_NE(PdfReading::Text(file, 1).find("the first page"), std::string::npos);
    EXPECT_EQ(PdfReading::Text(file, 1).find("second"), std::string::npos);
    EXPECT_NE(PdfReading::Text(file, 2).find("and the second"), std::string::npos);
}

TEST_F(PrintingTest, LettersOutsideOfAsciiCanBeReadToo) {
    Probe(1)->onPage = [](int) {
        VelaDrawing::MoveTo(20, 100);
        DrawString(Utf::FromUtf8("Größe, naïve, čaj"));
    };
    desktop.Print(glog, file);
    EXPECT_NE(PdfReading::Text(file, 1).find("Größe, naïve, čaj"), std::string::npos);
}

TEST_F(PrintingTest, APaneThatHasNothingIsEndedAllTheSame) {
    Probe(0);
    EXPECT_EQ(desktop.Print(glog, file), 0);
    EXPECT_EQ(notes, (Notes{"start 1", "end 0"}));
}

TEST_F(PrintingTest, WithNothingToPrintNoFileIsMade) {
    Probe(0);
    desktop.Print(glog, file);
    EXPECT_EQ(Files(), 0u);
}

TEST_F(PrintingTest, PagesOfSeveralPanesFollowEachOther) {
    Probe(2);
    Probe(1);
    EXPECT_EQ(desktop.Print(glog, file), 3);
    EXPECT_EQ(notes, (Notes{"start 1", "page 1", "page 2", "end 2", "start 1", "page 3", "end 3"}));
    EXPECT_EQ(PdfReading::Pages(file), 3);
}

TEST_F(PrintingTest, PanesInContainersPrintAndHiddenOnesDoNot) {
    CompoundPane *const container = new CompoundPane;
    container->CompoundPaneInit(glog, 0);
    container->Add(Probe(1), -1);
    PrintProbe *const hidden = Probe(1);
    container->Add(hidden, -1);
    hidden->SetVisibility(0);
    EXPECT_EQ(desktop.Print(glog, file), 1);
    container->SetVisibility(0);
    EXPECT_EQ(desktop.Print(glog, file), 0);
}

TEST_F(PrintingTest, OnePaneMayBePrintedWithoutTheOthers) {
    Probe(2);
    PrintProbe *const pane = Probe(1);
    EXPECT_EQ(desktop.Print(pane, file), 1);
    EXPECT_EQ(notes, (Notes{"start 1", "page 1", "end 1"}));
    EXPECT_EQ(PdfReading::Pages(file), 1);
}

TEST_F(PrintingTest, AWindowThatHasNotBeenShownPrints) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Title("Other"));
    new PrintProbe(other, 1, notes);
    EXPECT_EQ(desktop.Print(other, file), 1);
}

// Paper and header

TEST_F(PrintingTest, ThePaperIsA4) {
    Probe(1);
    desktop.Print(glog, file);
    EXPECT_EQ(PdfReading::Fact(file, "Page size"), "595 x 842 pts (A4)");
}

TEST_F(PrintingTest, OrLetter) {
    Rect page = {0, 0, 0, 0};
    Probe(1)->onPage = [&](int) { page = PageFormat::GetCurrentFormat(true)->GetPageRect(); };
    desktop.Print(glog, file, PrintOptions().Paper("Letter"));
    EXPECT_EQ(PdfReading::Fact(file, "Page size"), "612 x 792 pts (letter)");
    EXPECT_EQ(page, (Rect{0, 0, 720, 540}));
}

TEST_F(PrintingTest, OtherPapersAreUnknown) {
    Probe(1);
    EXPECT_THROW(desktop.Print(glog, file, PrintOptions().Paper("A3")), std::invalid_argument);
    EXPECT_TRUE(notes.empty());
}

TEST_F(PrintingTest, TheFormatIsKnownBeforeAJob) {
    ASSERT_NE(PageFormat::GetCurrentFormat(true), nullptr);
    EXPECT_EQ(PageFormat::GetCurrentFormat(true)->GetPageRect(), kA4);
    EXPECT_EQ(PageFormat::GetCurrentFormat(false), PageFormat::GetCurrentFormat(true));
}

TEST(PageFormatTest, WithoutADesktopThereIsNone) { EXPECT_EQ(PageFormat::GetCurrentFormat(true), nullptr); }

TEST_F(PrintingTest, TheHeaderIsTheWindowsTitle) {
    glogRec *const titled = desktop.NewGlog(GlogOptions().Title("Spüren"));
    PrintProbe *const pane = new PrintProbe(titled, 1, notes);
    desktop.Print(titled, file);
    EXPECT_EQ(pane->header[0], Utf::FromUtf8("Spüren"));
    EXPECT_TRUE(pane->header[1].empty());
    EXPECT_TRUE(pane->header[2].empty());
    EXPECT_EQ(PdfReading::Fact(file, "Title"), "Spüren");
}

TEST_F(PrintingTest, AHeaderThatIsGivenIsHandedOn) {
    PrintProbe *const pane = Probe(1);
    desktop.Print(glog, file, PrintOptions().Header("Song", "Take 2", "Bar"));
    EXPECT_EQ(pane->header[0], Text("Song"));
    EXPECT_EQ(pane->header[1], Text("Take 2"));
    EXPECT_EQ(pane->header[2], Text("Bar"));
}

TEST_F(PrintingTest, ATitleThatIsNoTextDoesNotSpoilTheJob) {
    Probe(1);
    EXPECT_EQ(desktop.Print(glog, file, PrintOptions().Header("broken \xFF\xC3", "", "")), 1);
    EXPECT_EQ(PdfReading::Fact(file, "Title"), "broken \xEF\xBF\xBD\xEF\xBF\xBD");
}

// Where drawing goes

Rect ClipBounds() {
    OSRgn clip;
    VelaDrawing::GetClip(&clip);
    return CarbonUtils::GetRgnBounds(&clip);
}

TEST_F(PrintingTest, WhatThePanePreparesIsThePage) {
    PrintProbe *const pane = Probe(1);
    Rect clip = {0, 0, 0, 0};
    OSPort *port = nullptr;
    pane->onPage = [&](int) {
        pane->Prepare();
        clip = ClipBounds();
        port = OSPort::GetCurrent();
    };
    desktop.Print(glog, file);
    EXPECT_EQ(clip, kA4);
    EXPECT_NE(port, glog->GetPort());
    pane->Prepare();
    EXPECT_EQ(OSPort::GetCurrent(), glog->GetPort());
    EXPECT_EQ(ClipBounds(), BoxOf(*pane));
}

TEST_F(PrintingTest, ThePageIsCurrentWithoutPreparingAnything) {
    Rect clip = {0, 0, 0, 0};
    Probe(1)->onPage = [&](int) { clip = ClipBounds(); };
    desktop.Print(glog, file);
    EXPECT_EQ(clip, kA4);
}

TEST_F(PrintingTest, OtherPanesStayInTheirWindow) {
    PrintProbe *const other = Probe(0);
    OSPort *port = nullptr;
    Probe(1)->onPage = [&](int) {
        other->Prepare();
        port = OSPort::GetCurrent();
    };
    desktop.Print(glog, file);
    EXPECT_EQ(port, glog->GetPort());
}

TEST_F(PrintingTest, EveryPageBeginsPlain) {
    Notes colors;
    Probe(2)->onPage = [&](int) {
        SaveColorRec now;
        GetColors(&now);
        colors.push_back(now.fore.red == 0 && now.back.red == 0xFFFF ? "black on white" : "tinted");
        GrayForeColor(50);
    };
    desktop.Print(glog, file);
    EXPECT_EQ(colors, (Notes{"black on white", "black on white"}));
}

TEST_F(PrintingTest, NothingOfItShowsInTheWindow) {
    PrintProbe *const pane = Probe(1);
    UpdateGlog(glog);
    desktop.TakePresented(glog);
    pane->onPage = [&](int) {
        pane->Prepare();
        Rect const all = {0, 0, 700, 500};
        VelaDrawing::PaintRect(&all);
        VelaDrawing::InvalRect(&all);
    };
    desktop.Print(glog, file);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(PrintingTest, WhatWasCurrentBeforeIsCurrentAfterwards) {
    PrintProbe *const pane = Probe(1);
    pane->Prepare();
    VelaDrawing::MoveTo(17, 18);
    desktop.Print(glog, file);
    Point pen{0, 0};
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(OSPort::GetCurrent(), glog->GetPort());
    EXPECT_EQ(pen, (Point{18, 17}));
}

// What it looks like on paper

int const kFineness = 3; // pixels to a point

class PrintedPicture : public PrintingTest {
protected:
    std::unique_ptr<Surface> Draw(std::function<void()> const &draw) {
        Probe(1)->onPage = [&](int) { draw(); };
        desktop.Print(glog, file);
        std::unique_ptr<Surface> picture = PdfReading::Picture(file, kFineness);
        if (!picture)
            throw std::runtime_error("the page has no picture");
        return picture;
    }
    // The pixel at a place of the page, in pixels to a point: 0xRRGGBB.
    static std::uint32_t At(Surface const &picture, double h, double v) {
        auto const place = [](double c) { return static_cast<int>((c + kMargin) * kFineness); };
        return picture.Row(place(v))[place(h)] & 0xFFFFFF;
    }
};

std::uint32_t const kWhite = 0xFFFFFF, kBlack = 0;

TEST_F(PrintedPicture, RectanglesHaveSharpEdges) {
    auto const picture = Draw([] {
        Rect const r = {20, 10, 40, 30};
        VelaDrawing::PaintRect(&r);
    });
    EXPECT_EQ(At(*picture, 10, 20), kBlack);
    EXPECT_EQ(At(*picture, 29.9, 39.9), kBlack);
    EXPECT_EQ(At(*picture, 9.9, 25), kWhite);
    EXPECT_EQ(At(*picture, 30, 25), kWhite);
    EXPECT_EQ(At(*picture, 15, 19.9), kWhite);
    EXPECT_EQ(At(*picture, 15, 40), kWhite);
}

TEST_F(PrintedPicture, TheClipCounts) {
    auto const picture = Draw([] {
        Rect const r = {20, 10, 40, 30};
        WithClipRect const clip({15.0, 25.0, 5.0, 5.0});
        VelaDrawing::PaintRect(&r);
    });
    EXPECT_EQ(At(*picture, 16, 26), kBlack);
    EXPECT_EQ(At(*picture, 14, 26), kWhite);
    EXPECT_EQ(At(*picture, 21, 26), kWhite);
    EXPECT_EQ(At(*picture, 16, 31), kWhite);
}

TEST_F(PrintedPicture, NothingLeavesThePrintablePart) {
    auto const picture = Draw([] {
        Rect const r = {-100, -100, 1000, 1000};
        VelaDrawing::PaintRect(&r);
    });
    EXPECT_EQ(At(*picture, -1, 100), kWhite);
    EXPECT_EQ(At(*picture, 0, 0), kBlack);
    EXPECT_EQ(At(*picture, kA4.right - 1, kA4.bottom - 1), kBlack);
    EXPECT_EQ(At(*picture, kA4.right, 100), kWhite);
}

TEST_F(PrintedPicture, LinesAndFramesAreOnePointWide) {
    auto const picture = Draw([] {
        VelaDrawing::MoveTo(10, 20);
        VelaDrawing::LineTo(30, 20);
        Rect const r = {40, 10, 60, 30};
        VelaDrawing::FrameRect(&r);
    });
    EXPECT_EQ(At(*picture, 20, 20.5), kBlack);
    EXPECT_EQ(At(*picture, 20, 21), kWhite);
    EXPECT_EQ(At(*picture, 10.5, 50), kBlack);
    EXPECT_EQ(At(*picture, 11, 50), kWhite);
    EXPECT_EQ(At(*picture, 29.5, 50), kBlack);
}

TEST_F(PrintedPicture, CurvesAreSmooth) {
    auto const picture = Draw([] {
        OSPort::Current().PaintOval({10, 10, 40, 40});
        OSPort::Current().PaintRoundRect({60, 10, 40, 40}, OS::Size(20, 20));
    });
    EXPECT_EQ(At(*picture, 30, 30), kBlack);
    EXPECT_EQ(At(*picture, 11, 11), kWhite);
    EXPECT_EQ(At(*picture, 80, 30), kBlack);
    EXPECT_EQ(At(*picture, 60.5, 10.5), kWhite);
    EXPECT_EQ(PdfReading::OutputOf("pdfimages -list '" + file + "' | wc -l"), "2\n")
        << "shapes became images";
}

TEST_F(PrintedPicture, APathNarrowsTheClip) {
    auto const picture = Draw([] {
        OSPath triangle;
        triangle.CreateSubpath(10, 10);
        triangle.AddLine(50, 10);
        triangle.AddLine(10, 50);
        triangle.CloseSubpath();
        WithSaveGraphicsState const saved(OSPort::Current(), 0);
        OSPort::Current().NarrowClipPath(triangle);
        Rect const r = {0, 0, 60, 60};
        VelaDrawing::PaintRect(&r);
    });
    EXPECT_EQ(At(*picture, 20, 20), kBlack);
    EXPECT_EQ(At(*picture, 45, 45), kWhite);
    EXPECT_EQ(At(*picture, 5, 20), kWhite);
}

TEST_F(PrintedPicture, IconsComeInTheirFinestPixels) {
    auto const picture = Draw([] { Draw1Icon(1002, 4, 10, 20); });
    IconPixels const icon = CopyIconPixels(1002, 4, DeviceScale(kFineness));
    std::istringstream facts(PdfReading::OutputOf("pdfimages -list '" + file + "' | sed -n 3p"));
    std::string page, number, type, color, components, bits, encoding, interpolated, object, generation;
    int width = 0, height = 0, pixelsPerInch = 0;
    facts >> page >> number >> type >> width >> height >> color >> components >> bits >> encoding >>
        interpolated >> object >> generation >> pixelsPerInch;
    EXPECT_EQ(width, icon.width);
    EXPECT_EQ(height, icon.height);
    EXPECT_EQ(pixelsPerInch, 72 * kFineness);
    // A plain part of its ground.
    int const x = 8, y = 12;
    EXPECT_EQ(At(*picture, 10 + x / 3.0, 20 + y / 3.0),
              icon.pixels[static_cast<std::size_t>(y * icon.width + x)] & 0xFFFFFF);
}

TEST_F(PrintedPicture, TilesFillTheirRectangle) {
    auto const picture = Draw([] {
        Rect const r = {20, 10, 34, 58};
        TileIcon(&r, 1000, 40, 16, 14);
    });
    EXPECT_NE(At(*picture, 11, 27), kWhite);
    EXPECT_EQ(At(*picture, 11, 27), At(*picture, 27, 27));
    EXPECT_EQ(At(*picture, 11, 27), At(*picture, 43, 27));
    EXPECT_EQ(At(*picture, 59, 27), kWhite);
}

TEST_F(PrintedPicture, WhatIsDisabledIsFaded) {
    auto const picture = Draw([] {
        Draw1Icon(1000, 61, 10, 20);
        GrayForeColor(50);
        Draw1Icon(1000, 61, 200, 20);
    });
    // The bar of the list that the icon shows.
    auto const brightness = [&](double h) { return At(*picture, h + 8.5, 28) & 0xFF; };
    EXPECT_LT(brightness(10), 0x50u);
    EXPECT_GT(brightness(200), 0x80u);
    EXPECT_LT(brightness(200), 0xF0u);
}

TEST_F(PrintedPicture, DarkeningDarkens) {
    auto const picture = Draw([] {
        Rect const r = {20, 10, 40, 30}, half = {20, 20, 40, 40};
        VelaDrawing::PaintRect(&r);
        WithDarkenDrawMode const darker(50, nullptr, WithDarkenDrawMode::Mode(0));
        VelaDrawing::PaintRect(&half);
    });
    EXPECT_EQ(At(*picture, 25, 30), kBlack);
    EXPECT_NEAR(static_cast<int>(At(*picture, 35, 30) & 0xFF), 127, 2);
}

// When something goes wrong

TEST_F(PrintingTest, AFolderThatDoesNotExistIsAnErrorThatSaysSo) {
    Probe(1);
    EXPECT_EQ(ErrorOf("/nowhere/a.pdf"), "cannot write /nowhere/a.pdf: No such file or directory");
}

TEST_F(PrintingTest, AFolderIsNoFile) {
    Probe(1);
    EXPECT_EQ(ErrorOf(directory.Path()), "cannot write " + directory.Path() + ": Is a directory");
}

TEST_F(PrintingTest, AFullDiskIsAnErrorThatSaysSo) {
    Probe(2);
    EXPECT_EQ(ErrorOf("/dev/full"), "cannot write /dev/full: No space left on device");
}

TEST_F(PrintingTest, APaneThatFailsLeavesAnOlderFileAsItWas) {
    std::ofstream(file) << "older";
    Probe(3)->onPage = [](int page) {
        if (page == 2)
            throw std::runtime_error("out of ink");
    };
    EXPECT_EQ(ErrorOf(file), "out of ink");
    EXPECT_EQ(ContentOf(file), "older");
    EXPECT_EQ(Files(), 1u);
    EXPECT_EQ(notes, (Notes{"start 1", "page 1", "page 2", "end 2"}));
}

TEST_F(PrintingTest, AfterAFailureTheNextJobPrints) {
    PrintProbe *const pane = Probe(1);
    pane->onPage = [](int) { throw std::runtime_error("out of ink"); };
    EXPECT_EQ(ErrorOf(file), "out of ink");
    pane->onPage = nullptr;
    EXPECT_EQ(desktop.Print(glog, file), 1);
    EXPECT_EQ(PageFormat::GetCurrentFormat(true)->GetPageRect(), kA4);
}

TEST_F(PrintingTest, AnOlderFileIsReplacedAndKeepsItsPermissions) {
    std::ofstream(file) << "older";
    std::filesystem::permissions(file, std::filesystem::perms(0604));
    Probe(1);
    desktop.Print(glog, file);
    EXPECT_EQ(PdfReading::Pages(file), 1);
    EXPECT_EQ(std::filesystem::status(file).permissions(), std::filesystem::perms(0604));
    EXPECT_EQ(Files(), 1u);
}

TEST_F(PrintingTest, ALinkStaysOne) {
    std::string const link = directory.Path() + "/link.pdf";
    std::ofstream(file) << "older";
    std::filesystem::create_symlink(file, link);
    Probe(1);
    desktop.Print(glog, link);
    EXPECT_TRUE(std::filesystem::is_symlink(link));
    EXPECT_EQ(PdfReading::Pages(file), 1);
}

TEST_F(PrintingTest, OneJobAtATime) {
    Probe(1)->onPage = [&](int) {
        EXPECT_THROW(desktop.Print(glog, directory.Path() + "/other.pdf"), std::logic_error);
    };
    EXPECT_EQ(desktop.Print(glog, file), 1);
    EXPECT_EQ(Files(), 1u);
}

TEST_F(PrintingTest, APaneMayBeDeletedWhileItPrints) {
    PrintProbe *const pane = Probe(3);
    Probe(1);
    pane->onPage = [pane](int) { delete pane; };
    EXPECT_EQ(desktop.Print(glog, file), 2);
    EXPECT_EQ(PdfReading::Pages(file), 2);
}

// Scripts

TEST_F(PrintingTest, AScriptPrintsTheWindow) {
    Probe(2)->onPage = [](int) { WriteOn(100, "from a script"); };
    desktop.Play("print " + file);
    EXPECT_EQ(PdfReading::Pages(file), 2);
    EXPECT_NE(PdfReading::Text(file, 2).find("from a script"), std::string::npos);
}

std::string ScriptErrorOf(SimulatedDesktop &desktop, std::string const &steps) {
    try {
        desktop.Play(steps);
    } catch (ScriptError const &error) {
        return error.what();
    }
    return "";
}

TEST_F(PrintingTest, AScriptInAWindowThatPrintsNothingFails) {
    EXPECT_EQ(ScriptErrorOf(desktop, "\nprint " + file), "script:2: nothing in the window prints");
}

TEST_F(PrintingTest, AScriptsErrorNamesTheLine) {
    Probe(1);
    EXPECT_EQ(ScriptErrorOf(desktop, "\n\nprint /nowhere/a.pdf"),
              "script:3: cannot write /nowhere/a.pdf: No such file or directory");
}

} // namespace
