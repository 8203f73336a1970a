#include "foundation/names/SVGName.h"

#include <algorithm>
#include <functional>
#include <iterator>
#include <string_view>
#include <type_traits>

namespace TalCommon {
namespace {

constexpr std::u16string_view texts[] = {
#define SVG_NAME(identifier, text) text,
#include "foundation/names/SVGName.def"
#undef SVG_NAME
};

static_assert(std::size(texts) + 1 == SVGName::count_);
static_assert(std::adjacent_find(std::begin(texts), std::end(texts),
                                 std::greater_equal<std::u16string_view>()) == std::end(texts),
              "the list is sorted and names nothing twice");
static_assert(std::is_trivially_copyable_v<SVGName>);

// One listed text stands for all: were the order lost, both tables would move apart.
static_assert(texts[SVGName::clip_path - 1] == u"clip-path");
static_assert(SVGName(MoxCommonNS::MoxName(SVGName(SVGName::clip_path))) == SVGName::clip_path);
static_assert(SVGName(MoxCommonNS::MOXNAME_SVG) == SVGName::svg);

} // namespace
} // namespace TalCommon
