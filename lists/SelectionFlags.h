// Which rows of a list are selected.
#pragma once
#include <cstddef>
#include <vector>

// A number for each row, above 0 for one that is selected. At rest it is 0 or 1; while a gesture runs the
// number also tells what the row was before, see GListPane. Takes two bytes a row, and a count for each block
// of some thousand rows, by which rows without a flag are passed over.
class SelectionFlags {
public:
    static constexpr int kNone = -1; // no such row

    int Count() const { return static_cast<int>(flags.size()); }  // of rows
    bool Has(int row) const { return row >= 0 && row < Count(); } // whether there is the row
    // 0 for a row that there is not.
    int At(int row) const { return Has(row) ? flags[static_cast<std::size_t>(row)] : 0; }
    bool IsSelected(int row) const { return At(row) > 0; }

    // Rows that are added get 0. Below 0 is 0. Throws std::bad_alloc when there is no room, and changes
    // nothing then.
    void SetCount(int);
    // No rows, and no memory.
    void Clear();
    // A row that there is not is left alone. A number beyond 16 bits becomes the nearest one that is as odd
    // or even.
    void Set(int row, int flag);
    void SetAllToZero();
    void SetZerosToOne(); // other flags stay
    // Rows from the place on move by one, the new one has 0. A place beyond the ends becomes the end. Throws
    // like SetCount.
    void Insert(int row);
    // Rows behind it move by one. Nothing for a row that there is not.
    void Remove(int row);

    int NumNonZero() const;               // rows whose flag is not 0
    int FirstNonZero() const;             // the lowest of them, or kNone
    int FirstSelectedFrom(int row) const; // the lowest selected row that is not before this one, or kNone
    int LastSelectedTo(int row) const;    // the highest selected row that is not behind this one, or kNone
    // 1 for what is selected, 0 for the rest. Looks only at rows whose flag may be another number.
    void Normalise();

private:
    typedef std::vector<short> Flags;

    std::size_t EndOfBlock(std::size_t block) const;
    void CountAnew();
    void NormaliseAllNextTime();

    Flags flags;
    std::vector<unsigned short> nonZero; // by block: how many flags in it are not 0
    int oddFirst = 0, oddLast = kNone;   // the rows among which there may be flags other than 0 and 1
};
