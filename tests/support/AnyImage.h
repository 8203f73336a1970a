/// An image of any type.
#pragma once

#include "foundation/records/TLMemoryImage.h"

#include <string_view>

namespace DrawmereTest {

/// An image of a type that its bytes don't tell.
class AnyImage : public TalGraphic::TLMemoryImage {
public:
    AnyImage(TalGraphic::TLGraphicType imageType, std::string_view bytes, const UnicodeString& name)
        : TLMemoryImage(bytes, name), type(imageType) {}

    TalGraphic::TLGraphicType getGraphicType() override { return type; }

private:
    TalGraphic::TLGraphicType type;
};

} // namespace DrawmereTest
