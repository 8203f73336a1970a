/// The bytes of packed nodes, as they grow and as they are read.
#pragma once

#include "foundation/common/MoxChunkSource.h"
#include "foundation/common/MoxNodeHeap.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <new>
#include <string_view>
#include <utility>

namespace MoxCommonNS {

/// Bytes that are appended. Nothing in them points anywhere, so a copy is a copy of the bytes.
class MoxPackedBytes {
public:
    MoxPackedBytes() = default;
    MoxPackedBytes(const MoxPackedBytes&) = delete;
    MoxPackedBytes& operator=(const MoxPackedBytes&) = delete;

    ~MoxPackedBytes() { release(); }

    /// Takes as much memory as a long row of nodes needs, rather than a little that grows.
    /// Throws: std::bad_alloc, and nothing has changed. Ignores: bytes that have memory.
    void reserveChunk() {
        if (!memory) {
            memory = MoxNodeHeap::allocateChunk();
            capacity = MoxChunkSource::room;
            isChunk = true;
        }
    }

    /// Returns: all that was appended, valid until more is.
    std::string_view get() const { return {memory, length}; }

    std::size_t size() const { return length; }

    /// Returns: how many bytes there is memory for.
    std::size_t getCapacity() const { return capacity; }

    /// Returns: whether the memory is that of `reserveChunk`.
    bool hasChunk() const { return isChunk; }

    /// Returns: whether `count` bytes more take no memory.
    bool hasRoom(std::size_t count) const { return count <= capacity - length; }

    /// Makes room for `count` bytes more. Returns: where they go; `advance` takes them.
    /// Throws: std::bad_alloc, and nothing has changed.
    char* room(std::size_t count) {
        if (!hasRoom(count)) {
            grow(count);
        }
        return memory + length;
    }

    void advance(const char* end) { length = static_cast<std::size_t>(end - memory); }

    void append(std::string_view bytes) {
        std::memcpy(room(bytes.size()), bytes.data(), bytes.size());
        length += bytes.size();
    }

    template <typename T> void appendNumber(T number) {
        std::memcpy(room(sizeof(T)), &number, sizeof(T));
        length += sizeof(T);
    }

    /// Lets go of what stands behind the first `count` bytes; memory stays.
    void cut(std::size_t count) { length = count; }

    /// Gives memory back that nothing was appended to, but for a chunk.
    void trim() {
        if (isChunk || length == 0) {
            return;
        }
        if (void* const shrunk = std::realloc(memory, length)) {
            memory = static_cast<char*>(shrunk);
            capacity = length;
        }
    }

private:
    void grow(std::size_t count) {
        constexpr std::size_t second = 256; // many take nothing after the first bytes
        std::size_t wanted = capacity == 0 ? count : std::max(second, 2 * capacity);
        while (wanted - length < count) {
            wanted *= 2;
        }
        void* const grown = std::realloc(isChunk ? nullptr : memory, wanted);
        if (!grown) {
            throw std::bad_alloc();
        }
        if (isChunk) {
            std::memcpy(grown, memory, length);
            release();
        }
        memory = static_cast<char*>(grown);
        capacity = wanted;
        isChunk = false;
    }

    void release() {
        if (isChunk) {
            MoxNodeHeap::releaseChunk(memory);
        } else {
            std::free(memory);
        }
    }

    char* memory = nullptr; // owned
    std::size_t length = 0;
    std::size_t capacity = 0;
    bool isChunk = false; // of the heap of nodes
};

/// Reads what `MoxPackedBytes` has taken.
class MoxPackedCursor {
public:
    /// Borrows: `bytes`.
    explicit MoxPackedCursor(std::string_view bytes)
        : place(bytes.data()), end(bytes.data() + bytes.size()) {}

    bool isAtEnd() const { return place == end; }

    template <typename T> T take() {
        T number;
        std::memcpy(&number, place, sizeof(T));
        place += sizeof(T);
        return number;
    }

    std::string_view takeBytes(std::size_t count) {
        return {std::exchange(place, place + count), count};
    }

private:
    const char* place; // borrowed
    const char* end;   // borrowed
};

} // namespace MoxCommonNS
