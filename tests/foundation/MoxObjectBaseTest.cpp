#include "foundation/common/MoxObjectBase.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxText.h"

#include <gtest/gtest.h>
#include <string>
#include <vector>

namespace {

using namespace MoxCommonNS;

constexpr std::uint32_t objectBase = 0xDF537371;
constexpr std::uint32_t rcObject = 0xD18D040A;
constexpr std::uint32_t nodeIterable = 0x6D959880;
constexpr std::uint32_t node = 0xFF72074A;
constexpr std::uint32_t document = 0x2A780AB6;
constexpr std::uint32_t element = 0x9B60777D;

struct TypeRow {
    const MoxObjectBase& object;
    std::uint32_t number;
    const char* name;
    std::vector<std::uint32_t> bases;
};

TEST(MoxObjectBase, EveryClassAnswersForItselfAndItsBasesOnly) {
    const MoxObjectBase plain;
    const MoxRCObject counted;
    const MoxNodeIterable iterable;
    const MoxDocument page;
    const MoxElement shape(nullptr);
    const MoxText text(nullptr, u"x");

    // A text has no number of its own: to a type test it is a node and no more.
    const TypeRow rows[] = {
        {plain, objectBase, "MoxObjectBase", {}},
        {counted, rcObject, "MoxRCObject", {objectBase}},
        {iterable, nodeIterable, "MoxNodeIterable", {objectBase, rcObject}},
        {page, document, "MoxDocument", {objectBase, rcObject, nodeIterable, node}},
        {shape, element, "MoxElement", {objectBase, rcObject, nodeIterable, node}},
        {text, node, "MoxText", {objectBase, rcObject, nodeIterable}},
    };
    const std::uint32_t all[] = {objectBase, rcObject, nodeIterable, node, document, element, 0};

    for (const TypeRow& row : rows) {
        EXPECT_EQ(row.object.getTypeID(), row.number) << row.name;
        EXPECT_STREQ(row.object.getTypeName(), row.name);
        for (const std::uint32_t id : all) {
            const bool isBase =
                std::find(row.bases.begin(), row.bases.end(), id) != row.bases.end();
            EXPECT_EQ(row.object.isA(id), isBase || id == row.number) << row.name << " " << id;
        }
    }
}

TEST(MoxObjectBase, IsDeletedThroughItsVirtualDestructor) {
    struct Probe : MoxObjectBase {
        explicit Probe(bool& flag) : dead(flag) {}

        ~Probe() override { dead = true; }

        bool& dead;
    };

    bool dead = false;
    const MoxObjectBase* object = new Probe(dead);
    delete object;
    EXPECT_TRUE(dead);
}

} // namespace
