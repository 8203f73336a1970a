#include "frontend/DrawmereError.h"

#include <iterator>

namespace DrawmereNS {
namespace {

constexpr unsigned short firstCode = 16404;

constexpr char16_t unlistedText[] = u"Drawmere error!";

/// One text. Those with an argument show it between their two halves.
struct ErrorText {
    const char16_t* prefix; // null for a code that has no text
    const char16_t* suffix; // null for a text without an argument
};

// Row by row the codes from 16404 on. On purpose: the spellings are what callers match and
// translate.
constexpr ErrorText errorTexts[] = {
    {u"Change font name to family name error.", nullptr},
    {u"Create an encoding buffer error.", nullptr},
    {u"Pop a empty stack.", nullptr},
    {u"Pop type is not same with push type.", nullptr},
    {u"Append an element to a NULL tree.", nullptr},
    {nullptr, nullptr}, // 16409
    {u"The svg output path ", u"doesn't exist."},
    {u"It is necessary to specify the uri that copies image files.", nullptr},
    {u"It is necessary to specify the uri that copies image files absolutely.", nullptr},
    {u"Specified uri that copies image files ", u"doesn't exists."},
    {u"Specified uri that svg output ", u"couldn't create."},
    {nullptr, nullptr}, // 16415
    {nullptr, nullptr}, // 16416
    {u"The image ", u"couldn't load."},
    {u"The image ", u"couldn't read."},
    {u"The copy image ", u"couldn't create."},
    {u"The Iimage ", u"isn't a raster image type."},
    {u"The Iimage ", u"isn't suppoeted type."},
    {nullptr, nullptr}, // 16422
    {u"There is no alternative file for the maximum size error.", nullptr},
    {u"The size of the output file exceeded the limitation of a specified maximum.", nullptr},
    {u"The image size height exceeded the limitation of a specified maximum.", nullptr},
    {u"The number of pages exceeded the limitation of a specified maximum.", nullptr},
    {nullptr, nullptr}, // 16427
    {u"clipPath element is required. It is not supported with SVG Tiny.", nullptr},
    {u"linerGradiant or radialGradiant element is required. It is not supported with SVG Tiny.",
     nullptr},
    {u"mask element is required. It is not supported with SVG Tiny.", nullptr},
    {u"pattern element is required. It is not supported with SVG Tiny.", nullptr},
};

static_assert(std::size(errorTexts) == 16431 - firstCode + 1);

/// Returns: the row of `code`, null for a code without a text.
const ErrorText* findText(unsigned short code) {
    if (code < firstCode || code - firstCode >= static_cast<int>(std::size(errorTexts))) {
        return nullptr;
    }
    const ErrorText& row = errorTexts[code - firstCode];
    return row.prefix ? &row : nullptr;
}

} // namespace

UnicodeString DrawmereError::getErrorMessage(unsigned short code, const UnicodeString& argument) {
    const ErrorText* text = findText(code);
    if (!text) {
        return UnicodeString(unlistedText);
    }
    UnicodeString message(text->prefix);
    if (!text->suffix) {
        return message;
    }
    if (!argument.isEmpty()) {
        message.append(u'(').append(argument).append(u") ", 2);
    }
    return message.append(text->suffix, -1);
}

void DrawmereError::throwError(unsigned short code, const UnicodeString& argument) {
    MoxError error(code, UnicodeString(), UnicodeString(), -1, -1, UnicodeString());
    error.setMessage(getErrorMessage(code, argument));
    error.throwFatalError();
}

} // namespace DrawmereNS
