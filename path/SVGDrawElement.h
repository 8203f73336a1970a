/// The segments of a path.
#pragma once

#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxPointT.h"
#include "foundation/common/MoxRCObject.h"
#include "foundation/common/MoxString.h"
#include "path/SVGSegmentHeap.h"

#include <memory>

namespace DrawmereNS {

using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxPointT;
using MoxCommonNS::MoxRCObject;

/// A command of path data and its form: odd numbers are absolute.
enum DrawmereDrawElementEnum : std::int32_t {
    DRAWELEMENT_NONE = 0,
    DRAWELEMENT_MOVE = 1,
    DRAWELEMENT_MOVE_RELATIVE = 2,
    DRAWELEMENT_LINE = 3,
    DRAWELEMENT_LINE_RELATIVE = 4,
    DRAWELEMENT_CLOSE = 5,
    DRAWELEMENT_CLOSE_RELATIVE = 6,
    DRAWELEMENT_CUBIC = 7,
    DRAWELEMENT_CUBIC_RELATIVE = 8,
    DRAWELEMENT_QUADRATIC = 9,
    DRAWELEMENT_QUADRATIC_RELATIVE = 10, ///< never assigned
    DRAWELEMENT_UNSET = 11,
};

/// One segment: a command and its points. It stays an object until the path ends, because only then
/// can it be made relative to where the segment before it ends. Its text is made when it is asked
/// for.
class DRAWMERE_API SVGDrawElement : public MoxRCObject {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0x28116EDF;
    /// Room that the text of any segment fits into: a letter, six numbers and what parts them.
    static constexpr std::size_t maxText = 272;

    /// Takes memory of segments.
    static void* operator new(std::size_t size) { return SVGSegmentHeap::allocate(size); }

    /// Gives the memory back.
    static void operator delete(void* segment, std::size_t size) {
        SVGSegmentHeap::release(segment, size);
    }

    ~SVGDrawElement() override;
    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;

    // What a class does not override does nothing, or gives (0, 0).

    /// Sets the target.
    virtual void setPoint(const MoxPointT<MoxLength>& newPoint);
    /// Returns: the target.
    virtual MoxPointT<MoxLength> getPoint() const;
    /// Sets the first control point.
    virtual void setPoint1(const MoxPointT<MoxLength>& newPoint);
    /// Returns: the first control point.
    virtual MoxPointT<MoxLength> getPoint1() const;
    /// Sets the second control point.
    virtual void setPoint2(const MoxPointT<MoxLength>& newPoint);
    /// Returns: the second control point.
    virtual MoxPointT<MoxLength> getPoint2() const;

    /// Makes the points relative to `origin`; a coordinate that is a NaN stays as it is.
    virtual void makeRelative(const MoxPointT<MoxLength>& origin);

    /// Returns: the text of the segment, valid until the segment changes; null for a class that
    /// stands for no command.
    virtual const char* toString();

    /// Writes the text without a terminator; nothing for a class that stands for no command.
    /// Shape: `out` has room for `maxText` characters. Returns: the end of the text.
    virtual char* writeText(char* out) const;

    /// Stores a number that nothing reads.
    void setDrawType(DrawmereDrawElementEnum type) { drawType = type; }

    /// Sets the command and its form.
    void setDrawName(DrawmereDrawElementEnum name) { drawName = name; }

    /// Returns: true for the absolute commands.
    bool isAbsolute() const;

    /// Writes a length by the number rule of path data, with a terminator.
    /// Shape: `buffer` of `size` characters; a text that does not fit is cut.
    static void makeLengthToStringValue(const MoxLength& length, char* buffer, unsigned long size);
    /// Writes x, a comma and y in the same way.
    static void makePointToStringValue(const MoxPointT<MoxLength>& point, char* buffer,
                                       unsigned long size);
    /// Returns: the text of a length by the same rule.
    static UnicodeString makeLengthToStringValue(const MoxLength& length);
    /// Returns: the text of a point by the same rule.
    static UnicodeString makePointToStringValue(const MoxPointT<MoxLength>& point);

    DrawmereDrawElementEnum drawType = DRAWELEMENT_UNSET; ///< nothing reads it
    DrawmereDrawElementEnum drawName = DRAWELEMENT_UNSET; ///< the command and its form

protected:
    /// A segment that begins with this letter.
    explicit SVGDrawElement(char commandLetter) : letter(commandLetter) {}

    /// The text of `writeText` with a terminator, kept until the next call.
    const char* makeText();

    char letter; ///< of the command

private:
    std::unique_ptr<char[]> text; // made at the first `toString`
};

/// The end of a subpath.
class DRAWMERE_API SVGDrawElementClose : public SVGDrawElement {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xA9477E24;

    SVGDrawElementClose();
    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    void makeRelative(const MoxPointT<MoxLength>& origin) override;
    const char* toString() override;
    char* writeText(char* out) const override;
};

/// A segment with one point.
class DRAWMERE_API SVGDrawElementPointTo : public SVGDrawElement {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xE2EDBCC5;

    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    /// Sets the target.
    void setPoint(const MoxPointT<MoxLength>& newPoint) override;
    /// Returns: the target.
    MoxPointT<MoxLength> getPoint() const override;

    MoxPointT<MoxLength> point; ///< the target

protected:
    /// A segment that ends in `target`.
    SVGDrawElementPointTo(char commandLetter, const MoxPointT<MoxLength>& target)
        : SVGDrawElement(commandLetter), point(target) {}
};

/// The start of a subpath.
class DRAWMERE_API SVGDrawElementMoveTo : public SVGDrawElementPointTo {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0x0136266E;

    /// An absolute one.
    explicit SVGDrawElementMoveTo(const MoxPointT<MoxLength>& target);
    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    void makeRelative(const MoxPointT<MoxLength>& origin) override;
    const char* toString() override;
    char* writeText(char* out) const override;
};

/// A line. A relative one that is horizontal or vertical takes the shorter command.
class DRAWMERE_API SVGDrawElementLineTo : public SVGDrawElementPointTo {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xFC9F018C;

    /// An absolute one.
    explicit SVGDrawElementLineTo(const MoxPointT<MoxLength>& target);
    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    void makeRelative(const MoxPointT<MoxLength>& origin) override;
    const char* toString() override;
    char* writeText(char* out) const override;
};

/// A curve with two control points and a target.
class DRAWMERE_API SVGDrawElementCubicBezierCurveTo : public SVGDrawElement {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xCE93740D;

    /// An absolute one.
    SVGDrawElementCubicBezierCurveTo(const MoxPointT<MoxLength>& control1,
                                     const MoxPointT<MoxLength>& control2,
                                     const MoxPointT<MoxLength>& target);
    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    /// Returns: the target. `setPoint` does nothing, as in the base.
    MoxPointT<MoxLength> getPoint() const override;
    /// Sets the first control point.
    void setPoint1(const MoxPointT<MoxLength>& newPoint) override;
    /// Returns: the first control point.
    MoxPointT<MoxLength> getPoint1() const override;
    /// Sets the second control point.
    void setPoint2(const MoxPointT<MoxLength>& newPoint) override;
    /// Returns: the second control point.
    MoxPointT<MoxLength> getPoint2() const override;
    void makeRelative(const MoxPointT<MoxLength>& origin) override;
    const char* toString() override;
    char* writeText(char* out) const override;

    MoxPointT<MoxLength> point1; ///< the first control point
    MoxPointT<MoxLength> point2; ///< the second control point
    MoxPointT<MoxLength> point;  ///< the target
};

/// A curve with one control point and a target.
/// On purpose: only the second pair of accessors is overridden, it reaches the first point, and
/// `getPoint` gives (0, 0). So the segment behind a quadratic one is relative to the origin.
class DRAWMERE_API SVGDrawElementQuadraticBezierCurveTo : public SVGDrawElement {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xAD56D32A;

    /// An absolute one.
    SVGDrawElementQuadraticBezierCurveTo(const MoxPointT<MoxLength>& control,
                                         const MoxPointT<MoxLength>& target);
    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    /// Sets the control point.
    void setPoint2(const MoxPointT<MoxLength>& newPoint) override;
    /// Returns: the control point.
    MoxPointT<MoxLength> getPoint2() const override;
    /// Leaves `drawName` alone, so `isAbsolute` stays true.
    void makeRelative(const MoxPointT<MoxLength>& origin) override;
    const char* toString() override;
    char* writeText(char* out) const override;

    MoxPointT<MoxLength> point1; ///< the control point
    MoxPointT<MoxLength> point2; ///< the target
};

} // namespace DrawmereNS
