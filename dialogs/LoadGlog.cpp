#include "dialogs/LoadGlog.h"
#include "dialogs/DialogReader.h"
#include "dialogs/GrowingPanes.h"
#include "dialogs/PaneMaker.h"
#include "dialogs/RecordFile.h"
#include "host/CompoundPane.h"
#include "host/TarnError.h"
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <vector>

namespace {

std::size_t const kMostBytes = std::size_t(64) << 20; // of a dialog of records

Desktop &OpenDesktop() {
    Desktop *const desktop = Desktop::Current();
    if (!desktop)
        throw std::logic_error("dialogs are loaded on an open desktop");
    return *desktop;
}

LoadError::Place WholeFile(std::string const &name) {
    LoadError::Place place;
    place.file = name;
    return place;
}

// A glog that is disposed of unless it was finished.
class GrowingGlog {
public:
    GrowingGlog(Desktop &desktop_, GlogOptions const &options, std::string const &file)
        : desktop(desktop_)
        , glog(desktop_.NewGlog(options)) {
        Glog::From(glog).SetSource(file);
    }
    ~GrowingGlog() { DisposeGlog(glog); }
    GrowingGlog(GrowingGlog const &) = delete;
    GrowingGlog &operator=(GrowingGlog const &) = delete;

    glogRec *Get() const { return glog; }
    glogRec *Finish(PaneMaker::PlaceOfKey const &placeOf) {
        PaneMaker::Guard(placeOf, [&] { desktop.FinishGlog(glog); });
        glogRec *const finished = glog;
        glog = nullptr;
        return finished;
    }

private:
    Desktop &desktop;
    glogRec *glog;
};

// For what goes wrong once all panes stand.
PaneMaker::PlaceOfKey PlacesIn(PaneMaker const &maker, std::string const &file) {
    return [&maker, file](std::string const &key, GlogPane const *pane) {
        return maker.PlaceOf(pane, key, WholeFile(file));
    };
}

glogRec *MakeGlog(Dialog const &dialog) {
    GrowingGlog growing(OpenDesktop(), dialog.options, dialog.file);
    PaneMaker maker(growing.Get());
    for (DialogItem const &item : dialog.items)
        maker.Make(item);
    // A dialog that names no limits keeps those of its grow box.
    if (dialog.minWidth || dialog.minHeight)
        growing.Get()->SetMinSize(dialog.minWidth, dialog.minHeight);
    if (dialog.maxWidth || dialog.maxHeight)
        growing.Get()->SetMaxSize(dialog.maxWidth, dialog.maxHeight);
    return growing.Finish(PlacesIn(maker, dialog.file));
}

bool BeginsWithMagic(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    char start[RecordFile::kMagicSize];
    return file.read(start, sizeof start) && RecordFile::HasMagic(start, sizeof start);
}

std::vector<char> ReadRecords(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    std::vector<char> bytes;
    for (std::istreambuf_iterator<char> at(file), end; at != end; ++at) {
        if (bytes.size() == kMostBytes)
            throw LoadError(WholeFile(path),
                            "the file is larger than " + std::to_string(kMostBytes >> 20) + " MiB");
        bytes.push_back(*at);
    }
    return bytes;
}

} // namespace

glogRec *LoadGlog(std::string const &path) {
    OpenDesktop();
    if (!BeginsWithMagic(path))
        return MakeGlog(DialogReader::ReadFile(path));
    std::vector<char> const bytes = ReadRecords(path);
    return LoadGlogFromRecords(bytes.data(), bytes.size(), GlogOptions().Title(path), path);
}

glogRec *LoadGlogFromText(std::string_view xml, std::string const &name) {
    OpenDesktop();
    return MakeGlog(DialogReader::ReadText(xml, name));
}

glogRec *LoadGlogFromRecords(void const *bytes, std::size_t size, GlogOptions const &options,
                             std::string const &name) {
    Desktop &desktop = OpenDesktop();
    RecordFile const records(bytes, size, name);
    GrowingGlog growing(desktop, GlogOptions(options).Size(records.Width(), records.Height()), name);
    records.MakePanes(growing.Get());
    return growing.Finish([&](std::string const &, GlogPane const *) { return WholeFile(name); });
}

glogRec *ReloadGlog(glogRec *shown, std::string const &path) {
    glogRec *const fresh = LoadGlog(path);
    if (PlatformWindow *const window = Glog::From(shown).Window()) {
        Point const topLeft = window->ScreenPlace();
        Rect place = {topLeft.v, topLeft.h, static_cast<short>(topLeft.v + GetGlogHeight(fresh)),
                      static_cast<short>(topLeft.h + GetGlogWidth(fresh))};
        PositionGlog(fresh, &place, false);
    }
    ShowGlog(fresh, kShowGlog);
    DisposeGlog(shown);
    return fresh;
}

void LoadItems(std::string const &path, CompoundPane *into) {
    Desktop &desktop = OpenDesktop();
    Dialog const dialog = DialogReader::ReadFile(path);
    glogRec *const glog = into->GetGlog();
    GrowingPanes const growing(glog);
    PaneMaker maker(glog);
    std::vector<GlogPane *> panes;
    for (DialogItem const &item : dialog.items)
        panes.push_back(maker.Make(item));
    for (GlogPane *pane : panes)
        GrowingPanes::MoveInto(*into, pane);
    PaneMaker::Guard(PlacesIn(maker, path), [&] { desktop.FinishGlog(glog); });
}

GlogOptions ReadGlogOptions(std::string const &path) {
    OpenDesktop();
    return DialogReader::ReadFile(path).options;
}
