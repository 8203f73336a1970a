/// What the caller wants made, and the books of what was made.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxError.h"
#include "foundation/common/MoxName.h"
#include "foundation/common/MoxString.h"

#include <cstdint>
#include <deque>
#include <iosfwd>
#include <map>
#include <set>

namespace MoxCommonNS {
class MoxObjectBase;
}

namespace TalGraphic {
class TLGraphicImage;
}

namespace DrawmereNS {

using MoxCommonNS::MoxError;
using MoxCommonNS::MoxName;

/// The options of a run, and its books: open streams, created files, names of images, errors.
/// The caller fills the members and calls the setters before `Drawmere::initRootSvg`, and keeps the
/// object as long as the `Drawmere` that it was given to. The defaults told below are what the
/// constructor and `init` set.
class DRAWMERE_API SVGConfig {
public:
    /// The profile of the output; any other number means full.
    enum SVGTYPE : std::int32_t {
        SVGTYPE_FULL = 0,
        SVGTYPE_BASIC = 1,
        SVGTYPE_TINY = 2,
        SVGTYPE_WISP = 3, ///< gives the full profile; `wispMode` with Tiny is the small-device mode
        SVGTYPE_PLAZMIC = 4,
    };

    /// What happens to images. An unlisted number embeds them, and copies what is not embedded.
    enum IMAGEPROCESSING : std::int32_t {
        IMAGEPROCESSING_EMBED_ALL = 0, ///< "embed-all": every image is embedded
        IMAGEPROCESSING_LINK = 1,      ///< "link": PNG, JPEG and SVG files stay where they are
        IMAGEPROCESSING_COPY_ALL = 2,  ///< "copy-all": every image is copied
        IMAGEPROCESSING_COPY = 3,      ///< "copy": files are copied, others embedded
    };

    /// The form that images are converted into.
    enum IMAGECONVERSION : std::int32_t {
        IMAGECONVERSION_AUTO = 0,     ///< "auto"
        IMAGECONVERSION_JPEG = 1,     ///< "jpeg" or "jpg"
        IMAGECONVERSION_PNG = 2,      ///< "png"
        IMAGECONVERSION_JPEG_ALL = 3, ///< "jpg-all"
        IMAGECONVERSION_PNG_ALL = 4,  ///< "png-all"
    };

    /// Makes a configuration with the defaults.
    SVGConfig();

    /// On purpose: copies nothing. The new object has empty texts and containers, zeros and false,
    /// and not even the defaults; a configuration is not a value.
    SVGConfig(const SVGConfig&);
    SVGConfig& operator=(const SVGConfig&) = delete;

    /// Deletes `ownedObject` if `ownsObject` is set. Streams that are still open are not deleted.
    virtual ~SVGConfig();

    /// Sets the defaults, for another run with the same object. The streams must have been released
    /// before: open ones are forgotten, not deleted, and so is `ownedObject`. Image names are
    /// cleared; errors and created files stay.
    void init();

    /// Makes options agree with each other; to be called when all are set.
    /// `maxLength` becomes 32768 when it is not positive, and for a profile other than full also
    /// when it is larger. In `wispMode` all images become JPEG, whatever was set.
    void adjustConfig();

    /// Sets what images are converted into by its keyword: "auto", "jpeg", "jpg", "png", "jpg-all",
    /// "png-all". An unknown one reads as "auto", though `imageConversionName` keeps it.
    void setImageConversion(const MoxName& name);

    /// Sets what happens to images by its keyword: "embed-all", "link", "copy-all", "copy". An
    /// unknown one reads as "embed-all", though `imageProcessingName` keeps it.
    void setImageProcessingType(const MoxName& name);

    /// Sets the names of the fonts to embed, in place of those set before.
    /// Shape: `list`, names with a comma between them. A name loses the character before its comma,
    /// so each comma wants a blank before it: "Arial ,Times".
    void setEmbedFonts(const UnicodeString& list);

    /// Returns: whether the options ask for the font `name`, compared exactly, to be embedded. The
    /// library itself doesn't ask: the caller may, to fill `SVGFont::embedFont`.
    bool isEmbedFont(const UnicodeString& name);

    /// Returns: whether `image` becomes part of the document. A null is an image without a file.
    bool isEmbedImage(TalGraphic::TLGraphicImage* image) const;

    /// Returns: whether `image` is copied next to the document; asked for what is not embedded.
    /// When both answers are false the document refers to the image where it is. A null is an image
    /// without a file.
    bool isCopyImage(TalGraphic::TLGraphicImage* image) const;

    /// Returns: the value of `key` in `options`, "key=value" pairs with commas between them and no
    /// blanks; the first when there are several, empty when there is none.
    UnicodeString findValue(const UnicodeString& options, const UnicodeString& key) const;

    /// Opens the file `name`, a local path or a `file:` URI, and enters the stream in the books.
    /// Owns: the books; `releaseOStream` deletes the stream. Returns: null when the file can't be
    /// made; nothing is entered then. A `name` whose stream is still open opens a second one, and
    /// the name goes on to mean the first.
    std::ostream* createOStream(const UnicodeString& name);

    /// Returns: whether a stream is entered under `name`.
    bool isCreatedOStream(const UnicodeString& name) const;

    /// Closes and deletes one stream, and strikes it and its name from the books.
    /// Ignores: a stream that is not entered.
    void releaseOStream(std::ostream* stream);

    /// Closes and deletes every stream that is entered.
    void releaseOStream();

    /// Moves the open output `stream` to the file `name`; a switch set by `ownsObject` allows it.
    /// The old file is removed, the old stream closed; it stays entered until it is released. The
    /// new file is one byte longer: it has the old one's last byte twice.
    /// Returns: the stream to go on with, owned by the books: `stream` itself when the operation is
    /// switched off, `stream` is not entered or `name` is the file it has; null when the new file
    /// can't be made. The old file stays when the new one is not complete.
    std::ostream* renameOStream(std::ostream* stream, const UnicodeString& name);

    /// Notes a file for `deleteEntryeFiles`; the library enters none. Ignores: every file while
    /// `streamOutput` is set.
    void entryCreatedFile(const UnicodeString& name);

    /// Removes the files noted, which undoes a failed run, and forgets them; a file that can't be
    /// removed is passed over. Ignores: the call while `streamOutput` is set.
    void deleteEntryeFiles(); // sic

    /// Marks the file name `entered` as used for an image, and, unless `source` is empty, remembers
    /// it for `key`. The first name for a key stays.
    void enterImageName(const UnicodeString& source, const UnicodeString& key,
                        const UnicodeString& entered);

    /// Returns: whether the file name is used for an image.
    bool isEnteredImagename(const UnicodeString& name) const; // sic

    /// Returns: the file name remembered for `key`, empty when there is none.
    UnicodeString getEnteredImageName(const UnicodeString& key) const;

    /// Forgets all image names and starts to count generated ones at 0 again.
    void initImageName();

    /// Returns: the limit for output files in kilobytes of 1024 bytes, the value of "maxsize" in
    /// `wispOptions`; 0, which means none, outside `wispMode`.
    std::int32_t getMaxFileSize() const;

    /// Returns: the local path of what stands in for a file beyond the limit, the value of
    /// "errorsvg" in `wispOptions`; empty outside `wispMode`.
    UnicodeString getMaxFileSizeErrorSvg() const;

    /// Replaces the output file `path`, a local path, by a copy of the substitute when it is larger
    /// than the limit; nothing but the caller runs this check. `pageNo` is told in the report. The
    /// substitute may be larger than the limit itself, and is replaced by itself then.
    /// Queues: 17320 (text 16424) for a file that was replaced; 16935 (text 16423) when there is no
    /// substitute that can be read, however large the file, which stays; 16926 (text 16414) when
    /// the copy can't be written.
    /// Ignores: a limit below 1, and a `path` that is no file.
    void checkMaxFileSize(const UnicodeString& path, int pageNo);

    /// Returns: whether errors wait that the document survived.
    bool hasError() const;

    /// Appends a copy of `error`.
    void pushError(const MoxError& error);

    /// Takes the newest error out. Returns: the error, an empty record when none is left.
    MoxError popError();

    /// Drops all errors.
    void clearError();

    // The values written here are those of a copy; the default of each member is told beside it.

    UnicodeString encoding;            ///< of documents, empty (UTF-8) by default
    SVGTYPE svgType = SVGTYPE_FULL;    ///< full by default
    UnicodeString svgVersion;          ///< of the root element, "1.1" by default
    bool gzip = false;                 ///< compress documents, false by default
    MoxName imageProcessingName;       ///< the keyword as set, "embed-all" by default
    std::int32_t imageProcessing = 0;  ///< an `IMAGEPROCESSING`, set with its keyword
    UnicodeString numberFormatDefault; ///< of page numbers, "1" by default; not read by the library
    bool embedAllFonts = false;        ///< false by default
    std::set<UnicodeString> embedFontNames; ///< set by `setEmbedFonts`
    bool keepGroups = false;                ///< true by default; not read by the library
    MoxName imageConversionName;            ///< the keyword as set, "auto" by default
    std::int32_t imageConversion = 0;       ///< an `IMAGECONVERSION`, set with its keyword
    std::int32_t jpegQuality = 0;           ///< of JPEG files that are written, 80 by default
    UnicodeString unsetText;                ///< bogus by default; not read by the library
    UnicodeString imageBaseUri;             ///< base of references to images, bogus by default
    /// Where copied images go, "./" by default; relative to the directory of `svgOutputUri`. It
    /// ends in a slash: without one its last part becomes the beginning of the file names.
    UnicodeString imageCopyUri;
    /// True, the default: the document goes to the caller's stream. For files set it to false. A
    /// document of several pages wants `singleFile` here too: links between its pages lead to the
    /// files of these pages otherwise.
    bool streamOutput = false;
    bool checkPaths = false;        ///< test output and copy paths, false by default
    UnicodeString svgOutputUri;     ///< the document's own URI, bogus by default
    bool singleFile = false;        ///< all pages in one document, false by default
    UnicodeString saveOption;       ///< options of `MoxDocument::save`, empty by default
    bool wispMode = false;          ///< small-device mode, false by default
    UnicodeString wispOptions;      ///< its parameters, "key=value,key=value"; empty by default
    std::int32_t downsampleDpi = 0; ///< target, 0 by default: no downsampling
    std::int32_t downsampleThreshold = 0; ///< 1 by default
    std::int32_t downsampleType = 0;      ///< a sampling type, 1 by default
    bool reservedFlag = false;            ///< false by default; not read by the library
    UnicodeString copyNamePrefix;         ///< of generated names of copied images, empty by default
    /// A run of one page keeps the number in its file name, false by default.
    bool keepPageNumber = false;
    std::set<UnicodeString> enteredImageNames;           ///< every image file name in use
    std::map<UnicodeString, UnicodeString> imageNameMap; ///< a source's key to its file name
    std::int32_t copyNameCounter = 0;                    ///< of generated names of copied images
    MoxCommonNS::MoxObjectBase* ownedObject = nullptr;   ///< null by default; owned if `ownsObject`
    bool ownsObject = false; ///< false by default; also allows `renameOStream`
    std::map<UnicodeString, std::ostream*> streamsByName; ///< open streams; owned, as are the next
    std::map<std::ostream*, UnicodeString> namesByStream; ///< the same the other way
    std::deque<MoxError> errors;                          ///< the newest is at the end
    std::set<UnicodeString> createdFiles;                 ///< what `deleteEntryeFiles` removes
    float maxLength = 0.0F;                               ///< 0 by default; not read by the library
    std::int32_t limitValue = 0; ///< 5000 by default; not read by the library
    bool colorFlag = false;      ///< colour names where they are shorter, true by default
};

} // namespace DrawmereNS
