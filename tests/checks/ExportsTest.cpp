// What programs rely on that were built against the library of panes: the classes that it exports, where each
// of them has the virtual operations that it declares or overrides, and its constants, variables and free
// functions.
//
// exports.txt holds them all. A line without an indent is an export; under a class stand its own operations,
// each with its table, from 0, and its place in that. A name that is lost or moved breaks programs; one that
// is new has to be added on purpose: GLOG_UPDATE_EXPORTS=1 in the environment writes the file anew, in a
// build that is not optimized, and fails that run.
#include "tests/LibraryExports.h"
#include "tools/TextFile.h"
#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cxxabi.h>
#include <fstream>
#include <iterator>
#include <memory>
#include <set>
#include <vector>

namespace {

typedef std::vector<std::string> Lines;

char const kIndent[] = "    ";
std::string const kKept = std::string(GLOG_TEST_SOURCE_DIR) + "/checks/exports.txt";
std::string const kTable = "_ZTV", kTypeInfo = "_ZTI";

// Of these the library has only what the compiler puts wherever a header is included.
char const *const kOthers[] = {"std::",
                               "boost::",
                               "__gnu_cxx::",
                               "OS::",
                               "TarnOSWindow::",
                               "CustomEventHandler",
                               "DragRegionUpdater",
                               "EventRecordAdapter"};
// Functions that are nobody's members, of which the library has more for its own use.
char const *const kFreeFunctions[] = {"GenericButtonTrackingLoop(",
                                      "IconButtonTransitionProc(",
                                      "TrackIconButton(",
                                      "TrackSpecialIconButton(",
                                      "DrawGLine(",
                                      "SimpleGLineTo(",
                                      "DrawProgressBarInRect(",
                                      "CheckedStaticCastToPopMPane("};

bool StartsWith(std::string const &text, std::string const &start) { return text.rfind(start, 0) == 0; }

std::string Demangled(std::string const &symbol) {
    int status = 0;
    std::unique_ptr<char, void (*)(void *)> const name(
        abi::__cxa_demangle(symbol.c_str(), nullptr, nullptr, &status), std::free);
    return status == 0 ? name.get() : symbol;
}

// Of a class that is named as the compiler spells it.
std::string ClassName(std::string const &spelt) {
    std::string const name = Demangled(kTable + spelt), start = "vtable for ";
    return StartsWith(name, start) ? name.substr(start.size()) : name;
}

bool IsOthers(std::string const &name) {
    return std::any_of(std::begin(kOthers), std::end(kOthers), [&](std::string const &other) {
        return StartsWith(name, other) || name.find('<' + other) != std::string::npos;
    });
}

// The indented lines that stand under the line.
std::set<std::string> LinesUnder(std::string const &owner, Lines const &lines) {
    std::set<std::string> under;
    bool isUnder = false;
    for (std::string const &line : lines) {
        if (!StartsWith(line, kIndent))
            isUnder = line == owner;
        else if (isUnder)
            under.insert(line.substr(sizeof kIndent - 1));
    }
    return under;
}

class Exports : public testing::Test {
protected:
    Exports()
        : library(dlopen(GLOG_PANES_LIBRARY, RTLD_NOW))
        , symbols(ExportsOfTheLibrary()) {
        for (auto const &symbol : symbols)
            if (symbol.second.type == 'T' || symbol.second.type == 'W')
                functions.emplace(reinterpret_cast<std::uintptr_t>(Find(symbol.first)),
                                  FunctionName(symbol.first));
    }
    ~Exports() override { dlclose(library); }

    // Where the library has it, or null.
    std::uintptr_t const *Find(std::string const &symbol) const {
        return static_cast<std::uintptr_t const *>(dlsym(library, symbol.c_str()));
    }

    // The names of classes, as the compiler spells them.
    std::vector<std::string> Classes() const {
        std::vector<std::string> names;
        for (auto const &symbol : symbols) {
            std::string const name = symbol.first.substr(std::min(kTable.size(), symbol.first.size()));
            if (StartsWith(symbol.first, kTable) && !IsOthers(ClassName(name)))
                names.push_back(name);
        }
        std::sort(names.begin(), names.end(),
                  [](auto const &a, auto const &b) { return ClassName(a) < ClassName(b); });
        return names;
    }

    // What stands in the class's tables that is its own: "TABLE.PLACE OPERATION", or "pure". An optimizer
    // makes functions one that do the same; then it is the one that is among the lines which are kept of the
    // class.
    Lines OperationsOf(std::string const &name, std::set<std::string> const &kept) const {
        std::uintptr_t const *const words = Find(kTable + name);
        std::size_t const count = std::stoul(symbols.at(kTable + name).size, nullptr, 16) / sizeof *words;
        Lines lines;
        int table = -1, place = 0;
        for (std::size_t i = 0; words && i < count; ++i) {
            if (SymbolAt(words[i]) == kTypeInfo + name) {
                ++table;
                place = 0;
                continue;
            }
            std::string const at = std::to_string(table) + '.' + std::to_string(place) + ' ';
            std::string line;
            for (std::string const &operation : OwnOperationsAt(words[i], ClassName(name) + "::"))
                if (line.empty() || kept.count(at + operation))
                    line = at + operation;
            if (table >= 0 && !line.empty())
                lines.push_back(line);
            ++place;
        }
        return lines;
    }

    // As the file has it, which is given for comparison.
    Lines Found(Lines const &kept) const {
        Lines lines;
        for (std::string const &name : Classes()) {
            lines.push_back("class " + ClassName(name));
            for (std::string const &operation : OperationsOf(name, LinesUnder(lines.back(), kept)))
                lines.push_back(kIndent + operation);
        }
        std::set<std::string> others;
        for (auto const &symbol : symbols) {
            std::string const kind = KindOf(symbol.first, symbol.second);
            if (!kind.empty())
                others.insert(kind + ' ' + Demangled(symbol.first));
        }
        lines.insert(lines.end(), others.begin(), others.end());
        return lines;
    }

    std::map<std::string, Symbol> const &Symbols() const { return symbols; }

private:
    // What begins at the address, or nothing.
    static std::string SymbolAt(std::uintptr_t address) {
        Dl_info info;
        void const *const place = reinterpret_cast<void const *>(address);
        return dladdr(place, &info) != 0 && info.dli_saddr == place && info.dli_sname ? info.dli_sname : "";
    }

    // Without the class's name, the one first that the linker says.
    Lines OwnOperationsAt(std::uintptr_t address, std::string const &prefix) const {
        std::string const symbol = SymbolAt(address);
        if (symbol == "__cxa_pure_virtual")
            return {"pure"};
        Lines operations;
        auto const add = [&](std::string const &function) {
            if (StartsWith(function, prefix))
                operations.push_back(function.substr(prefix.size()));
        };
        add(FunctionName(symbol));
        auto const others = functions.equal_range(address);
        for (auto other = others.first; other != others.second; ++other)
            add(other->second);
        return operations;
    }

    // Of the function that the symbol means or leads to.
    static std::string FunctionName(std::string const &symbol) {
        std::string const name = Demangled(symbol), thunk = "thunk to ";
        std::size_t const end = name.find(thunk);
        return end == std::string::npos ? name : name.substr(end + thunk.size());
    }

    // "constant", "variable" or "function", or nothing for what is none of the interface.
    static std::string KindOf(std::string const &symbol, Symbol const &details) {
        std::string const name = Demangled(symbol);
        auto const startsWith = [&](std::string const &start) { return StartsWith(name, start); };
        if (details.type == 'T' &&
            std::any_of(std::begin(kFreeFunctions), std::end(kFreeFunctions), startsWith))
            return "function";
        bool const isData = !StartsWith(symbol, "_") || StartsWith(symbol, "_ZN");
        if (isData && details.type == 'R')
            return "constant";
        return isData && (details.type == 'D' || details.type == 'B') ? "variable" : "";
    }

    void *const library;
    std::map<std::string, Symbol> const symbols;
    std::multimap<std::uintptr_t, std::string> functions; // by address
};

Lines LinesOf(std::string const &text) {
    Lines lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);)
        if (!StartsWith(line, "#"))
            lines.push_back(line);
    return lines;
}

// Each line with the class that it stands under.
std::set<std::string> WithTheirClasses(Lines const &lines) {
    std::set<std::string> whole;
    std::string owner;
    for (std::string const &line : lines) {
        if (!StartsWith(line, kIndent))
            owner = line;
        whole.insert(StartsWith(line, kIndent) ? owner + ": " + line.substr(sizeof kIndent - 1) : line);
    }
    return whole;
}

std::string Only(Lines const &in, Lines const &notIn) {
    std::set<std::string> const all = WithTheirClasses(in), others = WithTheirClasses(notIn);
    std::string text;
    for (std::string const &line : all)
        text += others.count(line) ? "" : "\n    " + line;
    return text;
}

void Keep(Lines const &lines) {
    std::ofstream file(kKept);
    file << "# What programs rely on that were built against the library of panes. Written by a test; see "
            "ExportsTest.cpp.\n";
    for (std::string const &line : lines)
        file << line << '\n';
}

} // namespace

TEST_F(Exports, AreThoseThatAreKept) {
    Lines const kept = LinesOf(TextFile::Read(kKept)), found = Found(kept);
    if (std::getenv("GLOG_UPDATE_EXPORTS")) {
        Keep(found);
        FAIL() << "the exports were written to " << kKept
               << "; look at what has changed and run the test again";
    }
    EXPECT_EQ(Only(kept, found), "") << "is no longer exported; programs that use it will not start";
    EXPECT_EQ(Only(found, kept), "")
        << "is exported and not kept; if that is meant, run this test with GLOG_UPDATE_EXPORTS=1";
}

TEST_F(Exports, HaveTypeInformationForEveryClass) {
    ASSERT_FALSE(Classes().empty());
    for (std::string const &name : Classes())
        EXPECT_NE(Find(kTypeInfo + name), nullptr) << ClassName(name);
}

TEST_F(Exports, OfFreeFunctionsAreAllThere) {
    for (std::string const start : kFreeFunctions)
        EXPECT_TRUE(std::any_of(Symbols().begin(), Symbols().end(), [&](auto const &symbol) {
            return StartsWith(Demangled(symbol.first), start);
        })) << start;
}

TEST_F(Exports, ThatAreLostNewOrMovedAreSeen) {
    Lines const kept = {"class A", "    0.2 F()", "    0.3 G()", "variable x"};
    EXPECT_EQ(Only(kept, kept), "");
    EXPECT_EQ(Only(kept, {"class A", "    0.2 F()", "    0.3 G()"}), "\n    variable x");
    EXPECT_EQ(Only(kept, {"class A", "    0.3 F()", "    0.2 G()", "variable x"}),
              "\n    class A: 0.2 F()\n    class A: 0.3 G()");
    EXPECT_EQ(
        Only({"class A", "    0.2 F()", "class B", "    0.2 F()"}, {"class A", "    0.2 F()", "class B"}),
        "\n    class B: 0.2 F()");
}
