// The books of a configuration: open streams, created files, names of images.
#include "SVGConfig.h"

#include "foundation/common/MoxCStr.h"
#include "foundation/common/MoxUri.h"

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <memory>
#include <system_error>

namespace DrawmereNS {

using MoxCommonNS::MoxCStr;
using MoxCommonNS::MoxUri;

namespace {

MoxUri makeUri(const UnicodeString& name) {
    return MoxUri(name, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr);
}

/// Returns: whether both names lead to one existing file.
bool isSameFile(const UnicodeString& one, const UnicodeString& other) {
    std::error_code failure;
    return std::filesystem::equivalent(MoxCStr(MoxUri::getLocalPath(one)).toBytes(),
                                       MoxCStr(MoxUri::getLocalPath(other)).toBytes(), failure);
}

/// Flushes `stream` and closes its file; a failure shows in the state of the stream.
void closeFile(std::ostream& stream) {
    stream.flush();
    auto* const file = dynamic_cast<std::filebuf*>(stream.rdbuf());
    if (file && !file->close()) {
        stream.setstate(std::ios::failbit);
    }
}

/// Copies what is left of `source`, and its last byte once more.
/// On purpose: the read that meets the end leaves the byte as it was, and it is written again; a
/// renamed file is one byte longer, and an empty one becomes a null byte.
void copyWithLastByteTwice(std::istream& source, std::ostream& target) {
    char byte = 0;
    while (!source.eof() && !source.bad() && target) {
        source.get(byte);
        target.put(byte);
    }
}

void removeFile(const UnicodeString& name) {
    if (name.indexOf(u'\0') < 0) { // it would end the path early and name some other file
        std::remove(MoxCStr(name).toCStr());
    }
}

} // namespace

std::ostream* SVGConfig::createOStream(const UnicodeString& name) {
    std::unique_ptr<std::ostream> stream(makeUri(name).getOStream(true));
    if (!stream) {
        return nullptr;
    }
    const auto entry = namesByStream.emplace(stream.get(), name).first;
    try {
        streamsByName.emplace(name, stream.get());
    } catch (...) { // no memory: a stream is in both books or in none
        namesByStream.erase(entry);
        throw;
    }
    return stream.release();
}

bool SVGConfig::isCreatedOStream(const UnicodeString& name) const {
    return streamsByName.contains(name);
}

void SVGConfig::releaseOStream(std::ostream* stream) {
    const auto found = namesByStream.find(stream);
    if (found == namesByStream.end()) {
        return;
    }
    // On purpose: strikes the name out even when it means an earlier stream of the same name; that
    // one is then found by its address alone.
    streamsByName.erase(found->second);
    namesByStream.erase(found);
    delete stream;
}

void SVGConfig::releaseOStream() {
    for (const auto& entry : namesByStream) {
        delete entry.first;
    }
    streamsByName.clear();
    namesByStream.clear();
}

std::ostream* SVGConfig::renameOStream(std::ostream* stream, const UnicodeString& name) {
    const auto found = namesByStream.find(stream);
    if (!ownsObject || found == namesByStream.end()) {
        return stream;
    }
    const UnicodeString old = found->second;
    // The same file by another name must not be emptied either: its content would be lost.
    if (old == name || isSameFile(old, name)) {
        return stream;
    }
    closeFile(*stream);
    std::ostream* const fresh = createOStream(name);
    if (!fresh) {
        return nullptr;
    }
    const std::unique_ptr<std::istream> source(makeUri(old).getIStream(nullptr, nullptr));
    if (source) {
        copyWithLastByteTwice(*source, *fresh);
    }
    if (fresh->flush()) {
        removeFile(old);
    }
    return fresh;
}

void SVGConfig::entryCreatedFile(const UnicodeString& name) {
    if (!streamOutput) {
        createdFiles.insert(name);
    }
}

void SVGConfig::deleteEntryeFiles() {
    if (streamOutput) {
        return;
    }
    for (const UnicodeString& name : createdFiles) {
        removeFile(name);
    }
    createdFiles.clear();
}

void SVGConfig::enterImageName(const UnicodeString& source, const UnicodeString& key,
                               const UnicodeString& entered) {
    enteredImageNames.insert(entered);
    if (!source.isEmpty()) {
        imageNameMap.emplace(key, entered);
    }
}

bool SVGConfig::isEnteredImagename(const UnicodeString& name) const {
    return enteredImageNames.contains(name);
}

UnicodeString SVGConfig::getEnteredImageName(const UnicodeString& key) const {
    const auto found = key.isEmpty() ? imageNameMap.end() : imageNameMap.find(key);
    return found == imageNameMap.end() ? UnicodeString() : found->second;
}

void SVGConfig::initImageName() {
    enteredImageNames.clear();
    imageNameMap.clear();
    copyNameCounter = 0;
}

} // namespace DrawmereNS
