// Turns XML elements into item trees and checks them on the way.
#pragma once
#include "desktop/resources/XmlFile.h"
#include "dialogs/KeyList.h"
#include "dialogs/LoadError.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>
#include <map>
#include <string>

// For one item of a dialog. All calls throw LoadError, with the place of the element that is wrong.
class ItemTreeReader {
public:
    typedef boost::shared_ptr<XMLLib::ContainerItem> Container;
    typedef std::map<std::string, LoadError::Place> KeyPlaces;

    // `item` describes it in messages; may be empty.
    ItemTreeReader(std::string const &file, std::string const &item);

    // The element's attributes; those that the list does not know are errors.
    Container ReadAttributes(XmlNode const &, KeyList const &) const;
    // The element's children. One named `skipped` is left to the caller.
    Container ReadKeys(XmlNode const &, KeyList const &, std::string const &skipped = std::string()) const;
    KeyPlaces PlacesOfKeys(XmlNode const &) const;
    // Text beside or instead of elements is an error.
    void RequireNoText(XmlNode const &) const;

    LoadError ErrorAt(XmlNode const &, std::string const &message) const;
    LoadError::Place PlaceOf(XmlNode const &) const;

private:
    ItemTreeReader Inside(std::string const &key) const;
    void AddKey(XMLLib::ContainerItem &, XmlNode const &, KeySchema const &) const;
    void AddValue(XMLLib::ContainerItem &, XmlNode const &, KeySchema const &, std::string const &text) const;
    void AddAttributes(XMLLib::ContainerItem &, XmlNode const &, KeySchema const &) const;
    void AddAnything(XMLLib::ContainerItem &, XmlNode const &) const;
    void CheckRect(XmlNode const &, KeySchema const &, XMLLib::ContainerItem const &) const;
    std::string TextOf(XmlNode const &, KeySchema const &) const;
    std::string StringOfList(XmlNode const &) const;
    void RequireKind(XmlNode const &, KeySchema const &) const;

    std::string file;
    std::string item;
    std::string path; // of keys, down to what is being read; empty for the item itself
};
