// Writing documents, the end of a run, and links by value.
#include "Drawmere.h"
#include "config/SVGZip.h"
#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxCStr.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "foundation/names/SVGName.h"
#include "frontend/DrawmereError.h"
#include "refs/SVGReferenceId.h"

#include <cstdio>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxElement;
using MoxCommonNS::MoxNamedValueMap;
using MoxCommonNS::MoxNameEnum;
using MoxCommonNS::MoxNode;
using TalCommon::SVGName;

/// The text of a destination: that of a name or a string, nothing of any other value.
UnicodeString toDestination(const MoxValue& value) {
    const bool isText = value.getType() == MoxCommonNS::MOXVALUE_NAME ||
                        value.getType() == MoxCommonNS::MOXVALUE_STRING;
    return isText ? value.toString() : UnicodeString();
}

bool isDefinitions(const MoxNode& node) {
    return node.kindLink() == MoxCommonNS::MOXNODE_ELEMENT &&
           static_cast<const MoxElement&>(node).localLink() == MoxName(SVGName(SVGName::defs));
}

enum class Place : std::uint8_t { nowhere, page, definition };

/// Where in `document` an anchor stands.
Place findPlace(const MoxDocument& document, const MoxNode* anchor) {
    Place place = Place::page;
    while (anchor && anchor != &document) {
        place = isDefinitions(*anchor) ? Place::definition : place;
        anchor = anchor->parentLink();
    }
    return anchor ? place : Place::nowhere;
}

/// Solves page anchors of a document without links, given in the order in which they were made.
/// Returns: false, with nothing changed, when that is not the order in which they stand: a
/// definition stands before all that was drawn ahead of it.
bool solveAnchors(SVGReferenceId& references, const MoxDocument& document,
                  const std::vector<MoxPtr<MoxElement>>& anchors) {
    std::vector<MoxElement*> standing;
    for (const auto& anchor : anchors) {
        const Place place = findPlace(document, anchor.get());
        if (place == Place::definition) {
            return false;
        }
        if (place == Place::page) {
            standing.push_back(anchor.get());
        }
    }
    for (MoxElement* anchor : standing) {
        references.solvePageAnchor(anchor);
    }
    return true;
}

constexpr MoxNameEnum destinationKeys[] = {
    MoxCommonNS::MOXNAME_ID,
    MoxCommonNS::MOXNAME_NAME,
    MoxCommonNS::MOXNAME_TARGET,
};

UnicodeString makeInternalUri(const MoxNamedValueMap& destination) {
    const MoxValue& page = destination.getNamedItem(MoxCommonNS::MOXNAME_PAGE);
    if (page.getKey()) {
        // On purpose: a page has no "#" before its mark, so the solver leaves the link as it is.
        return SVGReferenceId::getPageReferenceMark(page.getIntegerValue());
    }
    for (const MoxNameEnum key : destinationKeys) {
        const MoxValue& item = destination.getNamedItem(key);
        if (item.getKey()) {
            return UnicodeString(u"#") + toDestination(item);
        }
    }
    return UnicodeString(u"#");
}

} // namespace

void Drawmere::saveDocument(MoxDocument* document, std::ostream* stream) {
    if (!document || !stream) {
        return;
    }
    const UnicodeString none;
    if (!config->gzip) {
        document->save(config->encoding, none, *stream, nullptr, config->saveOption, none);
        return;
    }
    SVGZipStream zip(*stream);
    try {
        document->save(config->encoding, none, zip, nullptr, config->saveOption, none);
    } catch (...) { // no memory: without its end, nobody takes the file for a whole one
        stream->setstate(std::ios::badbit);
        throw;
    }
    // What the document itself had to refuse is known to the outer stream alone.
    if (!zip.good() && stream->good()) {
        stream->setstate(std::ios::badbit);
    }
}

void Drawmere::finish() {
    try {
        finishRun();
    } catch (const MoxError& error) {
        errorHandler->handleError(error);
    } catch (...) {
        errorHandler->handleError();
    }
}

void Drawmere::finishRun() {
    solveReferences();
    if (config->streamOutput || config->singleFile) {
        writeFirstDocument();
        return;
    }
    writeKeptDocuments();
    // A page that could not be written must not take the place of an older file.
    if (pageCount == 1 && hasWrittenFile && !config->keepPageNumber) {
        renameOnlyPage();
        hasWrittenFile = false;
    }
}

void Drawmere::solveReferences() {
    SVGReferenceId references;
    references.setRefernceIdInfo(config->singleFile, allAnchors, anchorPages, pageFiles);
    for (const auto& [page, document] : documents) {
        solveDocument(references, page, *document);
    }
}

void Drawmere::solveDocument(SVGReferenceId& references, std::int32_t page, MoxDocument& document) {
    KeptPage& kept = keptPages[page];
    // Solved again, a document would no longer tell which page its links are on.
    if (kept.isSolved) {
        return;
    }
    kept.isSolved = true;
    if (!kept.isLinkless || !solveAnchors(references, document, kept.anchors)) {
        references.solveReferenceId(page, document.getDocumentElement());
    }
}

void Drawmere::writeFirstDocument() {
    if (documents.empty()) {
        return;
    }
    const auto& [page, document] = *documents.begin();
    KeptPage& kept = keptPages[page];
    if (kept.isWritten) {
        return;
    }
    if (config->streamOutput) {
        writeStream(document.get());
    } else {
        writeFile(document.get(), outputPath);
    }
    kept.isWritten = true;
}

void Drawmere::writeKeptDocuments() {
    for (const auto& [page, document] : documents) {
        KeptPage& kept = keptPages[page];
        if (!kept.isWritten) {
            writeFile(document.get(), makePagePath(page));
            kept.isWritten = true;
        }
    }
}

void Drawmere::writeStream(MoxDocument* document) {
    if (!outputStream) {
        DrawmereError::throwError(16414, outputPath);
    }
    saveDocument(document, outputStream);
    // The stream stays the caller's, open and not flushed: what it has refused so far is known
    // here, the rest when the caller flushes or closes it.
    if (!outputStream->good()) {
        DrawmereError::throwError(16414, outputPath);
    }
}

void Drawmere::renameOnlyPage() const {
    const UnicodeString& plain = pageUri->getText();
    if (plain.indexOf(u'\0') >= 0) {
        return; // it would end the path early and name some other file
    }
    // On purpose: the text of the URI as the caller gave it, so a "file:" URI names no file here.
    // A file that can't be renamed keeps its number.
    static_cast<void>(std::rename(MoxCommonNS::MoxCStr(makePagePath(firstPage)).toCStr(),
                                  MoxCommonNS::MoxCStr(plain).toCStr()));
}

void Drawmere::startLink(const MoxValue& link) {
    const MoxValue& internal = link.getNamedItem(MoxCommonNS::MOXNAME_INTERNAL);
    const UnicodeString uri = internal == MoxValue::NULL_VALUE
                                  ? toDestination(link.getNamedItem(MoxCommonNS::MOXNAME_EXTERNAL))
                                  : makeInternalUri(internal.getNamedValueMap());
    startLink(uri, link.getNamedItem(MoxCommonNS::MOXNAME_SHOW).getNameValue());
}

} // namespace DrawmereNS
