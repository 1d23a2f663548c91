// Editable text in dialogs.
#include "buttons/NaturalSize.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "text/FontIndex.h"
#include "text/GTextPane.h"
#include "text/SearchFieldPane.h"
#include "text/TextEditPane.h"
#include "text/TextFieldFlags.h"
#include <memory>
#include <new>
#include <string>
#include <vector>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

short const kNoNumber = 0; // the loader numbers what it makes
long long const kLargestByte = 255;
long long const kLargestOffset = 1000; // pixels
long long const kLargestUnit = 0x7FFFFFFF;
long long const kLargestComponent = 65535;
std::size_t const kRecordPadding = 4; // before the text

// Messages

class TextReporter : public MessageReporter<TextPaneListener> {
public:
    using MessageReporter::MessageReporter;
    void TextPaneConfirmation(GTextPane *pane) override { Report(*pane, "TextPaneConfirmation"); }
    void BeginEditing(GTextPane *pane) override { Report(*pane, "BeginEditing"); }
    void EndEditing(GTextPane *pane) override { Report(*pane, "EndEditing"); }
    void ResetValue(GTextPane *pane) override { Report(*pane, "ResetValue"); }
    void ValueChanged(GTextPane *pane) override { Report(*pane, "ValueChanged"); }

private:
    static void Report(GTextPane &pane, char const *message) {
        if (MessageTrace::On())
            MessageTrace::Write(
                MessageTrace::Begin(pane).Text("message", std::string(message)).Text("text", pane.GetText()));
    }
};

void ReportText(GlogPane *pane) {
    if (GTextPane *const field = dynamic_cast<GTextPane *>(pane))
        new TextReporter(field);
}

class TextEditReporter : public MessageReporter<TextEditPane_Listener> {
public:
    using MessageReporter::MessageReporter;
    void TextEditPane_TextChanged(TextEditPane &pane) override { Report(pane, "TextChanged"); }
    void TextEditPane_Autoscrolled(TextEditPane &pane) override { Report(pane, "Autoscrolled"); }

private:
    static void Report(TextEditPane &pane, char const *message) {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(pane).Text("message", std::string(message)));
    }
};

void ReportTextEdit(GlogPane *pane) {
    if (TextEditPane *const edit = dynamic_cast<TextEditPane *>(pane))
        new TextEditReporter(edit);
}

class SearchReporter : public MessageReporter<SearchFieldPane_Listener> {
public:
    explicit SearchReporter(SearchFieldPane &pane_)
        : MessageReporter(&pane_)
        , pane(pane_) {}
    void TextChanged(UString const &text) override {
        if (MessageTrace::On())
            MessageTrace::Write(Begin("TextChanged").Text("text", text));
    }
    void SearchIsCanceled() override {
        if (MessageTrace::On())
            MessageTrace::Write(Begin("SearchIsCanceled"));
    }
    void HandleSpecialKey(EventRecordAdapter *event) override {
        if (MessageTrace::On())
            MessageTrace::Write(
                Begin("HandleSpecialKey").Text("key", std::string(UpArrowKey(event) ? "Up" : "Down")));
    }

private:
    JsonLine Begin(char const *message) {
        return MessageTrace::Begin(pane).Text("message", std::string(message));
    }
    SearchFieldPane &pane; // which it goes with
};

void ReportSearch(GlogPane *pane) {
    if (SearchFieldPane *const field = dynamic_cast<SearchFieldPane *>(pane))
        new SearchReporter(*field);
}

void DescribeSelection(JsonLine &line, unsigned int start, unsigned int end) {
    line.Integer("selectionStart", start).Integer("selectionEnd", end);
}

bool DescribeText(GlogPane &pane, JsonLine &line) {
    unsigned int start = 0, end = 0;
    if (GTextPane *const field = dynamic_cast<GTextPane *>(&pane)) {
        field->GetSelection(start, end);
        line.Text("text", field->GetText()).Integer("mode", field->GetMode());
    } else if (TextEditPane *const edit = dynamic_cast<TextEditPane *>(&pane)) {
        edit->GetTextEdit().GetSelection(start, end);
        line.Text("text", edit->GetTextEdit().GetText());
    } else if (SearchFieldPane *const search = dynamic_cast<SearchFieldPane *>(&pane)) {
        line.Text("text", search->GetText());
        return true;
    } else {
        return false;
    }
    DescribeSelection(line, start, end);
    return true;
}

// Text fields

int Number(Container const &item, char const *key) {
    return static_cast<int>(item->GetSIntItemValue(ResourceKey(key)));
}

double Component(Container const &color, char const *key) {
    return static_cast<double>(color->GetSIntItemValue(ResourceKey(key))) / kLargestComponent;
}

StyleRunRec RunOf(Container const &described) {
    fontSaveRec const *const font = GetIndVelaFont(FontIndexFromFSRID(Number(described, "FSRID")));
    StyleRunRec run;
    run.start = static_cast<unsigned int>(Number(described, "Start"));
    run.end = static_cast<unsigned int>(Number(described, "End"));
    run.style.family = font->family;
    run.style.face = font->face;
    run.style.size = font->size;
    RGBColor const usual = kTextWellTextColor;
    run.style.color = OS::RGBAColor(usual.red / 65535.0, usual.green / 65535.0, usual.blue / 65535.0, 1.0);
    if (Container const color = described->GetContainerItem(ResourceKey("Color")))
        run.style.color =
            OS::RGBAColor(Component(color, "Red"), Component(color, "Green"), Component(color, "Blue"), 1.0);
    return run;
}

GlogPane *MakeTextField(glogRec *glog, GlogStyleSheet *sheet) {
    Container const all = sheet->GetContainerItem(ResourceKey("StyleRuns"));
    std::vector<StyleRunRec> runs;
    for (std::size_t i = 0; all && i < all->GetNumItems(); ++i)
        runs.push_back(RunOf(XMLLib::ContainerFromItem(all->GetNthItem(i))));
    GTextPane *const pane = GTextPane::NewGTextPane(glog, sheet, nullptr, all ? &runs : nullptr);
    if (!pane)
        return nullptr;
    SetNaturalSize(*pane, pane->ItemWidth(), pane->ItemHeight());
    pane->SetMode(static_cast<unsigned char>(Number(sheet->GetItemRes(), "Mode")));
    return pane;
}

GlogPane *MakeTextFieldFromRecord(glogRec *glog, RecordBytes &bytes) {
    gtextResRec record;
    record.kind = bytes.Short();
    record.bounds = bytes.ReadRect();
    record.font = bytes.Byte();
    record.alignment = bytes.Byte();
    record.flags = bytes.Byte();
    record.moreFlags = bytes.Byte();
    record.textWell = static_cast<signed char>(bytes.Byte());
    bytes.Byte(); // the record's numbers lie at even places
    record.frameOffset = bytes.Short();
    record.firstLineOffset = bytes.Short();
    bytes.Skip(kRecordPadding);
    record.initialText = Utf8::ToUString(bytes.Rest());
    GlogStyleSheet sheet(GTextPane::XMLResFrom_GTextResRec(record));
    return GTextPane::NewGTextPane(glog, &sheet, nullptr, nullptr);
}

KeyList RunKeys() {
    return KeyList()
        .Integer("Start", 0, kLargestUnit)
        .Required()
        .Integer("End", 0, kLargestUnit)
        .Required()
        .Integer("FSRID", 0, kLargestByte)
        .Attributes("Color", KeyList()
                                 .Integer("red", 0, kLargestComponent)
                                 .As("Red")
                                 .Integer("green", 0, kLargestComponent)
                                 .As("Green")
                                 .Integer("blue", 0, kLargestComponent)
                                 .As("Blue"));
}

KeyList TextFieldKeys() {
    return KeyList()
        .Rect("BoundsRect")
        .Required()
        .Integer("FSRID", 0, kLargestByte)
        .Integer("Align", 0, TextSettings::kAlignLeft)
        .Integer("FirstLineOffset")
        .Flag("BoxIt")
        .Flag("NoTabIn")
        .Flag("RetOnClick")
        .Flag("RetOnModify")
        .Flag("MultiLine")
        .Flag("ReadOnly")
        .Flag("AutoScroll")
        .Flag("NotSelectable")
        .Flag("UseSavedColors")
        .Flag("TextWell")
        .Integer("FrameOffset", -kLargestOffset, kLargestOffset)
        .String("InitTextID")
        .Integer("BaselineOffset", -kLargestOffset, kLargestOffset)
        .Flag("PlatformHandlesTextInputEvents")
        .Integer("Mode", 0, kLargestByte)
        .Container("StyleRuns", KeyList().Container("Run", RunKeys()).Repeated());
}

// Bare engines

// Takes clicks, and the keyboard with them, which the bare pane leaves to others; and shows its text in the
// theme's colours.
class DialogTextEdit : public TextEditPane {
public:
    DialogTextEdit(glogRec *owner, unsigned int flags)
        : TextEditPane(owner, kNoNumber, flags) {}
    unsigned char Selectable() override { return GetVisibility(); }
    void Select(bool on) override {
        if (on == IsSelected())
            return;
        if (on)
            BeginEditing();
        else
            EndEditing();
        TextEditPane::Select(on);
    }
    int Tab(char) override {
        bool const had = IsSelected();
        Select(!had);
        return had ? 1 : 0;
    }
    char CanTabIn() override { return char(Selectable()); }
    void Deactivate() override {
        Select(false);
        TextEditPane::Deactivate();
    }

protected:
    bool BecomeGopherOnSelect() override { return true; }
    int HandleClick(EventRecordAdapter *event) override {
        PaneWatch const self(this);
        Select(true); // the pane that was selected before tells its listeners
        if (!self.PaneExists())
            return -1;
        Prepare();
        return GetTextEdit().HandleEvent(event) ? -1 : 0;
    }
    void DrawGuts(OSRgn *region) override {
        OSTextEdit &edit = GetTextEdit();
        RGBColor selected;
        GetHiliteColor(&selected);
        edit.SetBackgroundColor(kTextWellBackgroundColor);
        edit.SetDefaultColors(Opaque(kTextWellTextColor), Opaque(selected));
        TextEditPane::DrawGuts(region);
    }

private:
    static OS::RGBAColor Opaque(RGBColor const &c) {
        return OS::RGBAColor(c.red / 65535.0, c.green / 65535.0, c.blue / 65535.0, 1.0);
    }
};

// A place in hundredths of a pixel.
double Hundredths(Container const &item, char const *key) { return Number(item, key) / 100.0; }

GlogPane *MakeTextEdit(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    auto const flag = [&](char const *key) { return Number(item, key) != 0; };
    std::unique_ptr<DialogTextEdit> pane(new (std::nothrow) DialogTextEdit(
        glog, TextFieldFlags::Of(false, flag("MultiLine"), flag("ReadOnly"), flag("AutoScroll"))));
    if (!pane)
        return nullptr;
    Rect const box = XMLLib::GetRect(item, ResourceKey("BoundsRect"));
    SetNaturalSize(*pane, box.right - box.left, box.bottom - box.top);
    pane->SetFractionalBounds(OS::RectBase<OS::RectTag>(box.left + Hundredths(item, "FractionH"),
                                                        box.top + Hundredths(item, "FractionV"),
                                                        box.right - box.left, box.bottom - box.top));
    fontSaveRec const *const font = GetIndVelaFont(FontIndexFromFSRID(Number(item, "FSRID")));
    OS::TextStyle style;
    style.family = font->family;
    style.face = font->face;
    style.size = font->size;
    pane->GetTextEdit().SetStyle(TextStyleMask::kFont, style);
    pane->GetTextEdit().SetText(item->GetUStringItemValue(ResourceKey("Text")));
    return pane.release();
}

KeyList TextEditKeys() {
    long long const kLastHundredth = 99;
    return KeyList()
        .Rect("BoundsRect")
        .Required()
        .Integer("FractionH", 0, kLastHundredth)
        .Integer("FractionV", 0, kLastHundredth)
        .Integer("FSRID", 0, kLargestByte)
        .Flag("MultiLine")
        .Flag("ReadOnly")
        .Flag("AutoScroll")
        .String("Text");
}

// Search fields

GlogPane *MakeSearchField(glogRec *glog, GlogStyleSheet *sheet) {
    std::unique_ptr<SearchFieldPane> pane(new (std::nothrow) SearchFieldPane);
    if (!pane)
        return nullptr;
    Rect box = XMLLib::GetRect(sheet->GetItemRes(), ResourceKey("BoundsRect"));
    pane->Init(glog);
    if (!pane->GetGlog())
        return nullptr;
    SetNaturalSize(*pane, box.right - box.left, box.bottom - box.top);
    pane->SetBox(&box);
    return pane.release();
}

} // namespace

void AddTextItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeText);
    registry.Add(ItemType("TextField")
                     .Keys(TextFieldKeys())
                     .MadeBy(MakeTextField)
                     .ReportedBy(ReportText)
                     .LayoutType(gtextResRec::kKind)
                     .FromRecord(gtextResRec::kKind, ItemType::kWholeKind, MakeTextFieldFromRecord));
    registry.Add(ItemType("SearchField")
                     .Keys(KeyList().Rect("BoundsRect").Required())
                     .MadeBy(MakeSearchField)
                     .ReportedBy(ReportSearch));
    registry.Add(ItemType("TextEdit").Keys(TextEditKeys()).MadeBy(MakeTextEdit).ReportedBy(ReportTextEdit));
}
