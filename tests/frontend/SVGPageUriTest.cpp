#include "SVGPageUri.h"

#include "tests/support/Utf8.h"

#include <memory>

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;

TEST(SVGPageUri, IsAUriWithANumberFormat) {
    const SVGPageUri uri(u"dir/out.svg", u"01");
    EXPECT_EQ(utf8(uri.getText()), "dir/out.svg");
    EXPECT_EQ(utf8(uri.getBaseString()), "dir/");
    EXPECT_EQ(utf8(uri.getFileName()), "out.svg");
    EXPECT_EQ(utf8(uri.getExtension()), ".svg");
    EXPECT_EQ(utf8(uri.numberFormat), "01");
}

TEST(SVGPageUri, NumberFormatIsEmptyWhenNotGiven) {
    EXPECT_EQ(utf8(SVGPageUri(u"out.svg").numberFormat), "");
}

TEST(SVGPageUri, DiesThroughItsBase) {
    const std::unique_ptr<MoxCommonNS::MoxUri> uri = std::make_unique<SVGPageUri>(u"file:///a%20b");
    EXPECT_EQ(utf8(uri->getLocalPath()), "/a b");
}
