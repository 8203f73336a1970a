#include "tests/support/WholeRun.h"

#include "foundation/records/TLMemoryImage.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/SvgPage.h"
#include "tests/support/TinyImages.h"

namespace DrawmereTest {
namespace {

namespace fs = std::filesystem;

using TalGraphic::TLMemoryImage;

MoxPointT<MoxLength> point(float x, float y) { return {pt(x), pt(y)}; }

MoxRectT<MoxLength> box(float size) { return {point(0, 0), point(size, size)}; }

/// Texts that ICU does not keep within its strings.
constexpr char16_t longText[] = u"A text that is long enough to go to the heap \x3042\x3044";

std::set<int> listCodes(const std::bitset<0x10000>& codes) {
    std::set<int> list;
    for (std::size_t code = codes._Find_first(); code < codes.size();
         code = codes._Find_next(code)) {
        list.insert(static_cast<int>(code));
    }
    return list;
}

std::string readFile(const char* path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

/// Returns: the text without what differs from run to run.
std::string hidePath(std::string text, const std::string& path) {
    for (std::size_t at = text.find(path); at != std::string::npos; at = text.find(path)) {
        text.replace(at, path.size(), "DIRECTORY");
    }
    return text;
}

void drawImage(Drawmere& page, std::string_view bytes, const UnicodeString& name) {
    TLMemoryImage image(bytes, name);
    page.pushState();
    page.drawImage(&image, image.getGraphicType(), pt(20), pt(10), pt(1), pt(2));
    page.popState();
}

void drawText(Drawmere& page, const UnicodeString& text, TLStringWithGlyphInfo* glyphs) {
    std::vector<MoxLength> x;
    for (std::int32_t i = 0; i < text.length(); ++i) {
        x.push_back(pt(static_cast<float>(i) * 6.25F));
    }
    page.drawText(text, x, {pt(20)}, {}, PAINTMODE_FILL, glyphs, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

} // namespace

WholeRun::WholeRun(const RunOptions& runOptions, bool stopsAtErrors)
    : options(runOptions), stops(stopsAtErrors), path(directory.uri("page.svg")),
      base(directory.uri("")), copies(directory.uri("images/")) {
    fs::create_directory(directory.path("images"));
}

void WholeRun::configure(SVGConfig& config) const {
    config.svgType = options.profile;
    config.wispMode = options.wispMode;
    config.streamOutput = options.output == RunOptions::STREAM;
    config.singleFile = options.output != RunOptions::PAGES;
    config.gzip = options.gzip;
    config.encoding = options.encoding;
    config.checkPaths = true;
    config.svgOutputUri = path;
    config.imageCopyUri = copies;
    config.imageBaseUri = base;
    config.downsampleDpi = 72;
    config.setImageProcessingType(MoxName(options.copiesImages ? u"copy-all" : u"embed-all"));
    config.adjustConfig();
}

void WholeRun::draw(std::ostream& target) {
    step([&] {
        SVGConfig config;
        step([&] {
            configure(config);
            drawDocuments(config, target);
        });
        takeQueue(config);
    });
}

void WholeRun::drawDocuments(SVGConfig& config, std::ostream& target) {
    SVGPageUri uri(path);
    Drawmere page(&config, &uri);
    const bool isPaged = options.output == RunOptions::PAGES;
    for (int number = 1; number <= 2; ++number) {
        if (isPaged || number == 1) {
            openDocument(page, target);
        }
        drawPage(page, number);
        if (isPaged || number == 2) {
            step([&] { page.finishRootSvg(); }, /*isEnd=*/true);
        }
    }
    step(
        [&] {
            page.finish();
            hasEnded = true;
        },
        /*isEnd=*/true);
}

void WholeRun::openDocument(Drawmere& page, std::ostream& target) {
    step(
        [&] {
            if (options.output == RunOptions::STREAM) {
                page.initRootSvg(&target);
            } else {
                page.initRootSvg(path);
            }
        },
        /*isEnd=*/true);
}

void WholeRun::drawPage(Drawmere& page, int number) {
    step([&] {
        page.startPage(number, box(200));
        page.setCanvasSize(pt(200), pt(200));
    });
    drawLinks(page, number);
    if (number == 1) {
        drawShapes(page);
        drawPaths(page);
        drawDefinitions(page);
    } else {
        drawTexts(page);
        drawEmbeddedTexts(page);
        drawImages(page);
        drawGradients(page);
    }
    step([&] { page.endPage(); });
}

void WholeRun::drawShapes(Drawmere& page) {
    step([&] {
        page.pushState();
        page.setTransMatrix(SVGMatrix(2, 0, 0, 2, 10, 10));
        page.setFillColorName(u"a paint whose name is long enough for the heap");
        page.setStrokeColor(MoxColor(10, 20, 30));
        page.setOpacity(0.5F, OPACITYDEST_FILL);
        page.drawLine(pt(1), pt(2), pt(3), pt(4), PAINTMODE_STROKE);
        page.drawRect(pt(1), pt(2), pt(3), pt(4), pt(1), pt(1), PAINTMODE_FILLSTROKE);
        page.popState();
    });
    step([&] {
        const MoxLength dashes[] = {pt(1), pt(2), pt(3), pt(4), pt(5.25F), pt(6.125F)};
        page.setDashLine(dashes, 6, pt(1));
        page.setStrokeWidth(pt(2));
        page.setLineCap(LINECAP_ROUND);
        page.drawCircle(pt(50), pt(50), pt(10), PAINTMODE_STROKE);
        page.drawEllipse(pt(50), pt(50), pt(10), pt(20), PAINTMODE_FILLSTROKE);
        page.setDashLine(nullptr, 0, pt(0));
    });
    step([&] {
        float points[] = {1, 2, 3.5F, 4.25F, 100.125F, 7, 13.75F, 9, 10.5F, 11, 12, 14};
        page.drawPolyline(points, 12, PAINTMODE_STROKE);
        page.drawPolygon(points, 12, PAINTMODE_FILL);
    });
}

void WholeRun::drawPaths(Drawmere& page) {
    step([&] {
        page.startPathData();
        page.setPathMoveTo(point(1, 1));
        page.setPathLineTo(point(50, 1));
        page.setPathCubicBezierCurveTo(point(50, 10), point(60, 20), point(50, 50));
        page.setPathQuadraticBezierCurveTo(point(0, 60), point(10, 10));
        page.setPathClosepath();
        page.endPathData(PAINTMODE_FILL);
    });
    step([&] {
        constexpr int moreThanFitsNear = 3000;
        page.startPathData();
        page.setPathMoveTo(point(0, 0));
        for (int i = 0; i < moreThanFitsNear; ++i) {
            page.setPathLineTo(point(static_cast<float>(i) * 1.25F, static_cast<float>(i % 7)));
        }
        page.endPathData(PAINTMODE_STROKE);
    });
}

void WholeRun::drawTexts(Drawmere& page) {
    step([&] {
        SVGFont font;
        font.setFontAttribute(u"A family with a name for the heap", pt(12), FONTWEIGHT_BOLD,
                              FSTYLE_ITALIC, u"serif, 'and another one for the heap'", false);
        page.setFont(&font, nullptr);
        page.setTextDecoration(TEXTDECORATION_UNDERLINE);
        page.drawText(longText, pt(10), pt(20), PAINTMODE_FILL, nullptr, true, true);
        page.setTextDecoration(TEXTDECORATION_NONE);
        drawText(page, longText, nullptr);
    });
}

/// No face with outlines of cubic curves is among them: FreeType does not survive a lack of memory
/// in the interpreter that reads these.
void WholeRun::drawEmbeddedTexts(Drawmere& page) {
    static const std::string arabic = readFile(TEST_SOURCE_DIR "/data/fonts/SimpArabicTest.ttf");
    step([&] {
        SVGFont font = makeFont(arabicFace, /*byGlyphs=*/false);
        page.setFont(&font, &testFonts());
        drawText(page, u"\x628\x629 12", nullptr);
    });
    step([&] {
        FS_ExtraFonts fonts;
        if (!fonts.addBytes(arabic)) {
            throw std::bad_alloc(); // it says so by its result
        }
        SVGFont font = makeFont(u"SimpArabicTest", /*byGlyphs=*/true, FONTWEIGHT_BOLD);
        page.setFont(&font, &fonts);
        TLStringWithGlyphInfo glyphs(std::vector<TLGlyphEntry>{{1, 5}, {2, 6}, {0, 7}});
        drawText(page, u"\x628\x629\x62a", &glyphs);
    });
    step([&] {
        SVGFont font = makeFont(uprightFace, /*byGlyphs=*/false);
        page.setFont(&font, &testFonts());
        page.setWritingMode(MoxName(u"tb-rl"));
        page.drawText(u"A\xFF3B", pt(20), pt(30), PAINTMODE_FILL, nullptr, true, true);
        page.setWritingMode(MoxName(u"lr-tb"));
    });
}

void WholeRun::drawImages(Drawmere& page) {
    static const std::string png = makePng(30, 20, /*hasAlpha=*/true);
    static const std::string bmp = makeBmp(50, 40);
    step([&] { drawImage(page, png, u"a picture with a long name, for the heap.png"); });
    step([&] { drawImage(page, bmp, u"b.bmp"); });
    step([&] { drawImage(page, png, u"a picture with a long name, for the heap.png"); });
}

void WholeRun::drawDefinitions(Drawmere& page) {
    step([&] {
        page.startClipDef(USERSPACEONUSE);
        page.drawRect(pt(0), pt(0), pt(80), pt(80), pt(0), pt(0), PAINTMODE_FILL);
        page.endClipDef();
    });
    step([&] {
        page.pushState();
        page.doClip();
        page.drawCircle(pt(50), pt(50), pt(50), PAINTMODE_FILL);
        page.popState();
    });
    step([&] {
        const UnicodeString mask =
            page.startMask(pt(0), pt(0), pt(9), pt(9), USERSPACEONUSE, OBJECTBOUNDINGBOX);
        page.drawCircle(pt(5), pt(5), pt(5), PAINTMODE_FILL);
        page.endMask();
        page.setMaskReference(mask);
        page.drawCircle(pt(5), pt(5), pt(6), PAINTMODE_FILL);
        page.setMaskReference(u"none");
    });
    step([&] {
        const UnicodeString pattern = page.startPattern(
            box(10), box(20), SVGMatrix(1, 0.5F, 0.5F, 1, 0, 0), USERSPACEONUSE, USERSPACEONUSE);
        page.drawCircle(pt(5), pt(5), pt(5), PAINTMODE_FILL);
        page.endPattern();
        page.setFillColorId(pattern);
        page.drawCircle(pt(5), pt(5), pt(7), PAINTMODE_FILL);
    });
}

void WholeRun::drawGradients(Drawmere& page) {
    step([&] {
        const UnicodeString linear = page.startLinearGradient(pt(0), pt(0), pt(9), pt(9),
                                                              SVGMatrix(), USERSPACEONUSE, GRADPAD);
        page.setStopColor(MoxColor(1, 2, 3), 0.0F, 1.0F);
        page.setStopColor(MoxColor(250, 2, 3), 1.0F, 0.5F);
        page.endGradiant();
        page.setFillColorId(linear);
        page.drawCircle(pt(5), pt(5), pt(8), PAINTMODE_FILL);
    });
    step([&] {
        const UnicodeString radial =
            page.startRadialGradient(pt(0), pt(0), pt(9), pt(9), pt(9), SVGMatrix(1, 0, 0, 3, 0, 0),
                                     OBJECTBOUNDINGBOX, GRADREPEAT);
        page.setStopColor(MoxColor(1, 2, 3), 0.0F, 1.0F);
        page.endGradiant();
        page.setStrokeColorId(radial);
        page.drawCircle(pt(5), pt(5), pt(9), PAINTMODE_STROKE);
    });
}

void WholeRun::drawLinks(Drawmere& page, int number) {
    step([&] {
        page.startLink(number == 1 ? u"#an-anchor-on-the-page-that-follows" : u"#early",
                       MoxName(u"new"));
        page.drawCircle(pt(5), pt(5), pt(4), PAINTMODE_FILL);
        page.endLink();
    });
    step([&] {
        page.startLink(u"http://www.example.com/a/long/way/out", MoxName());
        page.drawCircle(pt(5), pt(5), pt(3), PAINTMODE_FILL);
        page.endLink();
    });
    step([&] {
        page.setInternalLinkAnchor(number == 1 ? u"early" : u"an-anchor-on-the-page-that-follows",
                                   10, 20);
        page.setInternalView(number == 1 ? u"view-one" : u"the-view-of-the-second-page", 1, 2, 3,
                             4);
    });
}

void WholeRun::takeQueue(SVGConfig& config) {
    for (const MoxError& error : config.errors) {
        queued.set(error.getCode());
    }
}

RunOutcome WholeRun::collect() {
    RunOutcome outcome;
    outcome.memoryErrors = memoryErrors;
    outcome.others = otherError ? otherError : "";
    outcome.isFinished = failedEnds == 0 && hasEnded;
    outcome.thrown = listCodes(thrown);
    outcome.queued = listCodes(queued);
    for (const auto& entry : fs::recursive_directory_iterator(directory.path())) {
        if (entry.is_regular_file()) {
            const std::string name = fs::relative(entry.path(), directory.path()).string();
            outcome.files[name] = hidePath(directory.read(name), directory.path());
        }
    }
    return outcome;
}

} // namespace DrawmereTest
