/// The collector of drawn elements: the open group and the graphic state that goes with it.
#pragma once

#include "DrawmereTypes.h"
#include "SVGFont.h"
#include "foundation/common/MoxPtr.h"
#include "foundation/common/MoxString.h"
#include "foundation/common/MoxValue.h"

namespace MoxCommonNS {
class MoxElement;
}

namespace DrawmereNS {

using MoxCommonNS::MoxElement;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxValue;

class SVGConfig;
class SVGDrawElement;
class SVGElement;
class SVGGraphicContext;
class SVGTreeManager;

/// Collects elements under an open `g` that stands outside the tree until it closes; only then does
/// it take its place and the attributes that differ from the defaults, while the elements in it
/// carry what differs from the group. A group is closed while `groupElement` is null.
/// The virtual operations are for the managers of pages and of paths; here they do nothing. Their
/// order is interface.
class DRAWMERE_API SVGGroupManager {
public:
    /// Makes a graphic state of its own. Borrows: `svgConfig`, for as long as this lives.
    explicit SVGGroupManager(SVGConfig* svgConfig);
    SVGGroupManager(const SVGGroupManager&) = delete;
    SVGGroupManager& operator=(const SVGGroupManager&) = delete;

    /// An open group is lost: whoever wants it calls `appendToTree` before.
    virtual ~SVGGroupManager();

    /// Returns: the graphic state that setters reach, borrowed.
    virtual SVGGraphicContext* getGContext() const;

    /// Returns: 0, and 4 for a manager that collects a path.
    virtual int getType() const;
    /// Takes a segment of a path.
    virtual void appendPathCommand(SVGDrawElement* command);
    /// Takes finished path data.
    virtual void addPathSeg(const UnicodeString& text, bool absolute);

    /// Returns: the path data, empty where none is collected; valid until the next change.
    virtual const UnicodeString& getPathSeg();
    /// Lets go of all path data.
    virtual void deletePathSeg();
    /// Keeps elements out, or lets them in again.
    virtual void addPathLock(bool lock);
    /// Does nothing in any class.
    virtual void addStopElem(MoxElement* stop);

    /// Tells what kind of element comes next, which may close the open group.
    virtual void setElemMode(PAINTMODE mode, ELEMENTTYPE kind);

    /// Closes the open group and saves the state.
    virtual void push(ELEMENT_TYPE type);
    /// Closes the open group and takes the saved state back. Throws: MoxError 16406 or 16407 when
    /// that is not what was saved last.
    virtual void pop(ELEMENT_TYPE type);

    /// Notes a scale that is saved and restored with the state; nothing is scaled by it.
    virtual void setScale(float scale);
    /// Returns: the scale in force, 1 where none is kept.
    virtual float getScale() const;

    /// Returns: the path data as the value of an attribute, null where there is none; what was
    /// collected is gone then.
    virtual MoxValue takePathData();

    /// Appends `element` to the open group, opening one when there is none, and writes on it what
    /// differs from the group.
    /// Throws: MoxError 16408 without a tree. Ignores: every call while the path lock is set, and a
    /// null.
    void addElement(SVGElement* element);

    /// Closes the open group: hangs it into the tree, writes its attributes and moves the state one
    /// level out. With no group open only a matrix that was set moves.
    void appendToTree();

    /// Writes the attributes of the open group. Ignores: the call when none is open.
    void setGroupAttrs();

    /// Keeps the font of the first text; nothing decides by it.
    void setFontAttribute(const FONTATTRIBUTE& attribute) { font = attribute; }

    /// Returns: the open group, borrowed, or null.
    SVGElement* getGroupRootNode() const { return groupElement.get(); }

    /// Returns: the tree that groups go to, borrowed; null until the creator sets it.
    SVGTreeManager* getTreeManager() const { return treeManager; }

    MoxPtr<SVGElement> groupElement;             ///< the open group
    SVGTreeManager* treeManager = nullptr;       ///< borrowed
    SVGGraphicContext* context;                  ///< owned
    bool pathLock = false;                       ///< while elements are kept out
    ELEMENTTYPE elementMode = ELEMENTTYPE_SHAPE; ///< the kind of the open group
    PAINTMODE paintMode = PAINTMODE_NONE;        ///< all modes seen in it; nothing decides by it
    SVGConfig* config;                           ///< borrowed
    FONTATTRIBUTE font;                          ///< of the first text

protected:
    /// Closes the open group when `kind` is another than its elements have, and notes the kind.
    void changeKind(ELEMENTTYPE kind);

private:
    void openGroup();
    void closeGroup();
};

} // namespace DrawmereNS
