// What the dialog reference says of keys that are left out is what the loader makes of them.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/docs/Document.h"
#include "tools/TextFile.h"
#include <algorithm>
#include <gtest/gtest.h>

namespace {

std::size_t const kLeftOut = 2; // the cell of the table
char const kItem[] = "<Item type=\"";

// A label that a string list has goes before one that is written down.
bool GoesBeforeWhatIsThere(std::string const &key) { return key == "TextNum" || key == "TextID"; }

bool IsIntegerOf(KeySchema const &key, std::string const &value) {
    return key.kind == KeySchema::kInteger && !value.empty() &&
           value.find_first_not_of("-0123456789") == std::string::npos && std::stoll(value) >= key.smallest &&
           std::stoll(value) <= key.largest;
}

bool IsWordOf(KeySchema const &key, std::string const &value) {
    return key.kind == KeySchema::kWord &&
           std::find(key.words.begin(), key.words.end(), value) != key.words.end();
}

// The dialog with the key in the first item of the type that lacks it; empty when there is none.
std::string WithKey(std::string const &dialog, std::string const &type, std::string const &key,
                    std::string const &value) {
    std::string const start = kItem + type + '"';
    for (std::size_t at = dialog.find(start); at != std::string::npos; at = dialog.find(start, at + 1)) {
        std::size_t const open = dialog.find('>', at), end = dialog.find("</Item>", at);
        if (dialog[open - 1] == '/' || dialog.substr(at, end - at).find('<' + key + '>') != std::string::npos)
            continue;
        return std::string(dialog).insert(open + 1, '<' + key + '>' + value + "</" + key + '>');
    }
    return std::string();
}

// Everything that can be seen of a dialog.
struct Seen {
    std::string tree;
    std::vector<std::uint32_t> pixels;
    bool operator==(Seen const &other) const { return tree == other.tree && pixels == other.pixels; }
};

Seen See(SimulatedDesktop &desktop, std::string const &dialog) {
    glogRec *const glog = LoadGlogFromText(dialog, "example");
    ShowGlog(glog, kShowGlog);
    desktop.Play("wait 0.5");
    Surface const &picture = *Glog::From(glog).Pixels();
    Seen const seen = {desktop.DumpTree(glog),
                       std::vector<std::uint32_t>(picture.Row(0), picture.Row(picture.Height()))};
    DisposeGlog(glog);
    return seen;
}

} // namespace

TEST(DialogReferenceLeftOut, IsWhatTheLoaderTakesInstead) {
    SimulatedDesktop desktop;
    int tried = 0;
    Document const document("docs/dialog-reference.md");
    for (Document::Row const &row : document.Rows()) {
        ItemType const *const type = ItemRegistry::Instance().Find(row.section);
        KeySchema const *const key = type ? type->keys.Find(row.cells[0]) : nullptr;
        if (!key || GoesBeforeWhatIsThere(key->name))
            continue;
        std::string const &value = row.cells[kLeftOut];
        if (!IsIntegerOf(*key, value) && !IsWordOf(*key, value))
            continue;
        std::string const dialog =
            TextFile::Read(GLOG_TEST_SOURCE_DIR "/../docs/panes/dialogs/" + row.section + ".xml");
        std::string const changed = WithKey(dialog, row.section, key->name, value);
        if (changed.empty())
            continue;
        EXPECT_EQ(See(desktop, dialog), See(desktop, changed))
            << row.section << ' ' << key->name << ' ' << value;
        ++tried;
    }
    EXPECT_GT(tried, 80);
}
