/// Solves the links of a finished page.
#pragma once

#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxString.h"

#include <map>
#include <set>

namespace DrawmereNS {

using MoxCommonNS::MoxElement;

/// Tells whether all links of a page lead somewhere already, and makes links to other pages lead
/// to the files of those pages. Two forms of link are its business: "#" and the id of a destination
/// (an internal destination), and the mark of a page, "Mox-SVG-page-12", which is also the id that
/// a page's own anchor has until it is solved. One object serves one check or one pass over the
/// pages. Walks don't recurse by depth.
class SVGReferenceId {
public:
    /// Returns: the mark of the page with this number.
    static UnicodeString getPageReferenceMark(int page);

    /// Returns: whether `reference` begins as the mark of a page does.
    static bool isPageReferenceId(const UnicodeString& reference);

    /// Returns: whether `reference` begins with "#".
    static bool isInternalDestination(const UnicodeString& reference);

    /// Returns: what follows the "#" of an internal destination; any other text as it is.
    static UnicodeString getDestinationId(const UnicodeString& reference);

    /// Returns: the page number in `mark`, 0 when there is none.
    int getReferencePageNo(const UnicodeString& mark) const;

    /// Returns: the id that the anchor of the page of `mark` has in the end: "p12".
    UnicodeString getInternalPageRefernceId(const UnicodeString& mark) const; // sic

    /// Returns: false for an internal destination on a page that is not known yet, or whose file
    /// is not; true for all else, and always with `singleFile`.
    bool isSolvedId(const UnicodeString& reference) const;

    /// Returns: whether `isSolvedId` says so of every link at or below `element`; true for null.
    /// Ignores: `page`.
    bool isSolvedReferenceId(int page, MoxElement* element) const;

    /// Returns: the file of the page that an internal destination is on, without the id; or
    /// `reference` as it is when that is the current page, or not known, or in the same document.
    UnicodeString getDestination(const UnicodeString& reference) const;

    /// Replaces the links at and below `element` by their destinations and the ids of page anchors
    /// by their final ones. A page anchor makes its page the current one for what follows it. A
    /// link that is not solved stays as it is, and so does all inside it.
    /// Ignores: `page`, and a null element.
    void solveReferenceId(int page, MoxElement* element);

    /// Gives the `text` that is the anchor of a page its final id, and makes that page the current
    /// one. Ignores: any other text, and a null.
    void solvePageAnchor(MoxElement* text);

    /// Sets what links are solved with: whether all pages are in one document, the ids of all
    /// destinations, the page of each, and the file name of each page.
    /// Borrows: the containers, which must outlive this object and may go on to grow; none of them
    /// may be a temporary.
    void setRefernceIdInfo(bool isSingleFile, const std::set<UnicodeString>& anchors,
                           const std::map<UnicodeString, int>& pagesOfAnchors,
                           const std::map<int, UnicodeString>& filesOfPages); // sic

    void setRefernceIdInfo(bool, const std::set<UnicodeString>&&,
                           const std::map<UnicodeString, int>&,
                           const std::map<int, UnicodeString>&) = delete;
    void setRefernceIdInfo(bool, const std::set<UnicodeString>&,
                           const std::map<UnicodeString, int>&&,
                           const std::map<int, UnicodeString>&) = delete;
    void setRefernceIdInfo(bool, const std::set<UnicodeString>&,
                           const std::map<UnicodeString, int>&,
                           const std::map<int, UnicodeString>&&) = delete;

    bool singleFile = false;
    const std::set<UnicodeString>* allAnchors = nullptr;       ///< borrowed; not read here
    const std::map<UnicodeString, int>* anchorPages = nullptr; ///< borrowed; none when null
    const std::map<int, UnicodeString>* pageFiles = nullptr;   ///< borrowed; none when null
    int currentPage = 0; ///< of the last page anchor met, 0 before the first

private:
    /// Where a reference leads.
    struct Target {
        bool isSolved = false;
        const UnicodeString* file = nullptr; ///< borrowed; null when the reference stays as it is
    };

    Target findTarget(const UnicodeString& reference) const;
    const int* findPage(const UnicodeString& reference) const;
    const UnicodeString* findFile(int page) const;
    bool solveLink(MoxElement& link) const;
    bool solveElement(MoxElement& element);
};

} // namespace DrawmereNS
