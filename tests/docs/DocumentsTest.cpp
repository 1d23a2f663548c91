// What the documents show works, and what they point to is there.
#include "desktop/SimulatedDesktop.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/docs/Document.h"
#include <algorithm>
#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <iterator>
#include <regex>
#include <sstream>

namespace {

std::string const kTop = std::string(GLOG_TEST_SOURCE_DIR) + "/../";

// The documents at the top, in docs/, docs/panes/ and artwork/, from the top of the tree.
std::vector<std::string> Documents() {
    std::vector<std::string> paths;
    for (std::string const folder : {"", "docs/", "docs/panes/", "artwork/", "artwork/icons/"}) {
        for (auto const &entry : std::filesystem::directory_iterator(kTop + folder)) {
            if (entry.path().extension() == ".md")
                paths.push_back(folder + entry.path().filename().string());
        }
    }
    return paths;
}

std::string FileText(std::string const &path) {
    std::ifstream file(kTop + path);
    return std::string((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
}

// A dialog as it stands, an item in a window of its own.
std::string Dialog(std::string const &xml) {
    if (xml.rfind("<Item", 0) != 0)
        return xml;
    return "<Glog width='320' height='200'><Items>" + xml + "</Items></Glog>";
}

TEST(Documents, PointToFilesThatAreThere) {
    ASSERT_FALSE(Documents().empty());
    for (std::string const &path : Documents()) {
        std::filesystem::path const folder = std::filesystem::path(kTop + path).parent_path();
        Document const document(path);
        for (std::string const &link : document.Links())
            EXPECT_TRUE(std::filesystem::exists(folder / link)) << path << " points to " << link;
    }
}

TEST(Documents, ShowDialogsThatLoad) {
    SimulatedDesktop desktop;
    int shown = 0;
    for (std::string const &path : Documents()) {
        if (path.rfind("artwork/", 0) == 0)
            continue; // they show other files
        for (std::string const &xml : Document(path).Blocks("xml")) {
            if (xml.find("\"Meter\"") != std::string::npos)
                continue; // a type of the guide's own: GuideCodeTest.cpp
            EXPECT_NO_THROW(DisposeGlog(LoadGlogFromText(Dialog(xml), path))) << xml;
            ++shown;
        }
    }
    EXPECT_GT(shown, 40);
}

// Lines without the white space around them, so that code may stand further to the left or right.
std::string Flush(std::string const &text) {
    std::istringstream lines(text);
    std::string flush = "\n";
    for (std::string line; std::getline(lines, line);) {
        std::size_t const first = line.find_first_not_of(' ');
        flush += (first == std::string::npos ? "" : line.substr(first)) + '\n';
    }
    return flush;
}

// The code that the guide may show, each file of which is built and run by a test.
std::vector<std::string> GuideSources() {
    std::vector<std::string> sources = {Flush(FileText("tests/docs/GuideCodeTest.cpp"))};
    for (auto const &entry : std::filesystem::directory_iterator(kTop + "examples/takes"))
        sources.push_back(Flush(FileText("examples/takes/" + entry.path().filename().string())));
    return sources;
}

TEST(Guide, ShowsCodeAsItIsBuilt) {
    Document const guide("docs/guide.md");
    std::vector<std::string> blocks = guide.Blocks("cpp");
    EXPECT_GT(blocks.size(), 8u);
    // The first of CMake is a file of its own, which tests/install/guide.cmake builds.
    std::vector<std::string> const cmake = guide.Blocks("cmake");
    blocks.insert(blocks.end(), cmake.begin() + 1, cmake.end());
    std::vector<std::string> const sources = GuideSources();
    for (std::string const &block : blocks) {
        EXPECT_TRUE(std::any_of(sources.begin(), sources.end(), [&](std::string const &source) {
            return source.find(Flush(block)) != std::string::npos;
        })) << block;
    }
}

TEST(Guide, ShowsTheDialogAndTheScriptOfItsExample) {
    Document const guide("docs/guide.md");
    EXPECT_EQ(guide.Blocks("xml").front(), FileText("examples/takes/takes.xml"));
    EXPECT_EQ(guide.Blocks("script").front(), FileText("examples/takes/takes.script"));
}

TEST(Guide, QuotesMessagesOfItsScript) {
    Document const guide("docs/guide.md");
    SimulatedDesktop desktop;
    glogRec *const glog = LoadGlogFromText(guide.Blocks("xml").front(), "guide.md");
    desktop.TakeMessages();
    ShowGlog(glog, kShowGlog);
    desktop.Play(guide.Blocks("script").front());
    std::string messages;
    for (std::string const &line : desktop.TakeMessages())
        messages += "    " + line + '\n';
    std::smatch quoted;
    std::string const text = FileText("docs/guide.md");
    ASSERT_TRUE(std::regex_search(text, quoted, std::regex("(    \\{\"time\"[^\n]*\n)+")));
    EXPECT_NE(messages.find(quoted.str()), std::string::npos) << messages;
}

TEST(Guide, QuotesTheComplaintThatTheLoaderMakes) {
    std::string xml = Document("docs/guide.md").Blocks("xml").front();
    xml.replace(xml.find("<ButtonText>"), 12, "<ButonText>");
    xml.replace(xml.find("</ButtonText>"), 13, "</ButonText>");
    SimulatedDesktop desktop;
    try {
        LoadGlogFromText(xml, "takes.xml");
        FAIL() << "the misspelt key was taken";
    } catch (LoadError const &error) {
        EXPECT_NE(FileText("docs/guide.md").find(error.what()), std::string::npos) << error.what();
    }
}

TEST(Readme, ShowsTheExampleAsItIsBuilt) {
    Document const readme("README.md");
    EXPECT_EQ(readme.Blocks("cpp").front(), FileText("examples/hello/main.cpp"));
    EXPECT_EQ(readme.Blocks("xml").front(), FileText("examples/hello/hello.xml"));
}

} // namespace
