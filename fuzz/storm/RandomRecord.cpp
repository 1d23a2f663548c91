#include "fuzz/storm/RandomRecord.h"

namespace {

// The numbers of a record behind its kind, a letter each: the edges and sides of its place, an icon family, a
// picture, a menu, and others that are any number, positive, small, or the digit itself; t is two letters of
// text.
struct Kind {
    int kind;
    char const *numbers;
};

Kind const kKinds[] = {{2, "nTLBRnn"},       {3, "nnnnnnn"},       {4, "TLBR0s0pnnnnss0s0"},
                       {5, "TLnW"},          {8, "TLBRnnnnn00t"},  {9, "BLn0t"},
                       {10, "TLBRsP"},       {11, "TLBR"},         {12, "TLBR"},
                       {13, "TLFnTLnn"},     {14, "ps"},           {18, "TLWns"},
                       {43, "nTLBRM"},       {47, "TLWHFnps"},     {49, "TLWHFnpspnnnnn"},
                       {53, "nn1TLn1BLn2t"}, {54, "nn1TLn1BLn2t"}, {64, "TLBR0F0n0p0"}};

int const kFamilies[] = {1002, 1007, 1608, 1821, 2002, 0, 1841};
int const kPictures[] = {9003, 9004, 1};
int const kMenu = 137;
int const kUsualNumber = 24, kLargest = 32767;

void Add(std::string &bytes, int number) {
    bytes += static_cast<char>(number & 0xFF);
    bytes += static_cast<char>(number >> 8 & 0xFF);
}

int NumberFor(char letter, Chance &chance, Rect const &place) {
    switch (letter) {
    case 'T':
        return place.top;
    case 'L':
        return place.left;
    case 'B':
        return place.bottom;
    case 'R':
        return place.right;
    case 'W':
        return place.right - place.left;
    case 'H':
        return place.bottom - place.top;
    case 'F':
        return chance.Of(kFamilies);
    case 'P':
        return chance.Of(kPictures);
    case 'M':
        return kMenu;
    case 't':
        return 'a' | 'b' << 8;
    case 'n':
        return chance.OneIn(20) ? chance.Between(-kLargest, kLargest) : chance.Between(-2, kUsualNumber);
    case 'p':
        return chance.Between(1, kUsualNumber);
    case 's':
        return chance.Below(3);
    default:
        return letter - '0';
    }
}

} // namespace

std::string RandomRecord::Of(Chance &chance, Rect const &place) {
    Kind const &kind = chance.Of(kKinds);
    std::string record;
    Add(record, kind.kind);
    for (char const *letter = kind.numbers; *letter; ++letter)
        Add(record, NumberFor(*letter, chance, place));
    std::string dialog = "GLOGREC1";
    for (int number : {100, 100, 1, static_cast<int>(record.size())})
        Add(dialog, number);
    return dialog + record;
}
