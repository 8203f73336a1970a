#include "foundation/common/MoxXmlWriter.h"

#include "foundation/common/MoxNamedValueMap.h"
#include "tests/support/Utf8.h"
#include "tests/support/XmlReader.h"

#include <fstream>
#include <gtest/gtest.h>
#include <limits>
#include <sstream>
#include <string>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::readXml;
using DrawmereTest::utf8;
using DrawmereTest::XmlEvent;
using DrawmereTest::XmlReading;

const MoxName x(u"x");

/// A document with a root `svg` and the ways to save it.
class MoxXmlWriterTest : public testing::Test {
protected:
    MoxXmlWriterTest() { document->appendChild(root.get()); }

    MoxPtr<MoxElement> make(const char16_t* name) { return document->createElement(MoxName(name)); }

    /// Appends a new element to `parent`.
    MoxElement* add(MoxNode* parent, const char16_t* name) {
        return static_cast<MoxElement*>(parent->appendChild(make(name).get()));
    }

    MoxElement* addNS(MoxNode* parent, const char16_t* uri, const char16_t* prefix,
                      const char16_t* local) {
        const MoxPtr<MoxElement> element =
            document->createElementNS(MoxName(uri), MoxName(prefix), MoxName(local));
        return static_cast<MoxElement*>(parent->appendChild(element.get()));
    }

    std::string save(const char16_t* options = u"", const char16_t* encoding = u"",
                     const char16_t* doctype = u"") const {
        std::ostringstream stream;
        document->save(encoding, doctype, stream, nullptr, options, u"");
        EXPECT_TRUE(stream.good());
        return stream.str();
    }

    /// Returns: what was saved, without the declaration and the last line feed.
    std::string body(const char16_t* options = u"") const {
        const std::string saved = save(options);
        const std::string declaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
        EXPECT_EQ(saved.substr(0, declaration.size()), declaration);
        EXPECT_EQ(saved.back(), '\n');
        EXPECT_EQ(readXml(saved).error, "");
        return saved.substr(declaration.size(), saved.size() - declaration.size() - 1);
    }

    /// Returns: what a reader says of a document saved in `encoding`.
    XmlReading readIn(const char16_t* encoding) const {
        const std::string saved = save(u"", encoding);
        const UnicodeString text(saved.data(), static_cast<int>(saved.size()),
                                 utf8(encoding).c_str());
        return readXml(utf8(text));
    }

    MoxPtr<MoxDocument> document = new MoxDocument;
    MoxPtr<MoxElement> root = make(u"svg");
};

TEST_F(MoxXmlWriterTest, TheReaderOfTheseTestsIsStrict) {
    const char* const bad[] = {
        "",
        "<a/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a></b>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a/><b/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a/>x",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>x<a/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a x=\"1\" x=\"2\"/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a x=\"1\"y=\"2\"/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a x=\"<\"/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a x=1/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><1a/>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>&</a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>&nbsp;</a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>&#0;</a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>&#xFFFF;</a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>]]></a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>\x01</a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>\xFF</a>",
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>\xED\xA0\x80</a>",
    };
    for (const char* sample : bad) {
        EXPECT_NE(readXml(sample).error, "") << sample;
    }
    const XmlReading good = readXml("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<!DOCTYPE a>\n"
                                    "<a x=\"&lt;\n&#10;\">&#x41;\r\n<b/>&amp;</a>\n");
    EXPECT_EQ(good.error, "");
    EXPECT_EQ(good.element("a").attribute("x"), "< \n");
    EXPECT_EQ(good.text(), "A\n&");
}

TEST_F(MoxXmlWriterTest, AnElementWithoutChildrenIsOneTag) {
    EXPECT_EQ(body(), "<svg/>");
    add(root.get(), u"g");
    EXPECT_EQ(body(), "<svg><g/></svg>");
}

TEST_F(MoxXmlWriterTest, ChildrenAndTextsStandInTheirOrder) {
    MoxElement* g = add(root.get(), u"g");
    g->appendChildText(u"one");
    add(g, u"a")->appendChildText(u"two");
    g->appendChildText(u"three");
    add(root.get(), u"b");
    EXPECT_EQ(body(), "<svg><g>one<a>two</a>three</g><b/></svg>");
}

TEST_F(MoxXmlWriterTest, AnEmptyTextIsAChildAllTheSame) {
    root->appendChildText(UnicodeString());
    EXPECT_EQ(body(), "<svg></svg>");
}

TEST_F(MoxXmlWriterTest, AttributesStandInTheOrderOfFirstSetting) {
    root->setAttribute(MoxName(u"b"), 1);
    root->setAttribute(MoxName(u"a"), 2);
    root->setAttribute(MoxName(u"b"), 3);
    EXPECT_EQ(body(), "<svg b=\"3\" a=\"2\"/>");
}

TEST_F(MoxXmlWriterTest, EveryKindOfValueIsWrittenAsItsText) {
    MoxNamedValueMap map;
    map.setNamedItem(MOXNAME_ID, 1);

    const struct {
        MoxValue value;
        const char* text;
    } rows[] = {
        {MoxValue(-12), "-12"},
        {MoxValue(std::numeric_limits<std::int32_t>::min()), "-2147483648"},
        {MoxValue(0.1F), "0.1"},
        {MoxValue(33.333332F), "33.333332"},
        {MoxValue(-0.0F), "0"},
        {MoxValue(std::numeric_limits<float>::quiet_NaN()), "0"},
        {MoxValue(std::numeric_limits<float>::infinity()), "0"},
        {MoxValue(MoxName(u"preserve")), "preserve"},
        {MoxValue(MoxName(MOXNAME_SVG_NAMESPACE)), "http://www.w3.org/2000/svg"},
        {MoxValue(MoxName(u"a<\"b\">&")), "a&lt;&quot;b&quot;&gt;&amp;"},
        {MoxValue(MoxName::fromNumber(0x7FFFFFFF)), ""},
        {MoxValue(u"short"), "short"},
        {MoxValue(u"a text that is longer than a value"), "a text that is longer than a value"},
        {MoxValue(u"\u65E5"), "\xE6\x97\xA5"},
        {MoxValue(u""), ""},
        {MoxValue(MoxLength::fromRaw(1.5F)), "1.5pt"},
        {MoxValue(MoxColor(255, 0, 0)), "red"},
        {MoxValue(map), ""},
    };

    for (const auto& row : rows) {
        root->setAttribute(x, row.value);
        EXPECT_EQ(body(), std::string("<svg x=\"") + row.text + "\"/>");
    }
}

TEST_F(MoxXmlWriterTest, DecimalsRoundRealsAndNothingElse) {
    root->setAttribute(MoxName(u"a"), 33.333332F);
    root->setAttribute(MoxName(u"b"), 0.00012F);
    root->setAttribute(MoxName(u"c"), 1.5F);
    root->setAttribute(MoxName(u"d"), 0.0F);
    root->setAttribute(MoxName(u"e"), 12);
    root->setAttribute(MoxName(u"f"), u"1.23456");
    root->setAttribute(MoxName(u"g"), MoxLength::fromRaw(1.23456F));
    EXPECT_EQ(body(u"decimals=3"), "<svg a=\"33.333\" b=\"0.0001\" c=\"1.5\" d=\"0\" e=\"12\" "
                                   "f=\"1.23456\" g=\"1.23456pt\"/>");
    EXPECT_EQ(body(u"decimals=0"), "<svg a=\"33\" b=\"0.0001\" c=\"2\" d=\"0\" e=\"12\" "
                                   "f=\"1.23456\" g=\"1.23456pt\"/>");
    const char* const allDigits = "<svg a=\"33.333332\" b=\"0.00012\" c=\"1.5\" d=\"0\" e=\"12\" "
                                  "f=\"1.23456\" g=\"1.23456pt\"/>";
    for (const char16_t* options :
         {u"", u"decimals=12", u"decimals=999", u"decimals=x", u"other"}) {
        EXPECT_EQ(body(options), allDigits);
    }
}

TEST_F(MoxXmlWriterTest, EscapesWhatMarkupIsMadeOf) {
    root->setAttribute(x, u"<&>\"'\t\n\r ]]>");
    root->appendChildText(u"<&>\"'\t\n\r ]]>");
    EXPECT_EQ(body(), "<svg x=\"&lt;&amp;&gt;&quot;'&#9;&#10;&#13; ]]&gt;\">"
                      "&lt;&amp;&gt;\"'\t\n&#13; ]]&gt;</svg>");
}

TEST_F(MoxXmlWriterTest, ControlCharactersAreReferencesInEveryEncoding) {
    root->setAttribute(x, u"a\x7F\u0080\u0085\u009F\u00A0");
    const std::string references = "<svg x=\"a&#127;&#128;&#133;&#159;";
    EXPECT_EQ(body(), references + "\xC2\xA0\"/>");
    EXPECT_NE(save(u"", u"windows-1252").find(references + "\xA0\"/>"), std::string::npos);
    EXPECT_NE(save(u"", u"Shift_JIS").find(references), std::string::npos);
    root->setAttribute(x, u"a\x7F");
    EXPECT_EQ(body(), "<svg x=\"a&#127;\"/>");
}

TEST_F(MoxXmlWriterTest, AReaderGetsBackWhatWasSet) {
    UnicodeString all;
    for (UChar32 c = 0x9; c < 0x3000; ++c) {
        if (c == 0x9 || c == 0xA || c == 0xD || c >= 0x20) {
            all.append(c);
        }
    }
    all.append(u"\xD7FF\xE000\xFFFD").append(UChar32(0x10000)).append(UChar32(0x10FFFF));
    root->setAttribute(x, all);
    root->appendChildText(all);
    const XmlReading reading = readXml(save());
    EXPECT_EQ(reading.error, "");
    EXPECT_TRUE(reading.element("svg").attribute("x") == utf8(all));
    EXPECT_TRUE(reading.text() == utf8(all));
    for (const char16_t* encoding : {u"US-ASCII", u"ISO-8859-1", u"UTF-16", u"Shift_JIS", u"EUC-KR",
                                     u"windows-1251", u"GB18030", u"UTF-32"}) {
        const XmlReading converted = readIn(encoding);
        EXPECT_EQ(converted.error, "");
        EXPECT_TRUE(converted.element("svg").attribute("x") == utf8(all)) << utf8(encoding);
        EXPECT_TRUE(converted.text() == utf8(all)) << utf8(encoding);
    }
}

TEST_F(MoxXmlWriterTest, WhatXmlForbidsBecomesTheReplacementCharacter) {
    const std::string replacement = "\xEF\xBF\xBD";
    for (const char16_t c : {u'\x1', u'\x8', u'\xB', u'\xC', u'\xE', u'\x1F', u'\xD800', u'\xDBFF',
                             u'\xDC00', u'\xDFFF', u'\xFFFE', u'\xFFFF'}) {
        for (const UnicodeString& frame : {UnicodeString(u"ab"), UnicodeString(u"\u65E5\u672C")}) {
            UnicodeString text(frame);
            text.insert(1, c);
            UnicodeString expected(frame);
            expected.insert(1, u'\xFFFD');
            root->setAttribute(x, text);
            EXPECT_EQ(body(), "<svg x=\"" + utf8(expected) + "\"/>");
        }
    }
    root->setAttribute(x, UnicodeString(u"a\0b", 3));
    EXPECT_EQ(body(), "<svg x=\"a" + replacement + "b\"/>");
    root->setAttribute(x, UnicodeString(u"\xDE00\xD83D")); // a pair the wrong way round
    EXPECT_EQ(body(), "<svg x=\"" + replacement + replacement + "\"/>");
}

TEST_F(MoxXmlWriterTest, NamesThatXmlForbidsAreMadeFitForIt) {
    add(root.get(), u"1 <g>")->setAttribute(MoxName(u"a b"), 1);
    addNS(root.get(), u"urn:p", u"1p", u"2l");
    root->appendChild(document->createElement(MoxName()).get());
    EXPECT_EQ(body(), "<svg><___g_ a_b=\"1\"/><_p:_l xmlns:_p=\"urn:p\"/><_/></svg>");
}

TEST_F(MoxXmlWriterTest, OfAttributesWithOneNameOnlyOneIsWritten) {
    root->setAttribute(MoxName(u"a b"), 1);
    root->setAttribute(MoxName(u"a<b"), 2);
    root->setAttribute(MoxName(u"a_b"), 3); // its name is its own
    root->setAttribute(MoxName(u"a>b"), 4);
    root->setAttribute(MoxName(u"c"), 5);
    root->setAttribute(MoxName(u"d e"), 6);
    EXPECT_EQ(body(), "<svg a_b=\"3\" c=\"5\" d_e=\"6\"/>");
}

TEST_F(MoxXmlWriterTest, NamesKeepToTheEncoding) {
    const MoxPtr<MoxElement> element = make(u"\u00E9\u65E5");
    element->setAttribute(MoxName(u"\u00E9"), u"\u00E9");
    root->appendChild(element.get());
    EXPECT_EQ(body(), "<svg><\xC3\xA9\xE6\x97\xA5 \xC3\xA9=\"\xC3\xA9\"/></svg>");
    EXPECT_NE(save(u"", u"US-ASCII").find("<__ _=\"&#233;\"/>"), std::string::npos);
    EXPECT_NE(save(u"", u"ISO-8859-1").find("<\xE9_ \xE9=\"\xE9\"/>"), std::string::npos);
    element->setAttribute(MoxName(u"\u00E8"), 2);
    EXPECT_EQ(readIn(u"US-ASCII").error, "");
}

TEST_F(MoxXmlWriterTest, TheDeclarationNamesTheEncoding) {
    root->setAttribute(x, u"\u00E9");
    EXPECT_EQ(save(u"", u""), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                              "<svg x=\"\xC3\xA9\"/>\n");
    EXPECT_EQ(save(u"", u"UTF-8"), save(u"", u""));
    EXPECT_EQ(save(u"", u"no such encoding"), save(u"", u""));
    EXPECT_EQ(save(u"", u"latin1"), "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?>\n"
                                    "<svg x=\"\xE9\"/>\n");
    EXPECT_EQ(save(u"", u"US-ASCII"), "<?xml version=\"1.0\" encoding=\"US-ASCII\"?>\n"
                                      "<svg x=\"&#233;\"/>\n");
    EXPECT_EQ(readIn(u"UTF-16").encoding, "UTF-16");
    EXPECT_EQ(readIn(u"Shift_JIS").encoding, "Shift_JIS");
}

TEST_F(MoxXmlWriterTest, TheDocumentTypeStandsBeforeTheRoot) {
    const char16_t* const svg = u"svg PUBLIC \"-//W3C//DTD SVG 1.1//EN\" "
                                u"\"http://www.w3.org/Graphics/SVG/1.1/DTD/svg11.dtd\"";
    const std::string saved = save(u"", u"", svg);
    EXPECT_EQ(saved,
              "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<!DOCTYPE " + utf8(svg) + ">\n<svg/>\n");
    EXPECT_EQ(readXml(saved).doctype, utf8(svg));
}

TEST_F(MoxXmlWriterTest, TextsLongerThanAnyBufferComeThrough) {
    // Pairs of surrogates at even and odd places, across every border of every buffer.
    UnicodeString text;
    for (int i = 0; i < 60000; ++i) {
        text.append(i % 7 == 0 ? u"<x" : u"y").append(UChar32(0x1F600 + i % 64));
    }
    const UnicodeString ascii(200000, u'a', 200000);
    root->setAttribute(x, text);
    root->appendChildText(text);
    add(root.get(), u"g")->appendChildText(ascii);
    for (const char16_t* encoding : {u"UTF-8", u"UTF-16", u"US-ASCII"}) {
        const XmlReading reading = readIn(encoding);
        EXPECT_EQ(reading.error, "");
        EXPECT_TRUE(reading.element("svg").attribute("x") == utf8(text));
        EXPECT_TRUE(reading.text() == utf8(text) + utf8(ascii));
    }
}

TEST_F(MoxXmlWriterTest, NamesLongerThanAnyBufferComeThrough) {
    const UnicodeString name(100000, u'n', 100000);
    add(root.get(), u"g")->setAttribute(MoxName(name), 1);
    root->appendChild(document->createElement(MoxName(name)).get());
    EXPECT_EQ(readXml(save()).element("g").attribute(utf8(name)), "1");
    EXPECT_EQ(readXml(save()).element(utf8(name)).kind, XmlEvent::START);
}

TEST_F(MoxXmlWriterTest, IndentsElements) {
    MoxElement* g = add(root.get(), u"g");
    add(g, u"a");
    add(g, u"b");
    add(root.get(), u"c");
    EXPECT_EQ(body(u"indent"), "<svg>\n  <g>\n    <a/>\n    <b/>\n  </g>\n  <c/>\n</svg>");
}

TEST_F(MoxXmlWriterTest, NeverIndentsInsideMixedContent) {
    MoxElement* text = add(root.get(), u"text");
    MoxElement* a = add(text, u"a");
    add(add(a, u"b"), u"c");
    text->appendChildText(u"after"); // the text comes last and counts all the same
    add(add(root.get(), u"g"), u"d");
    EXPECT_EQ(body(u"indent"), "<svg>\n  <text><a><b><c/></b></a>after</text>\n"
                               "  <g>\n    <d/>\n  </g>\n</svg>");
    root->appendChildText(u"x");
    EXPECT_EQ(body(u"indent"), body());
}

TEST_F(MoxXmlWriterTest, DeepLevelsAreIndentedLikeTheSixtyFourth) {
    MoxElement* deepest = root.get();
    for (int i = 0; i < 100; ++i) {
        deepest = add(deepest, u"g");
    }
    const std::string saved = body(u"indent");
    EXPECT_NE(saved.find("\n" + std::string(128, ' ') + "<g/>"), std::string::npos);
    EXPECT_EQ(saved.find(std::string(129, ' ')), std::string::npos);
}

TEST_F(MoxXmlWriterTest, DepthCostsNoStackAndNoMoreThanItsTags) {
    constexpr int depth = 1000000;
    const MoxName g(u"g");
    MoxNode* deepest = root.get();
    for (int i = 0; i < depth; ++i) {
        deepest = deepest->appendChild(document->createElement(g).get());
    }
    std::string expected = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<svg>";
    for (int i = 1; i < depth; ++i) {
        expected += "<g>";
    }
    expected += "<g/>";
    for (int i = 1; i < depth; ++i) {
        expected += "</g>";
    }
    EXPECT_TRUE(save() == expected + "</svg>\n");
    EXPECT_LT(save(u"indent").size(), depth * 270U);
}

TEST_F(MoxXmlWriterTest, ARootWithANamespaceDeclaresItFirst) {
    document->removeChild(root.get());
    MoxElement* svg = addNS(document.get(), u"http://www.w3.org/2000/svg", u"", u"svg");
    svg->setAttribute(x, 1);
    add(svg, u"rect");
    addNS(svg, u"http://www.w3.org/2000/svg", u"", u"g");
    EXPECT_EQ(body(), "<svg xmlns=\"http://www.w3.org/2000/svg\" x=\"1\"><rect/><g/></svg>");
}

TEST_F(MoxXmlWriterTest, ARootWithoutANamespaceDeclaresNone) {
    root->setAttribute(MoxName(u"xmlns:xlink"), MoxName(MOXNAME_XLINK_NAMESPACE));
    add(root.get(), u"rect");
    EXPECT_EQ(body(), "<svg xmlns:xlink=\"http://www.w3.org/1999/xlink\"><rect/></svg>");
}

TEST_F(MoxXmlWriterTest, AnInnerNamespaceIsDeclaredWhereItBegins) {
    MoxElement* outer = addNS(root.get(), u"urn:one", u"p", u"a");
    addNS(outer, u"urn:one", u"p", u"b");
    addNS(addNS(outer, u"urn:two", u"p", u"c"), u"urn:one", u"p", u"d");
    addNS(outer, u"urn:one", u"p", u"e");
    addNS(outer, u"urn:one", u"q", u"f");
    addNS(root.get(), u"urn:one", u"p", u"g");
    EXPECT_EQ(body(), "<svg><p:a xmlns:p=\"urn:one\"><p:b/><p:c xmlns:p=\"urn:two\">"
                      "<p:d xmlns:p=\"urn:one\"/></p:c><p:e/><q:f xmlns:q=\"urn:one\"/></p:a>"
                      "<p:g xmlns:p=\"urn:one\"/></svg>");
}

TEST_F(MoxXmlWriterTest, ADeclarationAmongTheAttributesCounts) {
    root->setAttribute(MoxName(u"xmlns:p"), u"urn:one");
    root->setAttribute(MoxName(u"xmlns"), MoxName(u"urn:default"));
    addNS(root.get(), u"urn:one", u"p", u"a");
    addNS(root.get(), u"urn:default", u"", u"b");
    MoxElement* c = addNS(root.get(), u"urn:one", u"p", u"c");
    c->setAttribute(MoxName(u"xmlns:p"), u"urn:one");
    EXPECT_EQ(body(), "<svg xmlns:p=\"urn:one\" xmlns=\"urn:default\"><p:a/><b/>"
                      "<p:c xmlns:p=\"urn:one\"/></svg>");
}

TEST_F(MoxXmlWriterTest, ADeclarationAmongTheAttributesHidesAnOuterOne) {
    MoxElement* a = addNS(root.get(), u"urn:one", u"p", u"a");
    MoxElement* b = add(a, u"b");
    b->setAttribute(MoxName(u"xmlns:p"), u"urn:two");
    addNS(b, u"urn:one", u"p", u"c");
    addNS(a, u"urn:one", u"p", u"d");
    EXPECT_EQ(body(), "<svg><p:a xmlns:p=\"urn:one\"><b xmlns:p=\"urn:two\">"
                      "<p:c xmlns:p=\"urn:one\"/></b><p:d/></p:a></svg>");
}

TEST_F(MoxXmlWriterTest, AStreamThatFailsKeepsItsState) {
    add(root.get(), u"g");
    std::ofstream full("/dev/full", std::ios::binary);
    ASSERT_TRUE(full);
    document->save(u"", u"", full, nullptr, u"", u"");
    full.flush();
    EXPECT_FALSE(full);

    std::ofstream closed;
    closed.setstate(std::ios::badbit);
    document->save(u"", u"", closed, nullptr, u"", u"");
    EXPECT_TRUE(closed.bad());
}

TEST_F(MoxXmlWriterTest, WritesATreeOfAllKindsWellFormed) {
    for (int i = 0; i < 3000; ++i) {
        MoxElement* g =
            add(i % 5 == 0 ? root.get() : static_cast<MoxElement*>(root->getFirstChild()),
                i % 2 == 0 ? u"g" : u"a b");
        g->setAttribute(MoxName::fromNumber(4096U + i % 300), 0.1F * static_cast<float>(i));
        g->setAttribute(x, UnicodeString(i % 50, UChar32(i * 21), i % 50));
        g->appendChildText(UnicodeString(UChar32(0x10FFFF - i)));
    }
    EXPECT_EQ(readXml(save()).error, "");
    EXPECT_EQ(readXml(save(u"indent,decimals=1")).error, "");
    EXPECT_EQ(readIn(u"ISO-8859-1").error, "");
}

} // namespace
