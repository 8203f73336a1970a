/// Judges documents by the document types of SVG 1.1.
#pragma once

#include "SVGConfig.h"

#include <memory>
#include <string>
#include <vector>

struct _xmlDtd; // NOLINT(bugprone-reserved-identifier): libxml2's own, included by the source alone

namespace DrawmereTest {

/// Validates documents in this process, by the document type of one output profile, which is read
/// once.
class SvgValidator {
public:
    /// What makes documents invalid on purpose.
    struct KnownFault {
        /// Returns: whether documents of the profile have it.
        bool concerns(DrawmereNS::SVGConfig::SVGTYPE type) const;

        std::vector<DrawmereNS::SVGConfig::SVGTYPE> profiles;
        const char* start; ///< of the complaint
        const char* rest;  ///< a pattern for what follows
        const char* reason;
    };

    /// Returns: all that there are.
    static const std::vector<KnownFault>& listKnownFaults();

    explicit SvgValidator(DrawmereNS::SVGConfig::SVGTYPE outputProfile);

    /// Returns: the complaints about a document, one for each place.
    std::vector<std::string> listFaults(const std::string& document) const;

    /// Returns: what the complaint is known as; null for one that there should not be.
    const KnownFault* findKnown(const std::string& fault) const;

private:
    struct DtdDeleter {
        void operator()(_xmlDtd* unused) const;
    };

    DrawmereNS::SVGConfig::SVGTYPE profile;
    std::unique_ptr<_xmlDtd, DtdDeleter> dtd;
};

} // namespace DrawmereTest
