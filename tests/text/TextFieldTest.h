// What the tests of text fields share: a field with its protected operations open, and an ear that writes
// down what it hears.
#pragma once
#include "frame/AutoSetActivityListener.h"
#include "frame/TextPaneListener.h"
#include "tests/PaneTest.h"
#include "text/GTextPane.h"
#include <memory>
#include <string>
#include <vector>

class OpenTextField : public GTextPane {
public:
    using GTextPane::CreateTextEdit;
    using GTextPane::HandleClick;
    using GTextPane::InitGTextPane;
    using GTextPane::UpdateTextEdit;
};

typedef std::vector<std::string> Heard;

class FieldEar : public TextPaneListener, public AutoSetActivityListener {
public:
    explicit FieldEar(GTextPane &pane) {
        TextPaneListener::DependUpon(&pane);
        AutoSetActivityListener::DependUpon(&pane);
    }
    void TextPaneConfirmation(GTextPane *) override { heard.push_back("Confirmation"); }
    void BeginEditing(GTextPane *) override { heard.push_back("Begin"); }
    void EndEditing(GTextPane *) override { heard.push_back("End"); }
    void ResetValue(GTextPane *) override { heard.push_back("Reset"); }
    void ValueChanged(GTextPane *) override { heard.push_back("Changed"); }
    void ListenToActivity(Provider<AutoSetActivityListener> *) override { heard.push_back("Activity"); }
    Heard Take() {
        Heard taken;
        taken.swap(heard);
        return taken;
    }

private:
    Heard heard;
};

class TextFieldTest : public PaneTest {
protected:
    // A shown field with these keys beside its place, which is (20, 20, 36, 200).
    OpenTextField *Make(TestItem item = TestItem()) {
        item.Box("BoundsRect", {20, 20, 36, 200});
        OpenTextField *const pane = new OpenTextField;
        EXPECT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
        Show();
        desktop.Play(""); // the window becomes active
        Repainted();
        return pane;
    }
    static EventRecordAdapter KeyOf(int character, unsigned short modifiers = 0) {
        EventRecordAdapter event;
        event.what = 3;
        event.message = static_cast<unsigned long long>(character);
        event.modifiers = modifiers;
        return event;
    }
    static int Press(GTextPane &pane, int character) {
        EventRecordAdapter event = KeyOf(character);
        return pane.Key(&event);
    }
    static std::pair<unsigned int, unsigned int> SelectionOf(GTextPane &pane) {
        unsigned int start = 99, end = 99;
        pane.GetSelection(start, end);
        return {start, end};
    }
    static constexpr int kEscape = 27, kReturn = 13, kEnter = 3;
};

typedef std::pair<unsigned int, unsigned int> Units;
