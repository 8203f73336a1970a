// The life of a run; the calls that only pass on stand in DrawmereCalls.cpp.
#include "Drawmere.h"

#include "draw/SVGBasicImpl.h"
#include "draw/SVGFullImpl.h"
#include "draw/SVGPlazmicImpl.h"
#include "draw/SVGTinyImpl.h"
#include "foundation/common/MoxUri.h"
#include "foundation/common/MoxUtil.h"
#include "frontend/DrawmereError.h"
#include "refs/SVGReferenceId.h"
#include "tree/SVGTreeManager.h"

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxUri;
using MoxCommonNS::MoxUtil;
using MoxCommonNS::MoxValueType;

/// How the system hands over a text that may be a local path or a URI.
MoxUri makeUri(const UnicodeString& text) {
    return {text, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr};
}

MoxUri resolveUri(const UnicodeString& base, const UnicodeString& relative) {
    return {makeUri(base), relative, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr};
}

template <typename Impl> DrawmereImpl* make(SVGConfig* config) { return new Impl(config); }

struct ProfileMaker {
    SVGConfig::SVGTYPE type;
    DrawmereImpl* (*make)(SVGConfig*);
};

// On purpose: Wisp is not here and gives the Full profile, as unknown numbers do. The small-device
// output is Tiny with the flag of the configuration.
constexpr ProfileMaker profileMakers[] = {
    {SVGConfig::SVGTYPE_BASIC, make<SVGBasicImpl>},
    {SVGConfig::SVGTYPE_TINY, make<SVGTinyImpl>},
    {SVGConfig::SVGTYPE_PLAZMIC, make<SVGPlazmicImpl>},
};

} // namespace

Drawmere::Drawmere(SVGConfig* options, SVGPageUri* uri)
    : config(options), pageUri(uri), errorHandler(DrawmereErrHandler::getDefault()) {}

Drawmere::~Drawmere() { closeImpl(); }

DrawmereImpl* Drawmere::createImplInstance(SVGConfig::SVGTYPE type) {
    for (const ProfileMaker& profile : profileMakers) {
        if (profile.type == type) {
            return profile.make(config);
        }
    }
    return make<SVGFullImpl>(config);
}

void Drawmere::initRootSvg(const UnicodeString& path) {
    outputPath = MoxUri::getLocalPath(path);
    UnicodeString base;
    if (config->checkPaths && !config->streamOutput) {
        base = pageUri->getBaseString();
        if (!base.isEmpty() && !makeUri(base).isFileExists()) {
            DrawmereError::throwError(16410, base);
        }
    }
    checkCopyUri(base);
    outputStream = nullptr;
    openImpl();
}

void Drawmere::checkCopyUri(const UnicodeString& base) const {
    const UnicodeString& copyUri = config->imageCopyUri;
    if (copyUri.isEmpty()) {
        if (copiesImages()) {
            DrawmereError::throwError(16411, UnicodeString());
        }
        return;
    }
    MoxUri target = makeUri(copyUri);
    if (!target.isAbsolute()) {
        target.setText(resolveUri(base, copyUri).getText());
    }
    if (config->checkPaths && !config->streamOutput && !target.isFileExists()) {
        DrawmereError::throwError(16413, copyUri);
    }
}

void Drawmere::initRootSvg(std::ostream* stream) {
    outputPath.remove();
    outputStream = stream;
    openImpl();
    // On purpose: a stream is checked after the document was opened, a path before. A caller that
    // goes on after the error finds an open document here and none there.
    if (!copiesImages()) {
        return;
    }
    if (config->imageCopyUri.isEmpty()) {
        DrawmereError::throwError(16411, UnicodeString());
    }
    if (config->checkPaths && config->streamOutput && !makeUri(config->imageCopyUri).isAbsolute()) {
        DrawmereError::throwError(16412, UnicodeString());
    }
}

void Drawmere::openImpl() {
    closeImpl();
    impl = createImplInstance(config->svgType);
    // Callers draw, and see the tree by `DrawmereImpl::getDocument` alone. The passes of the
    // small-device mode want all nodes in the end.
    impl->treeManager->packsFinished =
        config->svgType != SVGConfig::SVGTYPE_TINY || !config->wispMode;
    try {
        impl->initRootSvg();
    } catch (...) { // no memory
        closeImpl();
        throw;
    }
}

void Drawmere::closeImpl() {
    delete impl;
    impl = nullptr;
}

bool Drawmere::copiesImages() const {
    const MoxName name = config->imageProcessingName;
    return name == MoxName(u"copy-all") || name == MoxName(u"copy");
}

UnicodeString Drawmere::makePageFileName(std::int32_t page, const UnicodeString& format) const {
    UnicodeString name = pageUri->getFileName();
    const UnicodeString extension = pageUri->getExtension();
    name.truncate(std::max(name.length() - extension.length(), 0));
    name.append(MoxUtil::formatNumber(page, format, UnicodeString(), 0,
                                      MoxCommonNS::MoxLang(icu::Locale::getRoot()),
                                      MoxCommonNS::MOXNAME_ALPHABETIC));
    return name.append(extension);
}

UnicodeString Drawmere::makePagePath(std::int32_t page) const {
    const UnicodeString format =
        pageUri->numberFormat.isEmpty() ? UnicodeString(u"1") : pageUri->numberFormat;
    return resolveUri(pageUri->getBaseString(), makePageFileName(page, format)).getText();
}

void Drawmere::startPage(int pageNo, const MoxRectT<MoxLength>& rect) {
    if (!impl) {
        return;
    }
    currentPage = pageNo;
    if (pageCount == 0) {
        firstPage = pageNo;
    }
    ++pageCount;
    pageAnchors.clear();
    pageFiles.emplace(pageNo, makePageFileName(pageNo, pageUri->numberFormat));
    impl->setInternalLinkAnchor(SVGReferenceId::getPageReferenceMark(pageNo), rect.x1.getRawValue(),
                                rect.y1.getRawValue());
}

void Drawmere::endPage() {
    for (const UnicodeString& name : pageAnchors) {
        anchorPages.emplace(name, currentPage);
        allAnchors.insert(name);
    }
    pageAnchors.clear();
}

void Drawmere::finishRootSvg() {
    if (!impl) {
        return;
    }
    try {
        finishOpenDocument();
    } catch (const MoxError& error) {
        errorHandler->handleError(error);
    } catch (...) {
        errorHandler->handleError();
    }
}

void Drawmere::finishOpenDocument() {
    impl->finishRootSvg();
    const MoxPtr<MoxDocument> document(impl->treeManager->document.get());
    const bool waits =
        config->streamOutput || config->singleFile || !isSolved(document->getDocumentElement());
    if (waits) {
        keepDocument(document);
    } else {
        writeFile(document.get(), makePagePath(currentPage));
    }
    closeImpl();
}

bool Drawmere::isSolved(MoxCommonNS::MoxElement* root) const {
    if (!impl->mayHoldLinks()) {
        return true;
    }
    SVGReferenceId references;
    references.setRefernceIdInfo(/*isSingleFile=*/false, allAnchors, anchorPages, pageFiles);
    return references.isSolvedReferenceId(currentPage, root);
}

void Drawmere::keepDocument(const MoxPtr<MoxDocument>& document) {
    const bool isKept = documents.emplace(currentPage, document).second;
    if (isKept && !impl->mayHoldLinks()) {
        keptPages[currentPage] = {.isLinkless = true, .anchors = impl->getPageAnchors()};
    }
}

void Drawmere::writeFile(MoxDocument* document, const UnicodeString& path) {
    std::ostream* stream = config->createOStream(path);
    if (!stream) {
        DrawmereError::throwError(16414, path);
    }
    bool written = false;
    try {
        saveDocument(document, stream);
        written = stream->flush().good();
    } catch (...) { // no memory
        config->releaseOStream();
        throw;
    }
    config->releaseOStream();
    if (!written) {
        DrawmereError::throwError(16414, path);
    }
    hasWrittenFile = true;
}

bool Drawmere::hasError() { return config->hasError(); }

MoxError Drawmere::popError() { return config->popError(); }

void Drawmere::setErrorHandler(DrawmereErrHandler* handler) {
    errorHandler = handler ? handler : DrawmereErrHandler::getDefault();
    if (impl) {
        impl->setErrorHandler(errorHandler);
    }
}

} // namespace DrawmereNS
