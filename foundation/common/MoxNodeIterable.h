/// Anything that yields nodes.
#pragma once

#include "foundation/common/MoxRCObject.h"

namespace MoxCommonNS {

/// A counted object whose nodes can be walked.
class DRAWMERE_API MoxNodeIterable : public MoxRCObject {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0x6D959880;

    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
};

} // namespace MoxCommonNS
