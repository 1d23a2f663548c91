// What programs find in the built library that know no more than names. Needs the definitions GLOG_NM and
// GLOG_PANES_LIBRARY, and the library of dlsym.
#pragma once
#include <array>
#include <cstdio>
#include <dlfcn.h>
#include <gtest/gtest.h>
#include <map>
#include <sstream>
#include <string>

struct Symbol {
    char type;        // as nm tells it: 'D' and 'B' are exported data that can be written
    std::string size; // in bytes, hexadecimal
};

// The symbols that a library defines and that have a size, read from its file; nm takes the options.
inline std::map<std::string, Symbol> SymbolsOf(std::string const &library, std::string const &options) {
    std::map<std::string, Symbol> symbols;
    std::string const command = "'" GLOG_NM "' " + options + " --defined-only -S -P '" + library + "'";
    std::FILE *const output = popen(command.c_str(), "r");
    EXPECT_NE(output, nullptr);
    std::array<char, 4096> line;
    while (output && std::fgets(line.data(), line.size(), output)) {
        std::istringstream words(line.data());
        std::string name, address;
        Symbol symbol;
        if (words >> name >> symbol.type >> address >> symbol.size)
            symbols[name] = symbol;
    }
    EXPECT_EQ(output ? pclose(output) : -1, 0);
    return symbols;
}

// The dynamic ones of the library under test.
inline std::map<std::string, Symbol> ExportsOfTheLibrary() { return SymbolsOf(GLOG_PANES_LIBRARY, "-D"); }

// The variable as a program finds it that knows no more than its name.
template <class Procedure> Procedure *Find(char const *name) {
    return static_cast<Procedure *>(dlsym(RTLD_DEFAULT, name));
}

// Puts another procedure into a variable for a while.
template <class Procedure> class Replaced {
public:
    Replaced(Procedure *variable_, Procedure other)
        : variable(variable_)
        , former(*variable_) {
        *variable = other;
    }
    ~Replaced() { *variable = former; }
    Replaced(Replaced const &) = delete;
    Replaced &operator=(Replaced const &) = delete;

private:
    Procedure *variable;
    Procedure former;
};
