/// Contests in which the library, the plain writer and cairo draw the same page.
#pragma once

#include "Drawmere.h"
#include "bench/BenchFile.h"
#include "bench/BenchShapes.h"
#include "bench/Contest.h"
#include "bench/PlainWriter.h"
#include "bench/peers/CairoPeer.h"

namespace DrawmereNS {

/// The ratios to the plain writer that the library may have, 0 for none.
struct DrawGoals {
    double wall = 0.0;
    double bytes = 0.0;
};

inline MoxLength pt(float number) { return MoxLength::fromRaw(number); }

template <typename Draw, typename Input>
ContestResult runPlain(Draw draw, const Input& input, const BenchFile& file) {
    const Stopwatch watch;
    PlainWriter writer(file.getPath());
    writer.startPage(benchPageWidth, benchPageHeight);
    draw(writer, input);
    const std::size_t bytes = writer.finish();
    return {watch.getTime(), bytes};
}

template <typename Draw, typename Input>
void makeFile(Draw draw, const Input& input, const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;
    config.singleFile = true;
    config.saveOption = u"decimals=3";
    SVGPageUri uri(path);
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(1,
                       MoxRectT<MoxLength>(pt(0), pt(0), pt(benchPageWidth), pt(benchPageHeight)));
    drawmere.setCanvasSize(pt(benchPageWidth), pt(benchPageHeight));
    draw(drawmere, input);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

template <typename Draw, typename Input>
ContestResult runDrawmere(Draw draw, const Input& input, const BenchFile& file) {
    const Stopwatch watch;
    makeFile(draw, input, UnicodeString::fromUTF8(file.getPath()));
    return {watch.getTime(), file.getSize()};
}

template <typename Draw, typename Input>
ContestResult runCairo(Draw draw, const Input& input, const BenchFile& file) {
    const Stopwatch watch;
    CairoPeer cairo(file.getPath(), benchPageWidth, benchPageHeight);
    draw(cairo, input);
    cairo.finish();
    return {watch.getTime(), file.getSize()};
}

/// Makes a contest of the whole way from the first call to the saved file.
/// `draw` is called with each of the three and `input`.
/// Borrows: `input` and `file`, for the life of the contest.
template <typename Draw, typename Input>
Contest makeDrawContest(const char* title, Draw draw, const Input& input, const BenchFile& file,
                        DrawGoals goals) {
    return {title,
            {
                {"plain", [&, draw] { return runPlain(draw, input, file); }},
                {"drawmere", [&, draw] { return runDrawmere(draw, input, file); }},
                {"cairo", [&, draw] { return runCairo(draw, input, file); }, /*isSlow=*/true},
            },
            goals.wall,
            goals.bytes};
}

} // namespace DrawmereNS
