// Writing packed nodes, without making nodes of them.
#include "foundation/common/MoxDigitPairs.h"
#include "foundation/common/MoxXmlWriter.h"

#include <algorithm>
#include <bit>

namespace MoxCommonNS {

void MoxXmlWriter::writePacked(std::string_view bytes) {
    MoxPackedCursor cursor(bytes);
    while (!cursor.isAtEnd()) {
        const MoxPackedHead head = MoxPackedHead::take(cursor);
        if (head.kind() == MoxPackedHead::element) {
            writePackedElement(head, cursor);
        } else if (head.kind() == MoxPackedHead::text) {
            writePackedValue(MoxPackedValue::take(cursor), /*inAttribute=*/false);
        } else {
            endContent();
            sink.write("</");
            writeName(openPacked.back());
            sink.write('>');
            openPacked.pop_back();
        }
    }
}

void MoxXmlWriter::writePackedElement(const MoxPackedHead& head, MoxPackedCursor& cursor) {
    beginElement();
    sink.write('<');
    writeName(head.name);
    MoxPackedCursor place = cursor; // what is written can't change it
    for (int i = 0; i < head.attributeCount; ++i) {
        sink.write(MoxNameTable::getEntry(MoxPackedHead::takeKey(place)).attributeStart);
        writePackedValue(MoxPackedValue::take(place), /*inAttribute=*/true);
        sink.write('"');
    }
    cursor = place;
    if (!head.has(MoxPackedHead::hasChildren)) {
        sink.write("/>");
        return;
    }
    openPacked.push_back(head.name);
    beginContent(options.indent && head.has(MoxPackedHead::holdsText));
}

void MoxXmlWriter::writePackedValue(const MoxPackedValue& value, bool inAttribute) {
    switch (value.form) {
    case MoxPackedValue::shortText:
    case MoxPackedValue::longText:
        writeAscii(value.bytes, inAttribute);
        return;
    case MoxPackedValue::pairText:
        writePairs(value);
        return;
    case MoxPackedValue::wideText:
        writeText(value.toValue(), inAttribute);
        return;
    case MOXVALUE_REAL:
        writeReal(std::bit_cast<float>(value.number));
        return;
    case MOXVALUE_NAME:
        writeNameText(MoxName::fromNumber(value.number));
        return;
    default:
        writeValue(value.toValue());
    }
}

/// Unpacks piece by piece, straight to where the pieces are written from. They hold no markup.
void MoxXmlWriter::writePairs(const MoxPackedValue& value) {
    const char* packed = value.bytes.data();
    for (std::size_t left = value.number; left > 0;) {
        const std::size_t count = std::min(left, MoxXmlSink::maxRoom);
        char* const piece = sink.room(count + count % 2);
        packed = MoxDigitPairs::unpack(packed, count, piece);
        sink.advance(piece + count);
        left -= count;
    }
}

} // namespace MoxCommonNS
