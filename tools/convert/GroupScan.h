/// Looks ahead at what the groups and masks of a page contain.
#pragma once

#include <mupdf/fitz.h>

#include <cstdint>
#include <vector>

namespace DrawmereConvert {

/// What is drawn between the beginning of a group or of masked content and its end.
struct GroupFacts {
    int objects = 0;
    int images = 0;
    bool overlaps = false;  ///< two objects may cover the same place
    bool hasGroups = false; ///< it contains groups or masks itself

    /// Returns: whether a common opacity can be given to the objects one by one.
    bool isSimple() const { return !overlaps && !hasGroups; }
};

/// Runs a page without drawing it, and files what each group has, in the order of their beginnings.
///
/// An effect on a group as a whole needs a container around it, which is dear; objects that don't
/// overlap can have it one by one. Which it is must be known before the first is drawn.
class GroupScan {
public:
    /// A page that can't be read to its end has facts about what could be read.
    void run(fz_context* ctx, fz_page* page, const fz_matrix& matrix);

    bool hasRun() const { return isDone; }

    /// Returns: the facts about the group of this number; those of one that was not seen say that
    /// nothing is simple.
    GroupFacts get(std::size_t number) const;

    // What the device of the scan calls. None of them throws.

    void begin() noexcept;      ///< a group or mask with facts of its own
    void beginPlain() noexcept; ///< a clip, which is only to be ended
    void beginApart() noexcept; ///< what is drawn inside does not belong to the groups around
    void end() noexcept;
    void add(const fz_rect& bounds, bool isImage) noexcept;

private:
    enum KIND : std::int8_t { KIND_COUNTED, KIND_PLAIN, KIND_APART };

    struct OpenGroup {
        KIND kind = KIND_PLAIN;
        std::size_t number = 0;
        std::vector<fz_rect> seen{};
    };

    void push(KIND kind) noexcept;
    /// Runs `change` for the groups that what comes now belongs to.
    template <class Change> void forGroups(const Change& change);
    void addTo(OpenGroup& group, const fz_rect& bounds, bool isImage);

    bool isDone = false;
    bool isOutOfMemory = false;
    std::vector<GroupFacts> facts;
    std::vector<OpenGroup> open;
};

} // namespace DrawmereConvert
