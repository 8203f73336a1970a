/// The rewriting of a finished Tiny document for small devices.
#pragma once

#include "foundation/common/MoxElement.h"

#include <map>
#include <set>
#include <vector>

namespace DrawmereNS {

using MoxCommonNS::MoxElement;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxPtr;

/// Makes a tree flatter for simple viewers, in four passes: links become plain groups, texts are
/// split so that each positioned character stands alone, images stand where they are drawn, and
/// colours are spelled out. The first two leave everything inside a `defs` alone. No pass recurses
/// by the depth of the tree. A null is ignored everywhere.
class QuilletExtention { // sic
public:
    struct NameOrder {
        bool operator()(MoxName one, MoxName other) const { return one.number < other.number; }
    };

    /// The coordinate lists of one `text`.
    class TextCoordVector {
    public:
        TextCoordVector(const UnicodeString& x, const UnicodeString& y);

        /// Cuts `text` at every blank into `list`, in place of what is there. Two blanks in a row
        /// give an empty token, one at the end gives none; an empty text gives the token "0".
        void setCoord(const UnicodeString& text, std::vector<UnicodeString>* list);

        /// Returns: the length of the longer list.
        int size() const;

        /// Returns: the token at `index`, beyond the end of the list its last one.
        UnicodeString getX(int index) const;
        UnicodeString getY(int index) const;

        std::vector<UnicodeString> xList;
        std::vector<UnicodeString> yList;
        bool isSinglePoint; ///< one point, and both attributes were given
    };

    /// Takes the tree at `root` through all passes.
    void optimizeQuillet(MoxElement* root);

    /// Makes a `g` of each `a` below `element`. It keeps the `transform` and the child elements of
    /// the `a`, no other attribute and no text.
    void removeAElement(MoxElement* element);

    /// Splits each `text` below `element`. One with a single point given in full stays as it is; a
    /// text below its text is lost otherwise.
    void textCoordinate(MoxElement* element);

    /// Returns: a `text` with these values and the other attributes of `source`, an `id` among
    /// them; a `rotate` of "0" is left out. Null when `source` belongs to no document.
    MoxPtr<MoxElement> createSplitTextNode(const UnicodeString& x, const UnicodeString& y,
                                           const UnicodeString& rotate, const UnicodeString& text,
                                           MoxElement* source);

    /// Takes the images out of the first `defs` of `root`, and puts a copy where each is used.
    void embedImageDirect(MoxElement* root);

    /// Puts an `image` in the place of each nested `svg`, `element` among them, that uses one of
    /// `images`, which are found by their reference, "#" and the id.
    void execEmbedDirect(MoxElement* element, std::map<UnicodeString, MoxElement*>& images);

    /// Returns: whether `element` is an `svg` with a `use` and no other element in it.
    bool isImageRefSvgElement(MoxElement* element);

    /// Writes the paints of `element` and all below it as numbers. What is no colour, "none" or
    /// transparent stays as it is.
    void setRGBColor(MoxElement* element);

    std::set<MoxName, NameOrder> paintableElements; ///< whose paints are rewritten
    std::vector<MoxName> paintAttributes;           ///< which attributes are paints

private:
    bool rewrite(MoxElement* element, unsigned passes);
    bool rewriteBelow(MoxElement& root, unsigned passes);
    void spellOutColors(MoxElement& element) const;
    void splitText(MoxElement& text);
};

} // namespace DrawmereNS
