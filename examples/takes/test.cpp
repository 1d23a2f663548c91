// Drives the window without a display: what it tells, what it shows, and how it looks.
#include "Takes.h"
#include "desktop/SimulatedDesktop.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include <fstream>
#include <iostream>
#include <iterator>

namespace {

int failures = 0;

void Expect(bool holds, std::string const &what) {
    if (!holds) {
        std::cerr << "failed: " << what << '\n';
        ++failures;
    }
}

std::string FileText(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    return std::string((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
}

// Whether one of the lines has the part.
bool Has(std::vector<std::string> const &lines, std::string const &part) {
    for (std::string const &line : lines) {
        if (line.find(part) != std::string::npos)
            return true;
    }
    return false;
}

} // namespace

// The argument is the directory of the picture that is compared with.
int main(int, char **arguments) {
    SimulatedDesktop desktop(DesktopOptions().Scale(1));
    glogRec *glog = LoadGlog("takes.xml");
    Takes takes(glog);
    ShowGlog(glog, kShowGlog);

    desktop.TakeMessages();
    desktop.Play(FileText("takes.script"));
    std::vector<std::string> const messages = desktop.TakeMessages();
    for (std::string const &line : messages)
        std::cout << line << '\n';
    Expect(Has(messages, R"("message":"GlogButtonPressed")"), "the button tells of the press");
    Expect(Has(messages, R"("message":"MenuChange","item":3)"), "the menu tells of the choice");

    desktop.Snapshot(glog, "now.png");
    Expect(FileText("now.png") == FileText(arguments[1] + std::string("/takes.png")),
           "the window looks as it did");
    return failures;
}
