// Editable text: one character typed into a long text and shown, and a longer one opened.
#include "bench/BarePicture.h"
#include "bench/ProcessorClock.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/resources/Utf.h"
#include "host/GlogPane.h"
#include "host/OSPort.h"
#include "host/glogRec.h"
#include <benchmark/benchmark.h>
#include <malloc.h>
#include <memory>
#include <string>

namespace {

short const kWidth = 600, kHeight = 400; // pixels
int const kLines = 10000, kLineUnits = 60;
std::size_t const kLargeUnits = 10000000;

std::u16string Lines(std::size_t count) {
    std::u16string line(kLineUnits - 1, u'a');
    for (std::size_t i = 7; i < line.size(); i += 8)
        line[i] = u' ';
    line += u'\n';
    std::u16string text;
    text.reserve(count * line.size());
    for (std::size_t i = 0; i < count; ++i)
        text += line;
    return text;
}

// A window with an engine in all of it.
class EditorPane : public GlogPane {
public:
    EditorPane(glogRec *owner, unsigned int flags, UString const &text) {
        GlogPaneInit(owner, 0);
        editor = std::make_unique<TextEditor>(OSTextEdit::Window(*owner), flags);
        Rect box = {0, 0, kHeight, kWidth};
        SetBox(&box);
        editor->SetBounds(box);
        editor->SetText(text);
        editor->Activate();
    }
    std::unique_ptr<TextEditor> editor;

private:
    void DrawGuts(OSRgn *) override { editor->Draw(OSPort::Current()); }
};

class EditPage {
public:
    EditPage(unsigned int flags, UString const &text)
        : glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight)))
        , pane(new EditorPane(glog, flags, text)) {
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
    }
    void Type(char16_t character) {
        KeyEvent event;
        event.what = EventKinds::kKeyDown;
        event.text = Utf::FromUnits({&character, 1});
        pane->editor->HandleEvent(&event);
        UpdateGlog(glog);
    }

    SimulatedDesktop desktop;
    glogRec *glog;
    EditorPane *pane;
};

// Typed into the middle line, which is in the middle of the window, and shown.
void TypeInTheMiddle(benchmark::State &state) {
    EditPage page(TextEditFlags::kSeveralLines,
                  Utf::FromUnits(Lines(static_cast<std::size_t>(state.range(0)))));
    unsigned int const middle = static_cast<unsigned int>(state.range(0) / 2 * kLineUnits + kLineUnits / 2);
    page.pane->editor->SetSelection(middle, middle);
    page.pane->editor->VScrollToCharacterPosition(middle);
    UpdateGlog(page.glog);
    for (auto _ : state) {
        page.Type(u'x');
        state.PauseTiming();
        page.pane->editor->Undo(); // lines of one length throughout
        UpdateGlog(page.glog);
        page.desktop.TakePresented(page.glog);
        state.ResumeTiming();
    }
}
BENCHMARK(TypeInTheMiddle)->Arg(100)->Arg(kLines)->Arg(1000000);

// The line breaks in two and comes together again, both shown.
void BreakALineAndJoinIt(benchmark::State &state) {
    EditPage page(TextEditFlags::kSeveralLines,
                  Utf::FromUnits(Lines(static_cast<std::size_t>(state.range(0)))));
    unsigned int const middle = static_cast<unsigned int>(state.range(0) / 2 * kLineUnits + kLineUnits / 2);
    page.pane->editor->SetSelection(middle, middle);
    page.pane->editor->VScrollToCharacterPosition(middle);
    for (auto _ : state) {
        page.Type(u'\n');
        page.pane->editor->Delete(OS::TextEditAction::kCharacter, OS::TextEditAction::kLeft);
        UpdateGlog(page.glog);
    }
}
BENCHMARK(BreakALineAndJoinIt)->Arg(kLines)->Arg(1000000);

void TypeIn(EditPage &page, benchmark::State &state) {
    for (auto _ : state) {
        page.Type(u'x');
        state.PauseTiming();
        page.pane->editor->Undo();
        UpdateGlog(page.glog);
        state.ResumeTiming();
    }
}

// One line, as in a dialog.
void TypeInAField(benchmark::State &state) {
    EditPage page(0, Utf::FromUnits(u"Overhead left"));
    TypeIn(page, state);
}
BENCHMARK(TypeInAField);

// One line after a paste that went on beyond what a line takes, but for one unit: at its end.
void TypeInAFullField(benchmark::State &state) {
    unsigned int const kMostButOne = 32766;
    std::u16string text = Lines(kMostButOne / kLineUnits + 1);
    text.resize(kMostButOne);
    EditPage page(0, Utf::FromUnits(text));
    page.pane->editor->SetSelection(kMostButOne, kMostButOne);
    TypeIn(page, state);
}
BENCHMARK(TypeInAFullField)->Unit(benchmark::kMillisecond);

// The insertion point steps to and fro there.
void StepInAFullField(benchmark::State &state) {
    EditPage page(0, Utf::FromUnits(Lines(kLines)));
    for (auto _ : state) {
        for (bool toTheRight : {true, false}) {
            KeyEvent event;
            event.what = EventKinds::kKeyDown;
            event.message = static_cast<unsigned long long>(toTheRight ? KeyCodes::kRight : KeyCodes::kLeft);
            page.pane->editor->HandleEvent(&event);
            UpdateGlog(page.glog);
        }
    }
}
BENCHMARK(StepInAFullField)->Unit(benchmark::kMillisecond);

// From the text to the first picture. The counter: how many times the text's own memory everything takes that
// is made for it.
void OpenTenMillionUnits(benchmark::State &state) {
    UString const text = Utf::FromUnits(Lines(kLargeUnits / kLineUnits));
    double times = 0;
    for (auto _ : state) {
        std::size_t const before = mallinfo2().uordblks + mallinfo2().hblkhd;
        EditPage page(TextEditFlags::kSeveralLines, text);
        benchmark::DoNotOptimize(page.pane);
        times = static_cast<double>(mallinfo2().uordblks + mallinfo2().hblkhd - before) /
                static_cast<double>(text.length() * sizeof(char16_t));
    }
    state.counters["timesTheText"] = times;
}
BENCHMARK(OpenTenMillionUnits)->Unit(benchmark::kMillisecond);

// The window is drawn as a whole.
void DrawAllThatShows(benchmark::State &state) {
    EditPage page(TextEditFlags::kSeveralLines, Utf::FromUnits(Lines(kLines)));
    for (auto _ : state) {
        page.pane->Inval();
        UpdateGlog(page.glog);
    }
}
BENCHMARK(DrawAllThatShows);

void DrawAllThatShowsBare(benchmark::State &state) {
    int const kFont = 0, kLineHeight = 16;
    std::u16string const units = Lines(1);
    std::string const line(units.begin(), units.end() - 1);
    BarePicture picture(kWidth, kHeight);
    for (int top = 0; top < kHeight; top += kLineHeight)
        picture.Add(line, kFont, 0, top);
    for (auto _ : state)
        picture.Repaint();
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(DrawAllThatShowsBare);

} // namespace
