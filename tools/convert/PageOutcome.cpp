#include "tools/convert/PageOutcome.h"

#include <cstring>
#include <type_traits>

namespace DrawmereConvert {
namespace {

/// Both directions of a message have the same steps, so that they can't differ.
class Packer {
public:
    template <class Value> void pass(const Value& value) {
        static_assert(std::is_trivially_copyable_v<Value>);
        const std::size_t end = bytes.size();
        bytes.resize(end + sizeof value);
        std::memcpy(bytes.data() + end, &value, sizeof value);
    }

    void pass(const std::string& text) {
        pass(text.size());
        bytes += text;
    }

    template <class Item> void pass(const std::vector<Item>& items) {
        pass(items.size());
        for (const Item& item : items) {
            pass(item);
        }
    }

    void pass(const LinkArea& link) {
        pass(link.x);
        pass(link.y);
        pass(link.width);
        pass(link.height);
        pass(link.target);
    }

    std::string bytes;
};

class Unpacker {
public:
    explicit Unpacker(const std::string& message) : bytes(message) {}

    template <class Value> void pass(Value& value) {
        static_assert(std::is_trivially_copyable_v<Value>);
        std::memcpy(&value, bytes.data() + position, sizeof value);
        position += sizeof value;
    }

    void pass(std::string& text) {
        std::size_t size = 0;
        pass(size);
        text = bytes.substr(position, size);
        position += size;
    }

    template <class Item> void pass(std::vector<Item>& items) {
        std::size_t size = 0;
        pass(size);
        items.resize(size);
        for (Item& item : items) {
            pass(item);
        }
    }

    void pass(LinkArea& link) {
        pass(link.x);
        pass(link.y);
        pass(link.width);
        pass(link.height);
        pass(link.target);
    }

private:
    const std::string& bytes;
    std::size_t position = 0;
};

template <class Passer, class Outcome> void passOutcome(Passer& passer, Outcome& outcome) {
    passer.pass(outcome.page);
    passer.pass(outcome.isWritten);
    passer.pass(outcome.isLate);
    passer.pass(outcome.isUnreadable);
    passer.pass(outcome.size);
    passer.pass(outcome.error);
    passer.pass(outcome.report.approximations);
    passer.pass(outcome.report.isComplete);
    passer.pass(outcome.report.messages);
    passer.pass(outcome.report.links);
}

} // namespace

std::string packOutcome(const PageOutcome& outcome) {
    Packer packer;
    passOutcome(packer, outcome);
    return packer.bytes;
}

PageOutcome unpackOutcome(const std::string& bytes) {
    Unpacker unpacker(bytes);
    PageOutcome outcome;
    passOutcome(unpacker, outcome);
    return outcome;
}

} // namespace DrawmereConvert
