/// Streams that fail in every way there is.
#pragma once

#include <algorithm>
#include <ios>
#include <streambuf>
#include <string>

namespace DrawmereTest {

/// Bytes that can be read up to some place, and what happens there.
class BrittleBuffer : public std::streambuf {
public:
    enum Fault { ENDS, THROWS, REFUSES_TO_SEEK, THROWS_WHEN_SOUGHT };

    static constexpr Fault faults[] = {ENDS, THROWS, REFUSES_TO_SEEK, THROWS_WHEN_SOUGHT};

    BrittleBuffer(const std::string& content, std::size_t firstBad, Fault kind)
        : bytes(content), good(static_cast<off_type>(std::min(firstBad, bytes.size()))),
          fault(kind) {
        setg(bytes.data(), bytes.data(), bytes.data() + good);
    }

protected:
    int_type underflow() override {
        if (fault == THROWS) {
            throw std::ios_base::failure("no more");
        }
        return traits_type::eof();
    }

    pos_type seekoff(off_type offset, std::ios_base::seekdir from,
                     std::ios_base::openmode /*which*/) override {
        if (fault == THROWS_WHEN_SOUGHT) {
            throw std::ios_base::failure("no seeking");
        }
        if (fault == REFUSES_TO_SEEK) {
            return pos_type(off_type(-1));
        }
        off_type place = from == std::ios_base::cur ? gptr() - eback() : 0;
        place = (from == std::ios_base::end ? static_cast<off_type>(bytes.size()) : place) + offset;
        setg(bytes.data(), bytes.data() + std::min(place, good), bytes.data() + good);
        return pos_type(place);
    }

    pos_type seekpos(pos_type place, std::ios_base::openmode which) override {
        return seekoff(off_type(place), std::ios_base::beg, which);
    }

private:
    std::string bytes;
    off_type good;
    Fault fault;
};

} // namespace DrawmereTest
