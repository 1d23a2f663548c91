// The dialog reference tells of every key that the registry knows, with its kind and limits, and of no other.
#include "desktop/SimulatedDesktop.h"
#include "dialogs/CommonKeys.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/docs/Document.h"
#include <gtest/gtest.h>
#include <set>

namespace {

typedef std::set<std::string> Lines;

std::string Words(std::vector<std::string> const &words) {
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i)
        text += (i == 0 ? "" : i + 1 == words.size() ? " or " : ", ") + words[i];
    return text;
}

std::string IntegerText(KeySchema const &key) {
    if (key.smallest == 0 && key.largest == 1)
        return "0 or 1";
    if (key.smallest == KeyList::kSmallest && key.largest == KeyList::kLargest)
        return "integer";
    return "integer, " + std::to_string(key.smallest) + " to " + std::to_string(key.largest);
}

std::string KindText(KeySchema const &key) {
    switch (key.kind) {
    case KeySchema::kInteger:
        return IntegerText(key);
    case KeySchema::kString:
        return "text";
    case KeySchema::kWord:
        return Words(key.words);
    case KeySchema::kRect:
        return "rectangle";
    case KeySchema::kPoint:
        return "point";
    case KeySchema::kAttributes:
        return "attributes";
    case KeySchema::kContainer:
        return "keys";
    case KeySchema::kAnything:
        break;
    }
    return "anything";
}

bool HasKeysToTell(KeySchema const &key) {
    return key.kind == KeySchema::kAttributes || key.kind == KeySchema::kContainer;
}

void AddKeys(KeyList const &keys, std::string const &path, Lines &lines) {
    for (KeySchema const &key : keys.Keys()) {
        lines.insert(path + key.name + ": " + KindText(key) + (key.required ? ", required" : ""));
        if (HasKeysToTell(key))
            AddKeys(key.keys, path + key.name + '/', lines);
    }
}

Lines LinesOf(KeyList const &keys) {
    Lines lines;
    AddKeys(keys, "", lines);
    return lines;
}

class DialogReference : public testing::Test {
protected:
    // Key and value of each row in the section, and whether the key is required.
    Lines Told(std::string const &section) const {
        Lines lines;
        for (Document::Row const &row : document.Rows()) {
            if (row.section == section && row.cells.size() == kCells)
                lines.insert(row.cells[0] + ": " + row.cells[1] +
                             (row.cells[2] == "required" ? ", required" : ""));
        }
        return lines;
    }

    static std::size_t const kCells = 4; // key, value, what holds when it is left out, meaning
    Document const document{"docs/dialog-reference.md"};
};

TEST_F(DialogReference, TellsOfTheKeysOfEveryType) {
    for (std::string const &type : ItemRegistry::Instance().Names())
        EXPECT_EQ(Told(type), LinesOf(ItemRegistry::Instance().Find(type)->keys)) << type;
}

TEST_F(DialogReference, TellsOfTheKeysThatEveryItemHas) {
    EXPECT_EQ(Told("Every item"), LinesOf(CommonKeys::List()));
}

TEST_F(DialogReference, TellsWhichTypesHaveRecords) {
    Lines kinds;
    for (std::string const &name : ItemRegistry::Instance().Names()) {
        ItemType const *const type = ItemRegistry::Instance().Find(name);
        if (type->recordMaker)
            kinds.insert(name + ": " + std::to_string(type->recordKind));
    }
    Lines told;
    for (Document::Row const &row : document.Rows()) {
        if (row.section == "Binary dialogs")
            told.insert(row.cells[0] + ": " + row.cells[1]);
    }
    EXPECT_EQ(told, kinds);
}

TEST_F(DialogReference, NamesAttributesThatTheLoaderTakes) {
    SimulatedDesktop desktop;
    // What the title attributes may be depends on each other, so these are tried by themselves.
    std::string attributes;
    for (Document::Row const &row : document.Rows()) {
        if (row.section != "Glog" || row.cells[0].rfind("title", 0) == 0)
            continue;
        std::string const value = row.cells[1] == "yes or no" ? "yes" : "100";
        attributes += ' ' + row.cells[0] + "=\"" + value + '"';
    }
    ASSERT_FALSE(attributes.empty());
    for (std::string const title : {"title='Title'", "titleList='4323' titleIndex='1'"})
        EXPECT_NO_THROW(
            DisposeGlog(LoadGlogFromText("<Glog " + title + attributes + "><Items/></Glog>", "reference")));
}

} // namespace
