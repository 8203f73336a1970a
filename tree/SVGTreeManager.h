/// The document of a run and the cursor that says where its next element goes.
#pragma once

#include "DrawmereTypes.h"
#include "SVGFont.h"
#include "tree/SVGDocument.h"

#include <deque>
#include <vector>

namespace DrawmereNS {

class SVGConfig;
class SVGGraphicContext;

/// A cursor with a stack. Definitions are built by pushing into `defs` and popping out again, so
/// that drawing need not know where in the tree it stands. The document outlives its manager as
/// long as somebody holds it.
class DRAWMERE_API SVGTreeManager {
public:
    SVGTreeManager();
    SVGTreeManager(const SVGTreeManager&) = delete;
    SVGTreeManager& operator=(const SVGTreeManager&) = delete;
    virtual ~SVGTreeManager();

    /// Makes the root element with the attributes that every document has; once per document.
    /// Ignores: a null, and a call when there is a root.
    /// Borrows: `config`, for the call.
    void setSVGDocProp(const UnicodeString& version, const SVGConfig* config);

    /// Appends `element` at the cursor, writes the transform and clip path that an `a` takes, and
    /// in a clip definition the attributes of its content; moves the cursor when `makeCurrent`.
    /// Ignores: every call while the stop lock is set, or before there is a root.
    void addElement(SVGElement* element, bool makeCurrent);

    /// Gives a clipping `group` its transform and clip path. With `makeCurrent` it is appended at
    /// the cursor, which moves into it; otherwise it stands in the open group already.
    /// Ignores: every call while the stop lock is set, or before there is a root.
    void appendNewGroup(SVGElement* group, bool makeCurrent);

    /// Saves the cursor and moves it as `type` says, and saves the font of `newContext`.
    /// Borrows: `newContext`, until the next push.
    void push(ELEMENT_TYPE type, SVGGraphicContext* newContext);

    /// Takes the cursor back as `type` says, and gives the saved font to `font`.
    /// Ignores: a call when no cursor is saved; `font` then stays as it was.
    void pop(ELEMENT_TYPE type, SVGFont* font);

    /// Moves the cursor to the one `defs` of the document, which is made as the first child of
    /// `root` when there is none. Returns: the `defs`, borrowed.
    MoxElement* findDefs(MoxElement* root);

    /// Switches adding off, while a gradient is defined.
    void setupStopLock() { unlocked = false; }

    /// Switches adding on again.
    void defuseStopLock() { unlocked = true; }

    /// Packs the elements that came last into `group`, which may be null, and at the cursor, so
    /// that a finished document takes little memory. The caller is about to make another element.
    /// Ignores: what somebody holds, and every call unless `packsFinished` is set.
    void packFinished(SVGElement* group);

    /// Makes nodes again of all that is packed in the document and in the open `group`, which may
    /// be null, and packs no more. Throws: std::bad_alloc; the next call goes on then.
    void stopPacking(SVGElement* group);

    /// Returns: the element that receives the next one, borrowed; null before there is a root.
    SVGElement* getCurrentNode() const { return currentNode.get(); }

    /// Returns: whether nothing went into some clipping group; no other group is ever empty.
    bool hasEmptyGroup() const;

    /// Who changes its tree from outside asks for it by `DrawmereImpl::getDocument`.
    MoxPtr<SVGDocument> document;
    MoxPtr<SVGElement> currentNode;             ///< where the next element goes
    std::deque<MoxPtr<MoxElement>> nodeStack;   ///< kept, as callers may take them out of the tree
    std::deque<SVGFont> fontStack;              ///< the fonts saved by `push`
    SVGGraphicContext* context = nullptr;       ///< borrowed
    bool packsFinished = false;                 ///< whether nobody looks into the tree
    bool unlocked = true;                       ///< false while a gradient takes stops only
    MoxPtr<SVGElement> defsElement;             ///< once there is one
    std::vector<MoxPtr<SVGElement>> clipGroups; ///< all that came

private:
    void packLast(MoxNode* parent, const MoxNode*& kept) const;
    bool canAdd() const;
    void setRootAttributes(SVGElement& root, const UnicodeString& version,
                           const SVGConfig& config) const;
    void stampContext(SVGElement* element);

    // What could not be packed and need not be tried again; only ever compared.
    const MoxNode* keptInGroup = nullptr;
    const MoxNode* keptAtCursor = nullptr;
};

} // namespace DrawmereNS
