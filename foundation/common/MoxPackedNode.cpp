#include "foundation/common/MoxPackedNode.h"

#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxText.h"

#include <vector>

namespace MoxCommonNS {
namespace {

/// A node with so many bytes takes no more: few elements are larger than what a chunk has left.
constexpr std::size_t fullSize = MoxChunkSource::room - 1280;
/// The first nodes of a row grow up to here, so that a short row takes little memory.
constexpr std::size_t firstFullSize = 15360;
/// From so many nodes in a row on they take a chunk each.
constexpr int rowBeforeChunks = 8;

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
        const bool isPacked = MoxPacker::append(tail->bytes, *last, rules);
        if (isPacked) {
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
    if (fresh->placeInRow >= rowBeforeChunks) {
        fresh->bytes.reserveChunk();
    }
    fresh->bytes.append(packed.get());
    const MoxPtr<MoxNode> node(fresh);
    holder.replaceLink(*last, {&node, 1});
    return true;
}

bool MoxPackedNode::isFull() const {
    return bytes.size() >= (bytes.hasChunk() ? fullSize : firstFullSize);
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
