// Embedded images: base64 by itself, a document of large PNG files, and its memory.
#include "bench/DrawContest.h"
#include "bench/ResidentMemory.h"
#include "foundation/graphicservice/GS_Graphic.h"
#include "foundation/records/TLFileImage.h"
#include "images/SVGBase64.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <random>
#include <sstream>

namespace DrawmereNS {
namespace {

using TalGraphic::TLFileImage;

constexpr std::size_t imageCount = 20;
constexpr int imageSide = 1000; // of noise, three bytes a pixel: a file of 3 MB
constexpr int smokeSide = 30;
constexpr float width = 100.0F;
constexpr float height = 80.0F;

// Input: PNG files of noise, which no packing makes smaller.

void appendLittle(std::string& bytes, std::size_t number, int size) {
    for (int i = 0; i < size; ++i) {
        bytes += static_cast<char>(number >> static_cast<unsigned int>(8 * i) & 0xFFU);
    }
}

/// Returns: a BMP file of random pixels.
std::string makeNoise(std::size_t side, unsigned int seed) {
    constexpr std::size_t headerSize = 54;
    const std::size_t rowSize = (side * 3 + 3) / 4 * 4;
    std::string file = "BM";
    appendLittle(file, headerSize + rowSize * side, 4);
    appendLittle(file, 0, 4);
    appendLittle(file, headerSize, 4);
    appendLittle(file, 40, 4);
    appendLittle(file, side, 4);
    appendLittle(file, side, 4);
    appendLittle(file, 1, 2);
    appendLittle(file, 24, 2);
    file.append(24, '\0');
    std::mt19937 random(seed);
    while (file.size() < headerSize + rowSize * side) {
        appendLittle(file, random(), 4);
    }
    return file;
}

struct ImageFiles {
    std::vector<std::string> paths;
    std::size_t bytes = 0; ///< of all files

    std::size_t countEncoded() const {
        return paths.size() *
               SVGBase64::CalculateRecquiredEncodeOutputBufferSize(bytes / paths.size());
    }
};

ImageFiles makeImages(const BenchFile& place) {
    ImageFiles files;
    for (std::size_t i = 0; i < imageCount; ++i) {
        std::istringstream noise(
            makeNoise(isSmokeRun() ? smokeSide : imageSide, static_cast<unsigned int>(i)));
        const MoxGraphicService_NS::GS_Graphic graphic(noise, 72.0F);
        files.paths.push_back(place.getPath() + std::to_string(i) + ".png");
        if (graphic.isRaster()) {
            graphic.raster->writeToFile(files.paths.back().c_str(),
                                        MoxGraphicService_NS::CONVERT_BMP_PNG, 80);
        }
        std::ifstream file(files.paths.back(), std::ios::ate);
        files.bytes += static_cast<std::size_t>(file.tellg());
    }
    return files;
}

// Base64 by itself; the bytes told are those of the input.

ContestResult runMemcpy(const std::string& input, std::string& out) {
    const Stopwatch watch;
    std::memcpy(out.data(), input.data(), input.size());
    benchmark::DoNotOptimize(out.data());
    return {watch.getTime(), input.size()};
}

ContestResult runEncode(const std::string& input, std::string& out) {
    const Stopwatch watch;
    SVGBase64::EncodeBuffer(input.data(), input.size(), out.data());
    return {watch.getTime(), input.size()};
}

ContestResult runTriples(const std::string& input, std::string& out) {
    const Stopwatch watch;
    char* end = out.data();
    for (std::size_t i = 0; i + 3 <= input.size(); i += 3, end += 4) {
        SVGBase64::EncodeByteTriple(input.data() + i, 3, end);
    }
    return {watch.getTime(), input.size()};
}

Contest makeBase64Contest(const std::string& input, std::string& out) {
    return {"base64 of 60 MB of input; the copy is the yardstick",
            {
                {"memcpy", [&] { return runMemcpy(input, out); }},
                {"lines", [&] { return runEncode(input, out); }},
                {"triples", [&] { return runTriples(input, out); }, /*isSlow=*/true},
            },
            2.0};
}

// A document of images.

/// The place of the image with this number.
struct Place {
    explicit Place(std::size_t i) {
        const std::size_t row = i / 5;
        x = static_cast<float>(i % 5) * width;
        y = static_cast<float>(row) * height;
    }

    float x = 0.0F;
    float y = 0.0F;
};

void drawImages(PlainWriter& page, const ImageFiles& files) {
    for (std::size_t i = 0; i < imageCount; ++i) {
        const Place place(i);
        page.drawImage(files.paths[i % files.paths.size()], place.x, place.y, width, height);
    }
}

void drawImages(Drawmere& page, const ImageFiles& files) {
    for (std::size_t i = 0; i < imageCount; ++i) {
        const Place place(i);
        TLFileImage image(UnicodeString::fromUTF8(files.paths[i % files.paths.size()]));
        page.pushState();
        page.drawImage(&image, image.getGraphicType(), pt(width), pt(height), pt(place.x),
                       pt(place.y));
        page.popState();
    }
}

/// Cairo takes the bytes of a file along with pixels that it then does not look at.
void drawImages(CairoPeer& page, const ImageFiles& files) {
    for (std::size_t i = 0; i < imageCount; ++i) {
        const Place place(i);
        page.drawPng(files.paths[i % files.paths.size()], place.x, place.y, width, height);
    }
}

constexpr auto draw = [](auto& page, const ImageFiles& files) { drawImages(page, files); };

Contest makeImageContest(const ImageFiles& files, const BenchFile& file) {
    return makeDrawContest("20 PNG files of 3 MB, embedded and saved", draw, files, file,
                           {2.0, 0.0});
}

void printMemory(const ImageFiles& files, const BenchFile& file) {
    const std::size_t before = countResidentBytes();
    resetPeakBytes();
    runDrawmere(draw, files, file);
    const std::size_t peak = countPeakBytes() - before;
    const double encoded = static_cast<double>(files.countEncoded());
    std::printf("\nmemory\n  peak %.1f MB for %.1f MB of encoded text: %.2fx; goal: at most 1.5x\n",
                static_cast<double>(peak) / 1e6, encoded / 1e6,
                static_cast<double>(peak) / encoded);
}

void printOneImage(const ImageFiles& files, const BenchFile& file) {
    const ImageFiles one = {{files.paths[0]}, files.bytes / files.paths.size()};
    const ContestResult result = runDrawmere(draw, one, file);
    std::printf("\none image placed %zu times\n  %.2f MB written for %.2f MB of encoded text\n",
                imageCount, static_cast<double>(result.bytes) / 1e6,
                static_cast<double>(one.countEncoded()) / 1e6);
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const ImageFiles files = makeImages(file);
    const std::string input = makeNoise(isSmokeRun() ? smokeSide : 4472, 1);
    std::string out(SVGBase64::CalculateRecquiredEncodeOutputBufferSize(input.size()), '\0');
    runContests({makeBase64Contest(input, out), makeImageContest(files, file)});
    printMemory(files, file);
    printOneImage(files, file);
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
