// A large photograph made small: against the decoder's own scaling, which leaves more pixels.
#include "bench/BenchFile.h"
#include "bench/Contest.h"
#include "bench/peers/JpegPeer.h"
#include "foundation/graphicservice/GS_Graphic.h"

#include <benchmark/benchmark.h>
#include <fstream>
#include <sstream>

namespace DrawmereNS {
namespace {

using namespace MoxGraphicService_NS;

constexpr int fullColumns = 6000;
constexpr int fullRows = 4000;
constexpr int smokeColumns = 600;
constexpr int smokeRows = 400;
constexpr int targetColumns = 300;
constexpr int targetRows = 200;
constexpr int quality = 90;

ContestResult runPeer(const BenchFile& file) {
    const Stopwatch watch;
    const std::size_t bytes = decodeJpegScaled(file.getPath(), targetColumns);
    return {watch.getTime(), bytes};
}

ContestResult runService(const BenchFile& file, GSMP_SAMPLINGTYPE type) {
    const Stopwatch watch;
    std::ifstream source(file.getPath(), std::ios::binary);
    const GS_Graphic graphic(source, 72.0F);
    std::ostringstream target;
    graphic.raster->gl_setDownsample(targetColumns, targetRows, type);
    graphic.raster->writeToStream(target, CONVERT_JPEG_JPEG, quality);
    const std::size_t bytes = target.str().size();
    return {watch.getTime(), bytes};
}

Contender makeService(const std::string& name, const BenchFile& file, GSMP_SAMPLINGTYPE type) {
    return {name, [&file, type] { return runService(file, type); }};
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    writeJpegPhotograph(file.getPath(), isSmokeRun() ? smokeColumns : fullColumns,
                        isSmokeRun() ? smokeRows : fullRows);
    runContests({{.title = "JPEG of 24 megapixels to 300 columns, checked and written",
                  .contenders = {{"libjpeg alone", [&file] { return runPeer(file); }},
                                 makeService("cubic", file, SAMPLINGTYPE_CUBIC),
                                 makeService("linear", file, SAMPLINGTYPE_LINEAR),
                                 makeService("average", file, SAMPLINGTYPE_AVERAGE)},
                  .goal = 1.3}});
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
