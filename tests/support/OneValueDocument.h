/// A document whose root has one attribute, and its text.
#pragma once

#include "foundation/common/MoxDocument.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

namespace DrawmereTest {

/// Returns: a document with the root `svg`, whose attribute `name` is `value`.
inline MoxCommonNS::MoxPtr<MoxCommonNS::MoxDocument>
makeDocument(MoxCommonNS::MoxName name, const MoxCommonNS::MoxValue& value) {
    MoxCommonNS::MoxPtr<MoxCommonNS::MoxDocument> document(new MoxCommonNS::MoxDocument);
    const MoxCommonNS::MoxPtr<MoxCommonNS::MoxElement> root =
        document->createElement(MoxCommonNS::MoxName(u"svg"));
    root->setAttribute(name, value);
    document->appendChild(root.get());
    return document;
}

/// Returns: the bytes of a document, which has to be written without a failure.
inline std::string saveWhole(const MoxCommonNS::MoxDocument& document,
                             const char16_t* encoding = u"") {
    std::ostringstream stream;
    document.save(encoding, u"", stream, nullptr, u"", u"");
    EXPECT_TRUE(stream.good());
    return stream.str();
}

} // namespace DrawmereTest
