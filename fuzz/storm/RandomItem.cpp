#include "fuzz/storm/RandomItem.h"
#include "dialogs/CommonKeys.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyList.h"
#include "fuzz/storm/RandomText.h"
#include <algorithm>

namespace {

int const kDeepest = 2;         // containers within each other
int const kMostInside = 4;      // items in a container
int const kMostRepeated = 4;    // elements of a key
int const kUsualNumber = 24;    // most numbers are up to this
int const kLargestUsed = 32767; // of numbers that may be larger

char const *const kFamilies[] = {
    "1002",    "1007",   "1608", "1821", "kTransportIcons", "kEditToolIcons", "2002",
    "kBadges", "kClips", "0",    "1841"};
char const *const kPictures[] = {"kWaveformPicture", "kArrangementPicture", "kStepsPicture", "9004"};

bool NamesBar(std::string const &key) {
    return key == "ScrollItem" || key == "HScrollBar" || key == "VScrollBar" || key == "ScrollBar" ||
           key == "LateralScrollBar";
}

std::string Tagged(std::string const &name, std::string const &content) {
    return '<' + name + '>' + content + "</" + name + '>';
}

std::string RectAttributes(int top, int left, int bottom, int right) {
    return " top=\"" + std::to_string(top) + "\" left=\"" + std::to_string(left) + "\" bottom=\"" +
           std::to_string(bottom) + "\" right=\"" + std::to_string(right) + '"';
}

} // namespace

RandomItem::RandomItem(Chance &chance_, int firstID, std::vector<int> freeBars_)
    : chance(chance_)
    , nextID(firstID)
    , freeBars(std::move(freeBars_)) {}

std::string RandomItem::Write(Rect const &where) { return Once(where, 0); }

std::string RandomItem::Once(Rect const &where, int depth) {
    std::vector<std::string> const names = ItemRegistry::Instance().Names();
    std::string const name = chance.OfMany(names);
    ItemType const &type = *ItemRegistry::Instance().Find(name);
    if (type.holdsItems && depth == kDeepest)
        return Once(where, depth);
    place = where;
    std::string const id = std::to_string(nextID++);
    std::string const own = Keys(type.keys), common = Keys(CommonKeys::List());
    return "<Item type=\"" + name + "\" id=\"" + id + "\">" + own + common +
           (type.holdsItems ? Inside(where, depth) : std::string()) + "</Item>\n";
}

// Side by side, so that they do not lie over each other.
std::string RandomItem::Inside(Rect const &where, int depth) {
    int const count = chance.Below(kMostInside + 1);
    std::string items;
    for (int i = 0; i < count; ++i) {
        int const width = (where.right - where.left) / count;
        Rect const part = {0, static_cast<short>(i * width), static_cast<short>(where.bottom - where.top),
                           static_cast<short>((i + 1) * width)};
        items += Once(part, depth + 1);
    }
    return Tagged("Items", items);
}

bool RandomItem::IsWanted(KeySchema const &key) {
    if (NamesBar(key.name) && freeBars.empty())
        return false;
    if (key.kind == KeySchema::kAnything || key.name == "HelpTag")
        return key.required;
    if (key.name == "BoundsRect" || key.name == "Origin")
        return key.required || !chance.OneIn(12);
    if (key.name == "Layout" || key.name == "Visible")
        return chance.OneIn(5);
    return key.required || chance.OneIn(2);
}

std::string RandomItem::Keys(KeyList const &keys) {
    std::string written;
    for (KeySchema const &key : keys.Keys()) {
        if (!IsWanted(key))
            continue;
        int const count = key.repeated ? chance.Between(1, kMostRepeated) : 1;
        for (int i = 0; i < count; ++i)
            written += Element(key);
    }
    return written;
}

std::string RandomItem::Element(KeySchema const &key) {
    switch (key.kind) {
    case KeySchema::kRect:
    case KeySchema::kPoint:
        return '<' + key.name + Place(key) + "/>";
    case KeySchema::kAttributes:
        return '<' + key.name + Attributes(key.keys) + "/>";
    case KeySchema::kContainer:
        return Tagged(key.name, Keys(key.keys));
    case KeySchema::kAnything:
        return Tagged(key.name, std::string());
    default:
        return Tagged(key.name, Value(key));
    }
}

std::string RandomItem::Attributes(KeyList const &keys) {
    std::string written;
    for (KeySchema const &key : keys.Keys()) {
        if (IsWanted(key))
            written += ' ' + key.name + "=\"" + Value(key) + '"';
    }
    return written;
}

std::string RandomItem::Value(KeySchema const &key) {
    switch (key.kind) {
    case KeySchema::kInteger:
        return Number(key);
    case KeySchema::kWord:
        return chance.OfMany(key.words);
    default:
        return RandomText::Escaped(Text(key.name));
    }
}

std::string RandomItem::Number(KeySchema const &key) {
    if (NamesBar(key.name)) {
        int const bar = freeBars.back();
        freeBars.pop_back();
        return std::to_string(bar);
    }
    int const least = static_cast<int>(std::max<long long>(key.smallest, -kLargestUsed));
    int const most = static_cast<int>(std::min<long long>(key.largest, kLargestUsed));
    if (chance.OneIn(25))
        return std::to_string(chance.OneIn(2) ? least : most);
    int const low = std::max(least, chance.OneIn(4) ? -kUsualNumber : 0);
    return std::to_string(chance.Between(std::min(low, most), std::min(most, low + kUsualNumber)));
}

std::string RandomItem::Text(std::string const &key) {
    if (key == "ISetID" || key == "FamilyID")
        return chance.Of(kFamilies);
    if (key == "ResIDName")
        return chance.Of(kPictures);
    return RandomText::Of(chance);
}

// Bounds are the item's place, mostly; other rectangles and points lie within it.
std::string RandomItem::Place(KeySchema const &key) {
    int const width = place.right - place.left, height = place.bottom - place.top;
    bool const isItems = key.name == "BoundsRect" || key.name == "Origin";
    int const top = place.top + (isItems ? 0 : chance.Below(std::max(height, 1)));
    int const left = place.left + (isItems ? 0 : chance.Below(std::max(width, 1)));
    if (key.kind == KeySchema::kPoint)
        return " v=\"" + std::to_string(top) + "\" h=\"" + std::to_string(left) + '"';
    int const room = isItems && !chance.OneIn(4) ? 0 : 1;
    int const bottom = place.bottom - room * chance.Below(std::max(place.bottom - top, 1));
    int const right = place.right - room * chance.Below(std::max(place.right - left, 1));
    return RectAttributes(top, left, bottom, right);
}
