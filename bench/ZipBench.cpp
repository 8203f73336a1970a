// Compressed output against the gzip program, on one text.
#include "bench/BenchFile.h"
#include "bench/BenchShapes.h"
#include "bench/Contest.h"
#include "bench/PlainWriter.h"
#include "bench/ResidentMemory.h"
#include "config/SVGZip.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

#include <fcntl.h>
#include <sys/resource.h> // what a child has used is no part of standard C++
#include <sys/wait.h>
#include <unistd.h>

namespace DrawmereNS {
namespace {

constexpr std::size_t rectCount = 20'000;
constexpr std::size_t memoryFactor = 8;

/// The text that both compress: rectangles and words, as documents have them.
std::string makeText(const BenchFile& file) {
    PlainWriter writer(file.getPath());
    writer.startPage(benchPageWidth, benchPageHeight);
    writer.setFont("Helvetica", 10.5F);
    const std::vector<BenchRect> rects = makeBenchRects(scaleCount(rectCount));
    const std::vector<BenchText> texts = makeBenchTexts(rects.size());
    for (std::size_t i = 0; i < rects.size(); ++i) {
        const BenchRect& rect = rects[i];
        writer.setFillColor(rect.fillColor);
        writer.drawRect(rect.x, rect.y, rect.width, rect.height, {.fill = true, .stroke = false});
        writer.drawText(texts[i].bytes, texts[i].x, texts[i].y);
    }
    writer.finish();
    std::ifstream stream(file.getPath(), std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>());
}

void writeFile(const std::string& text, const std::string& path) {
    std::ofstream(path, std::ios::binary) << text;
}

double getSeconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) * 1e-6;
}

[[noreturn]] void becomeGzip(const char* source, const char* target) {
    dup2(open(source, O_RDONLY | O_CLOEXEC), STDIN_FILENO);
    dup2(open(target, O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600), STDOUT_FILENO);
    execlp("gzip", "gzip", "-9", "-n", nullptr);
    _exit(127);
}

/// Runs the program on the file `source`.
ContestResult runGzip(const std::string& source, const BenchFile& file) {
    const Stopwatch watch;
    const pid_t child = fork();
    if (child == 0) {
        becomeGzip(source.c_str(), file.getPath().c_str());
    }
    int state = 0;
    rusage used = {};
    if (wait4(child, &state, 0, &used) != child || state != 0) {
        throw std::runtime_error("gzip failed");
    }
    ContestTime time = watch.getTime();
    time.cpu = getSeconds(used.ru_utime) + getSeconds(used.ru_stime);
    return {time, file.getSize()};
}

/// Writes the text in pieces, as the saving of a document does.
void writePieces(std::ostream& stream, const std::string& text) {
    constexpr std::size_t piece = 65536;
    for (std::size_t i = 0; i < text.size(); i += piece) {
        const std::size_t size = std::min(piece, text.size() - i);
        stream.write(text.data() + i, static_cast<std::streamsize>(size));
    }
}

ContestResult runZip(const std::string& text, const BenchFile& file) {
    const Stopwatch watch;
    {
        SVGZipStream stream(UnicodeString::fromUTF8(file.getPath()));
        writePieces(stream, text);
    }
    return {watch.getTime(), file.getSize()};
}

/// Swallows everything.
class Nowhere : public std::streambuf {
protected:
    std::streamsize xsputn(const char*, std::streamsize count) override { return count; }

    int overflow(int c) override { return traits_type::not_eof(c); }
};

/// Returns: the memory that a stream has taken up when so many texts have gone through it.
std::size_t measureMemory(const std::string& text, std::size_t times) {
    Nowhere nowhere;
    std::ostream target(&nowhere);
    const std::size_t before = countResidentBytes();
    SVGZipStream stream(target);
    for (std::size_t i = 0; i < times; ++i) {
        writePieces(stream, text);
    }
    return countResidentBytes() - before;
}

void printMemory(const std::string& text) {
    measureMemory(text, 1); // what the process itself needs the first time
    const double one = static_cast<double>(measureMemory(text, 1)) / 1024.0;
    const double many = static_cast<double>(measureMemory(text, memoryFactor)) / 1024.0;
    std::printf("\nmemory of a compressed stream\n"
                "  %.0f KB for %.1f MB of text, %.0f KB for %.1f MB; goal: the same\n",
                one, static_cast<double>(text.size()) / 1e6, many,
                static_cast<double>(memoryFactor * text.size()) / 1e6);
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile source;
    const BenchFile file;
    const std::string text = makeText(file);
    writeFile(text, source.getPath());
    runContests({{"compressed output",
                  {
                      {"gzip -9", [&] { return runGzip(source.getPath(), file); }},
                      {"drawmere", [&] { return runZip(text, file); }},
                  },
                  1.1}});
    printMemory(text);
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
