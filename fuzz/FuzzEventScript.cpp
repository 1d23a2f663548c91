// Event scripts, read and played on a small dialog.
#include "buttons/FrameButtonPane.h"
#include "buttons/OvalButtonPane.h"
#include "buttons/StudButtonPane.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "fuzz/support/Entry.h"
#include "fuzz/support/Require.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"
#include <algorithm>
#include <string>
#include <vector>

namespace {

std::string const kName = "script";
int const kWidth = 160, kHeight = 120;
// A script may ask for a window of a gigabyte.
int const kLargestSide = 400; // pixels

typedef std::vector<ScriptStep> Steps;

// Nothing of what a fuzzer makes up may write to files.
bool WritesFile(ScriptStep const &step) {
    return step.kind == ScriptStep::kSnapshot || step.kind == ScriptStep::kDump ||
           step.kind == ScriptStep::kPrint;
}

// Empty when the script is refused, which has to be with its name.
Steps Parse(std::string const &script) {
    try {
        Steps steps = EventScript::Parse(script, kName);
        steps.erase(std::remove_if(steps.begin(), steps.end(), WritesFile), steps.end());
        return steps;
    } catch (ScriptError const &error) {
        Require(std::string(error.what()).compare(0, kName.size(), kName) == 0,
                "an error begins with the script's name");
        return Steps();
    }
}

void AddPanes(glogRec *glog) {
    gobResRec oval = {gobResRec::kKind, 10, 10, 60, 1, GlogButtonPane::kEnabled};
    OvalButtonPane::NewOvalButtonPane(glog, &oval);
    studResRec stud = {studResRec::kKind, 40, 10, 1, 60};
    StudButtonPane::NewStudButtonPane(glog, &stud);
    gfbResRec frame = {gfbResRec::kKind, {10, 90}, 1608, 69, {0, 0}, 0, 0};
    FrameButtonPane::NewFrameButtonPane(glog, &frame);
    Rect place = {90, 10, 104, 150};
    LabelPane::NewLabelPane(glog, 4, &place, false, UString("Level", UString::kByteEncoding1));
}

// A desktop of its own for each script: what one has pressed must not be down in the next.
void Play(Steps const &steps) {
    SimulatedDesktop desktop;
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(kWidth, kHeight).Growable(true));
    glog->SetMaxSize(kLargestSide, kLargestSide);
    AddPanes(glog);
    ShowGlog(glog, kShowGlog);
    SimulatedWindowSystem &windows = static_cast<SimulatedWindowSystem &>(desktop.Windows());
    windows.Append(steps);
    try {
        desktop.Run();
        Require(windows.AtEnd(), "a script that can go on is played to its end");
    } catch (ScriptError const &error) {
        Require(error.what()[0] != '\0', "an error says what is wrong");
    }
    Require(GetGlogWidth(glog) <= kLargestSide && GetGlogHeight(glog) <= kLargestSide,
            "a window keeps to its limits");
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    Steps const steps = Parse(std::string(reinterpret_cast<char const *>(data), size));
    if (!steps.empty())
        Play(steps);
    return 0;
}
