// A dialog on the screen that follows its file.
#pragma once
#include "tools/glogview/FileWatch.h"
#include <string>

class ErrorBanner;
struct glogRec;

class WatchedDialog {
public:
    // Loads and shows the dialog; throws LoadError.
    explicit WatchedDialog(std::string const &path);

    // Loads the dialog again when the file has changed. While the file has an error the last good dialog
    // stays, with the error in a banner.
    void Follow();
    glogRec *Shown() const { return shown; }

private:
    void ShowError(std::string const &text);

    std::string path;
    FileWatch file;
    glogRec *shown;
    ErrorBanner *banner = nullptr; // of the glog that is shown
};
