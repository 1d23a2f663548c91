// The desktop under the panes: what a program opens first and closes last.
#pragma once
#include <functional>
#include <memory>
#include <string>
#include <vector>

class DesktopRep;
class GlogPane;
class GlogStyleSheet;
class WindowSystem;
struct glogRec;

// How a desktop is opened; every setting has a default.
class DesktopOptions {
public:
    // "light" (default) or "dark".
    DesktopOptions &Theme(std::string const &name) { return theme = name, *this; }
    // Device pixels per pixel, 0.5 to 4; 0 (default): the display's.
    DesktopOptions &Scale(double factor) { return scale = factor, *this; }
    // "en" (default) or "de".
    DesktopOptions &Language(std::string const &code) { return language = code, *this; }
    // The directory of the artwork; default: beside the library.
    DesktopOptions &Artwork(std::string const &path) { return artwork = path, *this; }

    // What was set.
    std::string theme = "light";
    double scale = 0;
    std::string language = "en";
    std::string artwork;
};

// How a glog is made in code; dialogs in XML say the same in attributes.
class GlogOptions {
public:
    GlogOptions &Title(std::string const &utf8) { return title = utf8, *this; } // of the window
    GlogOptions &Size(int w, int h) { return width = w, height = h, *this; } // content in pixels, 1 to 16000
    GlogOptions &Growable(bool on) { return growable = on, *this; }          // by the user; default: not
    // Without a frame, above other windows, and never the active one: for what is up while the mouse is held.
    GlogOptions &Popup(bool on) { return popup = on, *this; }
    // The glog's own style sheet; the glog takes it over. Default: none.
    GlogOptions &StyleSheet(std::shared_ptr<GlogStyleSheet> sheet) {
        return styleSheet = std::move(sheet), *this;
    }

    // What was set.
    std::string title;
    int width = 320, height = 200;
    bool growable = false, popup = false;
    std::shared_ptr<GlogStyleSheet> styleSheet;
};

// How a window is printed.
class PrintOptions {
public:
    // "A4" (default) or "Letter".
    PrintOptions &Paper(std::string const &name) { return paper = name, *this; }
    // Texts for the top of every page, in UTF-8: the first line, what stands right of it, the second line.
    // Default: the window's title and nothing else.
    PrintOptions &Header(std::string const &first, std::string const &beside, std::string const &second) {
        return header = {first, beside, second}, *this;
    }

    // What was set.
    std::string paper = "A4";
    std::vector<std::string> header;
};

// Opens the window system and the resources; closes all glogs and both when it goes. One at a time: a second
// one throws std::logic_error. The constructor throws std::runtime_error with the reason when there is no
// display or no artwork. For a display it has Xlib keep its table of composed keys in the folder glogpanes of
// the user's cache, by a variable of the environment that is set meanwhile: no other thread may read the
// environment then.
class Desktop {
public:
    explicit Desktop(DesktopOptions const & = DesktopOptions()); // real windows
    virtual ~Desktop();
    Desktop(Desktop const &) = delete;
    Desktop &operator=(Desktop const &) = delete;
    static Desktop *Current(); // null while there is none

    // A new, invisible glog without panes. The desktop owns it until DisposeGlog; a closed window disposes of
    // its glog.
    glogRec *NewGlog(GlogOptions const &);
    // Calls GlogItemInit on every pane; for glogs made in code, once all panes stand. ShowGlog calls it if
    // nobody did.
    void FinishGlog(glogRec *);

    int Run(); // handles events until the last visible glog closes or Quit; the exit status
    bool ProcessEvents(double seconds); // handles what comes within the time; false once Run would have ended
    void Quit(int status = 0);          // ends Run, which answers the status

    // Both redraw everything. Unknown themes and scales out of range throw std::invalid_argument and change
    // nothing.
    void SetTheme(std::string const &);
    std::string const &Theme() const;
    void SetScale(double);

    // What a hit item does: called with the glog, the item's number and the value that HandleClick or Key
    // gave.
    typedef std::function<void(glogRec *, int item, int value)> HitHandler;
    void SetHitHandler(HitHandler);

    // One line of JSON for every message, and for what HandleClick, Key and Tab returned. An empty function
    // ends it.
    typedef std::function<void(std::string const &line)> LineSink;
    void WatchMessages(LineSink);
    void WatchDrawing(LineSink);
    std::string DumpTree(glogRec *) const; // JSON: every pane with class, id, box and state

    // Writes what the glog's window shows, with a menu that is open over it, in device pixels; throws
    // std::runtime_error when the file cannot be written.
    void Snapshot(glogRec *, std::string const &pngPath);

    // Prints all that the glog's visible panes have to print into one PDF file; the number of pages. 0: there
    // was nothing, and no file was made. Throws std::invalid_argument for a paper that it does not know,
    // std::logic_error while something is being printed, and std::runtime_error when the file cannot be
    // written; an older file of that name is untouched then.
    int Print(glogRec *, std::string const &pdfPath, PrintOptions const & = PrintOptions());
    // The same of one pane and what it contains.
    int Print(GlogPane *, std::string const &pdfPath, PrintOptions const & = PrintOptions());

    // What shows the windows and supplies events and time.
    WindowSystem &Windows();

protected:
    Desktop(DesktopOptions const &, std::unique_ptr<WindowSystem>);

private:
    friend class DesktopRep;
    std::unique_ptr<DesktopRep> rep;
};
