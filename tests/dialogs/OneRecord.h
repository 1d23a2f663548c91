// A binary dialog of one record.
#pragma once
#include "dialogs/LoadGlog.h"
#include <vector>

// Loads a dialog of 320 x 200 whose one record has these numbers of 16 bits.
inline glogRec *LoadOneRecord(std::vector<int> const &shorts) {
    std::vector<unsigned char> bytes(reinterpret_cast<unsigned char const *>("GLOGREC1"),
                                     reinterpret_cast<unsigned char const *>("GLOGREC1") + 8);
    auto const add = [&bytes](int number) {
        bytes.push_back(static_cast<unsigned char>(number & 0xFF));
        bytes.push_back(static_cast<unsigned char>(number >> 8 & 0xFF));
    };
    for (int number : {320, 200, 1, static_cast<int>(shorts.size() * 2)})
        add(number);
    for (int number : shorts)
        add(number);
    return LoadGlogFromRecords(bytes.data(), bytes.size(), GlogOptions(), "old.glog");
}
