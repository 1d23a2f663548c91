#include "desktop/type/FontFamilies.h"

// A known family. A FamilyID without one is the family of dialog text.
struct OS::Font::FamilyID::Rep {
    unsigned int number;
    std::string name;
};

namespace {

std::string &DialogFamily() {
    static std::string family = "Roboto";
    return family;
}

} // namespace

OS::Font::FamilyID FontFamilies::Named(std::string const &name) {
    OS::Font::FamilyID family;
    if (!name.empty() && name != DialogFamily())
        family.rep = Known(name);
    return family;
}

std::string const &FontFamilies::NameOf(OS::Font::FamilyID const &family) {
    return family.rep ? family.rep->name : DialogFamily();
}

std::string const &FontFamilies::NameOf(unsigned int number) {
    return number > 0 && number <= All().size() ? All()[number - 1].name : DialogFamily();
}

std::deque<FontFamilies::Family> &FontFamilies::All() {
    static std::deque<Family> families;
    return families;
}

FontFamilies::Family *FontFamilies::Known(std::string const &name) {
    for (Family &family : All()) {
        if (family.name == name)
            return &family;
    }
    All().push_back({static_cast<unsigned int>(All().size() + 1), name});
    return &All().back();
}

void FontFamilies::SetDialogFamily(std::string const &name) { DialogFamily() = name; }

namespace OS {
namespace Font {

FamilyID::FamilyID()
    : rep(nullptr) {}

FamilyID::FamilyID(FixedFontFamily)
    : rep(nullptr) {}

FamilyID::FamilyID(FamilyID const &) = default;

FamilyID::~FamilyID() {}

FamilyID &FamilyID::operator=(FamilyID const &) = default;

FamilyID &FamilyID::operator=(FixedFontFamily) {
    rep = nullptr;
    return *this;
}

unsigned int FamilyID::GetOrderedFontID() const { return rep ? rep->number : 0; }

} // namespace Font
} // namespace OS
