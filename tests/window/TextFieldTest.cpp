// A text field in a real window: real keys, and the clipboard that all programs of the screen share.
#include "desktop/Desktop.h"
#include "desktop/panes/Glog.h"
#include "desktop/resources/Utf.h"
#include "host/glogRec.h"
#include "tests/window/XScreen.h"
#include "text/GTextPane.h"
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <future>
#include <gtest/gtest.h>
#include <string>

namespace {

double const kStep = 0.02, kPatience = 10; // seconds

std::string OutputOf(std::string const &command) {
    std::string output;
    FILE *const pipe = popen(command.c_str(), "r");
    if (!pipe)
        return output;
    for (int c = std::fgetc(pipe); c != EOF; c = std::fgetc(pipe))
        output.push_back(static_cast<char>(c));
    return pclose(pipe) == 0 ? output : "the command failed";
}

class RealTextField : public testing::Test {
protected:
    RealTextField()
        : desktop(DesktopOptions().Scale(1))
        , glog(desktop.NewGlog(GlogOptions().Size(240, 60))) {
        Rect place = {200, 300, 260, 540}, box = {20, 20, 40, 220};
        PositionGlog(glog, &place, false);
        field = GTextPane::NewGTextPane(glog, 1, &box, UString(), nullptr);
        ShowGlog(glog, kShowGlog);
        WaitFor([this] { return Glog::From(glog).IsActive(); });
        field->Select(true);
        desktop.ProcessEvents(kStep);
    }

    // Handles events until it is so.
    void WaitFor(std::function<bool()> const &isSo) {
        for (double waited = 0; waited < kPatience && !isSo(); waited += kStep)
            desktop.ProcessEvents(kStep);
        EXPECT_TRUE(isSo());
    }
    // What the command of the shell prints, while events are handled.
    std::string RunBeside(std::string const &command) {
        std::future<std::string> output = std::async(std::launch::async, OutputOf, command);
        while (output.wait_for(std::chrono::seconds(0)) != std::future_status::ready)
            desktop.ProcessEvents(kStep);
        return output.get();
    }
    // Lets another program have the clipboard, with what the command of the shell prints. It takes it in a
    // process of its own, maybe after its command is over.
    void GiveClipboard(std::string const &command) {
        unsigned long const before = screen.ClipboardOwner();
        RunBeside(command + " | xclip -i -selection clipboard >/dev/null 2>&1");
        WaitFor([&] { return screen.ClipboardOwner() != before; });
    }
    std::string Text() const { return Utf::ToUtf8(field->GetText()); }
    void ExpectText(std::string const &text) {
        WaitFor([&] { return Text() == text; });
        EXPECT_EQ(Text(), text);
    }

    Desktop desktop;
    glogRec *glog;
    GTextPane *field;
    XScreen screen;
};

} // namespace

TEST_F(RealTextField, TakesWhatIsTyped) {
    RunBeside("xdotool type --delay 20 'Take 12!'");
    ExpectText("Take 12!");
}

TEST_F(RealTextField, WhatIsCopiedReachesOtherPrograms) {
    field->SetText(Utf::FromUtf8("caf\xC3\xA9 \xE2\x99\xAA \xF0\x9F\x98\x80"));
    RunBeside("xdotool key ctrl+a key ctrl+c sleep 0.2");
    EXPECT_EQ(RunBeside("xclip -o -selection clipboard"), "caf\xC3\xA9 \xE2\x99\xAA \xF0\x9F\x98\x80");
}

TEST_F(RealTextField, WhatOtherProgramsCopyIsPasted) {
    GiveClipboard("printf 'na\xC3\xAFve \xF0\x9F\x98\x80'");
    RunBeside("xdotool key ctrl+v");
    ExpectText("na\xC3\xAFve \xF0\x9F\x98\x80");
}

TEST_F(RealTextField, WhatIsCutComesBackByWayOfAnotherProgram) {
    field->SetText(Utf::FromUtf8("\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D 1"));
    RunBeside("xdotool key ctrl+a key ctrl+x");
    ExpectText("");
    // The other one owns the clipboard now, with the text that it was given.
    GiveClipboard("xclip -o -selection clipboard");
    RunBeside("xdotool key ctrl+v key ctrl+v");
    ExpectText("\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D 1\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D 1");
}
