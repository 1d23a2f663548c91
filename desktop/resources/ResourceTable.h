// A table that is read from resource files when it is first needed.
#pragma once
#include "desktop/resources/Resources.h"
#include "desktop/resources/XmlFile.h"
#include <string>

// Keeps a Table read from all files of one name, and reads it anew once the resources' directory or language
// changed. Table needs a default constructor and `void Read(XmlFile const &)`, which is called for each file
// in turn; later calls go before earlier ones.
template <class Table> class ResourceTable {
public:
    // `paths` gives the relative paths, weakest first, each time the table is read.
    explicit ResourceTable(std::vector<std::string> (*paths_)())
        : paths(paths_) {}

    // Throws ResourceError for a broken file; the next call tries again.
    Table const &Get() {
        Resources &resources = Resources::Instance();
        if (generation == resources.Generation())
            return table;
        Table fresh;
        for (std::string const &relativePath : paths()) {
            for (std::string const &path : resources.FindAll(relativePath))
                fresh.Read(XmlFile::Read(path));
        }
        table = std::move(fresh);
        generation = resources.Generation();
        return table;
    }

private:
    std::vector<std::string> (*paths)();
    Table table;
    unsigned int generation = 0;
};
