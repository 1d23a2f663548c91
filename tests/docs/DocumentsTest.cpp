// What the documents show works, and what they point to is there.
#include "desktop/SimulatedDesktop.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/docs/Document.h"
#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <iterator>

namespace {

std::string const kTop = std::string(GLOG_TEST_SOURCE_DIR) + "/../";

// The documents at the top and in docs/ and artwork/, from the top of the tree.
std::vector<std::string> Documents() {
    std::vector<std::string> paths;
    for (std::string const folder : {"", "docs/", "artwork/", "artwork/icons/"}) {
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
    for (std::string const path : {"README.md", "docs/guide.md", "docs/dialog-reference.md"}) {
        for (std::string const &xml : Document(path).Blocks("xml")) {
            EXPECT_NO_THROW(DisposeGlog(LoadGlogFromText(Dialog(xml), path))) << xml;
            ++shown;
        }
    }
    EXPECT_GT(shown, 0);
}

TEST(Guide, ShowsAScriptThatFitsItsFirstDialog) {
    Document const guide("docs/guide.md");
    ASSERT_FALSE(guide.Blocks("script").empty());
    std::filesystem::create_directories(GLOG_TEST_OUTPUT_DIR);
    std::filesystem::current_path(GLOG_TEST_OUTPUT_DIR); // the script writes files
    SimulatedDesktop desktop;
    glogRec *const glog = LoadGlogFromText(guide.Blocks("xml").front(), "guide.md");
    desktop.TakeMessages();
    ShowGlog(glog, kShowGlog);
    desktop.Play(guide.Blocks("script").front());
    std::string messages;
    for (std::string const &line : desktop.TakeMessages())
        messages += "    " + line + '\n';
    EXPECT_NE(FileText("docs/guide.md").find(messages), std::string::npos) << messages;
}

TEST(Guide, QuotesTheComplaintThatTheLoaderMakes) {
    std::string xml = Document("docs/guide.md").Blocks("xml").front();
    xml.replace(xml.find("<ButtonText>"), 12, "<ButonText>");
    xml.replace(xml.find("</ButtonText>"), 13, "</ButonText>");
    SimulatedDesktop desktop;
    try {
        LoadGlogFromText(xml, "metronome.xml");
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
