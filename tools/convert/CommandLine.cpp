#include "tools/convert/CommandLine.h"

#include "tools/convert/OutputNames.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <cmath>
#include <map>
#include <thread>

namespace DrawmereConvert {
namespace {

using DrawmereNS::SVGConfig;

constexpr std::size_t mebibyte = std::size_t{1} << 20U;

constexpr const char* description =
    "Converts documents (PDF, XPS, EPUB, HTML, CBZ, images) into SVG pages with working links.";

constexpr const char* closingWords = R"(
Examples:
  drawmere-convert report.pdf -o out/
      out/report01.svg and so on, and out/index.html, which shows them all
  drawmere-convert report.pdf --pages 1-5,8,12- -o out/page.svg
      out/page01.svg and so on, for some of the pages
  drawmere-convert report.pdf --single-file -o report.svg
      all pages below each other in one document
  drawmere-convert figure.pdf -o - | gzip > figure.svgz
      a document on the standard output
  drawmere-convert book.epub --text fonts --jobs 4 --gzip -o book/
      text as text, in fonts of the document, in compressed files

Exit status: 0 all pages are written, 1 some failed, 2 wrong use, 3 nothing could be read.
)";

const std::map<std::string, SVGConfig::SVGTYPE> profileWords = {
    {"full", SVGConfig::SVGTYPE_FULL},
    {"basic", SVGConfig::SVGTYPE_BASIC},
    {"tiny", SVGConfig::SVGTYPE_TINY},
    {"plazmic", SVGConfig::SVGTYPE_PLAZMIC},
};

const std::map<std::string, TEXTMODE> textWords = {
    {"outlines", TEXTMODE_OUTLINES},
    {"fonts", TEXTMODE_FONTS},
    {"plain", TEXTMODE_PLAIN},
};

/// Reads the words into the options, and checks what only all of them together can tell.
class Reader {
public:
    Reader() {
        app.set_version_flag("--version", "drawmere-convert " DRAWMERE_VERSION);
        app.footer(closingWords);
        options.jobs = std::max(1, static_cast<int>(std::thread::hardware_concurrency()));
        addPlaceOptions();
        addDocumentOptions();
        addImageOptions();
        addDeviceOptions();
        addRunOptions();
    }

    CommandLine read(int argc, const char* const* argv) {
        try {
            app.parse(argc, argv);
            settle();
            return {options, EXITSTATUS_DONE};
        } catch (const CLI::ParseError& error) {
            const bool isAnswer = error.get_exit_code() == 0;
            app.exit(error);
            return {std::nullopt, isAnswer ? EXITSTATUS_DONE : EXITSTATUS_USAGE};
        }
    }

private:
    void addPlaceOptions() {
        app.add_option("FILE", options.inputs, "Documents to convert")->required();
        app.add_option("-o,--output", options.output,
                       "A directory, a file that lends its name to the pages, or - for the "
                       "standard output (default: the current directory)");
        app.add_option("-p,--pages", pages, "Pages to convert, such as 1-5,8,12-");
        app.add_option("--number-format", options.numberFormat,
                       "Form of page numbers in file names: 1, 001, a, A, i or I (default: as many "
                       "digits as the last page has)");
        app.add_flag("--keep-number", options.keepNumber, "Number the file of a single page, too");
        app.add_flag("--single-file", options.singleFile, "Write all pages into one document");
        app.add_flag("--index,!--no-index", wantsIndex,
                     "Write index.html, which shows all pages (default: for more than one)");
    }

    void addDocumentOptions() {
        app.add_option("--profile", options.profile, "full, basic, tiny or plazmic")
            ->transform(CLI::CheckedTransformer(profileWords))
            ->option_text("WORD");
        app.add_option("--text", options.convert.textMode,
                       "Text as outlines (exact everywhere), fonts (text in embedded SVG fonts) "
                       "or plain (text with the names of its fonts)")
            ->transform(CLI::CheckedTransformer(textWords))
            ->option_text("WORD");
        app.add_option("--precision", options.convert.precision,
                       "Points by which outlines of text may be off, across and down (0.01): "
                       "smaller for prints, larger for smaller pages")
            ->check(CLI::Range(0.001, 1.0));
        app.add_flag("--gzip", options.gzip, "Compress the documents");
        app.add_option("--password", options.password, "Opens encrypted documents");
    }

    void addImageOptions() {
        app.add_option(
               "--images", options.images,
               "Images into the pages (embed-all), into files beside them (copy-all, or copy with "
               "names made of their content), or linked where they are (link: documents that are "
               "PNG or JPEG images; those inside other documents are embedded)")
            ->check(CLI::IsMember({"embed-all", "link", "copy-all", "copy"}))
            ->option_text("WORD");
        app.add_option("--image-format", options.imageFormat, "auto, jpeg, png, jpg-all or png-all")
            ->check(CLI::IsMember({"auto", "jpeg", "jpg", "png", "jpg-all", "png-all"}))
            ->option_text("WORD");
        app.add_option("--dpi", options.dpi, "Bring images of more dots an inch down to this many")
            ->check(CLI::Range(1, 10000));
        app.add_option("--quality", options.quality, "Of JPEG images that are written (80)")
            ->check(CLI::Range(1, 100));
        app.add_option("--shading-dpi", options.convert.shadeDpi,
                       "Dots an inch of shadings that are drawn as images (144)")
            ->check(CLI::Range(10, 2400));
    }

    void addDeviceOptions() {
        smallDevice = app.add_flag("--small-device", options.smallDevice,
                                   "Write Tiny documents that small devices can show");
        CLI::Option* const maxSize =
            app.add_option("--max-size", options.maxSize,
                           "Replace pages of more than this many KB, with --small-device")
                ->check(CLI::Range(1, 2'000'000));
        CLI::Option* const errorSvg =
            app.add_option("--error-svg", options.errorSvg, "The document that replaces such pages")
                ->check(CLI::ExistingFile);
        maxSize->needs(smallDevice)->needs(errorSvg);
        errorSvg->needs(maxSize);
    }

    void addRunOptions() {
        app.add_option("-j,--jobs", options.jobs,
                       "Pages at a time (default: as many as processors)")
            ->check(CLI::Range(1, 256));
        app.add_option("--timeout", options.timeout, "Seconds for a page, 0 for no limit (60)")
            ->check(CLI::Range(0.0, 1e6));
        app.add_option("--max-memory", maxMemory,
                       "Megabytes for the reader of the document, for each job, 0 for no limit "
                       "(2048)")
            ->check(CLI::Range(std::size_t{0}, std::size_t{1} << 24U));
        app.add_flag("-v,--verbose", options.verbose, "Say what became of each page");
        app.add_flag("-q,--quiet", options.quiet, "Say nothing but errors");
    }

    /// Throws: CLI::ParseError.
    void settle() {
        options.convert.maxMemory = maxMemory * mebibyte;
        if (app.count("--index") > 0) {
            options.index = wantsIndex ? INDEXMODE_ALWAYS : INDEXMODE_NEVER;
        }
        settleNumbers();
        settlePages();
        settleInputs();
        settleProfile();
        settlePlace();
    }

    // What is no number at all lies within every range.
    void settleNumbers() {
        if (std::isnan(options.timeout)) {
            throw CLI::ValidationError("--timeout", "that is no number of seconds");
        }
        if (std::isnan(options.convert.precision)) {
            throw CLI::ValidationError("--precision", "that is no number of points");
        }
        if (options.numberFormat.find('/') != std::string::npos) {
            throw CLI::ValidationError("--number-format", "a slash can't be part of a name");
        }
    }

    void settleInputs() {
        const std::vector<std::string>& inputs = options.inputs;
        for (auto input = inputs.begin(); input != inputs.end(); ++input) {
            if (std::find(inputs.begin(), input, *input) != input) {
                throw CLI::ValidationError("FILE", *input + " is given twice");
            }
        }
    }

    void settlePages() {
        if (app.count("--pages") == 0) {
            return;
        }
        try {
            options.pages = PageRanges(pages);
        } catch (const std::invalid_argument& error) {
            throw CLI::ValidationError("--pages", error.what());
        }
    }

    void settleProfile() {
        if (!options.smallDevice) {
            return;
        }
        if (app.count("--profile") > 0 && options.profile != SVGConfig::SVGTYPE_TINY) {
            throw CLI::ValidationError("--small-device", "goes with the profile tiny alone");
        }
        options.profile = SVGConfig::SVGTYPE_TINY;
        if (options.errorSvg.find(',') != std::string::npos) {
            throw CLI::ValidationError("--error-svg", "a comma can't be part of the name");
        }
    }

    void settlePlace() {
        if (options.isOneDocument() && options.index == INDEXMODE_ALWAYS) {
            throw CLI::ValidationError("--index", "one document needs no index");
        }
        if (options.isOneDocument() && options.maxSize > 0) {
            throw CLI::ValidationError("--max-size", "is a limit of pages in files of their own");
        }
        if (options.inputs.size() > 1 && !options.writesToOutput() &&
            !OutputNames::isDirectory(options.output)) {
            throw CLI::ValidationError("-o", "several documents need a directory, such as " +
                                                 options.output + "/");
        }
        if (!options.writesToOutput()) {
            return;
        }
        if (options.images.starts_with("copy")) {
            throw CLI::ValidationError("--images", "nothing is copied beside the standard output");
        }
        if (options.inputs.size() > 1) {
            throw CLI::ValidationError("-o", "the standard output takes one document");
        }
    }

    CLI::App app{description, "drawmere-convert"};
    RunOptions options;
    std::string pages;
    bool wantsIndex = false;
    std::size_t maxMemory = 2048;
    CLI::Option* smallDevice = nullptr; // borrowed from `app`
};

} // namespace

CommandLine readCommandLine(int argc, const char* const* argv) { return Reader().read(argc, argv); }

} // namespace DrawmereConvert
