// The small values of the interface: what they are by default and what they are made of.
#include "host/CommandSpecifier.h"
#include "host/DurationValue.h"
#include "host/EventRecordAdapter.h"
#include "host/Noncopyable.h"
#include "host/OSWindow.h"
#include "host/PortSavers.h"
#include "host/RGBColor.h"
#include "host/TarnError.h"
#include "host/TextSettings.h"
#include "host/TextStyle.h"
#include "host/XMLLib.h"
#include <gtest/gtest.h>
#include <type_traits>

namespace {

class First : public Noncopyable<First> {};
class Second : public Noncopyable<void> {};
class Both : public First, public Second {};

static_assert(!std::is_copy_constructible<First>::value && !std::is_copy_assignable<First>::value, "");
static_assert(!std::is_copy_constructible<Both>::value, "two noncopyable bases stand side by side");
static_assert(std::is_base_of<std::exception, TarnError>::value, "");
static_assert(sizeof(CommandSpecifier) == 4, "its address stands for the command");
static_assert(sizeof(RGBColor) == 6, "");
static_assert(!std::is_copy_constructible<WithCursorDispatchingDisabled>::value, "");
static_assert(
    !std::is_convertible<TarnOSWindow::OSWindow::PositionArg, TarnOSWindow::OSWindow::SendBehindArg>::value,
    "");

} // namespace

TEST(CommandSpecifier, IsNoCommandByDefault) {
    CommandSpecifier const none;
    EXPECT_EQ(none.classID, 0);
    EXPECT_EQ(none.commandID, 0);
}

TEST(CommandSpecifier, HasItsClassFirst) {
    CommandSpecifier const copy(15, 12);
    EXPECT_EQ(copy.classID, 15);
    EXPECT_EQ(copy.commandID, 12);
}

TEST(RGBAColor, IsOpaqueBlackByDefault) {
    OS::RGBAColor const color;
    EXPECT_EQ(color.r, 0.0);
    EXPECT_EQ(color.g, 0.0);
    EXPECT_EQ(color.b, 0.0);
    EXPECT_EQ(color.a, 1.0);
}

TEST(RGBAColor, IsMadeOfItsComponentsInOrder) {
    OS::RGBAColor const color(0.1, 0.2, 0.3, 0.4);
    EXPECT_EQ(color.r, 0.1);
    EXPECT_EQ(color.g, 0.2);
    EXPECT_EQ(color.b, 0.3);
    EXPECT_EQ(color.a, 0.4);
}

TEST(TextStyle, IsPlainOpaqueBlackInTheDialogFamilyByDefault) {
    OS::TextStyle const style;
    EXPECT_EQ(style.face, 0);
    EXPECT_EQ(style.size, 0);
    EXPECT_EQ(style.color.r, 0.0);
    EXPECT_EQ(style.color.a, 1.0);
    EXPECT_EQ(style.family.GetOrderedFontID(), OS::Font::FamilyID().GetOrderedFontID());
}

TEST(TextSettings, HasTheNumbersThatResourcesUse) {
    EXPECT_EQ(TextSettings::kAlignRight, -1);
    EXPECT_EQ(TextSettings::kAlignDefault, 0);
    EXPECT_EQ(TextSettings::kAlignCenter, 1);
    EXPECT_EQ(TextSettings::kAlignLeft, 2);
    EXPECT_EQ(TextSettings::kTruncateNone, 0);
    EXPECT_EQ(TextSettings::kTruncateEnd, 1);
    EXPECT_EQ(TextSettings::kTruncateMiddle, 2);
}

TEST(EventRecordAdapter, IsEmptyByDefault) {
    EventRecordAdapter const event;
    EXPECT_EQ(event.what, 0);
    EXPECT_EQ(event.message, 0u);
    EXPECT_EQ(event.when, 0u);
    EXPECT_EQ(event.where.v, 0);
    EXPECT_EQ(event.where.h, 0);
    EXPECT_EQ(event.modifiers, 0);
}

TEST(EventRecordAdapter, CanBeCopied) {
    EventRecordAdapter event;
    event.message = 13;
    event.where.h = 40;
    event.modifiers = 0x0200;
    EventRecordAdapter const copy(event);
    EXPECT_EQ(copy.message, 13u);
    EXPECT_EQ(copy.where.h, 40);
    EXPECT_EQ(copy.modifiers, 0x0200);
}

TEST(DurationValue, IsZeroByDefault) {
    DurationValue const none;
    EXPECT_EQ(none.first, 0);
    EXPECT_EQ(none.second, 0);
    DurationValue const some(1, 2);
    EXPECT_EQ(some.first, 1);
    EXPECT_EQ(some.second, 2);
}

TEST(SendBehindArg, KeepsThePosition) {
    typedef TarnOSWindow::OSWindow Window;
    EXPECT_EQ(Window::SendBehindArg(Window::PositionOnTop).position, Window::PositionOnTop);
}

TEST(WithCursorDispatchingDisabled, CountsHowManyLive) {
    int const before = WithCursorDispatchingDisabled::fgCount;
    {
        WithCursorDispatchingDisabled first;
        WithCursorDispatchingDisabled second;
        EXPECT_EQ(WithCursorDispatchingDisabled::fgCount, before + 2);
    }
    EXPECT_EQ(WithCursorDispatchingDisabled::fgCount, before);
}

TEST(XMLItems, KeepTheirValues) {
    EXPECT_EQ(XMLLib::SIntItem(-5000000000LL).Get(), -5000000000LL);
    UString const text("Play", UString::kByteEncoding1);
    EXPECT_TRUE(XMLLib::UStringItem(text).Get() == text);
}
