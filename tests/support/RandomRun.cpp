#include "tests/support/RandomRun.h"

#include "tests/support/Gunzip.h"

#include <filesystem>

namespace DrawmereTest {
namespace {

// ASCII, with references for what it can't carry, is UTF-8 too; an unknown encoding means UTF-8.
constexpr const char16_t* encodings[] = {u"", u"US-ASCII", u"UTF-8", u"none such"};

// Mostly the one that is there: without it some forms of run write nothing.
constexpr const char16_t* copyFolders[] = {u"./", u"./", u"./", u"./", u"", u"missing/"};

} // namespace

RandomRun::RandomRun(RandomCalls& choices)
    : calls(choices), uri(output.uri("page.svg"), choices.make<UnicodeString>()) {
    calls.configure(config);
    config.streamOutput = calls.flag();
    config.singleFile = calls.flag();
    config.gzip = calls.flag();
    config.keepPageNumber = calls.flag();
    config.checkPaths = calls.below(4) == 3;
    config.encoding = calls.pick(encodings);
    config.imageCopyUri = calls.pick(copyFolders);
    config.copyNamePrefix = calls.make<UnicodeString>();
}

std::vector<std::string> RandomRun::draw(int count) {
    // What can't be written is thrown, and there is nothing to look at.
    try {
        calls.draw(drawmere, stream, count);
    } catch (const MoxError&) {
        stream.str({});
    }
    std::vector<std::string> documents = listDocuments();
    if (config.gzip) {
        for (std::string& document : documents) {
            document = gunzip(document);
        }
    }
    return documents;
}

std::vector<std::string> RandomRun::listDocuments() const {
    std::vector<std::string> documents;
    if (!stream.str().empty()) {
        documents.push_back(stream.str());
    }
    for (const auto& file : std::filesystem::directory_iterator(output.path())) {
        documents.push_back(output.read(file.path().filename().string()));
    }
    return documents;
}

} // namespace DrawmereTest
