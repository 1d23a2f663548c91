// Keeps what was worked out for the texts used last.
#pragma once
#include "desktop/resources/Utf.h"
#include "desktop/type/ShapedText.h"
#include <cstddef>
#include <functional>
#include <iterator>
#include <list>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>

// Values by text and shape, at most `maxEntries` of them and for at most `maxUnits` units of text together,
// the least recently used going first.
template <class Value> class TextLru {
public:
    TextLru(std::size_t maxEntries_, std::size_t maxUnits_)
        : maxEntries(maxEntries_)
        , maxUnits(maxUnits_) {}

    // Null when it is not kept. Valid until the next Add or Clear.
    Value *Find(std::u16string_view text, TextShape const &shape) {
        auto const found = index.find(Key{text, &shape});
        if (found == index.end())
            return nullptr;
        entries.splice(entries.begin(), entries, found->second);
        return &found->second->value;
    }

    // The text and shape must not be kept yet.
    Value &Add(std::u16string_view text, TextShape const &shape, Value value) {
        entries.push_front(Entry{std::u16string(text), shape, std::move(value)});
        Entry &entry = entries.front();
        index.emplace(entry.GetKey(), entries.begin());
        units += text.size();
        while (entries.size() > 1 && (entries.size() > maxEntries || units > maxUnits))
            Drop(std::prev(entries.end()));
        return entry.value;
    }

    // Gives the value away, which is not kept any more; a default one when there is none.
    Value Take(std::u16string_view text, TextShape const &shape) {
        auto const found = index.find(Key{text, &shape});
        if (found == index.end())
            return Value();
        auto const entry = found->second;
        Value value = std::move(entry->value);
        Drop(entry);
        return value;
    }

    void Clear() {
        index.clear();
        entries.clear();
        units = 0;
    }

    std::size_t Size() const { return entries.size(); }

private:
    // Looks into an entry, or into what is looked for.
    struct Key {
        std::u16string_view text;
        TextShape const *shape;
        bool operator==(Key const &other) const {
            return Utf::SameUnits(text, other.text) && *shape == *other.shape;
        }
    };
    struct Hash {
        std::size_t operator()(Key const &key) const {
            TextShape const &shape = *key.shape;
            std::size_t hash = std::hash<std::u16string_view>()(key.text);
            for (int part : {static_cast<int>(shape.font.family), shape.font.face, shape.font.size,
                             shape.width, static_cast<int>(shape.truncation)})
                hash = hash * 31 + static_cast<std::size_t>(part);
            return hash;
        }
    };
    struct Entry {
        std::u16string text;
        TextShape shape;
        Value value;
        Key GetKey() const { return {text, &shape}; }
    };

    void Drop(typename std::list<Entry>::iterator entry) {
        units -= entry->text.size();
        index.erase(entry->GetKey());
        entries.erase(entry);
    }

    std::size_t maxEntries, maxUnits, units = 0;
    std::list<Entry> entries; // most recently used first; entries never move
    std::unordered_map<Key, typename std::list<Entry>::iterator, Hash> index;
};
