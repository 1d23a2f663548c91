// What the tests of search fields share: a shown field with its protected operations open, and an ear.
#pragma once
#include "frame/SearchFieldPane_Listener.h"
#include "host/EventRecordAdapter.h"
#include "tests/PaneTest.h"
#include "tests/resources/Text.h"
#include "text/SearchFieldPane.h"
#include "text/SearchTextPane.h"
#include <string>
#include <vector>

class OpenSearchField : public SearchFieldPane {
public:
    using SearchFieldPane::DrawBackgroundGuts;
    using SearchFieldPane::HandleClick;
};

typedef std::vector<std::string> Heard;

class SearchEar : public SearchFieldPane_Listener {
public:
    explicit SearchEar(SearchFieldPane &pane) { DependUpon(&pane); }
    void TextChanged(UString const &text) override { heard.push_back("Text " + Utf::ToUtf8(text)); }
    void SearchIsCanceled() override { heard.push_back("Canceled"); }
    void HandleSpecialKey(EventRecordAdapter *event) override {
        heard.push_back(UpArrowKey(event) ? "Up" : DownArrowKey(event) ? "Down" : "Other");
    }
    Heard Take() {
        Heard taken;
        taken.swap(heard);
        return taken;
    }

private:
    Heard heard;
};

class SearchFieldTest : public PaneTest {
protected:
    static constexpr short kLeft = 20, kTop = 30; // of the fields

    // A shown field of that width.
    OpenSearchField *Make(int width = 200) {
        OpenSearchField *const pane = new OpenSearchField;
        pane->Init(glog);
        Resize(*pane, width);
        Show();
        desktop.Play(""); // the window becomes active
        Repainted();
        return pane;
    }
    static void Resize(SearchFieldPane &pane, int width) {
        Rect box = {kTop, kLeft, kTop + 20, static_cast<short>(kLeft + width)};
        pane.SetBox(&box);
    }
    static SearchTextPane &TextOf(SearchFieldPane &pane) {
        return dynamic_cast<SearchTextPane &>(*pane.Get(0));
    }
    void Click(SearchFieldPane &pane) {
        Rect const box = BoxOf(pane);
        desktop.Play("click " + std::to_string(box.left + 60) + " " + std::to_string(box.top + 10));
    }
    // A press on the button, and then these steps.
    static std::string PressOnButton(SearchFieldPane &pane) {
        Rect const box = BoxOf(pane);
        return "press " + std::to_string(box.right - 10) + " " + std::to_string(box.top + 10) + "\n";
    }
};
