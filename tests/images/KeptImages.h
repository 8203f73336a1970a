/// Images that wait in a store.
#pragma once

#include "images/SVGImageStore.h"

#include <sstream>
#include <string>

namespace DrawmereTest {

using DrawmereNS::SVGImageStore;
using DrawmereNS::SVGStoredImage;

/// Returns: bytes of all values, in no simple order.
inline std::string makeBytes(std::size_t size) {
    std::string bytes(size, '\0');
    unsigned int state = 1;
    for (char& byte : bytes) {
        state = state * 1664525U + 1013904223U;
        byte = static_cast<char>(state >> 24U);
    }
    return bytes;
}

/// Returns: `bytes`, as `store` keeps them.
inline SVGStoredImage keep(SVGImageStore& store, const std::string& bytes) {
    std::istringstream stream(bytes);
    SVGStoredImage image;
    return store.keep(stream, bytes.size(), image) ? std::move(image) : SVGStoredImage();
}

/// Returns: the bytes of an image.
inline std::string read(const SVGStoredImage& image) {
    std::string bytes(image.fileBytes, '\0');
    if (image.file && !image.file->read(image.fileBegin, bytes.data(), bytes.size())) {
        return "nothing";
    }
    return bytes.append(image.block.get(), image.blockBytes);
}

} // namespace DrawmereTest
