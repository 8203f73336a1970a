/// A long text that is kept in another form until it is written.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxRCObject.h"

#include <cstddef>
#include <functional>
#include <mutex>
#include <string>
#include <string_view>

namespace MoxCommonNS {

/// A text that would need more memory than what it is made from. Values share it (see
/// `MoxValue::fromKept`), and a document is written with one piece of it in memory at a time.
///
/// Its characters are ASCII, and none of them is markup or a control character, but for line feeds.
/// Their count fits into an int.
class DRAWMERE_API MoxKeptText : public MoxRCObject {
public:
    /// Takes the next piece of the text, which is valid for the call.
    using Taker = std::function<void(std::string_view piece)>;

    static constexpr std::size_t maxLineFeed = 8; ///< characters that a line feed may become

    MoxKeptText() = default;
    MoxKeptText(const MoxKeptText&) = delete;
    MoxKeptText& operator=(const MoxKeptText&) = delete;
    ~MoxKeptText() override;

    /// Returns: the count of characters, with each line feed as one.
    virtual std::size_t getLength() const = 0;

    /// Gives the text from its beginning to its end to `take`, with `lineFeed` in the place of each
    /// line feed. Several threads may do so at once. Throws: what `take` throws.
    /// Shape: `lineFeed`, at most `maxLineFeed` characters.
    /// Returns: false when the rest of the text can't be had any more.
    virtual bool handOut(std::string_view lineFeed, const Taker& take) const = 0;

    /// Returns: the whole text, valid as long as the object; it is made by the first call, and its
    /// memory stays in use. Throws: std::bad_alloc; std::ios_base::failure when the text can't be
    /// had any more.
    std::string_view getText() const;

private:
    mutable std::mutex mutex;     // for values on several threads that share the object
    mutable std::string madeText; // empty until somebody asks for it
};

} // namespace MoxCommonNS
