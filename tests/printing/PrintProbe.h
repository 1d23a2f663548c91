// A pane that prints what a test says.
#pragma once
#include "host/GlogPane.h"
#include "host/PageFormat.h"
#include "host/VelaDrawing.h"
#include <functional>
#include <string>
#include <vector>

class PrintProbe : public GlogPane {
public:
    // The notes outlive the pane.
    PrintProbe(glogRec *glog_, int pages_, std::vector<std::string> &notes_)
        : pages(pages_)
        , notes(notes_) {
        GlogPaneInit(glog_, 0);
        Rect box = {10, 10, 60, 110};
        SetBox(&box);
    }

    bool Print(PrintMessageRec *message) override {
        static char const *const kNames[] = {"start", "page", "end"};
        notes.push_back(std::string(kNames[message->kind - 2]) + " " + std::to_string(message->page));
        header[0] = message->header[0];
        header[1] = message->header[1];
        header[2] = message->header[2];
        if (message->kind == 2) {
            printed = 0;
            return pages > 0;
        }
        if (message->kind != 3)
            return false;
        bool const more = ++printed < pages;
        std::function<void(int)> const draw = onPage; // which may delete the pane
        if (draw)
            draw(message->page);
        return more;
    }
    void DrawGuts(OSRgn *) override {}

    int pages;
    std::vector<std::string> &notes;
    std::function<void(int page)> onPage;
    UString header[3];

private:
    int printed = 0;
};
