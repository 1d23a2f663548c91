// What the tests of the engine share: one in a window, with keys and clicks that reach it.
#pragma once
#include "desktop/SimulatedDesktop.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/resources/Utf.h"
#include "desktop/windows/WindowSystem.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogPane.h"
#include "host/OSPort.h"
#include "host/glogRec.h"
#include <gtest/gtest.h>
#include <memory>
#include <string>
#include <vector>

// Shows an engine and gives it the clicks in its bounds.
class EditorPane : public GlogPane {
public:
    EditorPane(glogRec *owner, unsigned int flags, Rect box) {
        GlogPaneInit(owner, 0);
        editor = std::make_unique<TextEditor>(OSTextEdit::Window(*owner), flags);
        SetBox(&box);
    }
    void PanePositionChanged() override {
        Rect const box = GetBounds();
        if (editor)
            editor->SetBounds(box);
    }

    std::unique_ptr<TextEditor> editor;

protected:
    void DrawGuts(OSRgn *) override {
        if (editor)
            editor->Draw(OSPort::Current());
    }
    int HandleClick(EventRecordAdapter *event) override {
        Prepare();
        editor->Activate();
        return editor->HandleEvent(event) ? -1 : 0;
    }
};

// Counts what the engine tells.
class EditorEar : public OS::TextEditListener {
public:
    void TextEditListener_TextChanged() override { ++changes; }
    void TextEditListener_AutoScrolled() override { ++scrolls; }
    int changes = 0, scrolls = 0;
};

typedef std::pair<unsigned int, unsigned int> UnitRange;

class EditorTest : public testing::Test {
protected:
    static constexpr unsigned int kSeveralLines = TextEditFlags::kSeveralLines,
                                  kStyled = TextEditFlags::kStyled, kReadOnly = TextEditFlags::kReadOnly;

    EditorTest()
        : glog(desktop.NewGlog(GlogOptions().Size(320, 240))) {}

    // A new engine with the text, active, its insertion point at the start.
    TextEditor &Open(unsigned int flags, std::u16string const &text, Rect box = {10, 10, 210, 210}) {
        pane = new EditorPane(glog, flags, box);
        editor = pane->editor.get();
        editor->SetText(Utf::FromUnits(text));
        ear.DependUpon(editor);
        ShowGlog(glog, kShowGlog);
        desktop.Play("");
        editor->Activate();
        UpdateGlog(glog);
        desktop.TakePresented(glog);
        return *editor;
    }
    void Play(std::string const &script) { desktop.Play(script); }
    std::u16string Text() const { return std::u16string(Utf::View(editor->GetText())); }
    UnitRange Selection() const {
        UnitRange range;
        editor->GetSelection(range.first, range.second);
        return range;
    }
    std::string Clipboard() { return desktop.Windows().GetClipboardText(); }
    // What was presented since the last call.
    std::vector<Rect> Repainted() {
        UpdateGlog(glog);
        return desktop.TakePresented(glog);
    }
    OS::TextStyle StyleAt(unsigned int unit) {
        UnitRange const kept = Selection();
        editor->SetSelection(unit, unit + 1);
        OS::TextStyle style;
        editor->GetStyle(15, style);
        editor->SetSelection(kept.first, kept.second);
        return style;
    }

    SimulatedDesktop desktop;
    glogRec *glog;
    EditorPane *pane = nullptr;
    TextEditor *editor = nullptr;
    EditorEar ear;
};

inline UnitRange At(unsigned int unit) { return {unit, unit}; }
