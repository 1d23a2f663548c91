// The takes that the gallery's lists show: up to a million of them, in an order of their own.
#pragma once
#include "host/UString.h"
#include <vector>

class Takes {
public:
    explicit Takes(int count);

    int Count() const { return static_cast<int>(order.size()); }
    // Of the take in a row, from 0.
    UString Number(int row) const; // from 1, as it was recorded
    UString Name(int row) const;
    UString Length(int row) const; // minutes and seconds
    bool IsKept(int row) const { return kept[Index(row)]; }
    void SetKept(int row, bool on) { kept[Index(row)] = on; }
    // The row goes to where it is counted as `to` afterwards.
    void Move(int from, int to);

private:
    int Take(int row) const { return order[static_cast<std::size_t>(row)]; }
    std::size_t Index(int row) const { return static_cast<std::size_t>(Take(row)); }

    std::vector<int> order;
    std::vector<bool> kept; // by take
};
