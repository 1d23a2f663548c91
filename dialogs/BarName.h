// The scroll bar that an item names.
#pragma once

class GlogPane;
class GlogStyleSheet;
class ScrollBarPane;

// A scroll bar of the same dialog, which may stand behind the pane that names it.
class BarName {
public:
    // The number under the sheet's key, which is a literal.
    BarName(GlogStyleSheet *, char const *key);

    // Null when the dialog names none; throws KeyFault when there is no such bar. Only once the whole dialog
    // stands.
    ScrollBarPane *FindFor(GlogPane &scrolled) const;

private:
    GlogPane *Nearest(GlogPane &scrolled) const;

    char const *key;
    short number;
};
