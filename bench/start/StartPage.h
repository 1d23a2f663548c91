// What the two programs that are timed at their start show: 200 icons and 50 labels. Plain numbers only,
// since one of the two has nothing else to go by.
#pragma once
#include <string>

namespace StartPage {

int const kWidth = 800, kHeight = 600; // pixels
char const kTitle[] = "Start";

int const kIcons = 200, kIconColumns = 25;
short const kIconFamily = 1841;
int const kIconKinds = 6; // from index 0
int const kIconLeft = 10, kIconTop = 10, kIconColumnWidth = 31, kIconRowHeight = 28;

int const kLabels = 50, kLabelColumns = 5;
int const kLabelLeft = 20, kFirstBaseline = 270, kLabelColumnWidth = 150, kLabelRowHeight = 30;

struct Place {
    int h, v;
};

inline Place OfIcon(int number) {
    return {kIconLeft + number % kIconColumns * kIconColumnWidth,
            kIconTop + number / kIconColumns * kIconRowHeight};
}
inline int KindOfIcon(int number) { return number % kIconKinds; }

// The start of the baseline.
inline Place OfLabel(int number) {
    return {kLabelLeft + number % kLabelColumns * kLabelColumnWidth,
            kFirstBaseline + number / kLabelColumns * kLabelRowHeight};
}
inline std::string TextOfLabel(int number) { return "Input " + std::to_string(number + 1) + " level"; }

} // namespace StartPage
