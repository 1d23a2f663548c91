#pragma once
#include <filesystem>
#include <pugixml.hpp>
#include <string>

// One XML source of the artwork in memory, with error messages that lead back to its lines.
class ArtworkFile {
public:
    // Reads the whole file. Throws ArtworkError with line and column when it is missing, larger than 4 MiB,
    // not well formed, or its root is not called rootName.
    ArtworkFile(std::filesystem::path const &file, char const *rootName);
    ArtworkFile(ArtworkFile const &) = delete;
    ArtworkFile &operator=(ArtworkFile const &) = delete;

    pugi::xml_node Root() const { return document.document_element(); }
    std::filesystem::path const &Path() const { return path; }

    // Throws ArtworkError: file, line of the node, element with its id, name or number, problem.
    [[noreturn]] void Fail(pugi::xml_node, std::string const &problem) const;

    // A whole number in an attribute. Throws when it is missing, not a number, or outside the range.
    int Integer(pugi::xml_node, char const *attribute, int least, int most) const;
    // The text of an attribute. Throws when it is missing or empty.
    std::string Text(pugi::xml_node, char const *attribute) const;

private:
    std::string Position(std::ptrdiff_t offset) const; // ":line:column"

    std::filesystem::path path;
    std::string text;
    pugi::xml_document document;
};

// Parses a whole decimal number with an optional sign; false leaves the result alone.
bool ParseInteger(std::string const &, int &result);
