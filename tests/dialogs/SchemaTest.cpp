// docs/glog.xsd describes what the loader takes, and every dialog of the tree is valid by it.
#include "desktop/resources/XmlFile.h"
#include "dialogs/CommonKeys.h"
#include "dialogs/ItemRegistry.h"
#include "tests/resources/TemporaryDirectory.h"
#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <gtest/gtest.h>
#include <set>
#include <string>
#include <vector>

namespace {

std::string const kTree = std::string(GLOG_TEST_SOURCE_DIR) + "/..";
std::string const kSchema = kTree + "/docs/glog.xsd";

bool IsValid(std::string const &path) {
    std::string const command = "xmllint --noout --schema '" + kSchema + "' '" + path + "' 2>/dev/null";
    return std::system(command.c_str()) == 0;
}

XmlNode const *Named(XmlNode const &node, std::string const &element, std::string const &name) {
    for (XmlNode const &child : node.children) {
        std::string const *const own = child.Attribute("name");
        if (child.name == element && own && *own == name)
            return &child;
        if (XmlNode const *found = Named(child, element, name))
            return found;
    }
    return nullptr;
}

void CollectElements(XmlNode const &node, std::set<std::string> &names) {
    for (XmlNode const &child : node.children) {
        if (child.name == "xs:element")
            names.insert(*child.Attribute("name"));
        CollectElements(child, names);
    }
}

std::set<std::string> const kStockTypes = {
    "OvalButton",   "StudButton",    "FrameButton", "CheckBox",
    "RadioButton",  "Icon",          "IconButton",  "SuccessiveIcons",
    "TwistDown",    "TrackSelector", "Box",         "BoxSelect",
    "Label",        "Text",          "StyledText",  "StringGroup",
    "MultiString",  "Group",         "Spacer",      "ScrollBar",
    "GrowBox",      "ScrollPane",    "Grid",        "ScrollGrid",
    "Select",       "SelectString",  "List",        "TextField",
    "TextEdit",     "SearchField",   "PopUpMenu",   "ScrollBarPopUpMenu",
    "DurationNote", "ProgressBar",   "Line",        "Picture",
    "Graph",        "ZoomSlider",    "ZoomButtons", "Tabs",
    "ThreeD"};

std::set<std::string> KeysOfStockTypes() {
    std::set<std::string> names = {"Items"};
    for (std::string const &key : CommonKeys::List().Names())
        names.insert(key);
    for (std::string const &type : kStockTypes) {
        for (std::string const &key : ItemRegistry::Instance().Find(type)->keys.Names())
            names.insert(key);
    }
    return names;
}

TEST(Schema, KnowsTheKeysOfTheStockTypesAndNoOthers) {
    XmlFile const schema = XmlFile::Read(kSchema);
    std::set<std::string> known;
    for (char const *group :
         {"EveryItem", "SeveralTypes", "Buttons", "Choices", "Icons", "Boxes", "Labels", "StaticTexts",
          "Groups", "ScrollBars", "Scrolled", "Selectables", "Lists", "TextFields", "Menus", "Graphics"})
        CollectElements(*Named(schema.Root(), "xs:group", group), known);
    EXPECT_EQ(known, KeysOfStockTypes());
}

TEST(Schema, KnowsTheKeysWithinLayout) {
    XmlFile const schema = XmlFile::Read(kSchema);
    std::set<std::string> known;
    CollectElements(*Named(schema.Root(), "xs:complexType", "Layout"), known);
    std::vector<std::string> const names = CommonKeys::LayoutList().Names();
    EXPECT_EQ(known, std::set<std::string>(names.begin(), names.end()));
}

TEST(Schema, KnowsTheStockTypes) {
    XmlFile const schema = XmlFile::Read(kSchema);
    XmlNode const &list = Named(schema.Root(), "xs:simpleType", "StockItemType")->children.front();
    std::set<std::string> known;
    for (XmlNode const &value : list.children)
        known.insert(*value.Attribute("value"));
    EXPECT_EQ(known, kStockTypes);
    for (std::string const &name : known)
        EXPECT_NE(ItemRegistry::Instance().Find(name), nullptr) << name;
}

TEST(Schema, EveryDialogOfTheTreeIsValid) {
    namespace fs = std::filesystem;
    int dialogs = 0;
    for (char const *folder : {"tools", "examples", "docs", "artwork/windows"}) {
        if (!fs::exists(kTree + "/" + folder))
            continue;
        for (fs::directory_entry const &entry : fs::recursive_directory_iterator(kTree + "/" + folder)) {
            if (entry.path().extension() != ".xml" ||
                XmlFile::Read(entry.path().string()).Root().name != "Glog")
                continue;
            ++dialogs;
            EXPECT_TRUE(IsValid(entry.path().string())) << entry.path();
        }
    }
    EXPECT_GE(dialogs, 5);
}

class SchemaJudgement : public testing::Test {
protected:
    bool Accepts(std::string const &keys) {
        return IsValid(
            directory.Write("a.xml", "<Glog width=\"9\" height=\"9\"><Items><Item type=\"OvalButton\">" +
                                         keys + "</Item></Items></Glog>"));
    }
    TemporaryDirectory directory;
};

TEST_F(SchemaJudgement, TakesWhatTheLoaderTakes) {
    EXPECT_TRUE(Accepts("<BoundsRect top=\"1\" left=\"2\" bottom=\"3\" right=\"4\"/><TextNum>1</TextNum>"));
    EXPECT_TRUE(Accepts("<TextNum type=\"integer\"> 1 </TextNum><ButtonText list=\"4323\" index=\"1\"/>"));
    EXPECT_TRUE(Accepts("<Style>panel</Style><Style type=\"integer\">2</Style>"));
    EXPECT_TRUE(Accepts("<RectList><Box top=\"1\" left=\"2\" bottom=\"3\" right=\"4\"/></RectList>"));
    EXPECT_TRUE(Accepts("<NumStates>3</NumStates><Width>1</Width>"));
    EXPECT_TRUE(Accepts("<Layout><GrowWidth>1</GrowWidth><InsetTop>2</InsetTop></Layout>"));
}

TEST_F(SchemaJudgement, RefusesWhatTheLoaderRefuses) {
    EXPECT_FALSE(Accepts("<TextNum>one</TextNum>"));
    EXPECT_FALSE(Accepts("<TextNum>40000</TextNum>"));
    EXPECT_FALSE(Accepts("<TextNumber>1</TextNumber>"));
    EXPECT_FALSE(Accepts("<BoundsRect top=\"1\"/>"));
    EXPECT_FALSE(Accepts("<Visible>2</Visible>"));
    EXPECT_FALSE(Accepts("<Mode>256</Mode>"));
    EXPECT_FALSE(Accepts("<Layout><Alignment>4</Alignment></Layout>"));
    EXPECT_FALSE(Accepts("<Style>plate</Style>"));
    EXPECT_FALSE(Accepts("<Style>256</Style>"));
    EXPECT_FALSE(Accepts("<RectList/>"));
    EXPECT_FALSE(Accepts("<NumStates>0</NumStates>"));
    EXPECT_FALSE(Accepts("<Width>0</Width>"));
    EXPECT_FALSE(Accepts("text"));
}

} // namespace
