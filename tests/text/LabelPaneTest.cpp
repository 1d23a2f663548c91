#include "text/LabelPane.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/type/FontFamilies.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/TarnError.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include "tests/text/WatchedItem.h"
#include <type_traits>

namespace {

// Metrics that make all arithmetic plain: 10 above the baseline, 4 below it.
TarnQuickDrawText::FontInfo const kPlainMetrics = {10, 4, 20, 0};
short const kPlainWidth = 50;

// A label with those metrics and with its protected operations open.
class ProbeLabel : public LabelPane {
public:
    explicit ProbeLabel(glogRec *owner) {
        ForceFontInfo(kPlainMetrics);
        ForceStringWidth(kPlainWidth);
        LabelPaneInit(owner, 0, UString("Level", UString::kByteEncoding1));
    }
    using LabelPane::_GetFontInfoMethod;
    using LabelPane::_StringWidthMethod;
    using LabelPane::DrawGuts;
    using LabelPane::GetTextOrigin;
    using LabelPane::HandleClick;
    using LabelPane::SetFont;
    using LabelPane::SetPortStyle;
    using LabelPane::SetTextOrigin;

    void Inval() override {
        invalidated.push_back(BoxNow());
        LabelPane::Inval();
    }
    Rect BoxNow() {
        Rect box;
        GetBox(&box);
        return box;
    }
    std::vector<Rect> invalidated;
};

// The base class with its own box rule, which keeps the top left corner.
class PlainLabel : public LabelPaneImplementation {
public:
    explicit PlainLabel(glogRec *owner) {
        ForceFontInfo(kPlainMetrics);
        ForceStringWidth(kPlainWidth);
        LabelPaneImplementationInit(owner, 7, UString("Level", UString::kByteEncoding1));
    }
    using LabelPaneImplementation::DrawGuts;
    using LabelPaneImplementation::GetTextOrigin;
    void DontMakeConcrete() override {}
};

class Label : public PaneTest {
protected:
    Label()
        : label(new ProbeLabel(glog)) {}

    // The calls of a drawing of the text at that pen start.
    Lines Expected(Point origin, RGBColor const &color, char const *text = "Level", int width = kPlainWidth,
                   TextSettings::TruncateCode truncation = TextSettings::kTruncateNone) {
        return Traced(*label, [&] {
            SetForegroundColor(color);
            DrawStringAtPoint(Text(text), origin, width, truncation);
        });
    }

    // What is drawn, less the calls that set up the font.
    Lines Drawn() {
        Lines drawn;
        for (std::string const &line : DrawingOf(*label))
            if (line.find("\"op\":\"Text") == std::string::npos)
                drawn.push_back(line);
        return drawn;
    }

    // The width and ascent and descent that the font of the index gives.
    struct Measures {
        int width, ascent, descent;
    };
    Measures Measure(int font, char const *text) {
        SetPortToGlog(glog);
        SaveTextState const saver;
        SetFontData(GetIndVelaFont(font));
        TarnQuickDrawText::FontInfo info;
        tarn::GetFontInfo(info);
        return {LooseStringWidth(Text(text), 0.0f, 1.0f), info.ascent, info.descent};
    }

    // A family that is not the one of dialog text.
    static OS::Font::FamilyID OtherFamily() { return FontFamilies::Named("Another"); }

    ProbeLabel *label;
};

} // namespace

// Attachment

TEST_F(Label, TheImplementationAloneCannotBeMade) {
    static_assert(std::is_abstract<LabelPaneImplementation>::value, "only with an empty hook");
    static_assert(!std::is_abstract<LabelPane>::value, "the pane to use");
    static_assert(std::is_base_of<GlogPane, LabelPaneImplementation>::value, "one base");
}

TEST_F(Label, TheHookThatKeepsTheImplementationFromBeingMadeStandsBehindThoseOfThePane) {
    std::size_t const kPrivateHooks = 2; // of the pane, behind its drawing
    std::size_t const drawing = PlaceOf(&Opened<PlainLabel>::DrawGuts);
    EXPECT_EQ(PlaceOf(&PlainLabel::DontMakeConcrete), drawing + kPrivateHooks + 1);
}

TEST_F(Label, IsAttachedUnderItsNumberWithItsTextMeasured) {
    LabelPane *const other = new LabelPane;
    EXPECT_EQ(other->LabelPaneInit(glog, 12, Text("Gain")), other);
    EXPECT_EQ(other->GetID(), 12);
    EXPECT_EQ(GetGlogItem(glog, 12), other);
    EXPECT_EQ(BoxOf(*other).right, Measure(0, "Gain").width);
}

TEST_F(Label, CannotBeAttachedToNoGlog) {
    LabelPane loose;
    EXPECT_EQ(loose.LabelPaneInit(nullptr, 1, Text("Gain")), nullptr);
    gStringResRec record = {};
    EXPECT_EQ(loose.LabelPaneResInit(nullptr, &record), nullptr);
}

TEST_F(Label, StartsWithTheTopOfItsTextAtZero) {
    EXPECT_EQ(label->GetOrigin(), (Point{0, 0}));
    EXPECT_EQ(label->GetFontFSRID(), -1);
    EXPECT_EQ(label->BoxNow(), (Rect{0, 0, 14, 50}));
    EXPECT_EQ(label->GetTextOrigin(), (Point{10, 0}));
}

// The box of the base class

TEST_F(Label, TheImplementationSizesItsBoxFromTheTopLeftCorner) {
    PlainLabel *const plain = new PlainLabel(glog);
    EXPECT_EQ(BoxOf(*plain), (Rect{0, 0, 14, 50}));
    EXPECT_EQ(plain->GetTextOrigin(), (Point{10, 0}));
}

TEST_F(Label, TheImplementationKeepsOnlyTheCornerOfABox) {
    PlainLabel *const plain = new PlainLabel(glog);
    Rect box = {20, 30, 200, 300};
    plain->SetBox(&box);
    EXPECT_EQ(BoxOf(*plain), (Rect{20, 30, 34, 80}));
    EXPECT_EQ(plain->GetTextOrigin(), (Point{30, 30}));
}

TEST_F(Label, TheImplementationPutsExtraPixelsRoundTheText) {
    PlainLabel *const plain = new PlainLabel(glog);
    Rect box = {20, 30, 0, 0};
    plain->SetExtraWidth(5);
    plain->SetExtraHeight(7);
    plain->SetBox(&box);
    EXPECT_EQ(BoxOf(*plain), (Rect{20, 30, 20 + 7 + 14, 30 + 2 + 50 + 3}));
    EXPECT_EQ(plain->GetTextOrigin(), (Point{20 + 10 + 3, 30 + 2}));
}

TEST_F(Label, TheImplementationHalvesNegativeExtrasDownward) {
    PlainLabel *const plain = new PlainLabel(glog);
    Rect box = {20, 30, 0, 0};
    plain->SetExtraWidth(-5);
    plain->SetExtraHeight(-7);
    plain->SetBox(&box);
    EXPECT_EQ(BoxOf(*plain), (Rect{20, 30, 20 - 7 + 14, 30 - 3 + 50 - 2}));
    EXPECT_EQ(plain->GetTextOrigin(), (Point{20 + 10 - 4, 30 - 3}));
}

// The box from the anchor

TEST_F(Label, HangsItsBoxOnTheAnchorAsTheOptionsSay) {
    label->SetOrigin({100, 200});
    struct Case {
        short hOption, vOption, left, baseline;
    } const cases[] = {{0, 1, 200, 110},  {-1, 1, 150, 110}, {1, 1, 175, 110}, {2, 1, 200, 110},
                       {-2, 1, 200, 110}, {0, 2, 200, 96},   {0, 0, 200, 100}, {0, 3, 200, 100},
                       {0, -1, 200, 100}, {-1, 2, 150, 96}};
    for (Case const &c : cases) {
        label->SetHOption(c.hOption);
        label->SetVOption(c.vOption);
        Rect const box = {static_cast<short>(c.baseline - 10), c.left, static_cast<short>(c.baseline + 4),
                          static_cast<short>(c.left + 50)};
        EXPECT_EQ(label->BoxNow(), box) << c.hOption << ", " << c.vOption;
        EXPECT_EQ(label->GetTextOrigin(), (Point{c.baseline, c.left})) << c.hOption << ", " << c.vOption;
    }
}

TEST_F(Label, CentresAnOddWidthRoundingTowardZero) {
    label->SetOrigin({0, 100});
    label->SetHOption(1);
    label->ForceStringWidth(51);
    label->CalcBox();
    EXPECT_EQ(label->BoxNow().left, 75);
    EXPECT_EQ(label->BoxNow().right, 126);
}

TEST_F(Label, AWidthBeyondSixteenBitsWraps) {
    label->ForgetForcedStringWidth();
    label->SetOrigin({0, 100});
    label->SetHOption(1);
    std::string text(4000, 'W');
    bool sawOddNegative = false;
    for (int i = 0; i < 4; ++i, text += 'l') {
        label->SetText(Text(text.c_str()));
        short const width = static_cast<short>(Measure(0, text.c_str()).width);
        sawOddNegative |= width < 0 && width % 2 != 0;
        EXPECT_EQ(label->BoxNow().left, static_cast<short>(100 - width / 2)) << width;
    }
    EXPECT_TRUE(sawOddNegative);
}

TEST_F(Label, EndsAtItsAnchorWithTheBottomOption) {
    label->SetVOption(2);
    label->SetOrigin({100, 0});
    EXPECT_EQ(label->BoxNow().bottom, 100);
    label->SetExtraHeight(7);
    label->CalcBox();
    EXPECT_EQ(label->BoxNow().bottom, 104);
    EXPECT_EQ(label->BoxNow().top, 100 - 14 - 3);
}

TEST_F(Label, GrowsTwoToTheLeftAndThreeToTheRightWithAnExtraWidthOfFive) {
    label->SetOrigin({0, 100});
    label->SetExtraWidth(5);
    label->CalcBox();
    EXPECT_EQ(label->BoxNow().left, 98);
    EXPECT_EQ(label->BoxNow().right, 153);
    EXPECT_EQ(label->GetTextOrigin().h, 100);
}

TEST_F(Label, HalvesNegativeExtrasDownward) {
    label->SetOrigin({100, 100});
    label->SetExtraWidth(-5);
    label->SetExtraHeight(-5);
    label->CalcBox();
    EXPECT_EQ(label->BoxNow(), (Rect{103, 103, 112, 148}));
}

TEST_F(Label, ExtrasWrapBeforeTheyAreHalved) {
    label->SetExtraWidth(32767);
    label->SetExtraHeight(32767);
    label->CalcBox();
    EXPECT_EQ(label->BoxNow(), (Rect{-16383, -16383, 14 - 16384, 50 - 16384}));
    PlainLabel *const plain = new PlainLabel(glog);
    plain->SetExtraWidth(32767);
    plain->CalcBox();
    EXPECT_EQ(BoxOf(*plain).right, 16383 + 50 - 16384);
}

TEST_F(Label, ExtrasWaitForTheNextMeasuring) {
    Rect const before = label->BoxNow();
    label->SetExtraWidth(5);
    label->SetExtraHeight(7);
    EXPECT_EQ(label->BoxNow(), before);
    EXPECT_EQ(label->GetExtraWidth(), 5);
    EXPECT_EQ(label->GetExtraHeight(), 7);
    label->SetOrigin({0, 0});
    EXPECT_FALSE(label->BoxNow() == before);
}

TEST_F(Label, CoordinatesWrapAtSixteenBits) {
    label->SetOrigin({32760, 32740});
    EXPECT_EQ(label->BoxNow(), (Rect{32760, 32740, -32762, -32746}));
    EXPECT_EQ(label->GetTextOrigin(), (Point{-32766, 32740}));
}

TEST_F(Label, SetBoxMovesTheAnchorByAsMuchAsTheCorner) {
    label->SetOrigin({100, 200});
    label->SetVOption(0);
    Rect box = {95, 207, 500, 500};
    label->SetBox(&box);
    EXPECT_EQ(label->GetOrigin(), (Point{105, 207}));
    EXPECT_EQ(label->BoxNow(), (Rect{95, 207, 109, 257}));
    EXPECT_EQ(label->GetTextOrigin(), (Point{105, 207}));
}

TEST_F(Label, OffsetMovesBoxAndAnchorAndTheTextFollowsAtTheNextCalcBox) {
    label->SetOrigin({100, 200});
    label->Offset({3, -4});
    EXPECT_EQ(label->GetOrigin(), (Point{103, 196}));
    EXPECT_EQ(label->BoxNow(), (Rect{103, 196, 117, 246}));
    EXPECT_EQ(label->GetTextOrigin(), (Point{110, 200}));
    label->CalcBox();
    EXPECT_EQ(label->BoxNow(), (Rect{103, 196, 117, 246}));
    EXPECT_EQ(label->GetTextOrigin(), (Point{113, 196}));
}

// Measuring

TEST_F(Label, AForcedWidthOfZeroIsForced) {
    label->ForceStringWidth(0);
    EXPECT_EQ(label->_StringWidthMethod(), 0);
}

TEST_F(Label, ANegativeForcedWidthMeasures) {
    label->ForceStringWidth(-5);
    EXPECT_EQ(label->_StringWidthMethod(), Measure(0, "Level").width);
}

TEST_F(Label, ForgettingTheForcedWidthMeasures) {
    label->ForgetForcedStringWidth();
    EXPECT_EQ(label->_StringWidthMethod(), Measure(0, "Level").width);
}

TEST_F(Label, ForcingWaitsForTheNextMeasuring) {
    label->ForceStringWidth(30);
    EXPECT_EQ(label->BoxNow().right, 50);
    label->CalcBox();
    EXPECT_EQ(label->BoxNow().right, 30);
}

TEST_F(Label, ForcedMetricsWithoutMaximumWidthForceNothing) {
    Measures const font = Measure(0, "Level");
    label->ForceFontInfo({99, 98, 0, 97});
    TarnQuickDrawText::FontInfo info;
    label->_GetFontInfoMethod(&info);
    EXPECT_EQ(info.ascent, font.ascent);
    EXPECT_EQ(info.descent, font.descent);
}

TEST_F(Label, ForgettingForcedMetricsMeasures) {
    label->ForgetForcedFontInfo();
    TarnQuickDrawText::FontInfo info;
    label->_GetFontInfoMethod(&info);
    EXPECT_EQ(info.ascent, Measure(0, "Level").ascent);
}

TEST_F(Label, ANegativeMaximumWidthForcesToo) {
    label->ForceFontInfo({9, 3, -1, 2});
    TarnQuickDrawText::FontInfo info;
    label->_GetFontInfoMethod(&info);
    EXPECT_EQ(info.ascent, 9);
    EXPECT_EQ(info.descent, 3);
    EXPECT_EQ(info.leading, 2);
}

TEST_F(Label, MeasuresWithItsOwnFontInAPortThatHasAnother) {
    label->ForgetForcedStringWidth();
    label->ForgetForcedFontInfo();
    SetPortToGlog(glog);
    SetFontData(GetIndVelaFont(9));
    label->CalcBox();
    Measures const font = Measure(0, "Level");
    EXPECT_EQ(label->BoxNow(),
              (Rect{0, 0, static_cast<short>(font.ascent + font.descent), static_cast<short>(font.width)}));
}

TEST_F(Label, MeasuringTheWidthLeavesThePortAsItWas) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(50, 50));
    SetPortToGlog(other);
    label->CalcBox();
    OSPort *port = nullptr;
    VelaDrawing::GetPort(&port);
    EXPECT_EQ(port, other->GetPort());
}

TEST_F(Label, MeasuresTheWidthInThePortOfItsGlog) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(50, 50));
    SetPortToGlog(other);
    SetFontData(GetIndVelaFont(9));
    label->ForgetForcedStringWidth();
    label->CalcBox();
    EXPECT_EQ(VelaDrawing::GetPortTextSize(other->GetPort()), GetIndVelaFont(9)->size);
}

// Text and font

TEST_F(Label, SetTextMeasuresAndRepaintsNothing) {
    label->ForgetForcedStringWidth();
    Show();
    label->SetText(Text("A longer text"));
    EXPECT_EQ(label->BoxNow().right, Measure(0, "A longer text").width);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(Label, SetTextWithInvalRepaintsTheFormerAndTheNewBox) {
    label->ForgetForcedStringWidth();
    Rect const former = label->BoxNow();
    label->SetTextWithInval(Text("A longer text"));
    EXPECT_EQ(label->invalidated, (std::vector<Rect>{former, label->BoxNow()}));
    EXPECT_FALSE(former == label->BoxNow());
}

TEST_F(Label, SetTextWithInvalRepaintsOnceAfterAnEmptyText) {
    label->SetText(UString());
    label->SetTextWithInval(Text("Gain"));
    EXPECT_EQ(label->invalidated.size(), 1u);
}

TEST_F(Label, SetTextWithInvalRepaintsTwiceBeforeAnEmptyText) {
    label->SetTextWithInval(UString());
    EXPECT_EQ(label->invalidated.size(), 2u);
}

TEST_F(Label, SetTextWithInvalOfTheSameTextDoesNothing) {
    label->ForceStringWidth(30);
    label->SetTextWithInval(Text("Level"));
    EXPECT_TRUE(label->invalidated.empty());
    EXPECT_EQ(label->BoxNow().right, 50);
}

TEST_F(Label, SetFaceAndSetSizeMeasureAndRepaintNothing) {
    label->ForgetForcedStringWidth();
    label->ForgetForcedFontInfo();
    label->CalcBox();
    Rect const plain = label->BoxNow();
    Show();
    label->SetSize(24);
    EXPECT_GT(label->BoxNow().right, plain.right);
    EXPECT_GT(label->BoxNow().bottom, plain.bottom);
    short const right = label->BoxNow().right;
    label->SetFace(1);
    EXPECT_NE(label->BoxNow().right, right);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(Label, SetFontMeasuresOnlyWhenSomethingChanges) {
    fontSaveRec font = *GetIndVelaFont(0);
    font.face = 0;
    font.size = 12;
    label->SetFont(font);
    label->ForceStringWidth(30);
    label->SetFont(font);
    EXPECT_EQ(label->BoxNow().right, 50);
    font.size = 13;
    label->SetFont(font);
    EXPECT_EQ(label->BoxNow().right, 30);
    label->ForceStringWidth(31);
    font.face = 1;
    label->SetFont(font);
    EXPECT_EQ(label->BoxNow().right, 31);
}

TEST_F(Label, AnotherFamilyAloneIsAChangeOfFont) {
    fontSaveRec font = *GetIndVelaFont(0);
    label->SetFont(font);
    fontSaveRec const other = {OtherFamily(), font.face, font.size};
    ASSERT_NE(other.family.GetOrderedFontID(), font.family.GetOrderedFontID());
    label->ForceStringWidth(30);
    label->SetFont(other);
    EXPECT_EQ(label->BoxNow().right, 30);
}

TEST_F(Label, SetFontFSRIDTakesTheFontOfTheTable) {
    label->ForgetForcedStringWidth();
    label->ForgetForcedFontInfo();
    Show();
    label->SetFontFSRID(9);
    EXPECT_TRUE(Repainted().empty());
    EXPECT_EQ(label->GetFontFSRID(), 9);
    Measures const font = Measure(9, "Level");
    EXPECT_EQ(label->BoxNow(),
              (Rect{0, 0, static_cast<short>(font.ascent + font.descent), static_cast<short>(font.width)}));
}

TEST_F(Label, SettersOfAnchorAndOptionsRepaintNothing) {
    Show();
    label->SetOrigin({25, 65});
    label->SetHOption(1);
    label->SetVOption(2);
    EXPECT_FALSE(label->BoxNow() == (Rect{0, 0, 14, 50}));
    EXPECT_TRUE(Repainted().empty());
    label->Inval(); // so that the absence of damage means something
    EXPECT_EQ(Repainted(), std::vector<Rect>{label->BoxNow()});
}

TEST_F(Label, SettersOfAnchorAndOptionsMoveTheBoxAtOnce) {
    label->SetHOption(-1);
    EXPECT_EQ(label->BoxNow().right, 0);
    label->SetVOption(2);
    EXPECT_EQ(label->BoxNow().bottom, 0);
    label->SetOrigin({7, 8});
    EXPECT_EQ(label->BoxNow().right, 8);
    EXPECT_EQ(label->BoxNow().bottom, 7);
}

// Drawing

TEST_F(Label, DrawsItsTextAtItsOriginInTheActiveColour) {
    label->SetOrigin({20, 30});
    EXPECT_EQ(Drawn(), Expected({30, 30}, kDialogActiveTextColor));
}

TEST_F(Label, DrawsItsTextInsideTheExtraPixels) {
    label->SetExtraWidth(6);
    label->SetExtraHeight(8);
    label->SetVOption(0);
    label->SetOrigin({20, 30});
    EXPECT_EQ(Drawn(), Expected({20, 30}, kDialogActiveTextColor));
}

TEST_F(Label, DrawsInItsOwnGlogWhicheverPortIsCurrent) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(50, 50));
    SetPortToGlog(other);
    label->DrawGuts(nullptr);
    OSPort *port = nullptr;
    VelaDrawing::GetPort(&port);
    EXPECT_EQ(port, glog->GetPort());
}

TEST_F(Label, DrawsGrayTextInTheInactiveColour) {
    label->SetGrayTextMode(true);
    EXPECT_EQ(Drawn(), Expected({10, 0}, kDialogInactiveTextColor));
}

TEST_F(Label, GrayTextModeRepaintsOnlyAChange) {
    label->SetGrayTextMode(false);
    EXPECT_TRUE(label->invalidated.empty());
    label->SetGrayTextMode(true);
    EXPECT_EQ(label->invalidated.size(), 1u);
    label->SetGrayTextMode(true);
    EXPECT_EQ(label->invalidated.size(), 1u);
    label->SetGrayTextMode(false);
    EXPECT_EQ(label->invalidated.size(), 2u);
}

TEST_F(Label, DrawsInAColourOfItsOwnEvenInGrayTextMode) {
    RGBColor const reddish = {0xC000, 0x1000, 0x2000};
    label->SetPaneForegroundColor(&reddish);
    label->SetGrayTextMode(true);
    EXPECT_EQ(Drawn(), Expected({10, 0}, reddish));
    label->SetNoForegroundColor();
    EXPECT_EQ(Drawn(), Expected({10, 0}, kDialogInactiveTextColor));
}

TEST_F(Label, ReadsABorrowedColourWhenItDraws) {
    RGBColor color = {0xC000, 0x1000, 0x2000};
    label->SetPaneForegroundColor(&color);
    color.green = 0xF000;
    EXPECT_EQ(Drawn(), Expected({10, 0}, color));
}

TEST_F(Label, ErasesItsBoxFirstInItsBackgroundColour) {
    RGBColor const bluish = {0x1000, 0x2000, 0xC000};
    label->SetPaneBackgroundColor(&bluish);
    label->EraseUnderneath(true);
    Rect const box = label->BoxNow();
    EXPECT_EQ(Drawn(), Traced(*label, [&] {
                  SetBackgroundColor(bluish);
                  VelaDrawing::EraseRect(&box);
                  SetForegroundColor(kDialogActiveTextColor);
                  DrawStringAtPoint(Text("Level"), {10, 0}, 50, TextSettings::kTruncateNone);
              }));
}

TEST_F(Label, ErasesNothingUnlessTold) {
    EXPECT_TRUE(Only("EraseRect", DrawingOf(*label)).empty());
    label->EraseUnderneath(true);
    EXPECT_EQ(Only("EraseRect", DrawingOf(*label)).size(), 1u);
    label->EraseUnderneath(false);
    EXPECT_TRUE(Only("EraseRect", DrawingOf(*label)).empty());
}

TEST_F(Label, SetsItsBackgroundColourAlsoWithoutErasing) {
    RGBColor const bluish = {0x1000, 0x2000, 0xC000};
    label->SetPaneBackgroundColor(&bluish);
    EXPECT_EQ(Drawn(), Traced(*label, [&] {
                  SetBackgroundColor(bluish);
                  SetForegroundColor(kDialogActiveTextColor);
                  DrawStringAtPoint(Text("Level"), {10, 0}, 50, TextSettings::kTruncateNone);
              }));
}

TEST_F(Label, ForgettingTheBackgroundColourKeepsThePortsOwn) {
    RGBColor const bluish = {0x1000, 0x2000, 0xC000};
    label->SetPaneBackgroundColor(&bluish);
    label->SetNoBackgroundColor();
    EXPECT_EQ(Drawn(), Expected({10, 0}, kDialogActiveTextColor));
}

TEST_F(Label, DrawsWithItsWidthAndTruncation) {
    label->ForceStringWidth(33);
    label->SetTruncation(TextSettings::kTruncateMiddle);
    EXPECT_EQ(Drawn(), Expected({10, 0}, kDialogActiveTextColor, "Level", 33, TextSettings::kTruncateMiddle));
}

TEST_F(Label, DrawsWithTheMeasuredWidthUnlessForced) {
    label->ForgetForcedStringWidth();
    EXPECT_EQ(Drawn(), Expected({10, 0}, kDialogActiveTextColor, "Level", Measure(0, "Level").width));
}

TEST_F(Label, SetsThePortsFontOnlyWhereItDiffers) {
    label->SetFontFSRID(9);
    DrawingOf(*label);
    label->Prepare();
    SetFontData(GetIndVelaFont(9));
    desktop.TakeDrawing();
    label->DrawGuts(nullptr);
    Lines const lines = desktop.TakeDrawing();
    EXPECT_TRUE(Only("TextFont", lines).empty());
    EXPECT_TRUE(Only("TextFace", lines).empty());
    EXPECT_TRUE(Only("TextSize", lines).empty());
}

TEST_F(Label, SetsThePortsFontAlsoWhereNothingIsMeasured) {
    label->SetFontFSRID(9);
    fontSaveRec const other = {OtherFamily(), 1, 33};
    label->Prepare();
    SetFontData(&other);
    desktop.TakeDrawing();
    label->DrawGuts(nullptr);
    Lines const lines = desktop.TakeDrawing();
    auto const placeOf = [&](char const *call) {
        for (std::size_t i = 0; i < lines.size(); ++i)
            if (!Only(call, {lines[i]}).empty())
                return i;
        return lines.size();
    };
    for (char const *call : {"TextFont", "TextFace", "TextSize"})
        EXPECT_LT(placeOf(call), placeOf("DrawStringAtPoint")) << call;
}

TEST_F(Label, SetsThatPartOfThePortsFontAloneThatDiffers) {
    fontSaveRec const own = {OtherFamily(), 1, 17};
    label->SetFont(own);
    struct Case {
        char const *call;
        fontSaveRec port;
    } const cases[] = {{"TextFont", {OS::Font::FamilyID(), own.face, own.size}},
                       {"TextFace", {own.family, 0, own.size}},
                       {"TextSize", {own.family, own.face, 18}}};
    for (Case const &c : cases) {
        label->Prepare();
        SetFontData(&c.port);
        desktop.TakeDrawing();
        label->SetPortStyle();
        Lines const lines = desktop.TakeDrawing();
        EXPECT_EQ(lines.size(), 1u) << c.call;
        EXPECT_EQ(Only(c.call, lines).size(), 1u) << c.call;
    }
}

TEST_F(Label, ComparesTheLowSixteenBitsOfThePortsFace) {
    label->SetFont({OS::Font::FamilyID(), 1, 17});
    label->Prepare();
    label->SetPortStyle();
    desktop.TakeDrawing();
    GraphicsState &state = DrawingPort::CurrentPort()->State();
    state.textFace = 0x30001;
    label->SetPortStyle();
    EXPECT_TRUE(desktop.TakeDrawing().empty());
    state.textFace = 0x10000;
    label->SetPortStyle();
    EXPECT_EQ(Only("TextFace", desktop.TakeDrawing()).size(), 1u);
}

TEST_F(Label, LeavesFontAndColoursOfThePortAsTheyWere) {
    fontSaveRec const former = {OS::Font::FamilyID(), 0, 18};
    RGBColor const greenish = {0x1000, 0xE000, 0x2000}, bluish = {0x1000, 0x2000, 0xE000};
    label->SetFont({OtherFamily(), 1, 17});
    label->SetPaneForegroundColor(&greenish);
    label->SetPaneBackgroundColor(&bluish);
    label->Prepare();
    SetFontData(&former);
    EXPECT_TRUE(KeepsColors(*label));
    OSPort *port = nullptr;
    VelaDrawing::GetPort(&port);
    EXPECT_EQ(VelaDrawing::GetPortTextFont(port).GetOrderedFontID(), former.family.GetOrderedFontID());
    EXPECT_EQ(VelaDrawing::GetPortTextFace(port), former.face);
    EXPECT_EQ(VelaDrawing::GetPortTextSize(port), former.size);
}

TEST_F(Label, IsNotDrawnWhileHidden) {
    Show();
    label->Hide();
    UpdateGlog(glog);
    desktop.TakeDrawing();
    label->SetTextWithInval(Text("Gain"));
    UpdateGlog(glog);
    EXPECT_TRUE(Only("DrawStringAtPoint", desktop.TakeDrawing()).empty());
    label->Show();
    UpdateGlog(glog);
    EXPECT_EQ(Only("DrawStringAtPoint", desktop.TakeDrawing()).size(), 1u);
}

TEST_F(Label, TakesNoClicks) {
    EventRecordAdapter event;
    EXPECT_EQ(label->HandleClick(&event), 0);
    Show();
    EXPECT_EQ(ResultOfClick("click 5 5"), 0);
}

// Layout

namespace {

class LabelInLayout : public Label {
protected:
    LabelInLayout()
        : column(new CompoundPane) {
        column->CompoundPaneInit(glog, 1);
        Rect box = {0, 0, 200, 300};
        column->SetBox(&box);
        column->SetUseLayout(true);
        column->Add(label, 0);
    }
    GlogLayoutRectItem &Item() { return *label->GetLayoutRect(); }
    void Place(Rect box) { label->SetBox(&box); }
    static int WidthOf(Rect const &r) { return r.right - r.left; }
    static int HeightOf(Rect const &r) { return r.bottom - r.top; }

    CompoundPane *column;
};

} // namespace

TEST_F(LabelInLayout, KeepsTheLayoutsBoxAndCentresTheTextInItsHeight) {
    ASSERT_TRUE(label->IsInLayout());
    Place({20, 30, 61, 130});
    EXPECT_EQ(label->BoxNow(), (Rect{20, 30, 61, 130}));
    EXPECT_EQ(label->GetTextOrigin(), (Point{41 / 2 + 10 / 2 + 20, 30}));
}

TEST_F(LabelInLayout, HalvesHeightAndAscentOneByOne) {
    label->ForceFontInfo({11, 4, 20, 0});
    Place({20, 30, 61, 130});
    EXPECT_EQ(label->GetTextOrigin().v, 20 + 20 + 5);
    label->SetLineSpacing(41);
    Show();
    Rect const item = Item().GetItemRect();
    EXPECT_EQ(Drawn(), Expected({static_cast<short>(item.top + 20 + 5), item.left}, kDialogActiveTextColor));
}

TEST_F(LabelInLayout, MeasuringChangesNeitherBoxNorTextOrigin) {
    Place({20, 30, 61, 130});
    Point const origin = label->GetTextOrigin();
    label->SetText(Text("Another"));
    label->SetOrigin({99, 99});
    EXPECT_EQ(label->BoxNow(), (Rect{20, 30, 61, 130}));
    EXPECT_EQ(label->GetTextOrigin(), origin);
}

TEST_F(LabelInLayout, DrawsItsTextCentredInTheItem) {
    // 40 pixels of room and a line of 14: baseline at 40 / 2 + 10 / 2.
    Item().SetAttribute(GlogLayoutItem::kHeight, 40, GlogLayoutItem::kPixels, UString());
    Item().SetAttribute(GlogLayoutItem::kInsetTop, 7, GlogLayoutItem::kPixels, UString());
    Item().SetAttribute(GlogLayoutItem::kInsetLeft, 6, GlogLayoutItem::kPixels, UString());
    Show();
    ASSERT_EQ(Item().GetItemRect(), (Rect{7, 6, 47, 56}));
    EXPECT_EQ(Drawn(), Expected({7 + 25, 6}, kDialogActiveTextColor));
}

TEST_F(LabelInLayout, DrawsALineHigherThanTheItemFromTheItemsTop) {
    label->SetLineSpacing(9);
    Show();
    Rect const item = Item().GetItemRect();
    ASSERT_EQ(item.bottom - item.top, 9);
    EXPECT_EQ(Drawn(), Expected({static_cast<short>(item.top + 10), item.left}, kDialogActiveTextColor));
}

TEST_F(LabelInLayout, DrawsALineJustAsHighAsTheItemFromTheItemsTop) {
    label->SetLineSpacing(14);
    Show();
    Rect const item = Item().GetItemRect();
    ASSERT_EQ(item.bottom - item.top, 14);
    EXPECT_EQ(Drawn(), Expected({static_cast<short>(item.top + 10), item.left}, kDialogActiveTextColor));
}

TEST_F(LabelInLayout, DrawsALineInAHigherItemCentred) {
    label->SetLineSpacing(31);
    Show();
    Rect const item = Item().GetItemRect();
    ASSERT_EQ(item.bottom - item.top, 31);
    EXPECT_EQ(Drawn(), Expected({static_cast<short>(item.top + 5 + 15), item.left}, kDialogActiveTextColor));
}

TEST_F(LabelInLayout, ErasesItsBoxUnderTheText) {
    RGBColor const bluish = {0x1000, 0x2000, 0xC000};
    label->SetPaneBackgroundColor(&bluish);
    label->EraseUnderneath(true);
    label->SetLineSpacing(31);
    Show();
    ASSERT_EQ(label->BoxNow(), (Rect{0, 0, 31, 50}));
    EXPECT_EQ(Drawn(), Traced(*label, [&] {
                  SetBackgroundColor(bluish);
                  Rect const box = {0, 0, 31, 50};
                  VelaDrawing::EraseRect(&box);
                  SetForegroundColor(kDialogActiveTextColor);
                  DrawStringAtPoint(Text("Level"), {20, 0}, 50, TextSettings::kTruncateNone);
              }));
}

TEST_F(Label, TellsItsLayoutItemANewWidthAndNothingElse) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->ForceStringWidth(80);
    label->CalcBox();
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalWidth, 80, kInPixels, true}}));
}

TEST_F(Label, TellsItsLayoutItemANewHeightAndNothingElse) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->SetExtraHeight(9);
    label->CalcBox();
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalHeight, 23, kInPixels, true}}));
}

TEST_F(Label, TellsItsLayoutItemNothingWhenItOnlyMoves) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->SetOrigin({20, 30});
    label->SetHOption(1);
    label->SetText(Text("Gain"));
    EXPECT_TRUE(item.told.empty());
}

TEST_F(Label, TellsItsLayoutItemTheWidthFirst) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->ForceStringWidth(80);
    label->SetExtraHeight(9);
    label->CalcBox();
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalWidth, 80, kInPixels, true},
                                             {kNaturalHeight, 23, kInPixels, true}}));
}

TEST_F(Label, TellsItsLayoutItemNoHeightBesidesALineSpacing) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->SetLineSpacing(20);
    label->SetExtraHeight(9);
    label->CalcBox();
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalHeight, 20, kInPixels, true}}));
}

TEST_F(Label, ALineSpacingOfZeroIsToldAndFollowsTheFontFromThenOn) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->SetLineSpacing(20);
    label->SetLineSpacing(0);
    label->SetExtraHeight(9);
    label->CalcBox();
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalHeight, 20, kInPixels, true},
                                             {kNaturalHeight, 0, kInPixels, true},
                                             {kNaturalHeight, 23, kInPixels, true}}));
}

TEST_F(Label, TellsItsLayoutItemTheLineSpacingThatItHasAlready) {
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->SetLineSpacing(20);
    label->SetLineSpacing(20);
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalHeight, 20, kInPixels, true},
                                             {kNaturalHeight, 20, kInPixels, true}}));
}

TEST_F(LabelInLayout, TellsTheItemWhatDiffersFromTheBoxThatTheLayoutGave) {
    Place({20, 30, 61, 130});
    WatchedItem &item = WatchedItem::PutInto(*label);
    label->CalcBox();
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalWidth, 50, kInPixels, true},
                                             {kNaturalHeight, 14, kInPixels, true}}));
    Place({20, 30, 34, 80});
    item.told.clear();
    label->CalcBox();
    EXPECT_TRUE(item.told.empty());
}

TEST_F(LabelInLayout, TellsTheLayoutItsNewWidth) {
    Show();
    label->ForceStringWidth(80);
    label->CalcBox();
    EXPECT_EQ(WidthOf(Item().GetBorderRect()), 80);
}

TEST_F(LabelInLayout, TellsTheLayoutItsNewHeight) {
    Show();
    label->SetExtraHeight(9);
    label->CalcBox();
    EXPECT_EQ(HeightOf(Item().GetBorderRect()), 23);
}

TEST_F(LabelInLayout, KeepsTheHeightOfItsLineSpacing) {
    label->SetLineSpacing(20);
    Show();
    label->SetExtraHeight(9);
    label->CalcBox();
    EXPECT_EQ(HeightOf(Item().GetBorderRect()), 20);
}

TEST_F(LabelInLayout, IsAsHighAsItsLineSpacingAtOnce) {
    Show();
    label->SetLineSpacing(25);
    EXPECT_EQ(HeightOf(Item().GetBorderRect()), 25);
}

TEST_F(LabelInLayout, TakesItsLineSpacingFromTheSheet) {
    TestItem item;
    item.String("Text", "Gain").Integer("LineSpacing", 33);
    LabelPane *const made = LabelPane::NewLabelPane(glog, item.Sheet());
    column->Add(made, 1);
    EXPECT_EQ(HeightOf(made->GetLayoutRect()->GetBorderRect()), 33);
    made->SetSize(20);
    EXPECT_EQ(HeightOf(made->GetLayoutRect()->GetBorderRect()), 33);
}

// Records

namespace {

gStringResRec RecordOf(unsigned char alignment, unsigned char font = 0) {
    gStringResRec record = {};
    record.kind = gStringResRec::kKind;
    record.anchor = {100, 200};
    record.font = font;
    record.alignment = alignment;
    return record;
}

} // namespace

TEST_F(Label, IsMadeFromARecordUnderNumberZeroWithoutText) {
    gStringResRec record = RecordOf(0);
    LabelPane *const made = LabelPane::NewLabelPane(glog, &record);
    EXPECT_EQ(made->GetID(), 0);
    EXPECT_EQ(made->GetOrigin(), (Point{100, 200}));
    EXPECT_EQ(made->GetFontFSRID(), 0);
    EXPECT_EQ(BoxOf(*made).right, BoxOf(*made).left);
}

TEST_F(Label, ARecordWithTheFontThatItHasAlreadyLeavesTheBoxUntilTheTextComes) {
    // The label starts in the plain dialog font of this size; a record that changes nothing measures nothing.
    fontSaveRec const start = {OS::Font::FamilyID(), 0, 12};
    int same = -1;
    for (int index = 0; index <= 9 && same < 0; ++index) {
        fontSaveRec const &font = *GetIndVelaFont(index);
        if (font.family.GetOrderedFontID() == start.family.GetOrderedFontID() && font.face == start.face &&
            font.size == start.size)
            same = index;
    }
    ASSERT_GE(same, 0) << "no such font in the table";
    gStringResRec record = RecordOf(0, static_cast<unsigned char>(same));
    LabelPane *const made = LabelPane::NewLabelPane(glog, &record);
    Measures const font = Measure(same, "Gain");
    EXPECT_EQ(BoxOf(*made), (Rect{0, 0, static_cast<short>(font.ascent + font.descent), 0}));
    made->SetText(Text("Gain"));
    EXPECT_EQ(BoxOf(*made),
              (Rect{static_cast<short>(100 - font.ascent), 200, static_cast<short>(100 + font.descent),
                    static_cast<short>(200 + font.width)}));
}

TEST_F(Label, IsNotMadeFromARecordWithoutAGlog) {
    gStringResRec record = RecordOf(0);
    EXPECT_EQ(LabelPane::NewLabelPane(nullptr, &record), nullptr);
}

TEST_F(Label, ARecordsAnchorIsTheBaseline) {
    gStringResRec record = RecordOf(0, 9);
    LabelPane *const made = LabelPane::NewLabelPane(glog, &record);
    made->SetText(Text("Gain"));
    Measures const font = Measure(9, "Gain");
    EXPECT_EQ(BoxOf(*made),
              (Rect{static_cast<short>(100 - font.ascent), 200, static_cast<short>(100 + font.descent),
                    static_cast<short>(200 + font.width)}));
}

TEST_F(Label, ARecordsAlignmentSaysWhatLiesAtTheAnchor) {
    struct Case {
        unsigned char alignment;
        int left;
    } const cases[] = {{0, 200}, {1, 150}, {2, 175}, {7, 200}, {255, 200}};
    for (Case const &c : cases) {
        gStringResRec record = RecordOf(c.alignment);
        LabelPane *const made = LabelPane::NewLabelPane(glog, &record);
        made->ForceStringWidth(50);
        made->CalcBox();
        EXPECT_EQ(BoxOf(*made).left, c.left) << int(c.alignment);
    }
}

TEST_F(Label, ARecordsUnknownAlignmentLeavesTheOptionAlone) {
    LabelPane *const made = new LabelPane;
    made->LabelPaneInit(glog, 3, UString());
    made->SetHOption(-1);
    gStringResRec record = RecordOf(7);
    made->LabelPaneResInit(glog, &record);
    made->ForceStringWidth(50);
    made->CalcBox();
    EXPECT_EQ(BoxOf(*made).left, 150);
}

TEST_F(Label, ARecordsLeftAlignmentReplacesTheOption) {
    LabelPane *const made = new LabelPane;
    made->LabelPaneInit(glog, 3, UString());
    made->SetHOption(-1);
    gStringResRec record = RecordOf(0);
    made->LabelPaneResInit(glog, &record);
    made->ForceStringWidth(50);
    made->CalcBox();
    EXPECT_EQ(BoxOf(*made).left, 200);
}

TEST_F(Label, ARecordsFontIsAnIndexWithoutSign) {
    gStringResRec record = RecordOf(0, 200);
    EXPECT_EQ(LabelPane::NewLabelPane(glog, &record)->GetFontFSRID(), 200);
}

TEST_F(Label, IsMadeAtTheBottomOfARectangle) {
    Rect rect = {10, 20, 30, 120};
    LabelPane *const left = LabelPane::NewLabelPane(glog, 5, &rect, false, Text("Gain"));
    Measures const font = Measure(0, "Gain");
    EXPECT_EQ(left->GetID(), 5);
    EXPECT_EQ(left->GetOrigin(), (Point{30, 20}));
    EXPECT_EQ(BoxOf(*left),
              (Rect{static_cast<short>(30 - font.ascent), 20, static_cast<short>(30 + font.descent),
                    static_cast<short>(20 + font.width)}));
    LabelPane *const right = LabelPane::NewLabelPane(glog, -1, &rect, true, Text("Gain"));
    EXPECT_EQ(right->GetID(), -1);
    EXPECT_EQ(right->GetOrigin(), (Point{30, 120}));
    EXPECT_EQ(BoxOf(*right).right, 120);
}

TEST_F(Label, IsNotMadeInARectangleWithoutAGlog) {
    Rect rect = {10, 20, 30, 120};
    EXPECT_THROW(LabelPane::NewLabelPane(nullptr, 5, &rect, false, Text("Gain")), TarnError);
}

// Style sheets

TEST_F(Label, IsMadeFromASheet) {
    TestItem item;
    item.Spot("Origin", {100, 200}).Integer("FSRID", 9).Integer("Align", 1).String("Text", "Gain");
    item.Integer("LineSpacing", 22);
    LabelPane *const made = LabelPane::NewLabelPane(glog, item.Sheet());
    Measures const font = Measure(9, "Gain");
    EXPECT_EQ(made->GetFontFSRID(), 9);
    EXPECT_EQ(BoxOf(*made), (Rect{static_cast<short>(100 - font.ascent), static_cast<short>(200 - font.width),
                                  static_cast<short>(100 + font.descent), 200}));
}

TEST_F(Label, ASheetWithoutOriginAnchorsAtZero) {
    TestItem item;
    item.String("Text", "Gain");
    EXPECT_EQ(LabelPane::NewLabelPane(glog, item.Sheet())->GetOrigin(), (Point{0, 0}));
}

TEST_F(Label, ASheetsFormerFontNumbersAreFolded) {
    for (std::pair<int, int> const &c : {std::pair<int, int>{30, 0}, {31, 1}, {12, 0}, {9, 9}, {0x105, 5}}) {
        TestItem item;
        item.Integer("FSRID", c.first);
        EXPECT_EQ(LabelPane::NewLabelPane(glog, item.Sheet())->GetFontFSRID(), c.second) << c.first;
    }
}

TEST_F(Label, ASheetsAlignmentIsItsLowByte) {
    TestItem item;
    item.Integer("Align", 0x301).String("Text", "Gain");
    LabelPane *const made = LabelPane::NewLabelPane(glog, item.Sheet());
    EXPECT_EQ(BoxOf(*made).right, 0);
}

TEST_F(Label, ASheetWithoutItemFailsAnAssertion) {
    GlogStyleSheet empty;
    try {
        LabelPane::NewLabelPane(glog, &empty);
        FAIL() << "nothing was thrown";
    } catch (BrokenInvariant const &broken) {
        EXPECT_EQ(std::string(broken.what()).find("px != 0"), 0u) << broken.what();
    }
}

TEST_F(Label, IsNotMadeFromASheetWithoutAGlog) {
    TestItem item;
    EXPECT_EQ(LabelPane::NewLabelPane(nullptr, item.Sheet()), nullptr);
}
