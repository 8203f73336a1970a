#include "images/SVGGraphicManager.h"

#include "state/SVGGroupManager.h"

namespace DrawmereNS {

SVGGraphicManager::SVGGraphicManager() = default;

SVGGraphicManager::~SVGGraphicManager() = default;

void SVGGraphicManager::init(SVGGroupManager* groups, SVGRefIDManager* refIds, SVGConfig* options,
                             const UnicodeString& newSourceBase, const UnicodeString& newTargetBase,
                             const MoxName& conversion, int newQuality, bool /*unusedFlag*/,
                             const UnicodeString& /*unusedText*/) {
    treeManager = groups ? groups->getTreeManager() : nullptr;
    groupManager = groups;
    config = options;
    refIdManager = refIds;
    sourceBase = newSourceBase;
    targetBase = newTargetBase;
    conversionName = conversion;
    quality = newQuality;
}

} // namespace DrawmereNS
