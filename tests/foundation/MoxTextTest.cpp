#include "foundation/common/MoxText.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

TEST(MoxText, HoldsItsText) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxText> text(new MoxText(document.get(), u"some \u65E5 text"));
    EXPECT_EQ(utf8(text->getText()), "some \xE6\x97\xA5 text");
    EXPECT_EQ(text->getNodeValue(), MoxValue(u"some \u65E5 text"));
    EXPECT_EQ(text->getContent(), text->getNodeValue());
    EXPECT_EQ(text->getOwnerDocument(), document.get());
}

TEST(MoxText, SetTextReplacesIt) {
    MoxText text(nullptr, u"one");
    text.setText(u"another text that is longer");
    EXPECT_EQ(utf8(text.getText()), "another text that is longer");
    text.setText(UnicodeString());
    EXPECT_EQ(utf8(text.getText()), "");
    EXPECT_EQ(text.getNodeValue().getType(), MOXVALUE_STRING);
}

TEST(MoxText, HasTheNameOfAllTextsAndNoOther) {
    const MoxText text(nullptr, u"x");
    EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(text.getNodeName())), "#text");
    EXPECT_EQ(text.getLocalName(), MoxName());
    EXPECT_EQ(text.getPrefix(), MoxName());
}

TEST(MoxText, IsNoElement) {
    const MoxText text(nullptr, u"x");
    EXPECT_FALSE(text.isElementNode());
    EXPECT_FALSE(text.isA(0x9B60777D));
    EXPECT_TRUE(text.isText());
    EXPECT_FALSE(text.saveTextTag());
}

TEST(MoxText, ACloneHasItsText) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxText> text(new MoxText(document.get(), u"x"));
    const MoxPtr<MoxNode> copy = text->cloneNode(/*deep=*/true);
    text->setText(u"y");
    EXPECT_TRUE(copy->isText());
    EXPECT_EQ(utf8(copy->getText()), "x");
    EXPECT_EQ(copy->getOwnerDocument(), document.get());
}

} // namespace
