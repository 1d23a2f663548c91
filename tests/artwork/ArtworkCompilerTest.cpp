#include "tests/artwork/AtlasReader.h"
#include "tests/artwork/SampleArtwork.h"
#include <gtest/gtest.h>

namespace {

constexpr char kFrame[] = "<rect class=\"frame\" width=\"10\" height=\"10\" fill=\"none\"/>";

std::string Icon(std::string const &id, std::string const &drawing) {
    return "<g id=\"" + id + "\">" + kFrame + drawing + "</g>";
}

// The file of a picture of that width, without a drawing in it.
std::string Picture(int width) {
    std::string const size = std::to_string(width);
    return "<svg xmlns=\"http://www.w3.org/2000/svg\" data-family=\"9\" data-name=\"Wide\" data-size=\"" +
           size + " 8\"><g id=\"i0\"><rect class=\"frame\" width=\"" + size +
           "\" height=\"8\" fill=\"none\"/></g></svg>";
}

// Compiles a family with this content, expects a refusal, and returns the message.
std::string MessageFor(std::string const &familyContent) {
    SampleArtwork sample;
    sample.WriteFamily(familyContent);
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_EQ(1, run.status);
    return run.messages;
}

testing::AssertionResult Says(std::string const &message, std::string const &part) {
    if (message.find(part) != std::string::npos)
        return testing::AssertionSuccess();
    return testing::AssertionFailure() << "\"" << message << "\" does not say \"" << part << "\"";
}

// The atlas of a family with these drawings as icon 0, at a scale.
AtlasReader Compile(SampleArtwork const &sample, std::string const &drawing, std::string const &scale = "1") {
    sample.WriteFamily(Icon("i0", drawing));
    CompilerRun const run =
        RunCompiler(sample.Folder(), {"--out", sample.Output().string(), "--scale", scale});
    EXPECT_EQ(0, run.status) << run.messages;
    return AtlasReader(sample.Output() /
                       ("atlas-day-" + std::to_string(int(std::stod(scale) * 100)) + ".glogatlas"));
}

} // namespace

TEST(ArtworkCompiler, DrawsAPaintAsPremultipliedPixels) {
    SampleArtwork sample;
    AtlasReader const atlas = Compile(sample, "<rect width=\"5\" height=\"10\" class=\"fill-glass\"/>");
    AtlasFormat::ImageRecord const image = atlas.Find(7, 0)->images[0];
    EXPECT_EQ(0x80800000u, atlas.Pixel(image, 0, 0));
    EXPECT_EQ(0u, atlas.Pixel(image, 5, 0));
    EXPECT_EQ(0, image.flags);
}

TEST(ArtworkCompiler, MarksAnIconWithoutAnyTransparencyAsOpaque) {
    SampleArtwork sample;
    AtlasReader const atlas = Compile(sample, "<rect width=\"10\" height=\"10\" class=\"fill-ink\"/>");
    EXPECT_EQ(AtlasFormat::kImageOpaque, atlas.Find(7, 0)->images[0].flags);
    EXPECT_EQ(0xff204060u, atlas.Pixel(atlas.Find(7, 0)->images[0], 9, 9));
}

TEST(ArtworkCompiler, MarksAnIconWithNothingInItAsEmpty) {
    SampleArtwork sample;
    EXPECT_EQ(AtlasFormat::kImageEmpty, Compile(sample, "").Find(7, 0)->images[0].flags);
}

TEST(ArtworkCompiler, CutsADrawingAtItsFrame) {
    SampleArtwork sample;
    AtlasReader const atlas =
        Compile(sample, "<rect x=\"-50\" y=\"-50\" width=\"200\" height=\"200\" class=\"fill-ink\"/>");
    EXPECT_EQ(10, atlas.Find(7, 0)->images[0].width);
    EXPECT_EQ(AtlasFormat::kImageOpaque, atlas.Find(7, 0)->images[0].flags);
}

TEST(ArtworkCompiler, BeginsAnIconAtItsFrameWhereverItStandsOnTheSheet) {
    SampleArtwork sample;
    sample.WriteFamily("<g id=\"i0\" transform=\"translate(40 8)\">" + std::string(kFrame) +
                       "<rect width=\"10\" height=\"10\" class=\"fill-ink\"/></g>");
    ASSERT_EQ(0, RunCompiler(sample.Folder(), {"--out", sample.Output().string(), "--scale", "1"}).status);
    AtlasReader const atlas(sample.Output() / "atlas-day-100.glogatlas");
    EXPECT_EQ(AtlasFormat::kImageOpaque, atlas.Find(7, 0)->images[0].flags);
}

TEST(ArtworkCompiler, DrawsBothRoundingsOfEachSideAtAFractionalScale) {
    SampleArtwork sample;
    AtlasReader const atlas =
        Compile(sample, "<rect width=\"10\" height=\"10\" class=\"fill-ink\"/>", "1.25");
    auto const &images = atlas.Find(7, 0)->images;
    EXPECT_EQ(12, images[0].width);
    EXPECT_EQ(12, images[0].height);
    EXPECT_EQ(13, images[AtlasFormat::kWiderImage].width);
    EXPECT_EQ(12, images[AtlasFormat::kWiderImage].height);
    EXPECT_EQ(12, images[AtlasFormat::kTallerImage].width);
    EXPECT_EQ(13, images[AtlasFormat::kTallerImage].height);
    EXPECT_EQ(13, images[AtlasFormat::kWiderImage + AtlasFormat::kTallerImage].width);
    EXPECT_EQ(13, images[AtlasFormat::kWiderImage + AtlasFormat::kTallerImage].height);
}

TEST(ArtworkCompiler, KeepsOneImageWhereTheScaleGivesWholeSides) {
    SampleArtwork sample;
    AtlasReader const atlas = Compile(sample, "<rect width=\"10\" height=\"10\" class=\"fill-ink\"/>", "1.5");
    auto const &images = atlas.Find(7, 0)->images;
    for (AtlasFormat::ImageRecord const &image : images)
        EXPECT_EQ(images[0].offset, image.offset);
    EXPECT_EQ(15, images[0].width);
}

TEST(ArtworkCompiler, WritesTheTablesAsTheFormatSays) {
    SampleArtwork sample;
    AtlasReader const atlas =
        Compile(sample, "<rect width=\"10\" height=\"10\" class=\"fill-ink\"/>", "1.25");
    AtlasFormat::Header const &header = atlas.Header();
    EXPECT_EQ(0, std::string(AtlasFormat::kMagic, 8).compare(std::string(header.magic, 8)));
    EXPECT_EQ(AtlasFormat::kVersion, header.version);
    EXPECT_EQ(AtlasFormat::kByteOrderMark, header.byteOrder);
    EXPECT_EQ(1250u, header.scaleThousandths);
    EXPECT_EQ(2u, header.familyCount);
    EXPECT_EQ(2u, header.iconCount);
    EXPECT_EQ(atlas.FileSize(), header.fileSize);
    EXPECT_EQ(0, atlas.Families()[0].number);
    EXPECT_EQ(7, atlas.Families()[1].number);
    for (AtlasFormat::IconRecord const &icon : atlas.Icons())
        for (AtlasFormat::ImageRecord const &image : icon.images) {
            EXPECT_EQ(0u, image.offset % AtlasFormat::kPixelAlignment);
            EXPECT_LE(image.offset + std::size_t(image.width) * image.height * 4, atlas.FileSize());
        }
}

TEST(ArtworkCompiler, SortsIconsByIndexWhateverTheOrderOfTheFile) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i12", "") + Icon("i-3", "") + Icon("i5", ""));
    ASSERT_EQ(0, RunCompiler(sample.Folder(), {"--out", sample.Output().string(), "--scale", "1"}).status);
    AtlasReader const atlas(sample.Output() / "atlas-day-100.glogatlas");
    EXPECT_EQ(-3, atlas.Icons()[1].index);
    EXPECT_EQ(5, atlas.Icons()[2].index);
    EXPECT_EQ(12, atlas.Icons()[3].index);
}

TEST(ArtworkCompiler, NamesFileLineAndColumnOfXmlThatIsNotWellFormed) {
    std::string const message = MessageFor("<g id=\"i0\">");
    EXPECT_TRUE(Says(message, "icons/7.svg:3:"));
}

TEST(ArtworkCompiler, RefusesAnIconWithoutAFrame) {
    std::string const message = MessageFor("<g id=\"i4\"><rect width=\"10\" height=\"10\"/></g>");
    EXPECT_TRUE(Says(message, "icons/7.svg:2:"));
    EXPECT_TRUE(Says(message, "<g id=\"i4\">"));
    EXPECT_TRUE(Says(message, "frame"));
}

TEST(ArtworkCompiler, RefusesAFrameThatIsTooLarge) {
    EXPECT_TRUE(
        Says(MessageFor("<g id=\"i0\"><rect class=\"frame\" width=\"513\" height=\"1\" fill=\"none\"/></g>"),
             "width=\"513\" must be a whole number from 1 to 512"));
}

TEST(ArtworkCompiler, DrawsPicturesThatAreLargerThanAnIconMayBe) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", ""));
    sample.Write("pictures/9.svg", Picture(1200));
    ASSERT_EQ(0, RunCompiler(sample.Folder(), {"--out", sample.Output().string()}).status);
    EXPECT_TRUE(std::filesystem::exists(sample.Output() / "pictures/day/9@2x.png"));
}

TEST(ArtworkCompiler, RefusesAPictureThatIsTooLarge) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", ""));
    sample.Write("pictures/9.svg", Picture(4097));
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "pictures/9.svg:1:2: <svg>: data-size must be two whole numbers"));
    EXPECT_TRUE(Says(run.messages, "from 1 to 4096"));
}

TEST(ArtworkCompiler, RefusesIconsThatAreAllShadow) {
    SampleArtwork sample;
    sample.Write("icons/7.svg",
                 "<svg xmlns=\"http://www.w3.org/2000/svg\" data-family=\"7\" data-name=\"Seven\" "
                 "data-size=\"10 10\" data-shadow=\"4\"><g id=\"i0\"><rect class=\"frame\" "
                 "width=\"9\" height=\"4\" fill=\"none\"/></g></svg>");
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "all of the icon is shadow"));
}

TEST(ArtworkCompiler, RefusesAFrameWithoutArea) {
    EXPECT_TRUE(
        Says(MessageFor("<g id=\"i0\"><rect class=\"frame\" width=\"0\" height=\"1\" fill=\"none\"/></g>"),
             "width=\"0\" must be a whole number"));
}

TEST(ArtworkCompiler, RefusesAFrameWithAFractionOfAPixel) {
    EXPECT_TRUE(
        Says(MessageFor("<g id=\"i0\"><rect class=\"frame\" width=\"9.5\" height=\"1\" fill=\"none\"/></g>"),
             "width=\"9.5\" must be a whole number"));
}

TEST(ArtworkCompiler, RefusesAFrameThatWouldBeSeen) {
    EXPECT_TRUE(Says(MessageFor("<g id=\"i0\"><rect class=\"frame\" width=\"9\" height=\"1\"/></g>"),
                     "fill=\"none\""));
}

TEST(ArtworkCompiler, RefusesAFrameThatDoesNotBeginAtTheOrigin) {
    EXPECT_TRUE(Says(
        MessageFor("<g id=\"i0\"><rect class=\"frame\" x=\"2\" width=\"9\" height=\"1\" fill=\"none\"/></g>"),
        "begin at 0, 0"));
}

TEST(ArtworkCompiler, RefusesAnIndexThatIsDrawnTwice) {
    EXPECT_TRUE(Says(MessageFor(Icon("i3", "") + Icon("i3", "")), "index 3 is drawn twice"));
}

TEST(ArtworkCompiler, RefusesAnElementThatWouldNeverBeDrawn) {
    EXPECT_TRUE(
        Says(MessageFor(Icon("i0", "") + "<path id=\"stray\" d=\"M0 0H4\"/>"), "<path id=\"stray\">"));
}

TEST(ArtworkCompiler, RefusesAnIndexThatIsNoNumber) {
    EXPECT_TRUE(Says(MessageFor(Icon("ix", "")), "<g id=\"ix\">"));
}

TEST(ArtworkCompiler, RefusesAnIndexBeyondSixteenBits) {
    EXPECT_TRUE(Says(MessageFor(Icon("i32768", "")), "<g id=\"i32768\">"));
}

TEST(ArtworkCompiler, RefusesAFamilyWithoutIcons) { EXPECT_TRUE(Says(MessageFor(""), "no icon")); }

TEST(ArtworkCompiler, RefusesATurnedIcon) {
    EXPECT_TRUE(Says(MessageFor("<g id=\"i0\" transform=\"rotate(4)\">" + std::string(kFrame) + "</g>"),
                     "translate"));
}

TEST(ArtworkCompiler, RefusesAPaintThatTheThemeDoesNotHave) {
    std::string const message = MessageFor(Icon("i2", "<rect width=\"4\" height=\"4\" class=\"fill-mud\"/>"));
    EXPECT_TRUE(Says(message, "fill-mud"));
    EXPECT_TRUE(Says(message, "<g id=\"i2\">"));
    EXPECT_TRUE(Says(message, "\"day\""));
}

TEST(ArtworkCompiler, RefusesStylesOfTheFilesOwn) {
    EXPECT_TRUE(
        Says(MessageFor("<defs><style>rect { fill: red }</style></defs>" + Icon("i0", "")), "<style>"));
    EXPECT_TRUE(
        Says(MessageFor(Icon("i0", "<rect style=\"fill:red\" width=\"4\" height=\"4\"/>")), "classes"));
}

TEST(ArtworkCompiler, RefusesAReferenceToNothing) {
    EXPECT_TRUE(
        Says(MessageFor(Icon("i0", "<rect width=\"4\" height=\"4\" fill=\"url(#gone)\"/>")), "\"gone\""));
}

TEST(ArtworkCompiler, RefusesTwoFilesOfOneFamilyAndNamesBoth) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", ""));
    std::filesystem::copy(sample.Folder() / "icons/7.svg", sample.Folder() / "icons/seven.svg");
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "icons/7.svg"));
    EXPECT_TRUE(Says(run.messages, "icons/seven.svg"));
}

TEST(ArtworkCompiler, RefusesADrawingOfAnotherSizeThanTheIndexSays) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", ""));
    sample.Write("icons/index.xml",
                 "<icons><family number=\"7\"><icon index=\"0\" width=\"12\" height=\"10\" "
                 "shows=\"x\"/></family></icons>");
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "is 10 x 10; the panes rely on 12 x 10"));
}

TEST(ArtworkCompiler, HoldsDrawingsToLimitsOfTheIndex) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", ""));
    sample.Write(
        "icons/index.xml",
        "<icons><family number=\"7\"><icon index=\"0\" maxHeight=\"9\" shows=\"x\"/></family></icons>");
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_TRUE(Says(run.messages, "rely on any x at most 9"));
}

TEST(ArtworkCompiler, ListsWhatTheIndexHasAndNobodyDrew) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i1", ""));
    sample.Write(
        "icons/index.xml",
        "<icons><family number=\"7\"><icon index=\"0\" last=\"2\" shows=\"knob\"/></family></icons>");
    CompilerRun const run = RunCompiler(sample.Folder(), {"--undrawn"});
    EXPECT_EQ(0, run.status);
    EXPECT_EQ("7 0 knob\n7 2 knob\n2 undrawn\n", run.output);
}

TEST(ArtworkCompiler, NeedsADrawingForMissingIcons) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", ""));
    std::filesystem::remove(sample.Folder() / "icons/missing.svg");
    EXPECT_TRUE(
        Says(RunCompiler(sample.Folder(), {"--out", sample.Output().string()}).messages, "missing icons"));
}

TEST(ArtworkCompiler, NamesThemeFileAndPaintOfABadColour) {
    for (char const *colour : {"red", "#12345", "#1234567", "#12345g", "123456#", ""}) {
        SampleArtwork sample;
        sample.Write("themes/night.xml", std::string("<theme name=\"night\">\n<paint name=\"ink\" value=\"") +
                                             colour + "\"/></theme>");
        CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
        EXPECT_EQ(1, run.status) << colour;
        EXPECT_TRUE(Says(run.messages, "themes/night.xml:2:")) << colour;
        EXPECT_TRUE(Says(run.messages, "<paint name=\"ink\">")) << colour;
    }
}

TEST(ArtworkCompiler, RefusesAThemeThatNamesAColourTwice) {
    SampleArtwork sample;
    sample.Write("themes/night.xml", "<theme name=\"night\"><paint name=\"ink\" value=\"#000000\"/>"
                                     "<paint name=\"ink\" value=\"#111111\"/></theme>");
    EXPECT_TRUE(Says(RunCompiler(sample.Folder(), {"--out", sample.Output().string()}).messages, "twice"));
}

TEST(ArtworkCompiler, RefusesAThemeFileWithAnotherRoot) {
    SampleArtwork sample;
    sample.Write("themes/night.xml", "<colours/>");
    EXPECT_TRUE(
        Says(RunCompiler(sample.Folder(), {"--out", sample.Output().string()}).messages, "must be <theme>"));
}

TEST(ArtworkCompiler, SurvivesAFileOfTenThousandLevels) {
    std::string deep;
    for (int i = 0; i < 10000; ++i)
        deep += "<g>";
    for (int i = 0; i < 10000; ++i)
        deep += "</g>";
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", deep));
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string(), "--scale", "1"});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "icons/7.svg"));
}

TEST(ArtworkCompiler, RefusesAFileThatIsAbsurdlyLarge) {
    SampleArtwork sample;
    sample.WriteFamily(Icon("i0", "") + std::string(5u << 20, ' '));
    EXPECT_TRUE(
        Says(RunCompiler(sample.Folder(), {"--out", sample.Output().string()}).messages, "larger than"));
}

TEST(ArtworkCompiler, NamesAFolderThatIsNotThere) {
    CompilerRun const run = RunCompiler("/nowhere/at/all", {"--out", "/nowhere/out"});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "/nowhere/at/all"));
}

TEST(ArtworkCompiler, NamesAnOutputThatCannotBeWritten) {
    SampleArtwork sample;
    sample.Write("out", "a file where a folder should be");
    CompilerRun const run = RunCompiler(sample.Folder(), {"--out", sample.Output().string()});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, sample.Output().string()));
}

TEST(ArtworkCompiler, AnswersABadCommandLineWithStatusTwo) {
    SampleArtwork sample;
    EXPECT_EQ(2, RunCompiler(sample.Folder(), {}).status);
    EXPECT_EQ(2, RunCompiler(sample.Folder(), {"--undrawn", "--scale", "99"}).status);
    EXPECT_EQ(2, RunCompiler(sample.Folder(), {"--undrawn", "--scale", "nan"}).status);
    EXPECT_EQ(2, RunCompiler(sample.Folder(), {"--polish"}).status);
}

TEST(ArtworkCompiler, TellsTheThemesThereAreWhenAskedForAnother) {
    SampleArtwork sample;
    CompilerRun const run =
        RunCompiler(sample.Folder(), {"--sheet", (sample.Folder() / "s.png").string(), "--theme", "x"});
    EXPECT_EQ(1, run.status);
    EXPECT_TRUE(Says(run.messages, "there are: day"));
}

TEST(ArtworkCompiler, DrawsAContactSheet) {
    SampleArtwork sample;
    std::filesystem::path const sheet = sample.Folder() / "sheet.png";
    CompilerRun const run =
        RunCompiler(sample.Folder(), {"--sheet", sheet.string(), "--theme", "day", "--scale", "2"});
    EXPECT_EQ(0, run.status) << run.messages;
    EXPECT_EQ("\x89PNG", ReadFile(sheet).substr(0, 4));
}
