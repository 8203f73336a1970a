/// Reference counting for nodes, documents and path segments.
#pragma once

#include "foundation/common/MoxMutex.h"
#include "foundation/common/MoxObjectBase.h"

namespace MoxCommonNS {

/// An object that lives as long as somebody counts on it. A new object starts at 0, and the first
/// `MoxPtr` takes it to 1.
class DRAWMERE_API MoxRCObject : public MoxObjectBase {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xD18D040A;

    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;

    /// Adds a reference.
    void addRef() const { MoxMutex::interlockedIncrement(referenceCount); }

    /// Drops a reference and deletes the object when the count falls below 1.
    void release() const {
        if (MoxMutex::interlockedDecrement(referenceCount) < 1) {
            destroy();
        }
    }

    /// Drops a reference without deleting. Returns: true when nobody counts on the object now.
    bool releaseWithoutDelete() const { return MoxMutex::interlockedDecrement(referenceCount) < 1; }

    /// Returns: the number of references now.
    int getReferenceCount() const {
        return std::atomic_ref(referenceCount).load(std::memory_order_relaxed);
    }

private:
    void destroy() const;

    mutable int referenceCount = 0;
};

} // namespace MoxCommonNS
