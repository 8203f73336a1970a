/// A document whose image manager is called directly.
#pragma once

#include "foundation/common/MoxUri.h"
#include "foundation/records/TLMemoryImage.h"
#include "images/SVGGraphicManager.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tests/draw/DrawnTree.h"
#include "tests/draw/QueuedErrors.h"
#include "tests/support/TempDir.h"
#include "tests/support/TinyImages.h"
#include "tree/SVGTreeManager.h"

#include <string>
#include <vector>

namespace DrawmereTest {

using TalGraphic::TLGraphicType;

/// An image of a type that its bytes don't tell.
class TypedImage : public TalGraphic::TLMemoryImage {
public:
    TypedImage(int imageType, std::string_view bytes, const UnicodeString& name)
        : TLMemoryImage(bytes, name), type(static_cast<TLGraphicType>(imageType)) {}

    TLGraphicType getGraphicType() override { return type; }

private:
    TLGraphicType type;
};

/// An image whose stream is missing.
class LostImage : public TalGraphic::TLGraphicImage {
public:
    explicit LostImage(int imageType, const UnicodeString& name)
        : TLGraphicImage(name), type(static_cast<TLGraphicType>(imageType)) {}

    TLGraphicType getGraphicType() override { return type; }

    std::istream* getStream() override { return nullptr; }

private:
    TLGraphicType type;
};

/// A tree with the manager that places images in it, and a directory for files.
struct ImagePage : DrawnTree<> {
    SVGGraphicManager& manager() { return impl.graphicManager; }

    MoxUri target() const {
        return {directory.uri() + u"/", MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr};
    }

    /// Draws an image of 30 by 20 points at 1, 2 into the page.
    void draw(TLGraphicImage& image) { impl.drawImage(&image, pt(30), pt(20), pt(1), pt(2)); }

    /// The same between a push and a pop, which take the cursor back into the page.
    void drawApart(TLGraphicImage& image) {
        impl.pushState(ELEMENT_TYPE_PLAIN);
        draw(image);
        impl.popState(ELEMENT_TYPE_PLAIN);
    }

    /// Returns: the errors that wait, the oldest first.
    std::vector<std::string> errors() {
        std::vector<std::string> texts;
        for (const MoxError& error : config.errors) {
            texts.push_back(describe(error));
        }
        return texts;
    }

    TempDir directory;
};

constexpr char loadErrorText[] = "16929 The image couldn't load.";
constexpr char rasterErrorText[] = "16932 The Iimage isn't a raster image type.";
constexpr char kindErrorText[] = "16933 The Iimage isn't suppoeted type.";

/// Returns: what is queued when the copy at `path` can't be made.
inline std::string copyErrorText(const std::string& path) {
    return "16931 The copy image (" + path + ") couldn't create.";
}

} // namespace DrawmereTest
