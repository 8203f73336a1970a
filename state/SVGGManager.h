/// The manager in place while a page is drawn: groups, and the stacks of saved states.
#pragma once

#include "state/SVGGroupManager.h"

#include <deque>
#include <memory>

namespace DrawmereNS {

/// Saves and restores the graphic state, and decides which elements share a group. A difference in
/// attributes never closes a group; another kind of element, a text, a push or a pop does.
class SVGGManager : public SVGGroupManager {
public:
    /// Starts the stacks with the state as it is, of type -2, and a scale of 1.
    /// Borrows: `svgConfig`, for as long as this lives.
    explicit SVGGManager(SVGConfig* svgConfig);
    ~SVGGManager() override;

    /// Closes the open group when elements of another kind are in it, and for a text unless both
    /// fonts agree and have a size of 0.
    void setElemMode(PAINTMODE mode, ELEMENTTYPE kind) override;

    /// Closes the open group and saves the state; a type other than -1 starts from the defaults. A
    /// link, 5, saves nothing.
    void push(ELEMENT_TYPE type) override;

    /// Closes the open group and takes the saved state back; a link takes none.
    /// Throws: MoxError 16406 when nothing is saved, 16407 when `type` is not the saved one. The
    /// group is closed then, and the state as it was.
    void pop(ELEMENT_TYPE type) override;

    void setScale(float scale) override;
    float getScale() const override;

    std::deque<float> scaleStack;
    std::deque<SVGGraphicContext*> contextStack; // owned

private:
    void saveContext();
    void takeSavedContext();

    std::unique_ptr<SVGGraphicContext> spare; // the context popped last, for the next push
};

} // namespace DrawmereNS
