/// What happens to the images of a document.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxByteBlock.h"
#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxName.h"
#include "foundation/common/MoxPtr.h"
#include "foundation/graphicservice/GS_Types.h"

#include <cstdint>
#include <iosfwd>
#include <map>
#include <memory>
#include <set>
#include <vector>

namespace MoxCommonNS {
class MoxUri;
}

namespace MoxGraphicService_NS {
class GS_Graphic;
class GS_RasterImage;
} // namespace MoxGraphicService_NS

namespace TalGraphic {
class TLGraphicImage;
}

namespace DrawmereNS {

class DrawmereErrHandler;
class SVGConfig;
class SVGElement;
class SVGGraphicContext;
class SVGGroupManager;
class SVGImageStore;
class SVGRefIDManager;
struct SVGStoredImage;
class SVGTreeManager;

using MoxCommonNS::MoxElement;
using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxUri;
using MoxCommonNS::MoxValue;
using MoxGraphicService_NS::GS_GraphicType;
using MoxGraphicService_NS::GS_RasterImage;
using MoxGraphicService_NS::IMAGE_CONVERT_TYPE;
using TalGraphic::TLGraphicImage;

/// Places images: refers to their files, copies or converts these next to the output, or embeds
/// their bytes in the document; one lives in each `DrawmereImpl`. An image that fails is queued as
/// an error with the configuration and left out, and all else goes on.
///
/// Everywhere the lengths of an image come as width, height, x, y.
class DRAWMERE_API SVGGraphicManager {
public:
    SVGGraphicManager();
    SVGGraphicManager(const SVGGraphicManager&) = delete;
    SVGGraphicManager& operator=(const SVGGraphicManager&) = delete;
    virtual ~SVGGraphicManager();

    /// Starts over for a new document, which has no embedded images yet.
    /// Borrows: the pointers, for its own life; the tree manager is that of `groups`.
    /// The flag has no effect, and the text that follows it is kept and not read.
    void init(SVGGroupManager* groups, SVGRefIDManager* refIds, SVGConfig* options,
              const UnicodeString& newSourceBase, const UnicodeString& newTargetBase,
              const MoxName& conversion, int newQuality, bool unusedFlag,
              const UnicodeString& unusedText);

    /// Returns: the name by which a document at the target base refers to `name`: the file name
    /// alone when both lie in one place, otherwise `name` unchanged. Nothing inside calls this.
    UnicodeString makeRefernceName(const UnicodeString& name) const; // sic

    /// Returns: the form that the image takes if it is written anew.
    GS_GraphicType getCnvDstType(GS_RasterImage* raster) const;

    /// Tells whether the image has to be written anew, and by what conversion. With `force` it is
    /// even if its form could stay. Queues: 16421, for a raster kind without conversions.
    bool isRequiredImageConvert(GS_RasterImage* raster, IMAGE_CONVERT_TYPE* type, bool force) const;

    /// Returns: the path in `target`, a directory that ends in a slash, for the copy of `image`,
    /// which no other image has; the path it has already if it was copied before. An empty
    /// `extension` is chosen by the type of the image.
    UnicodeString makeCopyName(TLGraphicImage* image, const MoxUri& target,
                               const UnicodeString& extension) const;

    /// Copies a PNG, JPEG or SVG file byte for byte, and converts any other.
    /// Returns: the path of the file that holds the image, also when it could not be made.
    /// Queues: 16419, with that path.
    UnicodeString copyImage(TLGraphicImage* image, const MoxUri& target) const;

    /// Writes `image` anew as PNG or JPEG; what is one of them already is copied byte for byte.
    /// Returns: the path of the converted file; the original file name when nothing was converted,
    /// or, for an image whose type is no PNG, JPEG or SVG while its content is, the path of the
    /// copy. Queues: 16417 and 16420, for what can't be read, and 16419, for what can't be written.
    UnicodeString convertImage(TLGraphicImage* image, const MoxUri& target) const;

    /// Places an image that lies at `href`, as page content.
    void referGraphic(const UnicodeString& href, MoxLength width, MoxLength height, MoxLength x,
                      MoxLength y);

    /// Places an image whose bytes become part of the document, once for all uses of one file
    /// name: the first use decides the pixels. The cursor of the tree stays in `defs` until the
    /// next pop, so the caller wraps the call in a push and a pop. Ignores: an image in a gradient.
    /// Queues: 16417 and 16420, for what can't be read. Throws: MoxError 16405 when the text would
    /// be too large.
    void embedGraphic(TLGraphicImage* image, MoxLength width, MoxLength height, MoxLength x,
                      MoxLength y);

    /// Sets a smaller size in pixels for an image that has more than its place on the page can
    /// show at the resolution of the configuration. Returns: whether a size was set.
    bool execDownsample(GS_RasterImage* raster, MoxLength width, MoxLength height) const;

    /// Encodes a local file, in UTF-8, for `embedImage`. Nothing inside calls this form.
    /// Returns: `encodedText`. Throws: MoxError 16405 when there is no file, the text would be too
    /// large, or memory ran out.
    char* base64Encoding(const char* path);

    /// Encodes a stream from its beginning; one that can't be read gives an empty text.
    char* base64Encoding(std::istream& source);

    /// Stores the encoded text as an image in `defs`, and moves the cursor of the tree there. The
    /// lengths have no effect. Returns: the reference to the image, "#" and its id.
    UnicodeString embedImage(MoxLength width, MoxLength height, GS_GraphicType type);

    /// Places a stored image.
    void useEmbededImage(UnicodeString reference, MoxLength width, MoxLength height, MoxLength x,
                         MoxLength y); // sic

    SVGTreeManager* treeManager = nullptr;                 ///< borrowed
    SVGGroupManager* groupManager = nullptr;               ///< borrowed
    SVGConfig* config = nullptr;                           ///< borrowed
    std::map<UnicodeString, UnicodeString> embeddedImages; ///< references by original file name
    /// Owned, in `encodedBlock`; null but between encoding and storing.
    char* encodedText = nullptr;
    SVGRefIDManager* refIdManager = nullptr; ///< borrowed
    UnicodeString sourceBase;                ///< for `makeRefernceName`
    UnicodeString targetBase;                ///< for `makeRefernceName`
    MoxPtr<MoxElement> imageParent;   ///< the cursor of the tree when the last image call began
    DrawmereErrHandler* errorHandler; ///< borrowed; not called here
    MoxName conversionName;           ///< as of `init`; the configuration itself is what counts
    int quality = 0;                  ///< likewise
    // Nothing fills or reads the rest.
    std::map<UnicodeString, UnicodeString> unusedNames;      ///< stays empty
    std::vector<UnicodeString> unusedList;                   ///< stays empty
    std::set<UnicodeString> unusedSet;                       ///< stays empty
    std::map<UnicodeString, UnicodeString> unusedReferences; ///< stays empty
    UnicodeString unusedText;                                ///< stays empty
    std::int32_t unusedCounter = 0;                          ///< stays 0

private:
    void report(unsigned short message, const UnicodeString& name = UnicodeString()) const;
    bool isUsable(const MoxGraphicService_NS::GS_Graphic& graphic) const;
    UnicodeString copyBytes(TLGraphicImage* image, const MoxUri& target,
                            const UnicodeString& extension) const;
    void writeCopy(TLGraphicImage* image, const UnicodeString& path) const;
    void writeConverted(GS_RasterImage& raster, const UnicodeString& path,
                        IMAGE_CONVERT_TYPE type) const;
    bool keepGraphic(std::istream& source, GS_RasterImage& raster, MoxLength width,
                     MoxLength height, SVGStoredImage& bytes);
    void keepBytes(std::istream& source, SVGStoredImage& bytes);
    UnicodeString storeImage(MoxValue&& uri);
    void makeEncodedBlock(int size);
    void dropEncodedText();
    MoxValue takeDataUri(GS_GraphicType type);
    void stampGroup(SVGElement& group, SVGGraphicContext& context) const;

    MoxCommonNS::MoxByteBlock encodedBlock; ///< `encodedText` with room for its prefix before it
    std::size_t encodedSize = 0;
    std::unique_ptr<SVGImageStore> imageStore; ///< that of the document; null without images
};

} // namespace DrawmereNS
