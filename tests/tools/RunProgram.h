// Runs one of the tree's programs.
#pragma once
#include "tests/resources/TemporaryDirectory.h"
#include "tools/TextFile.h"
#include <cstdlib>
#include <string>
#include <sys/wait.h>

struct ProgramResult {
    int status;         // exit status; -1: did not exit by itself
    std::string output; // on standard output
    std::string errors; // on standard error
};

// The arguments are a shell's; `directory` is where the program runs and finds relative paths. It finds no
// display.
inline ProgramResult RunProgram(TemporaryDirectory const &directory, std::string const &name,
                                std::string const &arguments) {
    std::string const output = directory.Path() + "/standard-output";
    std::string const errors = directory.Path() + "/standard-error";
    std::string const command = "cd '" + directory.Path() + "' && env -u DISPLAY -u WAYLAND_DISPLAY " +
                                GLOG_PROGRAMS + "/" + name + " " + arguments + " >" + output + " 2>" +
                                errors + " </dev/null";
    int const status = std::system(command.c_str());
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, TextFile::Read(output), TextFile::Read(errors)};
}
