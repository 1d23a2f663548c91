// One line of JSON, built field by field.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"
#include <string>

// {"op":"Draw1Icon","family":1002}: fields in the order in which they are added. Strings are UTF-8 and are
// escaped.
class JsonLine {
public:
    // Each appends a field and answers the line.
    JsonLine &Text(char const *key, std::string const &utf8);
    JsonLine &Text(char const *key, UString const &);
    JsonLine &Integer(char const *key, long long);
    JsonLine &Number(char const *key, double); // as Shortest gives it
    JsonLine &Flag(char const *key, bool);
    JsonLine &Box(char const *key, Rect const &); // [top,left,bottom,right]
    JsonLine &Spot(char const *key, Point);       // [v,h]
    JsonLine &Raw(char const *key, std::string const &json);
    std::string Finish() const; // with both braces, without line end

    // The shortest form that reads back the same; null for what is not finite.
    static std::string Shortest(double);

private:
    void Key(char const *);
    std::string text;
};
