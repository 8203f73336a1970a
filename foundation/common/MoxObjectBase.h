/// The root of all counted objects: a virtual destructor and a type test by number.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>

namespace MoxCommonNS {

/// Base of every object that can be asked for its class by a fixed 32-bit number.
class DRAWMERE_API MoxObjectBase {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xDF537371;

    MoxObjectBase() = default;
    MoxObjectBase(const MoxObjectBase&) = delete;
    MoxObjectBase& operator=(const MoxObjectBase&) = delete;
    virtual ~MoxObjectBase();

    /// Returns: the number of the object's own class.
    virtual std::uint32_t getTypeID() const;

    /// Returns: true for the number of the object's class and of each of its bases.
    virtual bool isA(std::uint32_t id) const;

    /// Returns: the name of the object's class, a static text.
    virtual const char* getTypeName() const;
};

} // namespace MoxCommonNS
