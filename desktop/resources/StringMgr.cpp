#include "host/StringMgr.h"
#include "host/TarnError.h"
#include <deque>
#include <limits>
#include <vector>

namespace {

// Keys count from 1, so that a record of zeroes names no string.
constexpr std::size_t kMostStrings = std::numeric_limits<short>::max();

struct Entry {
    UString text;
    bool used = false;
};

// A deque, since references that Lookup gave must outlive the strings that are stored later.
struct Table {
    std::deque<Entry> entries;
    std::vector<short> freeKeys;
};

Table &TheTable() {
    // Never destroyed: panes of static lifetime free their keys after everything else.
    static Table *table = new Table;
    return *table;
}

Entry *Find(short key) {
    Table &table = TheTable();
    if (key < 1 || static_cast<std::size_t>(key) > table.entries.size())
        return nullptr;
    Entry &entry = table.entries[static_cast<std::size_t>(key) - 1];
    return entry.used ? &entry : nullptr;
}

short NewKey() {
    Table &table = TheTable();
    if (!table.freeKeys.empty()) {
        short const key = table.freeKeys.back();
        table.freeKeys.pop_back();
        return key;
    }
    if (table.entries.size() == kMostStrings)
        FailMemFullError();
    table.entries.emplace_back();
    return static_cast<short>(table.entries.size());
}

} // namespace

StringMgr &StringMgr::Instance() {
    static StringMgr manager;
    return manager;
}

short StringMgr::Store(UString const &text) {
    short const key = NewKey();
    Entry &entry = TheTable().entries[static_cast<std::size_t>(key) - 1];
    entry.text = text;
    entry.used = true;
    return key;
}

UString const &StringMgr::Lookup(short key) const {
    static UString const empty;
    Entry const *entry = Find(key);
    return entry ? entry->text : empty;
}

void StringMgr::Free(short key) {
    Entry *entry = Find(key);
    if (!entry)
        return;
    entry->text = UString();
    entry->used = false;
    TheTable().freeKeys.push_back(key);
}
