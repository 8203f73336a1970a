#include "foundation/common/MoxPackedNode.h"

#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxText.h"

#include <algorithm>
#include <vector>

namespace MoxCommonNS {
namespace {

/// The first nodes of a row grow up to here, so that a short row takes little memory.
constexpr std::size_t fullSize = 15360;
/// From so many nodes in a row on they take a chunk each.
constexpr int rowBeforeChunks = 8;
/// Elements that are larger would leave much of a chunk unused.
constexpr std::size_t largestInChunk = MoxChunkSource::room / 16;
/// What a chunk has left for the next element, at least; and in parts of the largest one so far,
/// which has asked for more while it was packed than it takes.
constexpr std::size_t leastSpare = 1280;
constexpr std::size_t sparesOfLargest = 3;

MoxPackedNode* toPacked(MoxNode* node) {
    return node && node->kindLink() == MOXNODE_PACKED ? static_cast<MoxPackedNode*>(node) : nullptr;
}

/// Makes nodes again.
class Unpacker {
public:
    /// Borrows: `parent`, whose class and document the elements get.
    explicit Unpacker(const MoxElement& parent) : model(parent) {}

    void read(std::string_view bytes) {
        MoxPackedCursor cursor(bytes);
        while (!cursor.isAtEnd()) {
            const MoxPackedHead head = MoxPackedHead::take(cursor);
            if (head.kind() == MoxPackedHead::element) {
                readElement(head, cursor);
            } else if (head.kind() == MoxPackedHead::text) {
                add(new MoxText(model.getOwnerDocument(),
                                MoxPackedValue::take(cursor).toValue().toString()));
            } else {
                current = current->parentLink();
            }
        }
    }

    std::vector<MoxPtr<MoxNode>> nodes;

private:
    void readElement(const MoxPackedHead& head, MoxPackedCursor& cursor) {
        const MoxPtr<MoxElement> element = model.makeLike();
        element->setName({}, {}, head.name);
        element->reserveAttributes(head.attributeCount);
        for (int i = 0; i < head.attributeCount; ++i) {
            const MoxName key = MoxPackedHead::takeKey(cursor);
            element->setAttribute(key, MoxPackedValue::take(cursor).toValue());
        }
        add(element.get());
        if (head.has(MoxPackedHead::hasChildren)) {
            current = element.get();
        }
    }

    void add(const MoxPtr<MoxNode>& node) {
        if (current) {
            current->appendChild(node.get());
        } else {
            nodes.push_back(node);
        }
    }

    const MoxElement& model;    // borrowed
    MoxNode* current = nullptr; // borrowed; the open element
};

} // namespace

MoxPackedNode::MoxPackedNode(MoxDocument* document) : MoxNode(MOXNODE_PACKED, document) {}

const char* MoxPackedNode::getTypeName() const { return "MoxPackedNode"; }

bool MoxPackedNode::packLast(MoxNode& holder, const MoxPackRules& rules) {
    MoxNode* const last = holder.lastLink();
    if (!last || last == holder.firstLink() || last->kindLink() != MOXNODE_ELEMENT) {
        return false;
    }
    MoxPackedNode* const tail = toPacked(last->previousLink());
    if (tail && !tail->isFull()) {
        const std::size_t before = tail->bytes.size();
        const bool isPacked = MoxPacker::append(tail->bytes, *last, rules);
        if (isPacked) {
            tail->noteElement(tail->bytes.size() - before);
            holder.removeChild(last);
        }
        return isPacked;
    }
    MoxPackedBytes packed;
    if (!MoxPacker::append(packed, *last, rules)) {
        return false;
    }
    const MoxPtr<MoxPackedNode> fresh(new MoxPackedNode(holder.getOwnerDocument()));
    fresh->placeInRow = tail ? tail->placeInRow + 1 : 0;
    if (fresh->placeInRow >= rowBeforeChunks && packed.size() <= largestInChunk) {
        fresh->bytes.reserveChunk();
    }
    fresh->bytes.append(packed.get());
    fresh->noteElement(packed.size());
    const MoxPtr<MoxNode> node(fresh);
    holder.replaceLink(*last, {&node, 1});
    return true;
}

/// Remembers the size of an element that came; a full node gives back what it has not used.
void MoxPackedNode::noteElement(std::size_t size) {
    largest = std::max(largest, size);
    if (isFull()) {
        bytes.trim();
    }
}

bool MoxPackedNode::isFull() const {
    if (!bytes.hasChunk()) {
        return bytes.size() >= fullSize;
    }
    return bytes.size() + std::max(leastSpare, sparesOfLargest * largest) >= MoxChunkSource::room;
}

void MoxPackedNode::unpack() {
    MoxNode* const holder = parentLink();
    Unpacker unpacker(static_cast<const MoxElement&>(*holder));
    unpacker.read(getBytes());
    holder->replaceLink(*this, unpacker.nodes);
}

MoxPtr<MoxNode> MoxPackedNode::cloneAlone() const {
    MoxPtr<MoxPackedNode> copy(new MoxPackedNode(nullptr));
    copy->shareOwner(*this);
    copy->bytes.append(getBytes());
    return copy;
}

} // namespace MoxCommonNS
