// Whether the lists by which the code is laid out still speak of this code.
#include "tools/TextFile.h"
#include <cstdio>
#include <gtest/gtest.h>
#include <memory>
#include <set>
#include <sstream>
#include <string>

namespace {

std::string const kLists = std::string(GLOG_TEST_SOURCE_DIR) + "/../cmake/order/";
std::string const kLibrary = GLOG_PANES_LIBRARY;

std::string Output(std::string const &command) {
    std::unique_ptr<std::FILE, int (*)(std::FILE *)> const pipe(popen(command.c_str(), "r"), pclose);
    std::string output;
    for (int c = std::fgetc(pipe.get()); c != EOF; c = std::fgetc(pipe.get()))
        output.push_back(static_cast<char>(c));
    return output;
}

// The symbols of what the library contains, for itself or for others.
std::set<std::string> SymbolsOf(std::string const &library) {
    std::istringstream lines(Output(GLOG_NM " --defined-only --format=just-symbols '" + library + "'"));
    std::set<std::string> symbols;
    for (std::string line; std::getline(lines, line);)
        symbols.insert(line);
    return symbols;
}

class CodeOrder : public testing::TestWithParam<std::string> {};

} // namespace

TEST_P(CodeOrder, NamesFunctionsThatThereAre) {
    std::string const folder = kLibrary.substr(0, kLibrary.rfind('/') + 1);
    std::set<std::string> const symbols = SymbolsOf(folder + "libglog" + GetParam() + ".so");
    ASSERT_FALSE(symbols.empty());
    std::istringstream lines(TextFile::Read(kLists + GetParam() + ".txt"));
    int named = 0, found = 0;
    for (std::string line; std::getline(lines, line);) {
        if (line.empty() || line.front() == '#')
            continue;
        ++named;
        found += symbols.count(line) > 0 ? 1 : 0;
    }
    EXPECT_GT(named, 0);
    EXPECT_GT(found * 4, named * 3) << found << " of " << named << "; bench/order/run writes the list anew";
}

INSTANTIATE_TEST_SUITE_P(Libraries, CodeOrder, testing::Values("desktop", "panes", "dialogs"),
                         [](testing::TestParamInfo<std::string> const &info) { return info.param; });
