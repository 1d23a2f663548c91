// The gallery's dialogs on disk.
#pragma once
#include <string>
#include <vector>

// One page: a dialog named NUMBER-NAME.xml, the numbers giving the order.
struct PageFile {
    std::string name; // "push-buttons"
    std::string path;
};

class PageFiles {
public:
    // gallery.xml and pages/ in this directory; empty: share/glogpanes/gallery beside the program's own.
    // Throws std::runtime_error, naming the directory, when they are not there.
    explicit PageFiles(std::string const &directory);

    // share/glogpanes/gallery beside the program's own directory, where sounds/ is too.
    static std::string OwnDirectory();

    // Adds strings/ and the windows that pages open to the resources of the desktop, if they are not there
    // yet; to be called once it is open, and before a page is loaded.
    void AddResources() const;

    std::string const &Directory() const { return directory; }
    std::string const &Frame() const { return frame; } // the dialog round the pages
    std::vector<PageFile> const &Pages() const { return pages; }
    // The place of the page in Pages(). Throws std::runtime_error, naming the pages there are.
    std::size_t Find(std::string const &name) const;

private:
    std::string directory;
    std::string frame;
    std::vector<PageFile> pages;
};
