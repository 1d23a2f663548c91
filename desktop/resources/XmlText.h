// What is checked of an XML file's bytes before they are parsed.
#pragma once
#include <cstddef>
#include <string>
#include <string_view>

// A place in a text that only moves forward, so that finding the places of all elements takes one pass.
class XmlPlace {
public:
    explicit XmlPlace(std::string_view text_)
        : text(text_) {}
    void MoveTo(std::size_t offset); // not before the present place
    int Line() const { return line; }
    int Column() const { return column; }

private:
    std::string_view text;
    std::size_t place = 0;
    int line = 1, column = 1;
};

struct XmlTextFault {
    std::size_t offset;
    std::string message; // empty when nothing is wrong
};

// Looks for bytes that are no UTF-8 and for characters that XML does not allow.
XmlTextFault FindXmlTextFault(std::string_view);
