// Shows the page of the start benchmark with panes, until it is told to end.
#include "bench/start/StartPage.h"
#include "desktop/Desktop.h"
#include "host/GlogPane.h"
#include "host/Icons.h"
#include "host/PortSavers.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"
#include <cstdio>
#include <cstdlib>
#include <exception>

namespace {

// All icons of the page.
class IconsPane : public GlogPane {
protected:
    void DrawGuts(OSRgn *) override {
        ClearColors();
        for (int i = 0; i < StartPage::kIcons; ++i) {
            StartPage::Place const place = StartPage::OfIcon(i);
            Draw1Icon(StartPage::kIconFamily, static_cast<short>(StartPage::KindOfIcon(i)),
                      static_cast<short>(place.h), static_cast<short>(place.v));
        }
    }
};

void AddIcons(glogRec *glog) {
    IconsPane *const icons = new IconsPane;
    icons->GlogPaneInit(glog, 0);
    Rect box = {0, 0, GetGlogHeight(glog), GetGlogWidth(glog)};
    icons->SetBox(&box);
}

void AddLabel(glogRec *glog, int number) {
    StartPage::Place const place = StartPage::OfLabel(number);
    short const baseline = static_cast<short>(place.v), left = static_cast<short>(place.h);
    Rect box = {baseline, left, baseline, left};
    UString const text(StartPage::TextOfLabel(number).c_str(), UString::kByteEncoding1);
    LabelPane::NewLabelPane(glog, number + 1, &box, false, text);
}

int Show() {
    Desktop desktop(DesktopOptions().Scale(1));
    glogRec *const glog =
        desktop.NewGlog(GlogOptions().Title(StartPage::kTitle).Size(StartPage::kWidth, StartPage::kHeight));
    AddIcons(glog);
    for (int i = 0; i < StartPage::kLabels; ++i)
        AddLabel(glog, i);
    ShowGlog(glog, kShowGlog);
    return desktop.Run();
}

} // namespace

int main() {
    try {
        return Show();
    } catch (std::exception const &error) {
        std::fprintf(stderr, "%s\n", error.what());
        return EXIT_FAILURE;
    }
}
