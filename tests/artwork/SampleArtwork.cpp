#include "tests/artwork/SampleArtwork.h"
#include "artwork/compiler/GlogArtwork.h"
#include <fstream>
#include <gtest/gtest.h>
#include <sstream>
#include <unistd.h>

namespace {

constexpr char kTheme[] = R"(<theme name="day">
  <color name="kWindowBackgroundColor" value="#eeeeee"/>
  <color name="kDialogActiveTextColor" value="#000000"/>
  <color name="kDialogInactiveTextColor" value="#666666"/>
  <color name="kDialogButtonActiveTextColor" value="#000000"/>
  <color name="kDialogButtonInactiveTextColor" value="#666666"/>
  <paint name="ink" value="#204060"/>
  <paint name="glass" value="#ff000080"/>
</theme>)";

constexpr char kMissing[] =
    R"(<svg xmlns="http://www.w3.org/2000/svg" data-family="0" data-name="Missing" data-size="4 4">
  <g id="i0"><rect class="frame" width="4" height="4" fill="none"/><rect width="4" height="4" class="fill-ink"/></g>
</svg>)";

} // namespace

SampleArtwork::SampleArtwork() {
    std::string pattern = (std::filesystem::temp_directory_path() / "glog-artwork-XXXXXX").string();
    if (!mkdtemp(pattern.data()))
        throw std::filesystem::filesystem_error("no temporary folder",
                                                std::error_code(errno, std::generic_category()));
    folder = pattern;
    Write("themes/day.xml", kTheme);
    Write("icons/missing.svg", kMissing);
}

SampleArtwork::~SampleArtwork() { std::filesystem::remove_all(folder); }

void SampleArtwork::Write(std::string const &relativePath, std::string const &content) const {
    std::filesystem::path const path = folder / relativePath;
    std::filesystem::create_directories(path.parent_path());
    std::ofstream(path, std::ios::binary) << content;
}

void SampleArtwork::WriteFamily(std::string const &content) const {
    Write("icons/7.svg", "<svg xmlns=\"http://www.w3.org/2000/svg\" data-family=\"7\" data-name=\"Seven\" "
                         "data-size=\"10 10\">\n" +
                             content + "\n</svg>\n");
}

CompilerRun RunCompiler(std::filesystem::path const &source, std::vector<std::string> const &arguments) {
    std::string const sourceText = source.string();
    std::vector<char const *> argv{"glog-artwork", sourceText.c_str()};
    for (std::string const &argument : arguments)
        argv.push_back(argument.c_str());
    std::ostringstream out, err;
    int const status = RunGlogArtwork(static_cast<int>(argv.size()), argv.data(), out, err);
    return {status, out.str(), err.str()};
}

std::string ReadFile(std::filesystem::path const &path) {
    std::ifstream in(path, std::ios::binary);
    EXPECT_TRUE(in) << path << " cannot be read";
    std::ostringstream all;
    all << in.rdbuf();
    return all.str();
}
