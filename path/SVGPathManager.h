/// The collector of the segments of one path.
#pragma once

#include "path/SVGDrawElement.h"
#include "state/SVGGroupManager.h"

#include <vector>

namespace DrawmereNS {

class PathText;

/// Stands in the place of the page's group manager while a path is open. What it collects becomes
/// the path data: the first command absolute, all others relative. Its graphic state is its own and
/// goes with it.
class DRAWMERE_API SVGPathManager : public SVGGroupManager {
public:
    /// Borrows: `svgConfig`, for as long as this lives.
    explicit SVGPathManager(SVGConfig* svgConfig);
    ~SVGPathManager() override;

    int getType() const override;

    /// Takes a reference to `command`. Ignores: a null.
    void appendPathCommand(SVGDrawElement* command) override;

    /// Appends a finished text, which counts in a path without segments alone.
    void addPathSeg(const UnicodeString& text, bool absolute) override;

    /// Returns: the path data; a second call gives the same text.
    const UnicodeString& getPathSeg() override;
    /// Lets go of all that was collected.
    void deletePathSeg() override;

    MoxValue takePathData() override;

    /// With `lock` keeps elements out; without it turns the lock over, whichever way it is.
    void addPathLock(bool lock) override;
    void setElemMode(PAINTMODE mode, ELEMENTTYPE kind) override;

    /// Makes all segments relative but the first, which must be an absolute move.
    void makePathDataRealtive(); // sic

    UnicodeString pathData;                       ///< the finished text, or raw text
    std::vector<MoxPtr<SVGDrawElement>> segments; ///< the commands in order

private:
    /// Makes the segments relative and writes them behind each other, then lets go of them.
    void writeSegments(PathText& text);
};

} // namespace DrawmereNS
