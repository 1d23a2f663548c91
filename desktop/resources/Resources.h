// Where the desktop's resource files are, and which theme and language hold.
#pragma once
#include "desktop/resources/ResourceError.h"
#include <string>
#include <vector>

// One for the process. Files are read when something of them is first asked for, and again after a change of
// directory or language. All calls that read throw ResourceError, with file and line, for a broken file; a
// missing one has nothing in it.
class Resources {
public:
    static Resources &Instance(); // one for the process

    // The directory of the library's own artwork, found from where the library's file is:
    // share/glogpanes/artwork beside or one above its directory. Throws ResourceError, naming the places,
    // when it is in neither.
    static std::string FindDirectory();

    // Reads everything from this directory from now on, without the added ones; throws ResourceError and
    // changes nothing when it is none. Until the first call, FindDirectory's is open.
    void Open(std::string const &directory);
    std::string const &Directory();
    // Adds a directory of an application's own: what its files hold goes before what files of the same name
    // hold in the directories added earlier and in Directory(). It need hold only what differs. Throws as
    // Open does.
    void AddDirectory(std::string const &directory);
    // Directory() first, then the added ones in their order: what comes later goes before.
    std::vector<std::string> Directories();
    // The paths of the file in the directories that hold it, in the order of Directories().
    std::vector<std::string> FindAll(std::string const &relativePath);
    // The one among them that goes before the others; empty when there is none.
    std::string Find(std::string const &relativePath);

    // Sets every named colour from themes/<name>.xml. Throws ResourceError and changes nothing when there is
    // no such theme, or when it is broken. At first "light" holds, with the colours that are built in.
    void SetTheme(std::string const &name);
    std::string const &Theme() const { return theme; }

    // "en" (at first) or "de", or another two-letter code of which an application brings files; what they
    // lack is English. Throws ResourceError for anything that is no code of two lower-case letters.
    void SetLanguage(std::string const &code);
    std::string const &Language() const { return language; }
    // The language as four characters in one integer, "enus" for English, "dede" for German.
    unsigned int LanguageCode() const;

    // Grows with every change of directory or language; what was read before must then be read again.
    unsigned int Generation() const { return generation; }

private:
    Resources();
    std::vector<std::string> directories; // empty until the first is needed
    std::string theme = "light", language = "en";
    unsigned int generation = 1;
};
