// The form that every toolkit shows: 10 groups of 5 radio buttons, and below them check boxes in rows of 20,
// all with a label. Plain numbers and names, since each toolkit has its own types.
#pragma once
#include <string>

namespace PeerForm {

char const kTitle[] = "Peers";
char const kFontFamily[] = "Roboto";
int const kFontSize = 12; // pixels

int const kColumns = 20, kColumnWidth = 90, kRowHeight = 24; // pixels
int const kGroups = 10, kRadiosPerGroup = 5;
int const kGroupWidth = kColumns / kGroups * kColumnWidth, kGroupHeight = kRadiosPerGroup * kRowHeight;
int const kWidth = kColumns * kColumnWidth;

int const kBoxes = 400;      // of the form that is timed
int const kManyBoxes = 1600; // of the one that it is compared with for its memory

inline int HeightFor(int boxes) { return kGroupHeight + boxes / kColumns * kRowHeight; }

struct Place {
    int h, v; // top left, pixels
};

inline Place OfBox(int box) {
    return {box % kColumns * kColumnWidth, kGroupHeight + box / kColumns * kRowHeight};
}
inline Place OfGroup(int group) { return {group * kGroupWidth, 0}; }
// Within its group.
inline Place OfRadio(int radio) { return {0, radio * kRowHeight}; }

inline std::string TextOfBox(int box) { return "Track " + std::to_string(box + 1); }
inline std::string TextOfRadio(int radio) { return "Mode " + std::to_string(radio + 1); }

} // namespace PeerForm
