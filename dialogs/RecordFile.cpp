#include "dialogs/RecordFile.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/PaneMaker.h"
#include "dialogs/RecordBytes.h"
#include "host/GlogPane.h"
#include <cstring>

namespace {

char const kMagic[] = "GLOGREC1";
static_assert(sizeof kMagic - 1 == RecordFile::kMagicSize, "the size of the magic is told");
int const kLargestSide = 16000; // pixels
int const kMostItems = 32767;

LoadError::Place StartOf(std::string const &name) {
    LoadError::Place place;
    place.file = name;
    place.byte = 0;
    return place;
}

std::string Bytes(std::size_t count) { return std::to_string(count) + (count == 1 ? " byte" : " bytes"); }

int UnsignedShort(RecordBytes &bytes) { return static_cast<unsigned short>(bytes.Short()); }

int ReadSide(RecordBytes &bytes, char const *which) {
    LoadError::Place const place = bytes.Place();
    int const side = UnsignedShort(bytes);
    if (side < 1 || side > kLargestSide)
        throw LoadError(place, std::string("expected a ") + which + " from 1 to " +
                                   std::to_string(kLargestSide) + ", found " + std::to_string(side));
    return side;
}

} // namespace

bool RecordFile::HasMagic(void const *bytes, std::size_t size) {
    return size >= kMagicSize && std::memcmp(bytes, kMagic, kMagicSize) == 0;
}

RecordFile::RecordFile(void const *bytes, std::size_t size, std::string const &name) {
    if (!HasMagic(bytes, size))
        throw LoadError(StartOf(name), std::string("a dialog of records begins with ") + kMagic);
    unsigned char const *const start = static_cast<unsigned char const *>(bytes);
    RecordBytes all(start, size, StartOf(name));
    all.Skip(kMagicSize);
    width = ReadSide(all, "width");
    height = ReadSide(all, "height");
    LoadError::Place const countPlace = all.Place();
    int const count = UnsignedShort(all);
    if (count > kMostItems)
        throw LoadError(countPlace, "more than " + std::to_string(kMostItems) + " items");
    for (int id = 1; id <= count; ++id)
        entries.push_back(ReadEntry(all, start, id));
    if (all.Left() > 0)
        throw LoadError(all.Place(), Bytes(all.Left()) + " after the last item");
}

RecordFile::Entry RecordFile::ReadEntry(RecordBytes &all, unsigned char const *start, int id) {
    Entry entry;
    entry.place = all.Place();
    entry.place.item = "item " + std::to_string(id);
    if (all.Left() < sizeof(short))
        throw LoadError(entry.place, "the dialog ends before this item");
    entry.size = static_cast<std::size_t>(UnsignedShort(all));
    entry.place.byte = all.Place().byte;
    if (entry.size > all.Left())
        throw LoadError(entry.place, "the record should have " + Bytes(entry.size) + ", but only " +
                                         Bytes(all.Left()) + " are left");
    entry.bytes = start + entry.place.byte;
    RecordBytes record(entry.bytes, entry.size, entry.place);
    int const firstNumber = UnsignedShort(record);
    entry.type = ItemRegistry::Instance().FindByRecord(firstNumber);
    if (!entry.type)
        throw LoadError(entry.place,
                        "there is no kind of record with the number " + std::to_string(firstNumber));
    entry.place.item += " (" + entry.type->name + ')';
    all.Skip(entry.size);
    return entry;
}

void RecordFile::MakePanes(glogRec *glog) const {
    int id = 0;
    for (Entry const &entry : entries)
        Make(glog, entry, ++id);
}

// Makers do not tell where in the record the key's number stood.
LoadError::Place RecordFile::PlaceOf(Entry const &entry, std::string const &key) {
    LoadError::Place place = entry.place;
    place.key = key;
    return place;
}

void RecordFile::Make(glogRec *glog, Entry const &entry, int id) const {
    PaneMaker::Guard([&](std::string const &key, GlogPane const *) { return PlaceOf(entry, key); },
                     [&] {
                         RecordBytes record(entry.bytes, entry.size, entry.place);
                         GlogPane *const pane = entry.type->recordMaker(glog, record);
                         if (!pane)
                             throw LoadError(entry.place, "the pane cannot be made");
                         if (record.Left() > 0)
                             throw LoadError(record.Place(),
                                             Bytes(record.Left()) + " after the record's last field");
                         pane->SetID(id);
                         if (entry.type->reporter)
                             entry.type->reporter(pane);
                     });
}
