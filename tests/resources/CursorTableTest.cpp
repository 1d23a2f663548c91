#include "desktop/resources/CursorTable.h"
#include <gtest/gtest.h>

static CursorTable Parsed(std::string const &xml) {
    CursorTable table;
    table.Read(XmlFile::Parse(xml, "cursors.xml"));
    return table;
}

TEST(CursorTable, HoldsTheIconAndTheHotSpotOfEachNumber) {
    CursorTable const table = Parsed(
        "<cursors><cursor number='650' name='x' family='6500' icon='10' hotH='12' hotV='3'/></cursors>");
    CursorEntry const *entry = table.Find(650);
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->family, 6500);
    EXPECT_EQ(entry->icon, 10);
    EXPECT_EQ(entry->hotH, 12);
    EXPECT_EQ(entry->hotV, 3);
    EXPECT_EQ(table.Find(651), nullptr);
}

TEST(CursorTable, ALaterEntryGoesBeforeAnEarlierOne) {
    CursorTable table =
        Parsed("<cursors><cursor number='650' family='1' icon='1' hotH='0' hotV='0'/></cursors>");
    table.Read(XmlFile::Parse(
        "<cursors><cursor number='650' family='2' icon='1' hotH='0' hotV='0'/></cursors>", "cursors.xml"));
    EXPECT_EQ(table.Find(650)->family, 2);
}

TEST(CursorTable, WhatItDoesNotKnowIsAnErrorWithItsPlace) {
    for (char const *xml :
         {"<cursor/>", "<cursors>\n<icon/></cursors>", "<cursors>\n<cursor/></cursors>",
          "<cursors>\n<cursor number='-1' family='1' icon='1' hotH='0' hotV='0'/></cursors>",
          "<cursors>\n<cursor number='1' family='40000' icon='1' hotH='0' hotV='0'/></cursors>",
          "<cursors>\n<cursor number='1' family='1' icon='1' hotH='256' hotV='0'/></cursors>",
          "<cursors>\n<cursor number='1' family='1' icon='one' hotH='0' hotV='0'/></cursors>"})
        EXPECT_THROW(Parsed(xml), XmlError) << xml;
}
