// What the tests of panes share: a simulated desktop with one glog, and ways to see what a pane draws,
// damages and answers.
#pragma once
#include "desktop/AssertionHandler.h"
#include "desktop/SimulatedDesktop.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogPane.h"
#include "host/GlogStyleSheet.h"
#include "host/PortSavers.h"
#include "host/UString.h"
#include "host/VelaDrawing.h"
#include "host/XMLLib.h"
#include "host/glogRec.h"
#include <boost/make_shared.hpp>
#include <functional>
#include <gtest/gtest.h>
#include <ostream>
#include <stdexcept>
#include <string>
#include <vector>

inline bool operator==(Rect const &a, Rect const &b) {
    return a.top == b.top && a.left == b.left && a.bottom == b.bottom && a.right == b.right;
}
inline bool operator==(Point a, Point b) { return a.v == b.v && a.h == b.h; }
inline std::ostream &operator<<(std::ostream &out, Rect const &r) {
    return out << "{top " << r.top << ", left " << r.left << ", bottom " << r.bottom << ", right " << r.right
               << "}";
}
inline std::ostream &operator<<(std::ostream &out, Point p) {
    return out << "{v " << p.v << ", h " << p.h << "}";
}

// The colours of a port, all components of both.
inline bool operator==(SaveColorRec const &a, SaveColorRec const &b) {
    return a.fore.red == b.fore.red && a.fore.green == b.fore.green && a.fore.blue == b.fore.blue &&
           a.back.red == b.back.red && a.back.green == b.back.green && a.back.blue == b.back.blue;
}
inline std::ostream &operator<<(std::ostream &out, SaveColorRec const &c) {
    return out << std::hex << "{" << c.fore.red << " " << c.fore.green << " " << c.fore.blue << " on "
               << c.back.red << " " << c.back.green << " " << c.back.blue << "}" << std::dec;
}

// Makes the protected operations of a pane class callable: (pane.*&Opened<Pane>::DrawGuts)(nullptr).
template <class Pane> class Opened : public Pane {
public:
    using Pane::DrawGuts;
    using Pane::HandleClick;
};

// A broken invariant, in a test.
class BrokenInvariant : public std::logic_error {
public:
    explicit BrokenInvariant(char const *text)
        : std::logic_error(text) {}
    [[noreturn]] static void Throw(char const *text) { throw BrokenInvariant(text); }
};

class PaneTest : public testing::Test {
protected:
    typedef std::vector<std::string> Lines;

    PaneTest()
        : glog(desktop.NewGlog(GlogOptions().Size(320, 200))) {
        SetAssertionHandler(BrokenInvariant::Throw);
    }
    ~PaneTest() override { SetAssertionHandler(nullptr); }

    static UString Text(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

    static Rect BoxOf(GlogPane &pane) {
        Rect box;
        pane.GetBox(&box);
        return box;
    }

    // Shows the glog and draws it, so that only what comes later is seen as drawing and damage.
    void Show() {
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        desktop.TakePresented(glog);
        desktop.TakeDrawing();
        desktop.TakeMessages();
    }

    // Redraws what is damaged; the rectangles that were presented.
    std::vector<Rect> Repainted() {
        UpdateGlog(glog);
        return desktop.TakePresented(glog);
    }

    // The drawing calls that the action makes in the coordinates of the pane. To be compared with those of
    // another action: tests write what they expect as calls.
    Lines Traced(GlogPane &pane, std::function<void()> const &action) {
        desktop.TakeDrawing();
        pane.Prepare();
        action();
        return desktop.TakeDrawing();
    }

    // Makes the port of another window the current one.
    void LeaveForAnotherPort() {
        if (!other)
            other = desktop.NewGlog(GlogOptions().Size(40, 30));
        SetPortToGlog(other);
    }
    // Whether the port of the test's own window is.
    bool IsInItsPort() const {
        OSPort *port = nullptr;
        VelaDrawing::GetPort(&port);
        return port == glog->GetPort();
    }

    // The drawing calls of the whole pane.
    template <class Pane> Lines DrawingOf(Pane &pane) {
        return Traced(pane, [&] { (pane.*&Opened<Pane>::DrawGuts)(nullptr); });
    }

    // Draws the whole pane in a port with colours that it has no use for; true if they are back afterwards.
    template <class Pane> bool KeepsColors(Pane &pane) {
        SaveColorRec const tinted = {{0xC000, 0x1000, 0x2000}, {0x3000, 0xD000, 0x4000}};
        pane.Prepare();
        SetColors(&tinted);
        (pane.*&Opened<Pane>::DrawGuts)(nullptr);
        SaveColorRec after;
        GetColors(&after);
        return after == tinted;
    }

    // The calls of one name, such as "Draw1Icon".
    static Lines Only(std::string const &operation, Lines const &lines) {
        std::string const mark = "\"op\":\"" + operation + "\"";
        Lines found;
        for (std::string const &line : lines)
            if (line.find(mark) != std::string::npos)
                found.push_back(line);
        return found;
    }

    // What the desktop reports while the script is played, each line from the key on.
    Lines ReportsOf(std::string const &script, std::string const &key) {
        desktop.TakeMessages();
        desktop.Play(script);
        Lines reports;
        for (std::string const &line : desktop.TakeMessages())
            reports.push_back(line.substr(line.find("\"" + key + "\"")));
        return reports;
    }

    // What the pane's HandleClick answers, by the desktop's own report, when the script is played.
    static constexpr int kNoClick = -1000;
    int ResultOfClick(std::string const &script) {
        desktop.TakeMessages();
        desktop.Play(script);
        std::string const mark = "\"message\":\"HandleClick\",\"result\":";
        int result = kNoClick;
        for (std::string const &line : desktop.TakeMessages()) {
            std::size_t const place = line.find(mark);
            if (place != std::string::npos)
                result = std::stoi(line.substr(place + mark.size()));
        }
        return result;
    }

    SimulatedDesktop desktop;
    glogRec *glog;

private:
    glogRec *other = nullptr;
};

// An item as a dialog's loader makes it, for creators that read one.
class TestItem {
public:
    TestItem()
        : item(XMLLib::CreateContainer(Name("Item"))) {}

    TestItem &Integer(char const *key, long long value) {
        item->AddSIntItem(Name(key), value);
        return *this;
    }
    TestItem &String(char const *key, char const *ascii) {
        item->AddUStringItem(Name(key), Name(ascii));
        return *this;
    }
    TestItem &Box(char const *key, Rect const &rect) {
        XMLLib::AddRect(item, Name(key), rect);
        return *this;
    }
    TestItem &Spot(char const *key, Point point) {
        boost::shared_ptr<XMLLib::ContainerItem> const spot = XMLLib::CreateContainer(Name(key));
        spot->AddSIntItem(Name("kV"), point.v);
        spot->AddSIntItem(Name("kH"), point.h);
        item->AddItem(Name(key), spot);
        return *this;
    }

    boost::shared_ptr<XMLLib::ContainerItem> Container() const { return item; }
    // A sheet round the item; valid while this object lives.
    GlogStyleSheet *Sheet() {
        sheet.SetItemRes(item);
        return &sheet;
    }

private:
    static UString Name(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

    boost::shared_ptr<XMLLib::ContainerItem> item;
    GlogStyleSheet sheet;
};
