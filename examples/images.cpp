// A sheet of images in every form that can be read, drawn once for each way an image can go:
// embedded, linked to, copied, converted, made smaller; into files and into a stream.
// Usage: images [DIRECTORY], where the images are.

#include "Drawmere.h"
#include "foundation/common/MoxUri.h"
#include "foundation/records/TLFileImage.h"

#include <cstdio>
#include <filesystem>
#include <fstream>

using namespace DrawmereNS;
using TalGraphic::TLFileImage;

namespace {

// A4, landscape. All numbers are points, y grows downwards.
constexpr float pageWidth = 842;
constexpr float pageHeight = 595;
constexpr float margin = 32;
constexpr float gap = 18;
constexpr float cardWidth = (pageWidth - 2 * margin - 3 * gap) / 4;
constexpr float cardHeight = 232;
constexpr float firstRow = 92;
constexpr float frame = 130; // the side of the square that an image has room in
constexpr float cell = 6.5F; // of the chequers that show through what is transparent

const MoxColor paper(0xF3F5FA);
const MoxColor white(0xFFFFFF);
const MoxColor navy(0x1D2B4F);
const MoxColor grey(0x7C8699);
const MoxColor pale(0xE2E7F1);

/// An image and its size on the page.
struct Picture {
    const char* file;
    const char16_t* form;
    const char16_t* remark;
    float width;
    float height;
};

constexpr Picture pictures[] = {
    {"tower.jpg", u"JPEG", u"a photograph", 130, 130},
    {"portrait_2.jpg", u"JPEG", u"mirrored by its EXIF data", 98, 130},
    {"tbrn2c08.png", u"PNG", u"one colour is transparent", 104, 104},
    {"basi6a16.png", u"PNG", u"alpha, 16 bits, interlaced", 104, 104},
    {"interlaced.gif", u"GIF", u"interlaced", 130, 79.5F},
    {"palette-1c-4b.tiff", u"TIFF", u"a palette of 16 colours", 130, 125},
    {"rgb24.bmp", u"BMP", u"24 bits", 127, 64},
    {"lossy_alpha1.webp", u"WebP", u"lossy, with alpha", 130, 40},
};

/// One way for the images to go.
struct Way {
    const char16_t* name;       ///< of the file
    const char16_t* heading;    ///< what the sheet says about itself
    const char16_t* processing; ///< what happens to images
    const char16_t* conversion; ///< what they are converted into
    int dpi;                    ///< to which they are made smaller, 0 for as they are
};

constexpr Way ways[] = {
    {u"images", u"Embedded in the document", u"embed-all", u"auto", 0},
    {u"images-link", u"Linked to where they are, embedded where no viewer reads them", u"link",
     u"auto", 0},
    {u"images-copy", u"Copied under their own names", u"copy", u"auto", 0},
    {u"images-copy-all", u"Copied under numbers", u"copy-all", u"auto", 0},
    {u"images-jpeg", u"Conversion jpeg", u"embed-all", u"jpeg", 0},
    {u"images-jpg", u"Conversion jpg", u"embed-all", u"jpg", 0},
    {u"images-png", u"Conversion png", u"embed-all", u"png", 0},
    {u"images-jpg-all", u"Conversion jpg-all", u"embed-all", u"jpg-all", 0},
    {u"images-png-all", u"Conversion png-all", u"embed-all", u"png-all", 0},
    {u"images-small", u"Embedded with 40 pixels an inch", u"embed-all", u"auto", 40},
};

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

void fillBox(Drawmere& page, float x, float y, float width, float height, const MoxColor& color,
             float corner) {
    page.setFillColor(color);
    page.drawRect(pt(x), pt(y), pt(width), pt(height), pt(corner), pt(corner), PAINTMODE_FILL);
}

void drawText(Drawmere& page, const UnicodeString& text, float x, float y, float size,
              FONTWEIGHT weight, const MoxColor& color) {
    SVGFont font;
    font.setFontAttribute(u"DejaVu Sans", pt(size), weight, FSTYLE_NORMAL, u"", false);
    font.fontFamily = u"'DejaVu Sans',sans-serif";
    page.setFont(&font, nullptr);
    page.setFillColor(color);
    page.drawText(text, pt(x), pt(y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

/// Draws the ground of an image as one path of chequers.
void drawChequers(Drawmere& page, float x, float y) {
    fillBox(page, x, y, frame, frame, paper, 0);
    page.setFillColor(pale);
    page.startPathData();
    for (int i = 0; i < 20 * 20; ++i) {
        const int column = i % 20;
        const int row = i / 20;
        if ((column + row) % 2 == 0) {
            const float left = x + cell * static_cast<float>(column);
            const float top = y + cell * static_cast<float>(row);
            page.setPathMoveTo({pt(left), pt(top)});
            page.setPathLineTo({pt(left + cell), pt(top)});
            page.setPathLineTo({pt(left + cell), pt(top + cell)});
            page.setPathLineTo({pt(left), pt(top + cell)});
            page.setPathClosepath();
        }
    }
    page.endPathData(PAINTMODE_FILL);
}

void drawPicture(Drawmere& page, const Picture& picture, const std::string& directory, float x,
                 float y) {
    TLFileImage image(UnicodeString::fromUTF8(directory + "/" + picture.file));
    // A push before and a pop behind each image, as the drawing goes on in the definitions of the
    // document once an image was embedded.
    page.pushState();
    page.drawImage(&image, image.getGraphicType(), pt(picture.width), pt(picture.height),
                   pt(x + (frame - picture.width) / 2), pt(y + (frame - picture.height) / 2));
    page.popState();
}

void drawCard(Drawmere& page, const Picture& picture, const std::string& directory, float x,
              float y) {
    const float left = x + (cardWidth - frame) / 2;
    page.pushState();
    fillBox(page, x, y, cardWidth, cardHeight, white, 8);
    drawChequers(page, left, y + 20);
    page.popState();
    drawPicture(page, picture, directory, left, y + 20);
    page.pushState();
    drawText(page, picture.form, left, y + 174, 13, FONTWEIGHT_BOLD, navy);
    drawText(page, picture.remark, left, y + 190, 8.5F, FONTWEIGHT_NORMAL, grey);
    drawText(page, UnicodeString::fromUTF8(picture.file), left, y + 206, 8.5F, FONTWEIGHT_NORMAL,
             grey);
    page.popState();
}

void drawSheet(Drawmere& page, const Way& way, const std::string& directory) {
    page.pushState();
    fillBox(page, 0, 0, pageWidth, pageHeight, paper, 0);
    fillBox(page, 0, 0, pageWidth, 64, navy, 0);
    drawText(page, u"Images", margin, 40, 24, FONTWEIGHT_BOLD, white);
    drawText(page, way.heading, margin + 130, 39, 13, FONTWEIGHT_NORMAL, pale);
    page.popState();
    float x = margin;
    float y = firstRow;
    for (const Picture& picture : pictures) {
        drawCard(page, picture, directory, x, y);
        x += cardWidth + gap;
        if (x > pageWidth - margin) {
            x = margin;
            y += cardHeight + gap;
        }
    }
}

void setOptions(SVGConfig& config, const Way& way) {
    config.saveOption = u"decimals=2"; // more would not be seen
    config.setImageProcessingType(MoxName(way.processing));
    config.setImageConversion(MoxName(way.conversion));
    config.imageCopyUri = UnicodeString(way.name) + u"-files/";
    config.copyNamePrefix = u"image";
    config.downsampleDpi = way.dpi;
    config.downsampleThreshold = 0; // of the longer side of an image: none
}

/// Draws the sheet into a document that was opened already, and ends the run.
void drawRun(Drawmere& drawmere, const Way& way, const std::string& directory) {
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(pageWidth), pt(pageHeight)));
    drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
    drawSheet(drawmere, way, directory);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

/// Returns: false when an image could not be placed.
bool printErrors(SVGConfig& config) {
    const bool isClean = !config.hasError();
    while (config.hasError()) {
        const MoxError error = config.popError();
        std::fprintf(stderr, "images: %s\n", error.what());
    }
    return isClean;
}

/// Writes the sheet into a file; the copies of images go into a directory beside it.
bool writeFile(const Way& way, const std::string& directory) {
    SVGConfig config;
    setOptions(config, way);
    const bool copies = config.imageProcessing == SVGConfig::IMAGEPROCESSING_COPY ||
                        config.imageProcessing == SVGConfig::IMAGEPROCESSING_COPY_ALL;
    if (copies) {
        std::string name;
        std::filesystem::create_directory(config.imageCopyUri.toUTF8String(name));
    }
    const UnicodeString path = UnicodeString(way.name) + u".svg";
    config.streamOutput = false;
    // Both paths full, so that the way from the document to an image can be told.
    config.svgOutputUri =
        UnicodeString::fromUTF8(std::filesystem::current_path().string()) + u"/" + path;
    SVGPageUri uri(path);
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawRun(drawmere, way, directory);
    return printErrors(config);
}

/// Writes the sheet into a stream; copies want a full path then.
bool writeStream(const Way& way, const std::string& directory) {
    SVGConfig config;
    setOptions(config, way);
    std::ofstream stream("images-stream.svg", std::ios::binary);
    SVGPageUri uri(u"images-stream.svg");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(&stream);
    drawRun(drawmere, way, directory);
    return printErrors(config);
}

} // namespace

int main(int argc, char** argv) {
    const std::string directory =
        std::filesystem::absolute(argc > 1 ? argv[1] : EXAMPLE_DATA "/images").lexically_normal();
    try {
        bool isClean = writeStream(ways[0], directory);
        for (const Way& way : ways) {
            isClean = writeFile(way, directory) && isClean;
        }
        return isClean ? 0 : 1;
    } catch (const MoxError& error) {
        std::fprintf(stderr, "images: %s\n", error.what());
        return 1;
    }
}
