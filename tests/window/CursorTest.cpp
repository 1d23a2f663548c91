#include "desktop/resources/Resources.h"
#include "tests/drawing/SampleAtlas.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tests/window/WindowTest.h"

static std::uint32_t const kColour = 0xFF2040C0U, kDarkColour = 0xFFD0E0F0U, kTranslucent = 0x80402010U;
static int const kNumber = 650, kTranslucentNumber = 651, kUndrawnNumber = 652;

namespace {

class Cursor : public WindowTest {
protected:
    Cursor() {
        directory.Write("cursors.xml", "<cursors>"
                                       "<cursor number='650' family='6500' icon='10' hotH='12' hotV='5'/>"
                                       "<cursor number='651' family='6500' icon='11' hotH='30' hotV='30'/>"
                                       "<cursor number='652' family='6501' icon='0' hotH='0' hotV='0'/>"
                                       "</cursors>");
        WriteAtlas("light", kColour);
        WriteAtlas("dark", kDarkColour);
        directory.Write("themes/light.xml", "<theme/>");
        directory.Write("themes/dark.xml", "<theme/>");
        Resources::Instance().Open(directory.Path());
        Resources::Instance().SetTheme("light");
    }
    void WriteAtlas(std::string const &theme, std::uint32_t colour) {
        SampleAtlas atlas;
        atlas.AddFamily(6500, 24, 24);
        atlas.AddIcon(10, 24, 24, colour);
        atlas.AddIcon(11, 24, 24, kTranslucent);
        directory.Write(atlas.Name(theme), atlas.Bytes());
    }
    Window OpenUnderPointer() {
        Window window = Open(At(200, 150, 300, 200));
        PointAt(*window, 40, 30);
        Await(InputEvent::kMouseMove);
        return window;
    }
    XScreen::PointerPicture Shown(int cursor) {
        System().SetCursor(cursor);
        Drain(); // sends it
        return Screen().Pointer();
    }
    TemporaryDirectory directory;
};

} // namespace

TEST_F(Cursor, OfANumberIsItsPictureWithItsHotSpot) {
    Window window = OpenUnderPointer();
    XScreen::PointerPicture picture = Shown(kNumber);
    EXPECT_EQ(picture.width, 24);
    EXPECT_EQ(picture.height, 24);
    EXPECT_EQ(picture.hotX, 12);
    EXPECT_EQ(picture.hotY, 5);
    EXPECT_EQ(picture.middle, kColour);
}

TEST_F(Cursor, KeepsItsTranslucency) {
    Window window = OpenUnderPointer();
    EXPECT_EQ(Shown(kTranslucentNumber).middle, kTranslucent);
}

TEST_F(Cursor, IsScaledWithTheWindow) {
    OpenSystem(2.0);
    Window window = Open(At(100, 80, 150, 100));
    PointAt(*window, 40, 30);
    Await(InputEvent::kMouseMove);
    XScreen::PointerPicture picture = Shown(kNumber);
    EXPECT_EQ(picture.width, 48);
    EXPECT_EQ(picture.hotX, 24);
    EXPECT_EQ(picture.hotY, 10);
}

TEST_F(Cursor, WithoutPictureIsTheArrow) {
    Window window = OpenUnderPointer();
    XScreen::PointerPicture arrow = Shown(Cursors::kArrow);
    Shown(kNumber);
    for (int number : {kUndrawnNumber, 4711, -1}) {
        XScreen::PointerPicture picture = Shown(number);
        EXPECT_EQ(picture.width, arrow.width) << number;
        EXPECT_EQ(picture.hotX, arrow.hotX) << number;
        EXPECT_EQ(picture.middle, arrow.middle) << number;
    }
}

TEST_F(Cursor, OfTextIsNotTheArrow) {
    Window window = OpenUnderPointer();
    XScreen::PointerPicture arrow = Shown(Cursors::kArrow), text = Shown(Cursors::kText);
    EXPECT_TRUE(arrow.width != text.width || arrow.hotX != text.hotX || arrow.middle != text.middle);
}

TEST_F(Cursor, FollowsTheTheme) {
    Window window = OpenUnderPointer();
    Shown(kNumber);
    Resources::Instance().SetTheme("dark");
    EXPECT_EQ(Shown(kNumber).middle, kDarkColour);
    Resources::Instance().SetTheme("light");
}

TEST_F(Cursor, FromABrokenTableIsAnErrorAndTheArrowIsNot) {
    directory.Write("cursors.xml", "<cursors><cursor number='x'/></cursors>");
    Resources::Instance().Open(directory.Path());
    EXPECT_NO_THROW(System().SetCursor(Cursors::kArrow));
    EXPECT_THROW(System().SetCursor(kNumber), ResourceError);
}
