#include "desktop/resources/XmlFile.h"
#include "tests/resources/TemporaryDirectory.h"
#include <functional>
#include <gtest/gtest.h>
#include <string>

namespace {

std::string const kUnknownReference =
    "\"&\" begins no character that is known here; the sign itself is written &amp;";

XmlNode Parse(std::string const &text) { return XmlFile::Parse(text, "test.xml").Root(); }

// what() of the error that parsing the text gives.
std::string ErrorOf(std::string const &text) {
    try {
        Parse(text);
    } catch (XmlError const &error) {
        return error.what();
    }
    return "no error";
}

std::string Nested(int depth) {
    std::string text;
    for (int i = 0; i < depth; ++i)
        text += "<a>";
    for (int i = 0; i < depth; ++i)
        text += "</a>";
    return text;
}

TEST(XmlFile, GivesNamesAttributesTextAndChildrenInOrder) {
    XmlNode const root = Parse("<Glog title='Mix &amp; match' width=\"360\"><A/>text<B>b</B></Glog>");
    EXPECT_EQ(root.name, "Glog");
    ASSERT_EQ(root.attributes.size(), 2u);
    EXPECT_EQ(root.attributes[0].name, "title");
    EXPECT_EQ(*root.Attribute("title"), "Mix & match");
    EXPECT_EQ(*root.Attribute("width"), "360");
    EXPECT_EQ(root.Attribute("height"), nullptr);
    EXPECT_EQ(root.text, "text");
    ASSERT_EQ(root.children.size(), 2u);
    EXPECT_EQ(root.children[0].name, "A");
    EXPECT_EQ(root.children[1].text, "b");
}

TEST(XmlFile, KnowsTheLineAndColumnOfEveryElement) {
    XmlNode const root = Parse("<?xml version='1.0'?>\n<a>\n  <b/><c/>\n\xC3\xA4\xC3\xB6<d/>\n</a>");
    EXPECT_EQ(root.line, 2);
    EXPECT_EQ(root.column, 1);
    EXPECT_EQ(root.children[0].line, 3);
    EXPECT_EQ(root.children[0].column, 3);
    EXPECT_EQ(root.children[1].column, 7);
    EXPECT_EQ(root.children[2].line, 4);
    EXPECT_EQ(root.children[2].column, 3); // characters, not bytes
}

TEST(XmlFile, PlacesAreTheSameAfterAByteOrderMark) {
    XmlNode const root = Parse("\xEF\xBB\xBF<a>\n<b/></a>");
    EXPECT_EQ(root.column, 1);
    EXPECT_EQ(root.children[0].line, 2);
}

TEST(XmlFile, CutsWhiteSpaceAtTheEndsOfText) {
    EXPECT_EQ(Parse("<a>\n  two  words \n</a>").text, "two  words");
    EXPECT_EQ(Parse("<a>  <b/>  </a>").text, "");
    EXPECT_EQ(Parse("<a>  one <!-- not this --> two </a>").text, "one  two");
}

TEST(XmlFile, KeepsWhiteSpaceInCdata) {
    EXPECT_EQ(Parse("<a><![CDATA[ <x> ]]></a>").text, " <x> ");
    EXPECT_EQ(Parse("<a> \n <![CDATA[ x ]]> \n </a>").text, " x ");
}

TEST(XmlFile, ResolvesCharacterReferences) { EXPECT_EQ(Parse("<a>&#xe4;&lt;</a>").text, "\xC3\xA4<"); }

TEST(XmlFile, SkipsDocumentTypesWithTheirEntities) {
    EXPECT_EQ(Parse("<!DOCTYPE a [<!ENTITY x \"1 > 2 & 3\">]><a>&lt;</a>").text, "<");
    EXPECT_EQ(ErrorOf("<!DOCTYPE a [<!ENTITY x \"boom\">]><a>&x;</a>"),
              "test.xml:1:37: " + kUnknownReference);
}

TEST(XmlFile, RejectsAnAmpersandThatStandsForItself) {
    EXPECT_EQ(ErrorOf("<a>\n  Drums & Bass</a>"), "test.xml:2:9: " + kUnknownReference);
    EXPECT_EQ(ErrorOf("<a b=\"R&B\"/>"), "test.xml:1:8: " + kUnknownReference);
    EXPECT_EQ(ErrorOf("<a>R&B<!-- ; --></a>"), "test.xml:1:5: " + kUnknownReference);
    EXPECT_EQ(ErrorOf("<a>&#;</a>"), "test.xml:1:4: " + kUnknownReference);
    EXPECT_EQ(ErrorOf("<a>&#x;</a>"), "test.xml:1:4: " + kUnknownReference);
    EXPECT_EQ(ErrorOf("<a>&amp</a>"), "test.xml:1:4: " + kUnknownReference);
}

TEST(XmlFile, AnAmpersandMayStandForItselfWhereNothingIsRead) {
    EXPECT_EQ(Parse("<?note a & b?><!-- R&B --><a b='&apos;&quot;'><![CDATA[R&B]]>&gt;&#38;&#x26;</a>").text,
              "R&B>&&");
}

TEST(XmlFile, NamesFileLineAndColumnOfAMistake) {
    EXPECT_EQ(ErrorOf("<a>\n  <b>\n</a>"), "test.xml:3:1: expected </b> for the <b> of line 2, found </a>");
}

TEST(XmlFile, NamesTheTagsThatAreNoPartners) {
    EXPECT_EQ(ErrorOf("<a>\n <b/><!-- <c> --><d e='>'>\n <![CDATA[<f>]]></g>"),
              "test.xml:3:17: expected </d> for the <d> of line 2, found </g>");
    EXPECT_EQ(ErrorOf("<a>\n  <b></b>\n  <c>\n"), "test.xml:3:3: <c> is not closed");
    EXPECT_EQ(ErrorOf("<a></a></b>"), "test.xml:1:8: </b> closes nothing: no element is open here");
}

TEST(XmlFile, RejectsTextThatIsNoXml) {
    EXPECT_NE(ErrorOf("").find("there is no element"), std::string::npos);
    EXPECT_NE(ErrorOf("hello"), "no error");
    EXPECT_NE(ErrorOf("<a"), "no error");
    EXPECT_NE(ErrorOf("<a b=c/>"), "no error");
    EXPECT_NE(ErrorOf("<a><![CDATA[x</a>"), "no error");
    EXPECT_NE(ErrorOf("<!-- "), "no error");
}

TEST(XmlFile, RejectsASecondRoot) {
    EXPECT_EQ(ErrorOf("<a/>\n<b/>"), "test.xml:2:1: a second root element <b>");
}

TEST(XmlFile, RejectsAnAttributeThatStandsTwice) {
    EXPECT_EQ(ErrorOf("<a>\n <b c='1' c='2'/></a>"), "test.xml:2:2: attribute \"c\" stands twice in <b>");
}

TEST(XmlFile, RejectsBytesThatAreNoUtf8) {
    EXPECT_EQ(ErrorOf("<a>\n\xFF</a>"), "test.xml:2:1: this is not UTF-8");
    EXPECT_NE(ErrorOf(std::string("\xFF\xFE<\0a\0/\0>\0", 10)).find("not UTF-8"), std::string::npos);
}

TEST(XmlFile, RejectsControlCharacters) {
    EXPECT_NE(ErrorOf(std::string("<a>\0</a>", 8)).find("test.xml:1:4: a control character"),
              std::string::npos);
}

TEST(XmlFile, TakesElementsUpToTheDeepestLevel) {
    XmlNode const root = Parse(Nested(XmlFile::kMaxDepth));
    int depth = 0;
    for (XmlNode const *node = &root; node; node = node->children.empty() ? nullptr : &node->children[0])
        ++depth;
    EXPECT_EQ(depth, XmlFile::kMaxDepth);
}

TEST(XmlFile, RejectsTenThousandLevelsWithTheirPlace) {
    EXPECT_EQ(ErrorOf(Nested(XmlFile::kMaxDepth + 1)),
              "test.xml:1:1537: more than 512 elements within each other");
    EXPECT_NE(ErrorOf(Nested(10000)).find("more than 512"), std::string::npos);
    EXPECT_NE(ErrorOf(Nested(1000000 - 1)).find("more than 512"), std::string::npos);
}

TEST(XmlFile, RejectsMoreElementsThanFitAnyDialog) {
    std::string text = "<a>";
    for (std::size_t i = 0; i < XmlFile::kMaxElements; ++i)
        text += "<b/>";
    EXPECT_NE(ErrorOf(text + "</a>").find("more than 1000000 elements"), std::string::npos);
}

TEST(XmlFile, RejectsMoreAttributesThanAnyElementHas) {
    std::string text = "<a";
    for (std::size_t i = 0; i <= XmlFile::kMaxAttributes; ++i)
        text += " a" + std::to_string(i) + "=''";
    EXPECT_NE(ErrorOf(text + "/>").find("more than 256 attributes"), std::string::npos);
}

TEST(XmlFile, RejectsFilesThatAreTooLarge) {
    std::string const text = "<a>" + std::string(XmlFile::kMaxBytes, ' ') + "</a>";
    EXPECT_EQ(ErrorOf(text), "test.xml: the file is larger than 64 MiB");
}

TEST(XmlFile, ReadsFilesAndNamesThemInErrors) {
    TemporaryDirectory const directory;
    std::string const path = directory.Write("good.xml", "<a/>");
    EXPECT_EQ(XmlFile::Read(path).Root().name, "a");
    EXPECT_EQ(XmlFile::Read(path).Name(), path);
    std::string const bad = directory.Write("bad.xml", "<a>");
    try {
        XmlFile::Read(bad);
        FAIL() << "no error";
    } catch (XmlError const &error) {
        EXPECT_EQ(error.File(), bad);
        EXPECT_EQ(error.Line(), 1);
        EXPECT_GT(error.Column(), 0);
    }
}

TEST(XmlFile, ReportsFilesThatAreMissingOrNoFiles) {
    TemporaryDirectory const directory;
    EXPECT_THROW(XmlFile::Read(directory.Path() + "/none.xml"), XmlError);
    EXPECT_THROW(XmlFile::Read(directory.Path()), XmlError);
}

TEST(XmlFile, ParsesWholeNumbersOnly) {
    long long number = 5;
    for (char const *text : {"", "-", "+", "+-1", "1.0", " 1", "1 ", "0x10", "9223372036854775808", "1a"}) {
        EXPECT_FALSE(XmlFile::ParseInteger(text, number)) << text;
        EXPECT_EQ(number, 5);
    }
    EXPECT_TRUE(XmlFile::ParseInteger("-9223372036854775808", number));
    EXPECT_EQ(number, -9223372036854775807LL - 1);
    EXPECT_TRUE(XmlFile::ParseInteger("+007", number));
    EXPECT_EQ(number, 7);
}

TEST(XmlFile, RequiredAttributesNameWhatIsWrong) {
    XmlFile const file = XmlFile::Parse("<a>\n<b n='70000' t='x'/></a>", "test.xml");
    XmlNode const &node = file.Root().children[0];
    auto const message = [](std::function<void()> const &call) {
        try {
            call();
        } catch (XmlError const &error) {
            return std::string(error.what());
        }
        return std::string("no error");
    };
    EXPECT_EQ(message([&] { file.RequireText(node, "c"); }), "test.xml:2:1: <b> lacks the attribute \"c\"");
    EXPECT_EQ(message([&] { file.RequireInteger(node, "n", 0, 9); }),
              "test.xml:2:1: attribute \"n\" of <b> is \"70000\", not a whole number from 0 to 9");
    EXPECT_EQ(message([&] { file.RequireRoot("theme"); }),
              "test.xml:1:1: the root element is <a>, not <theme>");
    EXPECT_EQ(file.RequireInteger(node, "n", 0, 70000), 70000);
}

} // namespace
