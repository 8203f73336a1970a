/// What happens to the images of a document.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxName.h"

namespace DrawmereNS {

class SVGConfig;
class SVGGroupManager;
class SVGRefIDManager;
class SVGTreeManager;

using MoxCommonNS::MoxName;

/// Takes the image options of a run; one lives in each `DrawmereImpl`.
class DRAWMERE_API SVGGraphicManager {
public:
    SVGGraphicManager();
    virtual ~SVGGraphicManager();

    /// Starts over for a new document.
    /// Borrows: the pointers, for its own life; the tree manager is that of `groups`.
    /// The two last arguments have no effect.
    void init(SVGGroupManager* groups, SVGRefIDManager* refIds, SVGConfig* options,
              const UnicodeString& newSourceBase, const UnicodeString& newTargetBase,
              const MoxName& conversion, int newQuality, bool unusedFlag,
              const UnicodeString& unusedText);

    SVGTreeManager* treeManager = nullptr;   // borrowed
    SVGGroupManager* groupManager = nullptr; // borrowed
    SVGConfig* config = nullptr;             // borrowed
    SVGRefIDManager* refIdManager = nullptr; // borrowed
    UnicodeString sourceBase;
    UnicodeString targetBase;
    MoxName conversionName;
    int quality = 0;
};

} // namespace DrawmereNS
