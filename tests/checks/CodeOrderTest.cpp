// Whether the lists by which the code is laid out still speak of this code.
#include "tests/LibraryExports.h"
#include "tools/TextFile.h"

namespace {

std::string const kLists = std::string(GLOG_TEST_SOURCE_DIR) + "/../cmake/order/";
std::string const kLibrary = GLOG_PANES_LIBRARY;

class CodeOrder : public testing::TestWithParam<std::string> {};

} // namespace

TEST_P(CodeOrder, NamesFunctionsThatThereAre) {
    std::string const folder = kLibrary.substr(0, kLibrary.rfind('/') + 1);
    std::map<std::string, Symbol> const symbols = SymbolsOf(folder + "libglog" + GetParam() + ".so", "");
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
