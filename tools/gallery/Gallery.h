// The gallery's window: a list of pages at the left, the page that was chosen, and a line that reports what
// was hit.
#pragma once
#include "desktop/Desktop.h"
#include "host/UString.h"
#include "tools/gallery/CommandReport.h"
#include "tools/gallery/PageFiles.h"
#include <string>

class CompoundPane;
class GlogPane;

class Gallery {
public:
    // Makes and shows the window with the first page. Takes the desktop's hit handler. Throws LoadError for a
    // dialog that is wrong.
    Gallery(Desktop &, PageFiles const &, double scale);

    // Puts another page into the window; when its dialog is wrong LoadError is thrown and the page before
    // stays.
    void ShowPage(std::size_t);
    glogRec *Window() const { return window; }

private:
    void AddPageButtons();
    void Hit(int item, int value);
    void ShowEffect(GlogPane *, int item);
    bool Navigate(int item);
    void SetScale(double);
    void MarkChoices();
    void Report(GlogPane *, int item, int value);
    void ReportCommand(CommandSpecifier const &);
    void SetStatus(UString const &);
    GlogPane *Find(int id) const;
    CompoundPane *Container(int id) const;
    void Choose(int id, bool);

    Desktop &desktop;
    PageFiles const &files;
    glogRec *window;
    CommandReport commands;
    std::size_t page = 0;
    double scale; // 0: the display's
};
