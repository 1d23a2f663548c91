// Every type of item and every class of panes can be seen: on a page of the gallery, or in a dialog of
// states, of which pictures are kept.
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/Glog.h"
#include "desktop/resources/XmlFile.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "host/CompoundPane.h"
#include "host/glogRec.h"
#include "tests/LibraryExports.h"
#include "tests/screens/GalleryPages.h"
#include "tools/gallery/GalleryItems.h"
#include <cstdlib>
#include <cxxabi.h>
#include <filesystem>
#include <memory>
#include <set>
#include <typeinfo>

namespace {

typedef std::set<std::string> Names;

std::string const kTypeInfo = "_ZTI", kPane = typeid(GlogPane).name();

// Classes that no dialog shows.
Names const kNotInDialogs = {"ZoomPopUpControl"}; // comes up while its button is held

std::string Readable(std::string const &className) {
    int status = 0;
    std::unique_ptr<char, void (*)(void *)> const name(
        abi::__cxa_demangle(className.c_str(), nullptr, nullptr, &status), std::free);
    return status == 0 ? name.get() : className;
}

// Taken before any test has the gallery add its own.
std::vector<std::string> const theTypesOfTheLibrary = ItemRegistry::Instance().Names();

// The gallery's pages and the dialogs beside this test.
std::vector<std::string> Dialogs() {
    std::vector<std::string> paths;
    for (PageFile const &page : GalleryFiles().Pages())
        paths.push_back(page.path);
    for (auto const &entry : std::filesystem::directory_iterator(TreeDirectory() + "/tests/screens"))
        if (entry.path().extension() == ".xml")
            paths.push_back(entry.path().string());
    return paths;
}

void CollectTypes(XmlNode const &node, Names &types) {
    if (node.name == "Item")
        types.insert(*node.Attribute("type"));
    for (XmlNode const &child : node.children)
        CollectTypes(child, types);
}

// The keys that items of the type have.
void CollectKeys(XmlNode const &node, std::string const &type, Names &keys) {
    bool const itself = node.name == "Item" && *node.Attribute("type") == type;
    for (XmlNode const &child : node.children) {
        if (itself)
            keys.insert(child.name);
        CollectKeys(child, type, keys);
    }
}

// Of the class and its bases, as the compiler spells them.
void CollectClasses(std::type_info const &type, Names &classes) {
    classes.insert(type.name());
    if (auto const *const single = dynamic_cast<abi::__si_class_type_info const *>(&type))
        CollectClasses(*single->__base_type, classes);
    if (auto const *const several = dynamic_cast<abi::__vmi_class_type_info const *>(&type))
        for (unsigned int i = 0; i < several->__base_count; ++i)
            CollectClasses(*several->__base_info[i].__base_type, classes);
}

void CollectPanes(GlogPane &pane, Names &classes) {
    CollectClasses(typeid(pane), classes);
    CompoundPane *const container = dynamic_cast<CompoundPane *>(&pane);
    for (short i = 0; container && i < container->NumSubpanes(); ++i)
        CollectPanes(*container->Get(i), classes);
}

// The classes of panes that the library exports.
Names PanesOfTheLibrary() {
    Names panes;
    for (auto const &symbol : ExportsOfTheLibrary()) {
        if (symbol.first.compare(0, kTypeInfo.size(), kTypeInfo) != 0)
            continue;
        Names bases;
        CollectClasses(*static_cast<std::type_info const *>(dlsym(RTLD_DEFAULT, symbol.first.c_str())),
                       bases);
        if (bases.count(kPane))
            panes.insert(symbol.first.substr(kTypeInfo.size()));
    }
    return panes;
}

} // namespace

TEST(Completeness, EveryTypeOfItemIsShown) {
    Names shown, missing;
    for (std::string const &path : Dialogs())
        CollectTypes(XmlFile::Read(path).Root(), shown);
    for (std::string const &type : theTypesOfTheLibrary)
        if (!shown.count(type))
            missing.insert(type);
    EXPECT_EQ(missing, Names());
}

TEST(Completeness, ThePageOfTextFieldsHasEveryKeyOfThem) {
    Names shown, missing;
    for (PageFile const &page : GalleryFiles().Pages())
        if (page.name == "text-fields")
            CollectKeys(XmlFile::Read(page.path).Root(), "TextField", shown);
    for (KeySchema const &key : ItemRegistry::Instance().Find("TextField")->keys.Keys())
        if (!shown.count(key.name))
            missing.insert(key.name);
    EXPECT_EQ(missing, Names());
}

TEST(Completeness, EveryClassOfPanesIsShown) {
    SimulatedDesktop desktop;
    GalleryItems::Add();
    GalleryFiles().AddResources();
    Names shown, missing;
    for (std::string const &path : Dialogs()) {
        glogRec *const glog = LoadGlog(path);
        ShowGlog(glog, kShowGlog);
        for (GlogPane *pane : Glog::From(glog).Items())
            CollectPanes(*pane, shown);
        DisposeGlog(glog);
    }
    Names const all = PanesOfTheLibrary();
    EXPECT_GT(all.size(), 40u);
    for (std::string const &name : all)
        if (!shown.count(name) && !kNotInDialogs.count(Readable(name)))
            missing.insert(Readable(name));
    EXPECT_EQ(missing, Names());
}
