#include "tools/glogview/CommandLine.h"
#include <CLI/CLI.hpp>

namespace {

int const kBadCommandLine = 2;
double const kSmallestScale = 0.5, kLargestScale = 4.0;

std::string LanguageFault(std::string const &code) {
    bool const good =
        code.size() == 2 && code.find_first_not_of("abcdefghijklmnopqrstuvwxyz") == std::string::npos;
    return good ? std::string() : "a language is two small letters, such as en or de";
}

} // namespace

bool CommandLine::Parse(int argc, char **argv, int &status) {
    CLI::App app("Shows a dialog in a window, or drives and photographs it without a display.", "glogview");
    app.add_option("FILE", dialog, "The dialog, in XML or binary records")->required();
    CLI::Option *const picture = app.add_option("--png", png, "Write a picture of the dialog and end");
    CLI::Option *const steps = app.add_option("--script", script, "Carry out the steps of this file and end");
    app.add_option("--theme", desktop.theme, "light or dark")->check(CLI::IsMember({"light", "dark"}));
    app.add_option("--scale", desktop.scale, "Device pixels per pixel")
        ->check(CLI::Range(kSmallestScale, kLargestScale));
    app.add_option("--language", desktop.language, "Language of the texts")
        ->check(CLI::Validator(LanguageFault, "CODE"));
    app.add_option("--messages", messages,
                   "Write each message between panes, a line of JSON each; - is standard output");
    app.add_option("--trace", trace, "Write each drawing call, a line of JSON each; - is standard output");
    app.add_option("--dump", dump, "Write the panes as JSON; - is standard output");
    app.add_flag("--watch", watch, "Load the dialog again whenever the file changes")
        ->excludes(picture)
        ->excludes(steps);
    try {
        app.parse(argc, argv);
    } catch (CLI::ParseError const &error) {
        status = app.exit(error) == 0 ? 0 : kBadCommandLine;
        return false;
    }
    return true;
}
