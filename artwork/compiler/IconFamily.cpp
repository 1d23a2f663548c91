#include "artwork/compiler/IconFamily.h"
#include <algorithm>
#include <limits>
#include <set>

namespace {

constexpr char kIconIdPrefix = 'i';
constexpr char kShadow[] = "data-shadow";
constexpr int kShortMin = std::numeric_limits<std::int16_t>::min();
constexpr int kShortMax = std::numeric_limits<std::int16_t>::max();

bool IsDecoration(pugi::xml_node node) {
    for (char const *name : {"defs", "title", "desc", "metadata"})
        if (std::string(node.name()) == name)
            return true;
    return node.type() != pugi::node_element;
}

pugi::xml_node FrameOf(pugi::xml_node group) {
    return group.find_child_by_attribute("rect", "class", "frame");
}

bool IsTranslation(std::string const &transform) {
    return transform.empty() ||
           (transform.rfind("translate(", 0) == 0 && transform.find(')') == transform.size() - 1);
}

// Every element of the file, in the order of the file; no recursion, however deep a hostile file goes.
template <class Visit> void ForEachElement(pugi::xml_node root, Visit visit) {
    struct Walker : pugi::xml_tree_walker {
        explicit Walker(Visit &v)
            : visit(v) {}
        bool for_each(pugi::xml_node &node) override {
            if (node.type() == pugi::node_element)
                visit(node);
            return true;
        }
        Visit &visit;
    } walker(visit);
    root.traverse(walker);
}

// The id in a reference such as "url(#face)" or "#face"; empty when the value is no reference.
std::string ReferredId(pugi::xml_attribute attribute) {
    std::string const value = attribute.value();
    std::string const name = attribute.name();
    std::string const prefix = name == "href" || name == "xlink:href" ? "#" : "url(#";
    std::size_t const start = value.find(prefix);
    if (start == std::string::npos)
        return {};
    std::size_t const idStart = start + prefix.size();
    return value.substr(idStart, value.find(')', idStart) - idStart);
}

} // namespace

IconFamily::IconFamily(std::filesystem::path const &file, int largestSide_)
    : largestSide(largestSide_)
    , source(std::make_unique<ArtworkFile>(file, "svg")) {
    ReadMetadata();
    CheckElements();
    for (pugi::xml_node node : source->Root().children())
        if (!IsDecoration(node))
            ReadIcon(node);
    if (icons.empty())
        source->Fail(source->Root(), "the family has no icon");
    std::sort(icons.begin(), icons.end(), [](Icon const &a, Icon const &b) { return a.index < b.index; });
}

IconFamily::Icon const *IconFamily::Find(int index) const {
    auto const found =
        std::find_if(icons.begin(), icons.end(), [&](Icon const &icon) { return icon.index == index; });
    return found == icons.end() ? nullptr : &*found;
}

void IconFamily::ReadMetadata() {
    pugi::xml_node const root = source->Root();
    number = static_cast<std::int16_t>(source->Integer(root, "data-family", kShortMin, kShortMax));
    name = source->Text(root, "data-name");
    std::string const size = source->Text(root, "data-size");
    std::size_t const space = size.find(' ');
    auto const validSide = [this](int side) { return side >= 1 && side <= largestSide; };
    if (space == std::string::npos || !ParseInteger(size.substr(0, space), width) ||
        !ParseInteger(size.substr(space + 1), height) || !validSide(width) || !validSide(height))
        source->Fail(root, "data-size must be two whole numbers, width and height, from 1 to " +
                               std::to_string(largestSide));
    if (root.attribute(kShadow))
        shadow = source->Integer(root, kShadow, 0, height - 1);
}

void IconFamily::ReadIcon(pugi::xml_node group) {
    std::string const id = group.attribute("id").value();
    int index = 0;
    if (std::string(group.name()) != "g" || id.empty() || id[0] != kIconIdPrefix ||
        !ParseInteger(id.substr(1), index) || index < kShortMin || index > kShortMax)
        source->Fail(group, "below the root there may be only <defs> and groups with an id like \"i12\"");
    if (Find(index))
        source->Fail(group, "the index " + std::to_string(index) + " is drawn twice");
    if (!IsTranslation(group.attribute("transform").value()))
        source->Fail(group, "an icon may be moved by translate(x y) only");
    pugi::xml_node const frame = FrameOf(group);
    if (!frame)
        source->Fail(group, "the invisible <rect class=\"frame\"> that gives the icon's size is missing");
    if (frame.attribute("x").as_double() != 0 || frame.attribute("y").as_double() != 0)
        source->Fail(group, "the frame must begin at 0, 0");
    if (std::string(frame.attribute("fill").value()) != "none")
        source->Fail(group, "the frame must have fill=\"none\"");
    if (source->Integer(frame, "height", 1, largestSide) <= shadow)
        source->Fail(group, "data-shadow says that all of the icon is shadow");
    icons.push_back({static_cast<std::int16_t>(index), source->Integer(frame, "width", 1, largestSide),
                     source->Integer(frame, "height", 1, largestSide), group});
}

void IconFamily::CheckElements() const {
    std::set<std::string> definitions;
    ForEachElement(Definitions(),
                   [&](pugi::xml_node node) { definitions.insert(node.attribute("id").value()); });
    ForEachElement(source->Root(), [&](pugi::xml_node node) {
        // The renderer accepts bad style rules in silence, and a theme could not replace their colours.
        if (std::string(node.name()) == "style" || node.attribute("style"))
            source->Fail(node, "colours come from the theme: use classes in place of styles");
        for (pugi::xml_attribute attribute : node.attributes()) {
            std::string const id = ReferredId(attribute);
            if (!id.empty() && definitions.count(id) == 0)
                source->Fail(node, std::string(attribute.name()) + " refers to \"" + id +
                                       "\", which <defs> does not hold");
        }
    });
}
