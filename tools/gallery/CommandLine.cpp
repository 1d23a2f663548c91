#include "tools/gallery/CommandLine.h"
#include <CLI/CLI.hpp>

namespace {

int const kBadCommandLine = 2;
double const kSmallestScale = 0.5, kLargestScale = 4.0;

} // namespace

bool CommandLine::Parse(int argc, char **argv, int &status) {
    CLI::App app("Shows the panes, page by page. Without a display every page is written as pictures.",
                 "gallery");
    app.add_option("--page", page, "Begin with this page, such as push-buttons");
    app.add_option("--pages", pages, "Take gallery.xml and pages/ from this directory");
    CLI::Option *const pictureOption = app.add_option(
        "--png-dir", pictures, "Write every page, in both themes and at 1x and 2x, to this directory");
    app.add_option("--theme", desktop.theme, "light or dark")->check(CLI::IsMember({"light", "dark"}));
    app.add_option("--language", desktop.language, "en or de")->check(CLI::IsMember({"en", "de"}));
    app.add_option("--scale", desktop.scale, "Device pixels per pixel")
        ->check(CLI::Range(kSmallestScale, kLargestScale));
    app.add_option("--script", script, "Carry out the steps of this file without a display and end")
        ->excludes(pictureOption);
    app.add_option("--messages", messages,
                   "Write each message between panes, a line of JSON each; - is standard output");
    try {
        app.parse(argc, argv);
    } catch (CLI::ParseError const &error) {
        status = app.exit(error) == 0 ? 0 : kBadCommandLine;
        return false;
    }
    return true;
}
