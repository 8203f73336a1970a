#include "foundation/common/MoxKeptText.h"

#include <ios>
#include <utility>

namespace MoxCommonNS {

MoxKeptText::~MoxKeptText() = default;

std::string_view MoxKeptText::getText() const {
    const std::lock_guard lock(mutex);
    if (madeText.empty()) {
        std::string whole;
        whole.reserve(getLength());
        if (!handOut("\n", [&whole](std::string_view piece) { whole.append(piece); })) {
            throw std::ios_base::failure("A text that was kept can't be read back.");
        }
        madeText = std::move(whole);
    }
    return madeText;
}

} // namespace MoxCommonNS
