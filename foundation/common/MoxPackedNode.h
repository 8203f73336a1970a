/// Finished siblings in a small form.
#pragma once

#include "foundation/common/MoxNode.h"
#include "foundation/common/MoxPackedForm.h"

namespace MoxCommonNS {

/// Stands in a tree for a row of elements that nobody will change: it keeps them as bytes, a
/// quarter of what the nodes take. It is no node of the DOM. Who asks a node for its relatives gets
/// nodes, as what is packed becomes nodes again then; the plain readings of links show it as a leaf
/// of its own kind.
class MoxPackedNode : public MoxNode {
public:
    /// A node without anything.
    explicit MoxPackedNode(MoxDocument* document);

    /// Packs the last child of `holder`, an element that only `holder` holds and that has a
    /// neighbour before it: so the first child of an element always is a node.
    /// Ignores: everything else, and what `rules` keep. Returns: whether it is packed now.
    static bool packLast(MoxNode& holder, const MoxPackRules& rules);

    /// Makes nodes of what is packed, which take the place of this. Afterwards this is gone unless
    /// somebody holds it. Throws: std::bad_alloc, and nothing has changed.
    void unpack();

    const char* getTypeName() const override;

    /// Returns: what is packed, in the form of `MoxPackedForm.h`.
    std::string_view getBytes() const { return bytes.get(); }

    /// Returns: the bytes of memory that stand behind them.
    std::size_t getMemory() const { return bytes.getCapacity(); }

protected:
    MoxPtr<MoxNode> cloneAlone() const override;

private:
    void noteElement(std::size_t size);
    bool isFull() const;

    MoxPackedBytes bytes;
    std::size_t largest = 0; // of the packed elements, in bytes
    int placeInRow = 0;      // among packed siblings
};

} // namespace MoxCommonNS
