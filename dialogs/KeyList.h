// Which keys an item may have, and what may stand under each.
#pragma once
#include <initializer_list>
#include <string>
#include <vector>

struct KeySchema;

// Built key by key:
//
//     KeyList().Integer("Level", -60, 6).Required().String("Text").Rect("BoundsRect")
//
// Names are those of elements or, where said, of attributes. No name may occur twice. Integers are 16 bits
// wide unless narrower limits are given.
class KeyList {
public:
    static constexpr long long kSmallest = -32768, kLargest = 32767; // of integers without limits

    // A whole number within the limits, both included.
    KeyList &Integer(std::string const &name, long long smallest = kSmallest, long long largest = kLargest);
    KeyList &Flag(std::string const &name); // the integer 0 or 1
    // A text; list="4323" index="5" instead takes it from a string list, in the user's language.
    KeyList &String(std::string const &name);
    KeyList &Word(std::string const &name, std::initializer_list<char const *> words); // one of these texts
    // <Name top="" left="" bottom="" right=""/>, a container with the integers kTop, kLeft, kBottom and
    // kRight. Neither width nor height may be negative, or wider than 16 bits.
    KeyList &Rect(std::string const &name);
    // <Name v="" h=""/>, a container with the integers kV and kH.
    KeyList &Point(std::string const &name);
    // An element with these keys as attributes, and nothing in it.
    KeyList &Attributes(std::string const &name, KeyList const &attributes);
    // An element with these keys as elements.
    KeyList &Container(std::string const &name, KeyList const &keys);
    // Whatever there is: elements become containers, whole numbers integers, other texts strings, attributes
    // rectangles and points.
    KeyList &Anything(std::string const &name);
    // All keys of the other list.
    KeyList &All(KeyList const &);

    // Of the key that was added last: it must be there; it may occur several times; a rectangle's corners may
    // stand in any order; the item tree has it under another name.
    KeyList &Required();
    KeyList &Repeated();
    KeyList &AnyCorners();
    KeyList &As(std::string const &itemKey);

    KeySchema const *Find(std::string const &name) const;       // null when there is none
    std::vector<KeySchema> const &Keys() const { return keys; } // in the order of their adding
    std::vector<std::string> Names() const;                     // in the same order

private:
    KeySchema &Add(std::string const &name);
    std::vector<KeySchema> keys;
};

// One key.
struct KeySchema {
    enum Kind { kInteger, kString, kWord, kRect, kPoint, kAttributes, kContainer, kAnything };

    std::string name;                                                     // of the element or attribute
    std::string itemKey;                                                  // in the item tree; mostly the same
    Kind kind = kAnything;                                                // what may stand there
    bool required = false;                                                // an item without it is wrong
    bool repeated = false;                                                // may stand several times
    bool anyCorners = false;                                              // kRect: bottom may lie above top
    long long smallest = KeyList::kSmallest, largest = KeyList::kLargest; // of kInteger
    std::vector<std::string> words;                                       // of kWord
    KeyList keys;                                                         // of a container, or the attributes
};
