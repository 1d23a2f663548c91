// Reads dialogs in XML.
#pragma once
#include "dialogs/Dialog.h"
#include <string>
#include <string_view>
#include <vector>

class ItemTreeReader;
struct XmlNode;

// Reads one file and checks all of it against the registered item types. Throws LoadError.
class DialogReader {
public:
    static Dialog ReadFile(std::string const &path);
    static Dialog ReadText(std::string_view xml, std::string const &name);

private:
    explicit DialogReader(std::string const &file_)
        : file(file_) {}
    Dialog Read(XmlNode const &root);
    void ReadGlogAttributes(XmlNode const &root, Dialog &) const;
    std::string Title(XmlNode const &root) const;
    std::shared_ptr<GlogStyleSheet> ReadStyleSheet(XmlNode const &) const;
    std::vector<DialogItem> ReadItems(XmlNode const &);
    DialogItem ReadItem(XmlNode const &);
    int ReadID(XmlNode const &, ItemTreeReader const &);

    std::string file;
    std::map<int, int> linesOfIDs; // of the items that were read so far
};
