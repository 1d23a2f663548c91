// A walk through the gallery: each page is opened with its button, and each kind of control on it is used.
//
// gallery-walk.txt is the walk's record: lines without an indent are steps, and under each stands what it led
// to: the messages as the desktop reports them, without time, and what a label says afterwards.
//
//     page NAME                     the page's button is clicked
//     click ITEM[.PART] [MODIFIER]  the middle of an item of the page, or of a part or half of it
//     slide ITEM[.PART]             the mouse is pressed there, moved off, and released
//     hold ITEM[.PART]              the mouse is held there for half a second
//     choose ITEM ANSWER            it is clicked, and the menu that opens is answered, as in scripts
//     ask ITEM ANSWER...            it is clicked, and the dialog that opens gets the keys, or clicks at H,V
//     drag ITEM[.PART] H V          the mouse is pressed there, moved that far right and down, and released
//     grab ITEM[.PART] H V H2 V2    the mouse is pressed so far from its top left corner, and dragged so far
//     wheel ITEM[.PART] H V         the wheel is turned there
//     type TEXT                     the letters are typed
//     key NAME [MODIFIER]           the key is pressed
//     label ITEM                    nothing is done; the label's text follows
//     bar ITEM                      the same with where a scroll bar stands
//
// After every step a full redraw must change nothing.
#include "buttons/BoxSelectPane.h"
#include "buttons/ButtonGroupPane.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "dialogs/Utf8.h"
#include "host/CompoundPane.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include "tests/screens/GalleryPages.h"
#include "text/LabelPane.h"
#include "tools/TextFile.h"
#include "tools/gallery/Gallery.h"
#include <algorithm>
#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <set>
#include <sstream>

namespace {

typedef std::vector<std::string> Lines;

int const kStatus = 9002;       // the line that tells what was hit
int const kPagePlace = 9001;    // what holds the page
int const kFirstPage = 9100;    // the button of the first page
char const kIndent[] = "    ";  // of what a step led to
char const kAside[] = "890 10"; // in the window, off every control

int const kTrough = 1, kThumb = 3; // parts of a scroll bar; 0 and 2 are its arrows
double const kLeastThumb = 16;     // pixels

// Classes of panes that nobody clicks, or that are clicked as the list that they are parts of.
std::set<std::string> const kStill = {"GroupPane",
                                      "LabelPane",
                                      "MultiStringPane",
                                      "StringGroupPane",
                                      "StyledStringPane",
                                      "TextPane",
                                      "SpacerPane",
                                      "BackdropPane",
                                      "WellPane",
                                      "SuccessiveIconsPane",
                                      "DialogScrollPane",
                                      "RowNumberPane",
                                      "TrackListPane::Table",
                                      "TrackListPane::Rows",
                                      "TrackListPane::Numbers",
                                      "TakeListPane::List",
                                      "SearchTextPane",
                                      "ListHeaderPane",
                                      "TrackRowPane",
                                      "GLinePane",
                                      "LinesPane",
                                      "LinesPane::Gutter",
                                      "LinesPane::Lines",
                                      "ListPane::HelperPane",
                                      "ProgressBarPane",
                                      "WaveViewPane",
                                      "WaveViewPane::Wave",
                                      "ZoomControlPane::ButtonPane"};

// Where a step is taken: "ITEM" or "ITEM.PART".
struct Place {
    explicit Place(std::string const &text)
        : item(std::stoi(text))
        , part(text.find('.') == std::string::npos ? -1 : std::stoi(text.substr(text.find('.') + 1))) {}
    int item;
    int part; // -1: all of it
};

Lines LinesOf(std::string const &text) {
    Lines lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);)
        lines.push_back(line);
    return lines;
}

std::string OutputPath() {
    std::string const directory = std::string(GLOG_TEST_OUTPUT_DIR) + "/screens";
    std::filesystem::create_directories(directory);
    return directory + "/gallery-walk.txt";
}

Rect HalfOf(Rect box, bool lower) {
    short const middle = static_cast<short>((box.top + box.bottom) / 2);
    (lower ? box.top : box.bottom) = middle;
    return box;
}

class GalleryWalk : public testing::Test {
protected:
    GalleryWalk()
        : desktop(DesktopOptions().Scale(1))
        , gallery(desktop, GalleryFiles(), 1) {
        desktop.TakeMessages();
    }

    GlogPane &Item(int id) const {
        GlogPane *const pane = GetGlogItem(gallery.Window(), static_cast<short>(id));
        if (!pane)
            throw std::runtime_error("there is no item " + std::to_string(id));
        return *pane;
    }

    // The item, or a scroll bar's arrow or trough, in which its thumb lies.
    GlogPane &PaneAt(Place const &place) const {
        ScrollBarPane *const bar = dynamic_cast<ScrollBarPane *>(&Item(place.item));
        int const part = place.part == kThumb ? kTrough : place.part;
        return bar && part >= 0 ? *bar->Get(static_cast<short>(part)) : Item(place.item);
    }

    // Of the bar's thumb as its client has it, in the trough.
    static Rect ThumbIn(Rect trough, ScrollBarPane &bar) {
        SingleAxis const along(!bar.IsHorizontal());
        double const length = along.Length(trough);
        double const thumb = std::max(bar.GetClient()->GetThumbRatio(&bar) * length, kLeastThumb);
        double const way = (length - thumb) * bar.GetPosition() / bar.GetRange();
        along.Start(trough) = static_cast<short>(along.Start(trough) + way);
        along.End(trough) = static_cast<short>(along.Start(trough) + thumb);
        return trough;
    }

    Rect RectOf(Place const &place) const {
        GlogPane &pane = PaneAt(place);
        short const part = static_cast<short>(place.part);
        Rect rect;
        if (ButtonGroupPane *group = dynamic_cast<ButtonGroupPane *>(&pane)) {
            group->GetButtonBounds(part, &rect);
            return rect;
        }
        if (BoxSelectPane *boxes = dynamic_cast<BoxSelectPane *>(&pane)) {
            boxes->GetOneBox(part, &rect);
            return rect;
        }
        rect = pane.GetDrawRectangle();
        if (place.part == kThumb)
            return ThumbIn(rect, dynamic_cast<ScrollBarPane &>(Item(place.item)));
        return place.part < 0 || &pane != &Item(place.item) ? rect : HalfOf(rect, place.part == 1);
    }

    // The middle of the place in the window, or what lies that far from it, as scripts have it.
    std::string Spot(Place const &place, int right = 0, int down = 0) const {
        Rect const rect = RectOf(place);
        Point const origin = PaneAccess::Origin(PaneAt(place));
        return std::to_string(origin.h + (rect.left + rect.right) / 2 + right) + ' ' +
               std::to_string(origin.v + (rect.top + rect.bottom) / 2 + down);
    }

    std::string LabelText(int id) const {
        LabelPane *const label = dynamic_cast<LabelPane *>(&Item(id));
        return label ? Utf8::FromUString(label->GetText()) : "no label";
    }

    std::string BarText(int id) const {
        ScrollBarPane &bar = dynamic_cast<ScrollBarPane &>(Item(id));
        return std::to_string(bar.GetPosition()) + " of " + std::to_string(bar.GetRange());
    }

    void OpenPage(std::string const &name) {
        int const index = static_cast<int>(GalleryFiles().Find(name));
        ExpectEveryKindUsed();
        visited.insert(name);
        desktop.Play("click " + Spot(Place(std::to_string(kFirstPage + index))) + "\nwait 1\n");
        unused = ClassesIn(Item(kPagePlace));
    }

    // Of the page that is about to be left.
    void ExpectEveryKindUsed() const { EXPECT_EQ(unused, std::set<std::string>()); }

    // The classes of what can be clicked in the container.
    static std::set<std::string> ClassesIn(GlogPane &pane) {
        std::set<std::string> classes;
        CompoundPane *const container = dynamic_cast<CompoundPane *>(&pane);
        for (short i = 0; container && i < container->NumSubpanes(); ++i)
            classes.merge(ClassesIn(*container->Get(i)));
        if (!kStill.count(MessageTrace::ClassName(pane)))
            classes.insert(MessageTrace::ClassName(pane));
        return classes;
    }

    // What stands behind the place in the step is left in the words.
    void Use(std::string const &gesture, Place const &place, std::istream &words) {
        unused.erase(MessageTrace::ClassName(Item(place.item)));
        unused.erase(MessageTrace::ClassName(PaneAt(place)));
        std::string const spot = Spot(place);
        std::string modifier, answer;
        int right = 0, down = 0;
        if (gesture == "click")
            desktop.Play("click " + spot + (words >> modifier ? ' ' + modifier : "") + "\nwait 1\n");
        else if (gesture == "choose" && words >> answer)
            desktop.Play("click " + spot + "\nmenu " + answer + "\nwait 1\n");
        else if (gesture == "ask")
            Ask(spot, words);
        else if (gesture == "drag" && words >> right >> down)
            desktop.Play("press " + spot + "\nmove " + Spot(place, right, down) + "\nrelease\nwait 1\n");
        else if (gesture == "grab" && words >> right >> down)
            Grab(place, right, down, words);
        else if (gesture == "wheel" && words >> right >> down)
            desktop.Play("wheel " + spot + ' ' + std::to_string(right) + ' ' + std::to_string(down) +
                         "\nwait 1\n");
        else if (gesture == "slide")
            desktop.Play("press " + spot + "\nmove " + kAside + "\nrelease\nwait 1\n");
        else if (gesture == "hold")
            desktop.Play("press " + spot + "\nwait 0.5\nrelease\nwait 1\n");
        else
            throw std::runtime_error("there is no step \"" + gesture + '"');
    }

    void Ask(std::string const &spot, std::istream &words) {
        std::string script = "click " + spot + "\nwait 1\n";
        for (std::string key; words >> key;)
            script += (key.find(',') == std::string::npos ? "key " + key
                                                          : "click " + key.replace(key.find(','), 1, " ")) +
                      "\nwait 1\n";
        desktop.Play(script);
    }

    // So far from the place's top left corner.
    void Grab(Place const &place, int right, int down, std::istream &words) {
        Rect const rect = RectOf(place);
        int const toLeft = (rect.left - rect.right) / 2, toTop = (rect.top - rect.bottom) / 2;
        int farther = 0, lower = 0;
        if (!(words >> farther >> lower))
            throw std::runtime_error("it is not said how far to drag");
        desktop.Play("press " + Spot(place, toLeft + right, toTop + down) + "\nmove " +
                     Spot(place, toLeft + right + farther, toTop + down + lower) + "\nrelease\nwait 1\n");
    }

    // Takes the step; the record gets what it led to.
    void Take(std::string const &step) {
        std::istringstream words(step);
        std::string gesture, where;
        words >> gesture >> where;
        record += step + '\n';
        if (gesture == "page")
            OpenPage(where);
        else if (gesture == "type")
            desktop.Play("type \"" + where + "\"\n");
        else if (gesture == "key")
            desktop.Play(step + "\n");
        else if (gesture != "label" && gesture != "bar")
            Use(gesture, Place(where), words);
        RecordMessages();
        record += kIndent + Told(gesture, where) + '\n';
        EXPECT_TRUE(IsWhole()) << step;
    }

    // What the window says after a step.
    std::string Told(std::string const &gesture, std::string const &where) const {
        if (gesture == "bar")
            return BarText(Place(where).item);
        return LabelText(gesture == "label" ? Place(where).item : kStatus);
    }

    // All but what containers answer to clicks, which is what the pane in them answers.
    void RecordMessages() {
        for (std::string const &line : desktop.TakeMessages()) {
            std::size_t const start = line.find(',') + 1; // after the time
            if (line.find("\"pane\":\"GroupPane\"") == std::string::npos)
                record += kIndent + line.substr(start, line.size() - start - 1) + '\n';
        }
    }

    // Whether the window shows what a full redraw shows.
    bool IsWhole() {
        Glog &glog = Glog::From(gallery.Window());
        glog.Update();
        Surface const &picture = *glog.Pixels();
        std::vector<std::uint32_t> const shown(picture.Pixels(),
                                               picture.Pixels() + picture.Width() * picture.Height());
        glog.DamageAll();
        glog.Update();
        return std::equal(shown.begin(), shown.end(), glog.Pixels()->Pixels());
    }

    SimulatedDesktop desktop;
    Gallery gallery;
    std::set<std::string> visited; // pages
    std::set<std::string> unused;  // classes of controls of the page that no step has used
    std::string record;
};

TEST_F(GalleryWalk, LeadsToTheMessagesOfTheRecord) {
    std::string const kept = TextFile::Read(TreeDirectory() + "/tests/screens/gallery-walk.txt");
    for (std::string const &line : LinesOf(kept)) {
        if (line.compare(0, sizeof kIndent - 1, kIndent) != 0)
            Take(line);
    }
    ExpectEveryKindUsed();
    EXPECT_EQ(visited.size(), GalleryFiles().Pages().size());
    std::ofstream(OutputPath()) << record;
    EXPECT_EQ(kept, record) << "what it led to is in " << OutputPath();
}

} // namespace
