// An engine of editable text, driven by any bytes, beside a text that is changed plainly.
#include "desktop/SimulatedDesktop.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/resources/Utf.h"
#include "fuzz/support/Entry.h"
#include "fuzz/support/Require.h"
#include "host/GlogPane.h"
#include "host/OSPort.h"
#include "host/glogRec.h"
#include <memory>
#include <string>

namespace {

class EditorPane : public GlogPane {
public:
    EditorPane(glogRec *owner, unsigned int flags) {
        GlogPaneInit(owner, 0);
        editor = std::make_unique<TextEditor>(OSTextEdit::Window(*owner), flags);
        Rect box = {5, 5, 75, 155};
        SetBox(&box);
        editor->SetBounds(box);
        editor->Activate();
    }
    std::unique_ptr<TextEditor> editor;

private:
    void DrawGuts(OSRgn *) override { editor->Draw(OSPort::Current()); }
};

// Numbers from the input, 0 when it is used up.
class Bytes {
public:
    Bytes(std::uint8_t const *data_, std::size_t size_)
        : data(data_)
        , size(size_) {}
    bool AtEnd() const { return size == 0; }
    unsigned int Byte() {
        if (size == 0)
            return 0;
        --size;
        return *data++;
    }
    unsigned int Pair() { return Byte() * 256 + Byte(); }
    std::u16string Units() {
        std::u16string units;
        for (unsigned int count = Byte() % 12; count > 0; --count) {
            unsigned int const unit = Pair();
            units += static_cast<char16_t>(unit % 3 == 0 ? unit % 128 : unit);
        }
        return units;
    }

private:
    std::uint8_t const *data;
    std::size_t size;
};

class Trial {
public:
    Trial(glogRec *glog, unsigned int flags)
        : edit(*(new EditorPane(glog, flags))->editor) {}

    void Take(Bytes &bytes) {
        switch (bytes.Byte() % 10) {
        case 0:
            edit.SetText(Utf::FromUnits(bytes.Units()));
            break;
        case 1: {
            unsigned int const start = bytes.Byte();
            edit.SetSelection(start, start + bytes.Byte());
            break;
        }
        case 2:
            Key(0, 0, bytes.Units());
            break;
        case 3:
        case 4: {
            static int const kKeys[] = {1, 4, 8, 11, 12, 13, 28, 29, 30, 31, 127, 'z', 'y', 'a', 'x', 'v'};
            int const key = kKeys[bytes.Byte() % 16];
            Key(key, static_cast<unsigned short>(bytes.Byte() << 8), {});
            break;
        }
        case 5:
            edit.Compose(Utf::FromUnits(bytes.Units()), static_cast<int>(bytes.Byte()));
            break;
        case 6: {
            OS::TextStyle style;
            style.face = static_cast<int>(bytes.Byte());
            style.size = static_cast<short>(bytes.Byte() % 40);
            edit.SetStyle(bytes.Byte() % 16, style);
            break;
        }
        case 7:
            edit.SetVScrollPos(static_cast<int>(bytes.Pair()) - 100, 0);
            break;
        case 8: {
            int const width = static_cast<int>(bytes.Byte()), height = static_cast<int>(bytes.Byte());
            edit.SetBounds(OS::RectBase<OS::RectTag>(5, 5, width, height));
            break;
        }
        default:
            edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(bytes.Byte(), bytes.Byte()));
        }
    }

    void Check() {
        std::size_t const size = edit.GetText().length();
        unsigned int start = 0, end = 0, at = 0;
        edit.GetSelection(start, end);
        Require(start <= end && end <= size, "the selection lies within the text");
        OS::TextStyle style;
        for (unsigned int i = 0; i < edit.GetNumberStyleRuns(); ++i) {
            edit.GetNthStyleRun(i, start, end, style);
            Require(start == at && end > start, "runs follow each other");
            at = end;
        }
        Require(at == size, "runs cover the text");
        if (edit.GetMarkedRange())
            Require(edit.GetMarkedRange()->second <= size, "what is marked lies within the text");
        Require(edit.GetCurrentScrolledOffset() >= 0 && edit.GetTextHeight() > 0, "heights make sense");
    }

    // Back to the text that was set last, and forward to the present one.
    void UndoAll() {
        edit.DeselectAll();
        UString const present = edit.GetText();
        int steps = 0;
        while (edit.Undo())
            ++steps;
        for (; steps > 0; --steps)
            Require(edit.Redo(), "what was undone can be made again");
        Require(edit.GetText() == present, "the text comes back");
    }

private:
    void Key(int code, unsigned short modifiers, std::u16string const &text) {
        KeyEvent event;
        event.what = EventKinds::kKeyDown;
        event.message = static_cast<unsigned long long>(code);
        event.modifiers = modifiers;
        event.text = Utf::FromUnits(text);
        edit.HandleEvent(&event);
    }

    TextEditor &edit;
};

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    static SimulatedDesktop &desktop = *new SimulatedDesktop;
    Bytes bytes(data, size);
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(160, 80));
    Trial trial(glog, (bytes.Byte() % 16) & ~TextEditFlags::kReadOnly);
    ShowGlog(glog, kShowGlog);
    while (!bytes.AtEnd()) {
        trial.Take(bytes);
        trial.Check();
        UpdateGlog(glog);
    }
    trial.UndoAll();
    DisposeGlog(glog);
    return 0;
}
